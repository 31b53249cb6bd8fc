## -*- texinfo -*-
## @deftypefn {} {[@var{days}, @var{order}] =} __ambrix_toDays__ (@var{epochs}, @var{order}, @var{datatype})
## Turn epochs into Octave's serial day numbers, and fill values (@code{-1e31}) into NaN.
##
## The two numbers of an EPOCH16, along the first axis, become one; the axis is then the last of
## @var{order}, the permutation to come.
## @end deftypefn

function [days, order] = __ambrix_toDays__ (epochs, order, datatype)
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
