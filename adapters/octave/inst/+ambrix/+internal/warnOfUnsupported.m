## -*- texinfo -*-
## @deftypefn {} {} ambrix.internal.warnOfUnsupported (@var{caller}, @var{file}, @var{left})
## Warn of what was left out because its datatype is not supported, if anything was.
## @end deftypefn

function warnOfUnsupported (caller, file, left)
  if (! isempty (left))
    warning ("ambrix:unsupportedDatatype", "%s: datatypes not supported, left out of \"%s\": %s\n",
             caller, file, strjoin (left, ", "));
  endif
endfunction

%!warning id=ambrix:unsupportedDatatype ambrix.internal.warnOfUnsupported ("f", "x", {"a", "b"})
%!test
%! lastwarn ("");
%! ambrix.internal.warnOfUnsupported ("f", "x", {});
%! assert (lastwarn (), "");
