## -*- texinfo -*-
## @deftypefn {} {} __ambrix_timeTicks__ (@var{ax}, @var{labelled})
## Label the x axis of axes whose values are serial day numbers: some five to ten round times, and
## the day or days below; or put ticks there only, where it is not to be @var{labelled}.
## @end deftypefn

function __ambrix_timeTicks__ (ax, labelled)
  limits = xlim (ax);
  [ticks, form] = __ambrix_roundTimes__ (limits);
  set (ax, "xtick", ticks, "xticklabel", {});
  if (! labelled)
    return;
  endif
  set (ax, "xticklabel", cellstr (datestr (ticks, form)));
  days = unique (cellstr (datestr (limits, "yyyy-mm-dd")));
  xlabel (ax, strjoin (days', " to "), "interpreter", "none");
endfunction

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))
%! before = graphics_toolkit ();
%! graphics_toolkit ("gnuplot");
%! f = figure ("visible", "off");
%! unwind_protect
%!   plot (datenum (2024, 5, 6, 0:6:24, 0, 0), 1:5);
%!   __ambrix_timeTicks__ (gca (), true);
%!   assert (get (gca (), "xticklabel"){2}, "03:00");
%!   assert (get (get (gca (), "xlabel"), "string"), "2024-05-06 to 2024-05-07");
%! unwind_protect_cleanup
%!   close (f);
%!   graphics_toolkit (before);
%! end_unwind_protect
