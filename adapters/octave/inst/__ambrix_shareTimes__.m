## -*- texinfo -*-
## @deftypefn {} {@var{pictures} =} __ambrix_shareTimes__ (@var{pictures}, @var{start})
## Give the pictures that @code{ambrix_plot} draws one below the other their x axes.
##
## Each gets @code{x.limits}, and @code{shows}: whether ticks are labelled below it, which the one
## below does for it where that has the same axis. All that are over time have the same limits and
## count from the same @code{x.start}, or from @var{start} where it is not empty.
## @end deftypefn

function pictures = __ambrix_shareTimes__ (pictures, start)
  times = cellfun (@(picture) picture.x.isTime, pictures);
  values = cellfun (@(picture) picture.x.values(:), pictures(times), "UniformOutput", false);
  limits = widened (vertcat (values{:}));
  if (isempty (start))
    start = beginning (limits);
  endif
  for k = 1:numel (pictures)
    pictures{k}.x.start = 0;
    if (times(k))
      pictures{k}.x.values -= start;
      pictures{k}.x.start = start;
      pictures{k}.x.limits = limits - start;
    else
      pictures{k}.x.limits = limitsOf (pictures{k});
    endif
  endfor
  for k = 1:numel (pictures)
    pictures{k}.shows = k == numel (pictures) || ! haveSameAxis (pictures{k}.x, pictures{k+1}.x);
  endfor
endfunction

## The first and last of the times, or a minute of that day with the only one in it.
function limits = widened (times)
  limits = [min(times), max(times)];
  if (isempty (limits) || limits(1) < limits(2))
    return;
  endif
  limits = max (floor (limits(1)), limits(1) - 30 / 86400) + [0, 60 / 86400];
endfunction

## OpenGL has 24 bits for a number: with them days tell milliseconds apart, and minutes microseconds.
function start = beginning (limits)
  start = floor (min (limits));
  if (diff (limits) < 59 / 86400)
    start = floor (limits(1) * 1440) / 1440;
  endif
endfunction

function limits = limitsOf (picture)
  values = picture.x.values(isfinite (picture.x.values));
  if (isfield (picture, "y"))
    values = __ambrix_edges__ (values, picture.x.isLog);
  endif
  limits = [min(values), max(values)];
  if (limits(1) == limits(2))
    limits += [-0.5, 0.5] * max (1, abs (limits(1)) / 1e3);
  endif
endfunction

function same = haveSameAxis (x, other)
  same = x.isTime && other.isTime;
  if (! x.isTime && ! other.isTime)
    same = isequal ({x.limits, x.label, x.units, x.isLog},
                    {other.limits, other.label, other.units, other.isLog});
  endif
endfunction

%!function picture = over (isTime, values)
%!  picture.x = struct ("values", values, "isTime", isTime, "isLog", false, "label", "x", ...
%!                      "units", "");
%!endfunction

%!test  # one axis for all times, and one for each of the others
%! day = datenum (2024, 5, 6);
%! given = {over(true, day + [0.5; 0.75]), over(true, day + [0.25; 0.5]), over(false, [1; 3])};
%! pictures = __ambrix_shareTimes__ (given, []);
%! assert (pictures{1}.x.values, [0.5; 0.75]);
%! assert (pictures{2}.x.limits, [0.25, 0.75]);
%! assert (pictures{1}.x.limits, [0.25, 0.75]);
%! assert (pictures{1}.x.start, day);
%! assert (pictures{3}.x, setfield (setfield (given{3}.x, "start", 0), "limits", [1, 3]));
%! assert (cellfun (@(picture) picture.shows, pictures), [false, true, true]);
%!test  # cells whose place is not known are not drawn
%! picture = setfield (over (false, [NaN; 1; 3]), "y", 1);
%! assert (__ambrix_shareTimes__ ({picture}, []){1}.x.limits, [0, 4]);
%!test  # what is added counts from where the rest does
%! day = datenum (2024, 5, 6);
%! pictures = __ambrix_shareTimes__ ({over(true, day + [0.5; 0.75])}, day - 1);
%! assert (pictures{1}.x.limits, [1.5, 1.75]);
%!test  # moments within a minute
%! day = datenum (2024, 5, 6);
%! moments = day + (12 * 3600 + 30 * 60 + [5; 5.002]) / 86400;
%! pictures = __ambrix_shareTimes__ ({over(true, moments)}, []);
%! assert (pictures{1}.x.limits * 86400, [5, 5.002], 2e-5);
%! assert (diff (single (pictures{1}.x.values)) * 86400, single (0.002), 2e-5);
%!test  # one time does not show the day before
%! day = datenum (2024, 5, 6);
%! pictures = __ambrix_shareTimes__ ({over(true, day)}, []);
%! assert (pictures{1}.x.limits, [0, 60 / 86400], 1e-9);
%! pictures = __ambrix_shareTimes__ ({over(false, 7), over(false, 7)}, []);
%! assert (pictures{1}.x.limits, [6.5, 7.5]);
%! assert (pictures{1}.shows, false);
