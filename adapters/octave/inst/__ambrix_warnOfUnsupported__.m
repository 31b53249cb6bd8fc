## -*- texinfo -*-
## @deftypefn {} {} __ambrix_warnOfUnsupported__ (@var{caller}, @var{file}, @var{left})
## Warn of what could not be read and was left out, if anything was.
## @end deftypefn

function __ambrix_warnOfUnsupported__ (caller, file, left)
  if (! isempty (left))
    warning ("ambrix:unsupportedDatatype", "%s: not supported, and left out of \"%s\": %s\n",
             caller, file, strjoin (left, ", "));
  endif
endfunction

%!warning id=ambrix:unsupportedDatatype __ambrix_warnOfUnsupported__ ("f", "x", {"a", "b"})
%!test
%! lastwarn ("");
%! __ambrix_warnOfUnsupported__ ("f", "x", {});
%! assert (lastwarn (), "");
