## -*- texinfo -*-
## @deftypefn {} {@var{given} =} ambrix.internal.compressionArguments (@var{described})
## The arguments for the commands that set a compression: none for no compression, and GZIP with a
## medium level where the description has none.
## @end deftypefn

function given = compressionArguments (described)
  given = {};
  if (! isfield (described, "compression") || strcmpi (described.compression, "NO_COMPRESSION"))
    return;
  endif
  given = {described.compression};
  if (isfield (described, "compressionParameter") && ! isempty (described.compressionParameter))
    given{2} = described.compressionParameter;
  elseif (strcmpi (described.compression, "GZIP_COMPRESSION"))
    given{2} = 6;
  endif
endfunction

%!assert (ambrix.internal.compressionArguments (struct ()), {})
%!assert (ambrix.internal.compressionArguments (struct ("compression", "NO_COMPRESSION")), {})
%!test
%! s = struct ("compression", "GZIP_COMPRESSION");
%! assert (ambrix.internal.compressionArguments (s), {"GZIP_COMPRESSION", 6});
%! s.compressionParameter = 9;
%! assert (ambrix.internal.compressionArguments (s), {"GZIP_COMPRESSION", 9});
%!test
%! s = struct ("compression", "RLE_COMPRESSION", "compressionParameter", []);
%! assert (ambrix.internal.compressionArguments (s), {"RLE_COMPRESSION"});
