## -*- texinfo -*-
## @deftypefn {} {@var{panels} =} __ambrix_placeAxes__ (@var{pictures})
## Make room for what @code{ambrix_plot} draws: the current axes for one picture, new ones for
## several, of equal width, so that times are below each other also beside a scale of colors.
##
## What is at the right of axes, a scale or names, gets its room from their width. Plotting again in
## the same axes gives it back.
## @end deftypefn

function panels = __ambrix_placeAxes__ (pictures)
  margin = max (cellfun (@marginOf, pictures));
  if (numel (pictures) == 1)
    panels = gca ();
    colorbar (panels, "off");
    place (panels, boxOf (panels), margin);
    return;
  endif
  rows = cellfun (@(picture) picture.shows, pictures);
  rows(end) = false;  # its labels are below all
  between = 0.085;
  height = (0.84 - between * sum (rows)) / numel (pictures);
  bottom = 0.96;
  for k = 1:numel (pictures)
    bottom -= height;
    panels(k) = axes ("position", [0.16, bottom + 0.06 * height, 0.8 - margin, 0.88 * height]);
    bottom -= between * rows(k);
  endfor
endfunction

## The part of the figure's width that is needed at the right.
function margin = marginOf (picture)
  margin = 0;
  if (isfield (picture, "y"))
    margin = 0.15;
  elseif (! isempty (picture.names))
    margin = min (0.28, 0.03 + 0.014 * max (cellfun (@numel, picture.names)));
  endif
endfunction

## Where axes were before a margin was left.
function box = boxOf (ax)
  box = get (ax, "position");
  placed = getappdata (ax, "ambrix_placed");
  if (! isempty (placed) && isequal (placed.now, box))
    box = placed.before;
  endif
endfunction

function place (ax, box, margin)
  now = box - [0, 0, min(margin, box(3) / 2), 0];
  set (ax, "position", now);
  setappdata (ax, "ambrix_placed", struct ("before", box, "now", now));
endfunction

%!function picture = named (names)
%!  picture = struct ("names", {names}, "shows", false);
%!endfunction

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))
%! before = graphics_toolkit ();
%! graphics_toolkit ("gnuplot");
%! f = figure ("visible", "off");
%! unwind_protect
%!   ax = gca ();
%!   whole = get (ax, "position");
%!   for k = 1:2  # no less room when it is used again
%!     __ambrix_placeAxes__ ({named({"Bx", "By"})});
%!     assert (get (ax, "position"), whole - [0, 0, 0.058, 0], 1e-9);
%!   endfor
%!   __ambrix_placeAxes__ ({named({})});
%!   assert (get (ax, "position"), whole);
%!   clf (f);
%!   panels = __ambrix_placeAxes__ ({named({"Bx"}), setfield(named ({}), "y", 1)});
%!   assert (get (panels(1), "position")([1, 3, 4]), get (panels(2), "position")([1, 3, 4]), 1e-9);
%!   assert (get (panels(1), "position")(2) > sum (get (panels(2), "position")([2, 4])));
%! unwind_protect_cleanup
%!   close (f);
%!   graphics_toolkit (before);
%! end_unwind_protect
