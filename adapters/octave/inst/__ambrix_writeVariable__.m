## -*- texinfo -*-
## @deftypefn {} {@var{number} =} __ambrix_writeVariable__ (@var{id}, @var{v}, @var{data}, @var{rowMajor})
## Create a completely described variable and write its data, in the order of the commands.
## @end deftypefn

function number = __ambrix_writeVariable__ (id, v, data, rowMajor)
  if (rowMajor)
    v.sizes = fliplr (v.sizes);
    v.variances = fliplr (v.variances);
  endif
  datatype = __ambrix__ ("-extended", "getConstantValue", v.datatype);
  number = __ambrix__ ("-extended", "createVar", id, v.name, datatype, v.elements, v.sizes,
                       v.recordVariance, v.variances);
  applySettings (id, number, v);
  for run = runsToWrite (v, data)
    first = run(1);
    count = run(2);
    part = data;
    if (count != v.records)
      part = reshape (data, [], v.records)(:,first+1:first+count);
    endif
    __ambrix__ ("-extended", "hyperPutVarData", id, number, first, count, 1,
                zeros (size (v.sizes)), v.sizes, ones (size (v.sizes)), part);
  endfor
endfunction

## All of them before there are data, as the library wants.
function applySettings (id, number, v)
  compression = __ambrix_compressionArguments__ (v);
  if (! isempty (compression))
    ambrix_setVarCompression (id, number, compression{:});
  endif
  if (isfield (v, "sparseRecords"))
    ambrix_setVarSparseRecords (id, number, v.sparseRecords);
  endif
  if (isfield (v, "padValue") && ! isempty (v.padValue))
    __ambrix__ ("-extended", "setVarPadValue", id, number, v.padValue);
  endif
  if (isfield (v, "blockingFactor") && v.blockingFactor > 0)
    ambrix_setVarBlockingFactor (id, number, v.blockingFactor);
  endif
endfunction

## The records to be written, as columns of first and count. Those that a sparse variable had not
## written read as its pad value, or as the record before: they are left out again.
function runs = runsToWrite (v, data)
  runs = zeros (2, 0);
  if (v.records == 0)
    return;
  endif
  isSparse = isfield (v, "sparseRecords") && ! strcmpi (v.sparseRecords, "NO_SPARSERECORDS");
  isWhole = ! isfield (v, "written") || v.written == v.records;
  if (! isSparse || isWhole || ! isfield (v, "padValue"))
    runs = [0; v.records];
    return;
  endif
  differs = distinctRecords (v, reshape (data, [], v.records));
  differs(end) = true;  # it tells how many records there are
  edges = diff ([false, differs, false]);
  first = find (edges > 0);
  runs = [first - 1; find(edges < 0) - first];
endfunction

function differs = distinctRecords (v, records)
  values = rows (records) / numel (v.padValue);
  before = repmat (v.padValue(:), values, columns (records));
  if (strcmpi (v.sparseRecords, "PREV_SPARSERECORDS"))
    before(:,2:end) = records(:,1:end-1);
  endif
  differs = any (records != before, 1);
  if (hasOtherFill (v))
    isFirst = [true, false(1, columns (records) - 1)];
    differs |= strcmpi (v.sparseRecords, "PAD_SPARSERECORDS") | isFirst;
  endif
endfunction

## Some libraries answer with an entry FILLVAL of the variable's datatype instead of the pad value.
function other = hasOtherFill (v)
  other = false;
  if (isfield (v, "attributes") && isfield (v.attributes, "FILLVAL"))
    fill = v.attributes.FILLVAL;
    other = strcmp (class (fill), class (v.padValue)) && ! isequal (fill(:), v.padValue(:));
  endif
endfunction

%!test  # what was left out is left out again
%! [id, restore] = __ambrix_example__ ();
%! v = struct ("name", "gaps", "datatype", "CDF_INT2", "elements", 1, "sizes", 2, "records", 5, ...
%!             "recordVariance", true, "variances", true, "sparseRecords", "PAD_SPARSERECORDS", ...
%!             "padValue", int16 (-1), "written", 2);
%! data = int16 ([1, -1, -1, 2, -1; 1, -1, -1, 2, -1]);
%! number = __ambrix_writeVariable__ (id, v, data, false);
%! assert (ambrix_getVarNumRecsWritten (id, number), 3);
%! assert (ambrix_hyperGetVarData (id, number, 0, 5, 1, 0, 2, 1), data);
%! v.name = "repeats";
%! v.sparseRecords = "PREV_SPARSERECORDS";
%! data = int16 ([1, 1, 2, 2, 2; 1, 1, 3, 3, 3]);
%! number = __ambrix_writeVariable__ (id, v, data, false);
%! assert (ambrix_getVarNumRecsWritten (id, number), 3);
%! assert (ambrix_hyperGetVarData (id, number, 0, 5, 1, 0, 2, 1), data);
%! ambrix_close (id);
%!test  # pad values in data are no fill values, which is what the library might make of them
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! v = struct ("sparseRecords", "PAD_SPARSERECORDS", "padValue", int32 (5), "written", 2);
%! v.attributes.FILLVAL = int32 (-1);
%! s = struct ("data", struct ("v", int32 ([5; 1; 5; -1; 9; 9; 2])), "variables", struct ("v", v));
%! for kind = {"PAD_SPARSERECORDS", "PREV_SPARSERECORDS"}
%!   s.variables.v.sparseRecords = kind{1};
%!   ambrix_write ("sparse", s, "overwrite");
%!   assert (ambrix_read ("sparse", "v"), s.data.v);
%! endfor
%! assert (ambrix_info ("sparse").variables.v.written, 6);
