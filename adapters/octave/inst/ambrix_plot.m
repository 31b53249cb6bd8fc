## -*- texinfo -*-
## @deftypefn  {} {} ambrix_plot (@var{file}, @var{name})
## @deftypefnx {} {} ambrix_plot (@var{file}, @var{names})
## @deftypefnx {} {} ambrix_plot (@dots{}, "range", [@var{first}, @var{last}])
## @deftypefnx {} {@var{h} =} ambrix_plot (@dots{})
## Plot variables of a CDF file, with axes by their attributes.
##
## @var{file} is the path of a file, with or without @code{.cdf}, or the identifier of an open one.
## One variable is plotted in the current axes. Several @var{names} in a cell array make panels one
## below the other, which replace the contents of the figure. Panels over time share one time axis.
## With @qcode{"range"} only these records are plotted, counted from 1. @var{h} are the handles of
## the plotted objects.
##
## A scalar variable, or a variable with components, is drawn as lines over the variable that its
## attribute DEPEND_0 names. Without it, the lines are over the epochs of the file if exactly one
## epoch variable has as many records, else over record numbers. The names of up to ten components
## are at the right. They come from the variable that LABL_PTR_1 or DEPEND_1 names.
##
## A variable with one dimension is drawn as a picture of its values over time and the numbers of
## DEPEND_1, if there are more than four of them or DISPLAY_TYPE is spectrogram. A variable with two
## dimensions is drawn as a picture of its first record.
##
## Values that equal FILLVAL, or are not from VALIDMIN to VALIDMAX, are left out. If SCALETYP says
## so, axes are logarithmic, without values that are not positive. Labels consist of LABLAXIS or the
## name of the variable, and UNITS; the codes @code{!E}, @code{!U}, @code{!D} and @code{!N} raise
## and lower characters. Titles are CATDESC or FIELDNAM. Lines with more than 4000 records are
## reduced to the extremes that axes can show, pictures with more than 2000 records to means of
## neighbours. Texts, variables with more dimensions and variables without records are the error
## @code{ambrix:cannotPlot}.
##
## The x axis of plots over time counts days from the beginning of the first day, or of the first
## minute if all times are within one, because serial day numbers have too many digits for graphics
## cards. @code{getappdata (gca (), "ambrix_start")} is the day number of its zero. Subtract it from
## times that you add and from limits that you set. The labels of the axis are adjusted to the
## limits. For the same reason, values far from zero that differ little are drawn with an offset,
## which is in the label.
##
## @example
## @group
## ambrix_plot ("geocpi0", @{"HP_P_Den", "HP_V"@})
## start = getappdata (gca (), "ambrix_start");
## xlim (datenum (1994, 7, 26, 0, [10, 20], 0) - start)
## print ("-dpng", "plasma.png")
## @end group
## @end example
## @seealso{ambrix_read, ambrix_info, plot, pcolor, xlim, datenum, print}
## @end deftypefn

function h = ambrix_plot (file, names, varargin)
  if (nargin < 2)
    print_usage ();
  endif
  options = __ambrix_parseOptions__ ("ambrix_plot", struct ("range", []), varargin);
  if (ischar (names) && rows (names) == 1)
    names = {names};
  endif
  if (! iscellstr (names) || isempty (names))
    error ("ambrix:invalidName",
           "ambrix_plot: give the name of a variable, or a cell array of names");
  endif
  [id, closer] = __ambrix_openToRead__ (file);
  pictures = cellfun (@(name) __ambrix_plotData__ (id, name, options.range), names(:).',
                      "UniformOutput", false);
  handles = drawn (pictures);
  if (nargout > 0)
    h = handles;
  endif
endfunction

function handles = drawn (pictures)
  start = [];
  if (numel (pictures) > 1)
    clf ();
    pictures = cellfun (@(picture) setfield (picture, "title", ""), pictures, ...
                        "UniformOutput", false);
  elseif (ishold ())
    start = getappdata (gca (), "ambrix_start");
  endif
  pictures = __ambrix_shareTimes__ (pictures, start);
  panels = __ambrix_placeAxes__ (pictures);
  handles = [];
  for k = 1:numel (pictures)
    handles = [handles; __ambrix_drawPicture__(panels(k), pictures{k})];
    drawXAxis (panels(k), pictures{k}.x, pictures{k}.shows);
  endfor
  times = cellfun (@(picture) picture.x.isTime, pictures);
  if (sum (times) > 1)
    linkaxes (panels(times), "x");
  endif
endfunction

## The scale, limits, ticks and labels below, where the axis `shows` them.
function drawXAxis (ax, x, shows)
  held = isappdata (ax, "ambrix_start") && ishold (ax);
  limits = x.limits;
  if (held)
    limits = [min(xlim (ax)(1), limits(1)), max(xlim (ax)(2), limits(2))];
  endif
  xlim (ax, limits);
  setappdata (ax, "ambrix_start", x.start);
  if (x.isLog)
    set (ax, "xscale", "log");
  endif
  if (x.isTime)
    __ambrix_timeTicks__ (ax, x.start, shows);
    addlistener (ax, "xlim", @(varargin) __ambrix_timeTicks__ (ax, x.start, shows));
  elseif (shows)
    [lines, interpreter] = __ambrix_labelText__ (x.label, x.units, 60);
    xlabel (ax, strjoin (lines, " "), "interpreter", interpreter);
  else
    set (ax, "xticklabel", {});
  endif
endfunction

%!function [id, restore, f] = drawing ()
%!  graphics_toolkit ("gnuplot");
%!  f = figure ("visible", "off");
%!  [id, restore] = __ambrix_example__ ();
%!  for field = {"DEPEND_0", "DEPEND_1", "UNITS", "SCALETYP", "LABLAXIS"}
%!    ambrix_createAttr (id, field{1}, "VARIABLE_SCOPE");
%!  endfor
%!endfunction

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))  # lines over time
%! [id, restore, f] = drawing ();
%! unwind_protect
%!   number = ambrix_createVar (id, "speed", "CDF_INT2", 1, 2, true, true);
%!   ambrix_hyperPutVarData (id, number, 0, 2, 1, 0, 2, 1, int16 ([300, 400; 310, 390]));
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "UNITS"), number, "CDF_CHAR", "km/s");
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "SCALETYP"), number, "CDF_CHAR", "log");
%!   h = ambrix_plot (id, "speed");
%!   assert (numel (h), 2);
%!   start = getappdata (gca (), "ambrix_start");
%!   assert (start, datenum (2024, 1, 1));
%!   assert (get (h(1), "xdata")(:) + start, ambrix_read (id, "Time", "time"));
%!   assert (get (h(2), "ydata")(:), [310; 390]);
%!   assert (get (get (gca (), "ylabel"), "string"), "speed [km/s]");
%!   assert (get (get (gca (), "xlabel"), "string"), "2024-01-01");
%!   assert (get (gca (), "yscale"), "log");
%! unwind_protect_cleanup
%!   ambrix_close (id);
%!   close (f);
%! end_unwind_protect

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))  # a spectrogram
%! [id, restore, f] = drawing ();
%! unwind_protect
%!   energy = ambrix_createVar (id, "energy", "CDF_REAL4", 1, 5, false, true);
%!   ambrix_putVarRecordData (id, energy, 0, single (10 .^ (0:4)));
%!   flux = ambrix_createVar (id, "spectrum", "CDF_REAL4", 1, 5, true, true);
%!   ambrix_hyperPutVarData (id, flux, 0, 2, 1, 0, 5, 1, single ([1:4, -1, 6:10]));
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "DEPEND_1"), flux, "CDF_CHAR", "energy");
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "DEPEND_0"), flux, "CDF_CHAR", "Time");
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "SCALETYP"), flux, "CDF_CHAR", "log");
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "SCALETYP"), energy, "CDF_CHAR", "log");
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "LABLAXIS"), energy, "CDF_CHAR", "E");
%!   h = ambrix_plot (id, "spectrum");
%!   colors = get (h, "cdata")(1:5,1:2);
%!   expected = log10 ([1:4, 0; 6:10].');
%!   expected(5,1) = -1 / 63;  # invalid: below all others
%!   assert (colors, expected, 1e-6);
%!   assert (get (get (gca (), "ylabel"), "string"), "E");
%!   assert (get (gca (), "yscale"), "log");
%! unwind_protect_cleanup
%!   ambrix_close (id);
%!   close (f);
%! end_unwind_protect

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))  # pictures and panels
%! [id, restore, f] = drawing ();
%! unwind_protect
%!   h = ambrix_plot (id, "Flux");
%!   assert (get (h, "cdata")(1:3,1:2), [1, 2; 3, 4; 5, 6]);
%!   clf (f);
%!   number = ambrix_createVar (id, "count", "CDF_INT4", 1, [], true, []);
%!   ambrix_hyperPutVarData (id, number, 0, 3, 1, [], [], [], int32 ([5; 6; 7]));
%!   ambrix_plot (id, {"count", "count"}, "range", [2, 3]);
%!   axes = findobj (f, "type", "axes");
%!   assert (numel (axes), 2);
%!   assert (get (get (axes(1), "children"), "ydata"), [6, 7]);
%!   assert (get (get (axes(1), "xlabel"), "string"), "record");
%! unwind_protect_cleanup
%!   ambrix_close (id);
%!   close (f);
%! end_unwind_protect

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))  # panels share the times
%! [id, restore, f] = drawing ();
%! unwind_protect
%!   energy = ambrix_createVar (id, "energy", "CDF_INT2", 1, 5, false, true);
%!   ambrix_putVarRecordData (id, energy, 0, int16 (1:5));
%!   flux = ambrix_createVar (id, "spectrum", "CDF_REAL4", 1, 5, true, true);
%!   ambrix_hyperPutVarData (id, flux, 0, 2, 1, 0, 5, 1, single (1:10));
%!   ambrix_putAttrEntry (id, ambrix_getAttrNum (id, "DEPEND_1"), flux, "CDF_CHAR", "energy");
%!   count = ambrix_createVar (id, "count", "CDF_INT4", 1, [], true, []);
%!   ambrix_hyperPutVarData (id, count, 0, 2, 1, [], [], [], int32 ([5; 6]));
%!   plot (1:3);  # goes
%!   h = ambrix_plot (id, {"count", "spectrum", "Time"});
%!   panels = cell2mat (get (h, "parent"));
%!   assert (numel (findobj (f, "type", "axes")), 4);  # with the scale of colors
%!   boxes = cell2mat (get (panels, "position"));
%!   assert (boxes(:,[1, 3]), repmat (boxes(1,[1, 3]), 3, 1), 1e-9);
%!   times = ambrix_read (id, "Time", "time");
%!   for panel = panels.'  # no cell begins on the day before
%!     assert (xlim (panel), times([1, 2]).' - datenum (2024, 1, 1), 1e-9);
%!     assert (get (panel, "xtick"), get (panels(3), "xtick"));
%!   endfor
%!   assert (get (panels(1), "xticklabel"), cell (0, 0));
%!   assert (get (get (panels(3), "xlabel"), "string"), "2024-01-01");
%!   xlim (panels(3), [0, 0.125]);  # ticks follow, in all panels
%!   assert (get (panels(3), "xticklabel"){2}, "00:30");
%!   assert (get (panels(1), "xtick")(2), 1 / 48, 1e-9);
%! unwind_protect_cleanup
%!   ambrix_close (id);
%!   close (f);
%! end_unwind_protect

%!testif ; any (strcmp (available_graphics_toolkits (), "gnuplot"))  # what is added to a plot
%! [id, restore, f] = drawing ();
%! unwind_protect
%!   later = ambrix_createVar (id, "later", "CDF_EPOCH", 1, [], true, []);
%!   times = ambrix_computeEpoch ([2024; 1; 2; 6; 0; 0; 0]) + [0; 3600e3; 7200e3];
%!   ambrix_hyperPutVarData (id, later, 0, 3, 1, [], [], [], times);
%!   ambrix_plot (id, "Time");
%!   limits = xlim ();
%!   hold on
%!   h = ambrix_plot (id, "later");
%!   assert (get (h, "xdata"), 1 + [6, 7, 8] / 24, 1e-9);
%!   assert (xlim (), [limits(1), 1 + 8 / 24], 1e-9);
%!   assert (get (h, "ydata"), [6, 7, 8] / 24, 1e-9);
%!   assert (get (get (gca (), "ylabel"), "string"), "later [days since 2024-01-02]");
%! unwind_protect_cleanup
%!   ambrix_close (id);
%!   close (f);
%! end_unwind_protect

%!test
%! [id, restore] = __ambrix_example__ ();
%! err = __ambrix_raised__ (@() ambrix_plot (id, "Mode"));
%! assert (err.identifier, "ambrix:cannotPlot");
%! err = __ambrix_raised__ (@() ambrix_plot (id, "None"));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:libraryFailure");
%! err = __ambrix_raised__ (@() ambrix_plot (id, ["Flux"; "Mode"]));
%! assert (err.identifier, "ambrix:invalidName");
%! err = __ambrix_raised__ (@() ambrix_plot (id, "Flux", "range", [2, 1]));
%! assert (err.identifier, "ambrix:cannotPlot");
%! err = __ambrix_raised__ (@() ambrix_plot (id, 1));
%! assert (err.identifier, "ambrix:invalidName");
%! ambrix_close (id);
%!error <Invalid call> ambrix_plot ("x")
