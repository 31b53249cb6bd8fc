## -*- texinfo -*-
## @deftypefn {} {} __ambrix_timeTicks__ (@var{ax}, @var{start}, @var{labelled})
## Put ticks at round times on the x axis of axes whose values are days since the serial day number
## @var{start}; with labels, and the day or days below, where it is to be @var{labelled}.
## @end deftypefn

function __ambrix_timeTicks__ (ax, start, labelled)
  limits = xlim (ax) + start;
  [ticks, form] = __ambrix_roundTimes__ (limits);
  set (ax, "xtick", ticks - start, "xticklabel", {});
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
%!   plot (0:0.25:1, 1:5);
%!   __ambrix_timeTicks__ (gca (), datenum (2024, 5, 6), true);
%!   assert (get (gca (), "xtick")(2), 0.125, 1e-9);
%!   assert (get (gca (), "xticklabel"){2}, "03:00");
%!   assert (get (get (gca (), "xlabel"), "string"), "2024-05-06 to 2024-05-07");
%!   xlim ([0.5, 0.7]);
%!   __ambrix_timeTicks__ (gca (), datenum (2024, 5, 6), false);
%!   assert (get (gca (), "xtick")(2), 0.5 + 1 / 24, 1e-9);
%!   assert (get (gca (), "xticklabel"), cell (0, 0));
%! unwind_protect_cleanup
%!   close (f);
%!   graphics_toolkit (before);
%! end_unwind_protect
