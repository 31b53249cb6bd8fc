## -*- texinfo -*-
## @deftypefn {} {@var{values} =} __ambrix_validOf__ (@var{values}, @var{attributes})
## The values as doubles, with NaN for those that equal the attribute FILLVAL or are not from
## VALIDMIN to VALIDMAX. There may be one of these for each column.
## @end deftypefn

function values = __ambrix_validOf__ (values, attributes)
  kind = class (values);
  invalid = false (size (values));
  for [limit, name] = attributes
    if (! isnumeric (limit) || ! any (numel (limit) == [1, columns(values)]))
      continue;
    endif
    if (any (strcmp (kind, {"single", "double"})))
      limit = cast (limit, kind);  # of single data these may be doubles
    endif
    limit = limit(:).';
    if (strcmp (name, "FILLVAL"))
      invalid |= values == limit;
    elseif (strcmp (name, "VALIDMIN"))
      invalid |= values < limit;
    elseif (strcmp (name, "VALIDMAX"))
      invalid |= values > limit;
    endif
  endfor
  values = double (values);
  values(invalid) = NaN;
endfunction

%!test
%! limits = struct ("VALIDMIN", [1, 4], "VALIDMAX", 5, "FILLVAL", int16 (3), "UNITS", "nT");
%! values = __ambrix_validOf__ (int16 ([0, 3; 2, 4; 3, 5; 5, 6]), limits);
%! assert (values, [NaN, NaN; 2, 4; NaN, 5; 5, NaN]);
%!test  # a double fill value of single data
%! assert (__ambrix_validOf__ (single ([0.1; 2]), struct ("FILLVAL", 0.1)), [NaN; 2]);
%!assert (__ambrix_validOf__ (single ([0.1; 2]), struct ("VALIDMIN", 0.1)), double (single ([0.1; 2])))
%!test  # neighbours that are the same double
%! most = intmax ("int64");
%! limits = struct ("FILLVAL", most - 1, "VALIDMIN", 0);
%! found = __ambrix_validOf__ (most - int64 ([0; 1; 2]), limits);
%! assert (isnan (found), [false; true; false]);
