## -*- texinfo -*-
## @deftypefn {} {[@var{times}, @var{form}] =} __ambrix_roundTimes__ (@var{limits})
## At most ten times at equal, round intervals within limits, as serial day numbers, and the form in
## which @code{datestr} shows them.
## @end deftypefn

function [times, form] = __ambrix_roundTimes__ (limits)
  seconds = [1, 2, 5, 10, 15, 30, 60 * [1, 2, 5, 10, 15, 30], 3600 * [1, 2, 3, 6, 12], ...
             86400 * [1, 2, 5, 10, 20, 50, 100, 200, 500, 1000, 2000, 5000, 10000, 1e5, 1e6]];
  step = [seconds(diff (limits) * 86400 ./ seconds <= 9), seconds(end)](1);
  first = ceil (limits(1) * 86400 / step - 1e-6);
  last = floor (limits(2) * 86400 / step + 1e-6);
  times = (first:last) * step / 86400;
  form = "yyyy-mm-dd";
  if (step < 60)
    form = "HH:MM:SS";
  elseif (step < 86400)
    form = "HH:MM";
  endif
endfunction

%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, 1, [10, 10], [0, 0], [0.5, 8.5]));
%! assert (datestr (times([1, end]), form), ["10:00:01"; "10:00:08"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, [1, 2]));
%! assert (datestr (times, form)(1:3,:), ["00:00"; "03:00"; "06:00"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, [1, 300]));
%! assert (form, "yyyy-mm-dd");
%! assert (diff (times), 50 * ones (1, numel (times) - 1));
