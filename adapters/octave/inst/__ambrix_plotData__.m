## -*- texinfo -*-
## @deftypefn {} {@var{picture} =} __ambrix_plotData__ (@var{id}, @var{name}, @var{range})
## What @code{ambrix_plot} draws of a variable.
##
## @var{picture} has the @code{values}, without invalid ones, whether their axis @code{isLog}, its
## @code{label} and @code{units}, the @code{names} of components and a @code{title}; and @code{x},
## with @code{values}, a @code{label}, @code{units} and whether it @code{isTime} or @code{isLog}.
## Pictures of values over two axes have @code{y}, too.
## @end deftypefn

function picture = __ambrix_plotData__ (id, name, range)
  name = __ambrix_fieldName__ (name);
  s = __ambrix_describeFile__ (id);
  values = ambrix_read (id, name, "range", range);  # raises the error for a name that there is not
  v = s.variables.(name);
  if (! isnumeric (values) || numel (v.sizes) > 2)
    error ("ambrix:cannotPlot", ["ambrix_plot: \"%s\" is text or has more than two dimensions; " ...
           "read it, and plot what you need"], name);
  endif
  if (isempty (values))
    error ("ambrix:cannotPlot", "ambrix_plot: there are no records of \"%s\" to plot", name);
  endif
  picture = labelled (v, {"LABLAXIS"});
  picture.title = titleOf (v);
  picture.names = {};
  if (isTime (v))
    [picture.values, picture.units] = daysOf (id, v, range);
  else
    picture.values = __ambrix_validOf__ (values, v.attributes);
  endif
  picture.x = recordAxis (id, s, v, range, rows (picture.values));
  if (numel (v.sizes) == 2)
    picture = imageOf (id, s, v, picture);
  elseif (isSpectrogram (s, v))
    picture.y = dimensionAxis (id, s, v, 1);
  elseif (! v.recordVariance && ! isempty (v.sizes))
    picture.x = dimensionAxis (id, s, v, 1);
  else
    picture.names = componentNames (id, s, v);
  endif
endfunction

## Places along an axis. What files say of their valid range may be meant for others.
function values = withoutFill (values, attributes)
  limits = struct ();
  if (isfield (attributes, "FILLVAL"))
    limits.FILLVAL = attributes.FILLVAL;
  endif
  values = __ambrix_validOf__ (values, limits);
endfunction

## Days from the beginning of the first day: graphics cards have too few digits for epochs.
function [days, units] = daysOf (id, v, range)
  days = double (ambrix_read (id, v.name, "time", "fill", "range", range));
  first = [floor(min (days(:))), 0](1);
  if (isnan (first))
    first = 0;
  endif
  days -= first;
  units = ["days since " datestr(first, "yyyy-mm-dd")];
endfunction

## The first record, over its two dimensions.
function picture = imageOf (id, s, v, picture)
  if (v.recordVariance)
    picture.title = strtrim ([picture.title " " picture.x.first]);
    picture.values = reshape (picture.values(1,:), v.sizes);
  endif
  picture.x = dimensionAxis (id, s, v, 1);
  picture.y = dimensionAxis (id, s, v, 2);
endfunction

## The variable that an attribute names, empty when there is no such that can be read.
function other = named (s, v, attribute)
  other = [];
  if (isfield (v.attributes, attribute) && ischar (v.attributes.(attribute)))
    name = strtrim (v.attributes.(attribute));
    if (isfield (s.variables, name) && s.variables.(name).supported)
      other = s.variables.(name);
    endif
  endif
endfunction

function axis = recordAxis (id, s, v, range, count)
  axis = numbered (count, "record");
  other = named (s, v, "DEPEND_0");
  if (isempty (other))
    other = onlyEpochs (s, v.records);
  endif
  if (isempty (other) || ! v.recordVariance || ! isempty (other.sizes)
      || other.records != v.records || ! hasNumbers (other))
    return;
  endif
  values = double (ambrix_read (id, other.name, "time", "fill", "range", range));
  if (! any (isfinite (values)))
    return;
  endif
  axis = labelled (other, {"LABLAXIS", "FIELDNAM"});
  axis.values = values;
  axis.isTime = isTime (other);
  axis.isLog = ! axis.isTime && axis.isLog && all (values > 0);
  axis.first = "";
  if (axis.isTime && ! isnan (axis.values(1)))
    axis.first = datestr (axis.values(1), "yyyy-mm-dd HH:MM");
  endif
endfunction

function epochs = onlyEpochs (s, records)
  epochs = [];
  for v = struct2cell (s.variables)'
    if (isTime (v{1}) && v{1}.records == records)
      if (! isempty (epochs))
        epochs = [];
        return;
      endif
      epochs = v{1};
    endif
  endfor
endfunction

## Files of old days don't tell what belongs to a dimension, but may leave no doubt.
function numbers = onlyNumbers (s, size)
  numbers = [];
  for v = struct2cell (s.variables)'
    if (isequal (v{1}.sizes, size) && ! v{1}.recordVariance && hasNumbers (v{1}))
      if (! isempty (numbers))
        numbers = [];
        return;
      endif
      numbers = v{1};
    endif
  endfor
endfunction

## The numbers along a dimension; those of the first record where they change.
function axis = dimensionAxis (id, s, v, k)
  axis = numbered (v.sizes(k), sprintf ("index %d", k));
  other = named (s, v, sprintf ("DEPEND_%d", k));
  if (isempty (other))
    other = onlyNumbers (s, v.sizes(k));
  endif
  if (! isempty (other) && isequal (other.sizes, v.sizes(k)) && hasNumbers (other))
    values = ambrix_read (id, other.name, "range", [1, 1]);
    values = withoutFill (values(:), other.attributes);
    if (any (isfinite (values)))
      axis = setfield (labelled (other, {"LABLAXIS", "FIELDNAM"}), "values", values);
      axis.isLog = axis.isLog && all (values > 0 | isnan (values));
      axis.isTime = false;
    endif
  endif
endfunction

function axis = numbered (count, label)
  axis = struct ("values", (1:count).', "label", label, "units", "", "isTime", false, ...
                 "isLog", false, "first", "");
endfunction

function time = isTime (v)
  time = __ambrix_isTime__ (v.datatype);
endfunction

function numbers = hasNumbers (v)
  numbers = ! any (strcmp (v.datatype, {"CDF_CHAR", "CDF_UCHAR"})) && v.records > 0;
endfunction

function spectrogram = isSpectrogram (s, v)
  other = named (s, v, "DEPEND_1");
  type = __ambrix_textOf__ (v.attributes, {"DISPLAY_TYPE"}, "");
  spectrogram = v.recordVariance && numel (v.sizes) == 1 && ! isempty (other) ...
    && hasNumbers (other) && (strncmpi (type, "spect", 5) ...
                              || (v.sizes > 4 && ! strncmpi (type, "time_series", 11)));
endfunction

## None where there is one line, or so many that their names would hide more than they tell.
function names = componentNames (id, s, v)
  names = {};
  if (! any (prod (v.sizes) == 2:10))
    return;
  endif
  names = arrayfun (@(k) sprintf ("%s %d", __ambrix_fieldName__ (v.name), k), ...
                    1:prod (v.sizes), "UniformOutput", false);
  for attribute = {"LABL_PTR_1", "DEPEND_1"}
    other = named (s, v, attribute{1});
    if (! isempty (other) && isequal (other.sizes, v.sizes) && ! hasNumbers (other))
      names = cellstr (ambrix_read (id, other.name, "range", [1, 1]))(:).';
      return;
    endif
  endfor
endfunction

function log = isLogarithmic (attributes)
  log = strncmpi (__ambrix_textOf__ (attributes, {"SCALETYP"}, ""), "log", 3);
endfunction

## What there is to say about an axis for a variable's values.
function axis = labelled (v, names)
  axis.label = __ambrix_textOf__ (v.attributes, names, __ambrix_fieldName__ (v.name));
  axis.units = __ambrix_textOf__ (v.attributes, {"UNITS"}, "");
  axis.isLog = isLogarithmic (v.attributes);
endfunction

## Where a description begins with an arrow, this marks variables that have been derived.
function title = titleOf (v)
  title = __ambrix_textOf__ (v.attributes, {"CATDESC", "FIELDNAM"}, __ambrix_fieldName__ (v.name));
  title = regexprep (title, '^-+>\s*', "");
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! picture = __ambrix_plotData__ (id, "Flux", []);
%! assert (picture.values, [1, 3, 5; 2, 4, 6]);
%! assert (picture.label, "Flux");
%! assert (picture.units, "");
%! assert (picture.title, "Flux 2024-01-01 00:00");
%! assert (picture.x.label, "index 1");
%! assert (picture.y.values, [1; 2; 3]);
%! ambrix_close (id);
%!test  # of an axis only fill values are left out
%! s.data = struct ("image", magic (3), "place", [1; 99; -1]);
%! s.variables.image.recordVariance = false;
%! s.variables.place.recordVariance = false;
%! s.variables.place.attributes = struct ("FILLVAL", -1, "VALIDMAX", 3);
%! s.variables.image.attributes = struct ("DEPEND_1", "place", "VALIDMAX", 8);
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! ambrix_write ("places", s);
%! id = ambrix_open ("places");
%! picture = __ambrix_plotData__ (id, "image", []);
%! assert (picture.x.values, [1; 99; NaN]);
%! assert (isnan (picture.values), magic (3) > 8);
%! ambrix_close (id);
%!test  # what some files hold: one number, texts or fill values for times
%! s.data = struct ("one", 5, "a", [1; 2], "b", [3; 4], "c", {{"x"; "y"}});
%! s.data.missing = [-1e31; 63e12];
%! s.variables.one.recordVariance = false;
%! s.variables.missing.datatype = "CDF_EPOCH";
%! s.variables.c.datatype = "CDF_UCHAR";
%! s.variables.a.attributes.DEPEND_0 = "c";
%! s.variables.b.attributes.DEPEND_0 = "missing";
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! ambrix_write ("odd", s);
%! id = ambrix_open ("odd");
%! picture = __ambrix_plotData__ (id, "one", []);
%! assert (picture.values, 5);
%! picture = __ambrix_plotData__ (id, "a", []);
%! assert (picture.x.values, [1; 2]);
%! picture = __ambrix_plotData__ (id, "b", []);
%! assert (isnan (picture.x.values), [true; false]);
%! ambrix_close (id);
