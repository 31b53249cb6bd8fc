## -*- texinfo -*-
## @deftypefn {} {@var{field} =} ambrix.internal.fieldName (@var{name})
## The field for a variable or an attribute: its name without blanks at the end, which many files
## have and which look-ups of the CDF library ignore.
## @end deftypefn

function field = fieldName (name)
  field = regexprep (name, ' +$', "");
endfunction

%!assert (ambrix.internal.fieldName ("SST   "), "SST")
%!assert (ambrix.internal.fieldName (" a b"), " a b")
