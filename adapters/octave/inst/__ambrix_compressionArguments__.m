## -*- texinfo -*-
## @deftypefn {} {@var{given} =} __ambrix_compressionArguments__ (@var{described})
## The arguments for the commands that set a compression: none for no compression, and GZIP with a
## medium level where the description has none.
## @end deftypefn

function given = __ambrix_compressionArguments__ (described)
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

%!assert (__ambrix_compressionArguments__ (struct ()), {})
%!assert (__ambrix_compressionArguments__ (struct ("compression", "NO_COMPRESSION")), {})
%!test
%! s = struct ("compression", "GZIP_COMPRESSION");
%! assert (__ambrix_compressionArguments__ (s), {"GZIP_COMPRESSION", 6});
%! s.compressionParameter = 9;
%! assert (__ambrix_compressionArguments__ (s), {"GZIP_COMPRESSION", 9});
%!test
%! s = struct ("compression", "RLE_COMPRESSION", "compressionParameter", []);
%! assert (__ambrix_compressionArguments__ (s), {"RLE_COMPRESSION"});
