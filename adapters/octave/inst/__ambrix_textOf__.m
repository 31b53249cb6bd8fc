## -*- texinfo -*-
## @deftypefn {} {@var{text} =} __ambrix_textOf__ (@var{attributes}, @var{names}, @var{default})
## The first of the attributes of these names that is a text and not blank, without blanks around
## it; the default where there is none.
## @end deftypefn

function text = __ambrix_textOf__ (attributes, names, default)
  text = default;
  for name = names
    if (isfield (attributes, name{1}) && ischar (attributes.(name{1}))
        && ! isempty (strtrim (attributes.(name{1}))))
      text = strtrim (attributes.(name{1}))(1,:);
      return;
    endif
  endfor
endfunction

%!test
%! attributes = struct ("CATDESC", "  ", "FIELDNAM", 5, "UNITS", " nT ", "LABLAXIS", ["Bx"; "By"]);
%! assert (__ambrix_textOf__ (attributes, {"CATDESC", "FIELDNAM", "UNITS"}, "none"), "nT");
%! assert (__ambrix_textOf__ (attributes, {"CATDESC", "FIELDNAM"}, "none"), "none");
%! assert (__ambrix_textOf__ (attributes, {"LABLAXIS"}, "none"), "Bx");
