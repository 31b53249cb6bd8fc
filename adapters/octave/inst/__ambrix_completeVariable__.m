## -*- texinfo -*-
## @deftypefn {} {[@var{v}, @var{data}] =} __ambrix_completeVariable__ (@var{name}, @var{v}, @var{s}, @var{rowMajor})
## Complete what describes a variable from its data, and bring these into the order of the commands.
## @end deftypefn

function [v, data] = __ambrix_completeVariable__ (name, v, s, rowMajor)
  if (! isfield (v, "name") || ! strcmp (__ambrix_fieldName__ (v.name), name))
    v.name = name;
  endif
  data = [];
  if (isfield (s.data, name))
    data = s.data.(name);
  elseif (! isfield (v, "datatype"))
    error ("ambrix:invalidData",
           "ambrix_write: variable \"%s\" has neither data nor a datatype", name);
  elseif (isfield (v, "records") && v.records > 0)
    error ("ambrix:invalidData", ["ambrix_write: variable \"%s\" is described with %d records, " ...
           "and there are no data of it; remove s.variables.%s, too, or set its records to 0"], ...
           name, v.records, name);
  endif
  if (! isfield (v, "datatype"))
    v.datatype = __ambrix_datatypeOf__ (data, sprintf ("variable \"%s\"", name));
  endif
  v.datatype = upper (v.datatype);
  classes = __ambrix_datatypes__ ();
  if (! isfield (classes, v.datatype))
    error ("ambrix:unsupportedDatatype",
           "ambrix_write: variable \"%s\" has datatype \"%s\"; it must be one of: %s",
           name, v.datatype, strjoin (fieldnames (classes)', ", "));
  endif
  if (! isfield (v, "recordVariance"))
    v.recordVariance = true;
  endif
  [v, data] = storable (v, data, s.options);
  [v, data] = shaped (v, data, s.options.records, rowMajor);
  if (! isfield (v, "variances"))
    v.variances = true (1, numel (v.sizes));
  endif
endfunction

## Values as the file holds them: no logicals, day numbers, NaN for fill values or cells of texts.
function [v, data] = storable (v, data, options)
  if (islogical (data))
    data = uint8 (data);
  endif
  if (issparse (data))
    data = full (data);
  endif
  if (iscomplex (data))
    error ("ambrix:unsupportedClass",
           "ambrix_write: variable \"%s\" is complex, and no datatype is", v.name);
  endif
  if (isfloat (data) && __ambrix_isTime__ (v.datatype))
    data = __ambrix_toEpochs__ (data, v.datatype, options, sprintf ("variable \"%s\"", v.name));
  endif
  if (options.fill && isfloat (data) && isfield (v.attributes, "FILLVAL"))
    data = withFill (data, v, options.records);
  endif
  if (iscellstr (data))
    [data, v] = __ambrix_fromCells__ (data, v, options.records);
  endif
endfunction

## A fill value that is no number, or none for each value, was not looked for in reading either.
function data = withFill (data, v, records)
  fill = v.attributes.FILLVAL;
  missing = isnan (data);
  if (isnumeric (fill) && isscalar (fill))
    data(missing) = double (fill);  # an integer would make integers of the data
  elseif (isnumeric (fill) && numel (fill) == 2 && strcmp (v.datatype, "CDF_EPOCH16"))
    times = numel (data) / 2;
    fills = kron (fill(:), ones (times, 1));
    if (strcmp (records, "last"))
      fills = repmat (fill(:), times, 1);
    endif
    data(missing) = fills(missing(:));
  endif
endfunction

## The number of records, and the data with their axes in the order of the commands.
function [v, data] = shaped (v, data, records, rowMajor)
  v = __ambrix_deduceSizes__ (v, data, records);
  v.records = 0;
  if (isempty (data))
    return;
  endif
  [order, lead] = __ambrix_axesOf__ (v, rowMajor, records);
  v.records = 1;
  if (v.recordVariance)
    v.records = numel (data) / prod ([lead, v.sizes]);
  endif
  sizes = v.sizes;
  if (rowMajor)
    sizes = fliplr (sizes);
  endif
  expected = [lead, sizes, v.records, 1, 1](order);
  if (! isequal (expected(expected != 1), size (data)(size (data) != 1)))
    error ("ambrix:wrongSize", ["ambrix_write: data of variable \"%s\" are %s, which does not " ...
           "fit dimensions of sizes [%s]; records come %s"], v.name,
           strjoin (strsplit (num2str (size (data))), "-by-"), num2str (v.sizes), records);
  endif
  data = reshape (data, expected);
  if (! issorted (order))
    data = ipermute (data, order);
  endif
endfunction

%!shared s
%! s.options = struct ("records", "first", "time", [], "fill", false);
%! s.data = struct ("a", single ([1, 2, 3; 4, 5, 6]), "t", {{"ab"; "c"}}, "d", uint64 (1), ...
%!                  "i", true, "c", 1i);
%!test
%! [v, data] = __ambrix_completeVariable__ ("a", struct (), s, false);
%! assert ({v.datatype, v.sizes, v.records, v.elements}, {"CDF_FLOAT", 3, 2, 1});
%! assert (v.variances, true);
%! assert (data, single ([1, 4; 2, 5; 3, 6]));
%!test
%! v = struct ("recordVariance", false);
%! [v, data] = __ambrix_completeVariable__ ("a", v, s, true);
%! assert ({v.sizes, v.records}, {[2, 3], 1});
%! assert (data, single ([1, 4; 2, 5; 3, 6]));
%!test
%! [v, data] = __ambrix_completeVariable__ ("t", struct (), s, false);
%! assert ({v.datatype, v.sizes, v.records, v.elements}, {"CDF_CHAR", [], 2, 2});
%! assert (data, ["ac"; "b "]);
%!test
%! [v, data] = __ambrix_completeVariable__ ("i", struct (), s, false);
%! assert ({v.datatype, data}, {"CDF_UINT1", uint8(1)});
%!test  # a fill value of another class
%! v.attributes.FILLVAL = int32 (-1);
%! given = struct ("data", struct ("a", single ([1; NaN])), "options", s.options);
%! given.options.fill = true;
%! [~, data] = __ambrix_completeVariable__ ("a", v, given, false);
%! assert (data, single ([1; -1]));
%!error <no datatype holds variable "d">
%! __ambrix_completeVariable__ ("d", struct (), s, false);
%!error id=ambrix:unsupportedClass __ambrix_completeVariable__ ("c", struct (), s, false);
%!error <"gone" is described with 3 records, and there are no data of it; remove s.variables.gone>
%! v = struct ("datatype", "CDF_INT4", "records", 3);
%! __ambrix_completeVariable__ ("gone", v, s, false);
%!error <neither data> __ambrix_completeVariable__ ("none", struct (), s, false);
%!error <are 2-by-3, which does not fit dimensions of sizes .4.>
%! __ambrix_completeVariable__ ("a", struct ("sizes", 4), s, false);
%!error <"CDF_INT3"; it must be one of: CDF_INT1,>
%! __ambrix_completeVariable__ ("a", struct ("datatype", "cdf_int3"), s, false);
