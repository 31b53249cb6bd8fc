## -*- texinfo -*-
## @deftypefn {} {@var{h} =} __ambrix_drawPicture__ (@var{ax}, @var{picture})
## Draw lines or a picture in axes, with the y axis, names or colors and the title; the x axis is
## left to the caller.
## @end deftypefn

function h = __ambrix_drawPicture__ (ax, picture)
  if (isfield (picture, "y"))
    h = drawImage (ax, picture);
  else
    h = drawLines (ax, picture);
  endif
  if (! any (isfinite (picture.values(:))))
    text (0.5, 0.5, "no valid values", "parent", ax, "units", "normalized", ...
          "horizontalalignment", "center", "color", [0.5, 0.5, 0.5]);
  endif
  if (! isempty (picture.title))
    [lines, interpreter] = __ambrix_labelText__ (picture.title, "", 42);
    title (ax, lines{1}, "interpreter", interpreter);
  endif
endfunction

function h = drawLines (ax, picture)
  values = picture.values;
  label = picture.label;
  isLog = picture.isLog && any (values(:) > 0);
  if (isLog)
    values(values <= 0) = NaN;
  else
    [values, label] = withoutBase (ax, values, label);
  endif
  lines = {};
  for k = 1:columns (values)
    [x, y] = __ambrix_thinLine__ (picture.x.values, values(:,k));
    lines = [lines, {x, y, ".-"}];
  endfor
  h = plot (ax, lines{:});
  if (rows (values) < 200)
    set (h, "markersize", 8);  # a point alone is hardly seen else
  endif
  set (ax, "gridcolor", [0.8, 0.8, 0.8], "gridalpha", 1, "xgrid", "on", "ygrid", "on");
  if (isLog)
    set (ax, "yscale", "log");
  endif
  labelY (ax, ax, label, picture.units, leftOf (ax));
  nameLines (ax, h, picture.names);
endfunction

## Values that differ by little from each other, such as seconds since 1970 of one day, less a round
## number: graphics cards count in single precision. What is added to a plot is less the same.
function [values, label] = withoutBase (ax, values, label)
  base = baseOf (values);
  if (ishold (ax) && isappdata (ax, "ambrix_base"))
    base = getappdata (ax, "ambrix_base");
  endif
  setappdata (ax, "ambrix_base", base);
  values -= base;
  if (base != 0)
    label = sprintf ("%s - %.15g", label, base);
  endif
endfunction

function base = baseOf (values)
  base = 0;
  span = max (values(:)) - min (values(:));
  if (span > 0 && max (abs (values(:))) > 1e4 * span)
    step = 10 ^ ceil (log10 (span));
    base = floor (min (values(:)) / step) * step;
  endif
endfunction

## At the right, in the lines' colors: as a legend, but small and the same in all toolkits.
function nameLines (ax, lines, names)
  height = 420 * get (ax, "position")(4) / max (5, numel (names));  # of a line, in pixels
  for k = 1:numel (names)
    set (lines(k), "displayname", names{k}, "color", colorOf (k));
    [string, interpreter] = __ambrix_labelText__ (names{k}, "", 14);
    text (1.02, 1 - (k - 0.5) / max (5, numel (names)), string{1}, "parent", ax, ...
          "units", "normalized", "interpreter", interpreter, "color", colorOf (k), ...
          "fontsize", max (5, min (10, floor (height / 1.5))));
  endfor
endfunction

## Octave's colors for lines, which are seven, and three more.
function color = colorOf (k)
  colors = [lines(7); 0.9, 0.3, 0.7; 0.5, 0.5, 0.5; 0, 0, 0];
  color = colors(k,:);
endfunction

## Left of the axes, or right of the scale of colors in them, which belongs to `labelled`. Labels of
## two lines don't work everywhere: the second is a text of its own, `outside` of the axes.
function labelY (labelled, ax, label, units, outside)
  box = get (ax, "position");
  width = max (12, round (60 * box(4)));
  [lines, interpreter] = __ambrix_labelText__ (label, units, width);
  ylabel (labelled, lines{1}, "interpreter", interpreter, "fontsize", sizeOf (lines{1}, width));
  if (numel (lines) > 1)
    text ((outside - box(1)) / box(3), 0.5, lines{2}, "parent", ax, "units", "normalized", ...
          "rotation", 90, "horizontalalignment", "center", "interpreter", interpreter, ...
          "fontsize", sizeOf (lines{2}, width));
  endif
endfunction

## Smaller for long lines.
function points = sizeOf (line, width)
  shown = numel (regexprep (line, '[\\^_{}]', ""));
  points = max (6, floor (11 * min (1, width / shown)));
endfunction

## The values belong to the middles of the cells; the last row and column of `pcolor` don't show.
function h = drawImage (ax, picture)
  label = picture.label;
  values = picture.values;
  [x, values] = __ambrix_thinImage__ (picture.x.values, values);
  [y, values] = __ambrix_thinImage__ (picture.y.values, values.');
  if (picture.isLog && any (values(:) > 0))
    values(values <= 0) = NaN;
    values = log10 (values);
    label = ["log10 " label];
  endif
  x = __ambrix_edges__ (x, picture.x.isLog);
  y = __ambrix_edges__ (y, picture.y.isLog);
  [values, colors, limits] = withColors (values);
  h = pcolor (ax, x, y, values([1:end, end],[1:end, end]));
  set (h, "edgecolor", "none");
  ylim (ax, [min(y), max(y)]);
  labelY (ax, ax, picture.y.label, picture.y.units, leftOf (ax));
  if (picture.y.isLog)
    set (ax, "yscale", "log");
  endif
  colormap (ax, colors);
  caxis (ax, limits);
  labelY (colorScale (ax), ax, label, picture.units, rightOf (ax));
endfunction

function x = leftOf (ax)
  x = max (0.025, get (ax, "position")(1) - 0.14);
endfunction

function x = rightOf (ax)
  x = sum (get (ax, "position")([1, 3])) + 0.17;
endfunction

## Beside the axes, which stay as wide as they are.
function scale = colorScale (ax)
  box = get (ax, "position");
  scale = colorbar (ax);
  set (ax, "position", box);
  set (scale, "position", [box(1) + box(3) + 0.02, box(2), 0.025, box(4)]);
endfunction

## Invalid values become the lowest color, which is white: not all toolkits leave them out.
function [values, colors, limits] = withColors (values)
  invalid = ! isfinite (values);
  limits = [min(values(! invalid)), max(values(! invalid))];
  if (numel (limits) < 2 || limits(1) == limits(2))
    limits = [[limits, 0](1), [limits, 0](1) + 1];
  endif
  colors = viridis (64);
  if (any (invalid(:)))
    limits(1) -= diff (limits) / 63;
    colors(1,:) = [1, 1, 1];
    values(invalid) = limits(1);
  endif
endfunction

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))
%! before = graphics_toolkit ();
%! graphics_toolkit ("gnuplot");
%! f = figure ("visible", "off");
%! x = struct ("values", (1:3).', "isLog", false);
%! picture = struct ("x", x, "values", [1, 2; -1, 0; 3, 4], "isLog", true, "label", "B", ...
%!                   "units", "nT", "names", {{"Bx", "B_y"}}, "title", "a_b");
%! unwind_protect
%!   lastwarn ("");
%!   h = __ambrix_drawPicture__ (gca (), picture);  # what is not positive is left out quietly
%!   assert (lastwarn (), "");
%!   assert (get (h(2), "ydata"), [2, NaN, 4]);
%!   assert (get (gca (), "yscale"), "log");
%!   names = findobj (gca (), "type", "text");
%!   assert (sort (get (names, "string")), {"B_y"; "Bx"});
%!   for name = names.'  # outside, in the color of the line
%!     assert (get (name, "position")(1) > 1);
%!     line = h(strcmp (get (h, "displayname"), get (name, "string")));
%!     assert (get (name, "color"), get (line, "color"));
%!   endfor
%!   clf (f);  # nothing is positive
%!   picture.values = zeros (3, 1);
%!   picture.names = {};
%!   __ambrix_drawPicture__ (gca (), picture);
%!   assert (get (gca (), "yscale"), "linear");
%!   picture.values = 1294333200 + [5; 60; 20];  # far from zero, and little else
%!   picture.isLog = false;
%!   h = __ambrix_drawPicture__ (gca (), picture);
%!   assert (get (h, "ydata"), [5, 60, 20]);
%!   assert (get (get (gca (), "ylabel"), "string"), "B - 1294333200 [nT]");
%!   hold on
%!   picture.values += 1000;
%!   assert (get (__ambrix_drawPicture__ (gca (), picture), "ydata"), [1005, 1060, 1020]);
%!   hold off
%!   picture.values(:) = NaN;
%!   __ambrix_drawPicture__ (gca (), picture);
%!   assert (get (findobj (gca (), "type", "text"), "string"), "no valid values");
%! unwind_protect_cleanup
%!   close (f);
%!   graphics_toolkit (before);
%! end_unwind_protect
%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))
%! before = graphics_toolkit ();
%! graphics_toolkit ("gnuplot");
%! f = figure ("visible", "off");
%! axis = struct ("values", (1:3).', "isLog", false, "label", "y", "units", "");
%! picture = struct ("x", axis, "y", axis, "values", magic (3), "isLog", true, "title", "", ...
%!                   "label", "Number density of all ions but protons", "units", "/cm**3");
%! unwind_protect
%!   ax = axes ("position", [0.1, 0.1, 0.6, 0.3]);
%!   __ambrix_drawPicture__ (ax, picture);
%!   assert (get (ax, "position"), [0.1, 0.1, 0.6, 0.3], 1e-9);
%!   second = findobj (f, "type", "text", "string", "[/cm**3]");
%!   assert (get (second, "position")(1) > 1);
%!   scale = findobj (f, "tag", "colorbar");
%!   assert (get (get (scale, "ylabel"), "string"), "log10 Number density of...");
%!   assert (get (scale, "position")([2, 4]), [0.1, 0.3], 1e-9);
%! unwind_protect_cleanup
%!   close (f);
%!   graphics_toolkit (before);
%! end_unwind_protect
