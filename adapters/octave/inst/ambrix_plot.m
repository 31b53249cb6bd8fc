## -*- texinfo -*-
## @deftypefn  {} {} ambrix_plot (@var{file}, @var{name})
## @deftypefnx {} {} ambrix_plot (@var{file}, @var{names})
## @deftypefnx {} {} ambrix_plot (@dots{}, "range", [@var{first}, @var{last}])
## @deftypefnx {} {@var{h} =} ambrix_plot (@dots{})
## Plot variables of a CDF file, with axes as their attributes tell.
##
## @var{file} is the path of a file, with or without @code{.cdf}, or the identifier of an open one;
## several @var{names} in a cell array make panels one below the other. With @qcode{"range"} only
## these records are plotted, counted from 1. @var{h} are the handles of what was plotted.
##
## A scalar variable, or one of some components, becomes lines over the variable that its attribute
## DEPEND_0 names, else over the only epochs that there are as many of as records, else over record
## numbers. The components have the labels in the variable that LABL_PTR_1 or DEPEND_1 names.
##
## A variable with one dimension whose DEPEND_1 has numbers, and more than four or with a
## DISPLAY_TYPE of spectrogram, becomes a picture of its values over time and these numbers. A
## variable with two dimensions becomes a picture of its first record.
##
## Values that equal FILLVAL, or are not from VALIDMIN to VALIDMAX, are left out. Axes are
## logarithmic where SCALETYP says so; labels are made of LABLAXIS or the variable's name and of
## UNITS, titles of CATDESC or FIELDNAM. Texts, variables with more dimensions and those without
## records are the error @code{ambrix:cannotPlot}.
##
## @example
## @group
## ambrix_plot ("geocpi0", @{"HP_P_Den", "HP_V"@})
## print ("-dpng", "plasma.png")
## @end group
## @end example
## @seealso{ambrix_read, ambrix_info, plot, pcolor, print}
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
  handles = [];
  for k = 1:numel (names)
    picture = __ambrix_plotData__ (id, names{k}, options.range);
    if (numel (names) > 1)
      picture = panel (picture, k, numel (names));
    endif
    handles = [handles; drawn(picture)];
  endfor
  if (nargout > 0)
    h = handles;
  endif
endfunction

## Axes for one of several panels, which share what is below the last one.
function picture = panel (picture, k, count)
  height = 0.86 / count;
  axes ("position", [0.14, 0.12 + (count - k) * height, 0.78, 0.88 * height]);
  picture.title = "";
  if (k < count)
    picture.x.label = "";
  endif
endfunction

function h = drawn (picture)
  if (isfield (picture, "y"))
    h = drawnImage (picture);
  else
    h = drawnLines (picture);
    fit (@xlim, picture.x.values);
  endif
  ax = gca ();
  xlabel (ax, picture.x.label, "interpreter", "none");
  if (picture.x.isTime)
    __ambrix_timeTicks__ (ax, ! isempty (picture.x.label));
  elseif (isempty (picture.x.label))
    set (ax, "xticklabel", {});
  endif
  title (ax, picture.title, "interpreter", "none");
endfunction

function fit (limits, values)
  range = [min(values(:)), max(values(:))];
  if (numel (range) == 2 && range(1) < range(2))
    limits (range);
  endif
endfunction

function h = drawnLines (picture)
  h = plot (picture.x.values, picture.values, ".-");
  ylabel (picture.label, "interpreter", "none");
  set (gca (), "gridcolor", [0.8, 0.8, 0.8]);
  grid on
  if (picture.isLog)
    set (gca (), "yscale", "log");
  endif
  if (columns (picture.values) > 1)
    if (! picture.isLog)
      ylim (ylim () * [1, -0.25; 0, 1.25]);  # room for the names
    endif
    legend (picture.names, "interpreter", "none", "location", "northeast", ...
            "orientation", "horizontal");
    legend boxoff
  endif
endfunction

## The values belong to the middles of the cells; the last row and column of `pcolor` don't show.
function h = drawnImage (picture)
  values = picture.values.';
  label = picture.label;
  if (picture.isLog)
    values(values <= 0) = NaN;
    values = log10 (values);
    label = ["log10 " label];
  endif
  x = __ambrix_edges__ (picture.x.values, false);
  y = __ambrix_edges__ (picture.y.values, picture.y.isLog);
  h = pcolor (x, y, withColors (values)([1:end, end],[1:end, end]));
  shading flat
  fit (@xlim, x);
  fit (@ylim, y);
  ylabel (picture.y.label, "interpreter", "none");
  if (picture.y.isLog)
    set (gca (), "yscale", "log");
  endif
  ylabel (colorbar (), label, "interpreter", "none");
endfunction

## Invalid values become the lowest color, which is white: not all toolkits leave them out.
function values = withColors (values)
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
  colormap (gca (), colors);
  caxis (limits);
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
%!   assert (get (h(1), "xdata")(:), ambrix_read (id, "Time", "time"));
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
