## -*- texinfo -*-
## @deftypefn {} {@var{field} =} ambrix.internal.fieldName (@var{name})
## The field for a variable or an attribute: its name without blanks at the end, which many files
## have and which look-ups of the CDF library ignore.
## @end deftypefn

function field = fieldName (name)
  field = name(1:find ([true, name != " "], 1, "last") - 1);
endfunction

%!assert (ambrix.internal.fieldName ("SST   "), "SST")
%!assert (ambrix.internal.fieldName (" a b"), " a b")
%!assert (isempty (ambrix.internal.fieldName ("  ")))
%!assert (isempty (ambrix.internal.fieldName ("")))
%!assert (ambrix.internal.fieldName (["\xe9" " "]), "\xe9")  # not UTF-8
