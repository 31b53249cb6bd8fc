## -*- texinfo -*-
## @deftypefn {} {[@var{days}, @var{order}] =} __ambrix_toDays__ (@var{epochs}, @var{order}, @var{datatype})
## Turn epochs into Octave's serial day numbers, and their fill values (@code{-1e31}, of a
## CDF_TIME_TT2000 @code{intmin ("int64")}) into NaN.
##
## The two numbers of an EPOCH16, along the first axis, become one; the axis is then the last of
## @var{order}, the permutation to come.
## @end deftypefn

function [days, order] = __ambrix_toDays__ (epochs, order, datatype)
  if (strcmp (datatype, "CDF_TIME_TT2000"))
    days = daysOfTT2000 (epochs);
    return;
  endif
  isFill = epochs <= -1e30;
  if (strcmp (datatype, "CDF_EPOCH16"))
    sizes = size (epochs);
    isFill = any (isFill, 1);
    epochs = reshape (epochs, 2, []);
    days = epochs(1,:) / 86400 + epochs(2,:) / 86400e12 + 1;
    days = reshape (days, [1, sizes(2:end)]);
    order = [order(order != 1), 1];
  else
    days = epochs / 86400e3 + 1;
  endif
  days(isFill) = NaN;
endfunction

## Some at a time, because there are nine numbers for each. Leap seconds run into the next day, as
## they do in datenum.
function days = daysOfTT2000 (times)
  days = NaN (size (times));
  valid = find (times != intmin ("int64"));
  for first = 1:1e6:numel (valid)
    part = valid(first:min (first + 1e6 - 1, end));
    t = ambrix_tt2000Breakdown (times(part));
    seconds = t(4,:) * 3600 + t(5,:) * 60 + t(6,:) + (t(7,:) * 1e6 + t(8,:) * 1e3 + t(9,:)) / 1e9;
    days(part) = datenum (t(1,:), t(2,:), t(3,:)) + seconds / 86400;
  endfor
endfunction

%!test
%! epochs = ambrix_computeEpoch ([2024; 2; 29; 12; 30; 15; 250]);
%! days = __ambrix_toDays__ (epochs, [1, 2], "CDF_EPOCH");
%! assert (datestr (days, "yyyy-mm-dd HH:MM:SS.FFF"), "2024-02-29 12:30:15.250");
%!test
%! epochs = ambrix_computeEpoch16 ([2024; 2; 29; 12; 30; 15; 250; 0; 0; 0]);
%! [days, order] = __ambrix_toDays__ ([epochs, [-1e31; -1e31]], [2, 1], "CDF_EPOCH16");
%! assert (datestr (days(1), "yyyy-mm-dd HH:MM:SS.FFF"), "2024-02-29 12:30:15.250");
%! assert (isnan (days), [false, true]);
%! assert (order, [2, 1]);
%!test
%! times = ambrix_computeTT2000 ([2024, 1969; 2, 7; 29, 20; 12, 20; 30, 17; 15, 40; 250, 0; ...
%!                                zeros(2, 2)]);
%! days = __ambrix_toDays__ ([times, intmin("int64")], [1, 2], "CDF_TIME_TT2000");
%! assert (datestr (days(1:2), "yyyy-mm-dd HH:MM:SS.FFF"), ...
%!         ["2024-02-29 12:30:15.250"; "1969-07-20 20:17:40.000"]);
%! assert (isnan (days), [false, false, true]);
%! days = __ambrix_toDays__ (reshape (times(1) + int64 (0:5), 1, 2, 3), 1:3, "CDF_TIME_TT2000");
%! assert (days, repmat (datenum (2024, 2, 29, 12, 30, 15.25), 1, 2, 3), 1e-9);
%!test  # a leap second, and the second after it
%! times = ambrix_computeTT2000 ([2016, 2017; 12, 1; 31, 1; 23, 0; 59, 0; 60, 0; zeros(3, 2)]);
%! assert (diff (times), int64 (1e9));
%! days = __ambrix_toDays__ (times, [1, 2], "CDF_TIME_TT2000");
%! assert (days, datenum ([2017, 2017], 1, 1));
%!assert (__ambrix_toDays__ (zeros (0, 3, "int64"), [1, 2], "CDF_TIME_TT2000"), zeros (0, 3))
