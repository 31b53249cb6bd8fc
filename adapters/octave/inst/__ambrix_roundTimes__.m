## -*- texinfo -*-
## @deftypefn {} {[@var{times}, @var{form}] =} __ambrix_roundTimes__ (@var{limits})
## Times at equal, round intervals within limits, as serial day numbers, and the form in which
## @code{datestr} shows them: at most ten, and fewer where the form is long, so that labels find
## room on an axis.
## @end deftypefn

function [times, form] = __ambrix_roundTimes__ (limits)
  span = diff (limits);
  if (span > 90)
    [times, form] = roundMonths (limits);
    return;
  endif
  [steps, forms] = intervals ();
  most = struct ("HHMMSSFFF", 4, "HHMMSS", 5, "HHMM", 9, "mmdd", 9);
  for k = 1:numel (steps)
    form = forms{k};
    if (span * 86400 / steps(k) <= most.(form(isletter (form))))
      break;
    endif
  endfor
  first = ceil (limits(1) * 86400 / steps(k) - 1e-6);
  last = floor (limits(2) * 86400 / steps(k) + 1e-6);
  times = (first:last) * steps(k) / 86400;
endfunction

## In seconds, with the form for each.
function [steps, forms] = intervals ()
  fractions = [1, 2, 5].' * 10 .^ (-3:-1);
  kinds = {fractions(:).', "HH:MM:SS.FFF"; ...
           [1, 2, 5, 10, 15, 30], "HH:MM:SS"; ...
           [60 * [1, 2, 5, 10, 15, 30], 3600 * [1, 2, 3, 6]], "HH:MM"; ...
           86400 * [1, 2, 5, 10], "mm-dd"};
  steps = [kinds{:,1}];
  counts = cellfun (@numel, kinds(:,1));
  forms = repelem (kinds(:,2), counts);
endfunction

## The beginnings of months or years.
function [times, form] = roundMonths (limits)
  steps = [1, 2, 3, 6, 12 * [1; 2; 5](:).', 12 * ([1; 2; 5] * 10 .^ (1:4))(:).'];
  step = [steps(diff (limits) / 30.4 ./ steps <= 6), steps(end)](1);
  months = datevec (limits)(:,1:2) * [12; 1] - 1;
  months = ceil (months(1) / step) * step:step:months(2);
  times = datenum (floor (months / 12), mod (months, 12) + 1, 1);
  times = times(times >= limits(1));
  form = "yyyy-mm";
  if (step >= 12)
    form = "yyyy";
  endif
endfunction

%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, 1, [10, 10], [0, 0], [0.5, 8.5]));
%! assert (datestr (times([1, end]), form), ["10:00:02"; "10:00:08"]);
%! assert (numel (times), 4);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, [1, 2]));
%! assert (datestr (times, form)(1:3,:), ["00:00"; "03:00"; "06:00"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, [30, 34]));
%! assert (datestr (times, form), ["01-30"; "01-31"; "02-01"; "02-02"; "02-03"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2023, 11, [2, 302]));
%! assert (datestr (times, form), ["2024-01"; "2024-03"; "2024-05"; "2024-07"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum ([1957, 2023], [6, 2], 1));
%! assert (datestr (times, form), ["1960"; "1980"; "2000"; "2020"]);
%!test
%! [times, form] = __ambrix_roundTimes__ (datenum (2024, 1, 1, 0, 0, [1.001, 1.010]));
%! assert (datestr (times, form)([1, end],:), ["00:00:01.005"; "00:00:01.010"]);
