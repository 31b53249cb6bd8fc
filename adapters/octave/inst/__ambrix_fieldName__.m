## -*- texinfo -*-
## @deftypefn {} {@var{field} =} __ambrix_fieldName__ (@var{name})
## The field for a variable or an attribute: its name without blanks at the end, which many files
## have and which look-ups of the CDF library ignore.
## @end deftypefn

function field = __ambrix_fieldName__ (name)
  field = name(1:find ([true, name != " "], 1, "last") - 1);
endfunction

%!assert (__ambrix_fieldName__ ("SST   "), "SST")
%!assert (__ambrix_fieldName__ (" a b"), " a b")
%!assert (isempty (__ambrix_fieldName__ ("  ")))
%!assert (isempty (__ambrix_fieldName__ ("")))
%!assert (__ambrix_fieldName__ (["\xe9" " "]), "\xe9")  # not UTF-8
