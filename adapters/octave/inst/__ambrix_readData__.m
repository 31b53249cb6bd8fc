## -*- texinfo -*-
## @deftypefn {} {[@var{data}, @var{v}] =} __ambrix_readData__ (@var{id}, @var{v}, @var{rowMajor}, @var{options}, @var{fill})
## Read the data of a described variable by one command, in the form that the options tell.
##
## @var{fill} is the value that becomes NaN, empty for none. @var{v} describes what was read.
## @end deftypefn

function [data, v] = __ambrix_readData__ (id, v, rowMajor, options, fill)
  [range, slab, v] = selection (v, options);
  hostOrder = 1:numel (v.sizes);
  if (rowMajor)
    hostOrder = fliplr (hostOrder);
  endif
  [order, lead] = __ambrix_axesOf__ (v, rowMajor, options.records);
  if (range.count > 0)
    data = __ambrix__ ("-extended", "hyperGetVarData", id, v.number, range.start, range.count,
                       range.step, slab.start(hostOrder), slab.count(hostOrder),
                       slab.step(hostOrder));
  else
    data = emptyOf (v.datatype);
  endif
  data = reshape (data, [lead, v.sizes(hostOrder), range.count, 1, 1]);
  isText = any (strcmp (v.datatype, {"CDF_CHAR", "CDF_UCHAR"}));
  if (isText)
    v.filler = fillerOf (data);
  elseif (options.time && __ambrix_isTime__ (v.datatype))
    [data, order] = __ambrix_toDays__ (data, order, v.datatype);
  elseif (isfloat (data) && isnumeric (fill))
    data = withoutFill (data, fill, lead);
  endif
  if (isText && strcmp (options.text, "cell"))
    data = __ambrix_toCells__ (data, order, v.filler);
  elseif (! issorted (order))
    data = permute (data, order);
  endif
  if (! v.recordVariance && range.count == 0)
    data = reshape (data, 0, 0);
  endif
endfunction

## An EPOCH16 is missing where both of its numbers are those of the fill value.
function data = withoutFill (data, fill, lead)
  if (isscalar (fill))
    data(data == fill) = NaN;
  elseif (numel (fill) == lead)
    data(:,all (data(:,:) == fill(:), 1)) = NaN;
  endif
endfunction

## Which records and elements are read, counted from 0 as in the commands.
function [range, slab, v] = selection (v, options)
  if (v.recordVariance)
    range = span ("range", options.range, v.records);
  else  # there is but one record, whatever the others' range
    range = span ("range", [], v.records);
  endif
  v.records = range.count;
  parts = options.slab;
  if (isempty (parts))
    parts = cell (1, numel (v.sizes));
  elseif (! iscell (parts) || numel (parts) != numel (v.sizes))
    error ("ambrix:invalidOption",
           ["ambrix_read: option \"slab\" must be a cell array with one range for each of the " ...
            "%d dimensions of \"%s\"; an empty one takes all"], numel (v.sizes), v.name);
  endif
  slab = struct ("start", zeros (1, 0), "count", zeros (1, 0), "step", zeros (1, 0));
  for k = 1:numel (parts)
    part = span ("slab", parts{k}, v.sizes(k));
    slab.start(k) = part.start;
    slab.count(k) = part.count;
    slab.step(k) = part.step;
    v.sizes(k) = part.count;
  endfor
endfunction

## first:last or first:step:last of `size` things, from [first, last] or [first, last, step].
function part = span (option, limits, size)
  if (isempty (limits))
    part = struct ("start", 0, "count", size, "step", 1);
    return;
  endif
  isRange = isnumeric (limits) && isreal (limits) && any (numel (limits) == [2, 3]);
  if (! isRange || any (limits != fix (limits)) || limits(1) < 1 || limits(2) > size
      || (numel (limits) == 3 && limits(3) < 1))
    error ("ambrix:invalidOption",
           ["ambrix_read: a range of option \"%s\" must be [first, last] or " ...
            "[first, last, step], in whole numbers from 1 to %d"], option, size);
  endif
  limits = double (limits);
  step = [limits(3:end), 1](1);
  count = max (0, floor ((limits(2) - limits(1)) / step) + 1);
  part = struct ("start", limits(1) - 1, "count", count, "step", step);
endfunction

function data = emptyOf (datatype)
  classes = __ambrix_datatypes__ ();
  if (strcmp (classes.(datatype), "char"))
    data = "";
  else
    data = zeros (0, 0, classes.(datatype));
  endif
endfunction

## What texts shorter than others are filled with, in a file from elsewhere also zero bytes.
function filler = fillerOf (data)
  filler = " ";
  if (any (data(:) == 0))
    filler = "\0";
  endif
endfunction

%!test  # values by indices are the same whatever the order in which they are stored
%! [id, restore] = __ambrix_example__ ();
%! options = struct ("records", "first", "range", [], "slab", [], "time", false, "fill", false, ...
%!                   "text", "cell");
%! v = __ambrix_describeVariable__ (id, 1, true);
%! data = __ambrix_readData__ (id, v, true, options, single (6));
%! assert (squeeze (data(1,:,:)), single ([1, 3, 5; 2, 4, NaN]));
%! s = ambrix_read (id);
%! s.file.majority = "COLUMN_MAJOR";
%! ambrix_write ("column", s);
%! assert (ambrix_read ("column", "Flux"), s.data.Flux);
%! column = ambrix_open ("column");
%! assert (ambrix_getVarRecordData (column, 1, 0), single ([1, 3, 5; 2, 4, 6]));
%! ambrix_close (column);
%! number = ambrix_createVar (id, "none", "CDF_INT2", 1, 3, true, true);
%! v = __ambrix_describeVariable__ (id, number, true);
%! data = __ambrix_readData__ (id, v, true, options, []);
%! assert (data, zeros (0, 3, "int16"));
%! ambrix_close (id);
%!test  # an EPOCH16 is missing where both of its numbers say so; other fill values are left alone
%! s.data.t = [-1e31, 0; 5, 0; -1e31, 7];
%! s.data.v = [1, 2; 3, 4];
%! s.variables.t.datatype = "CDF_EPOCH16";
%! s.variables.t.attributes.FILLVAL = [-1e31, 0];
%! s.variables.v.attributes.FILLVAL = "none";
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! ambrix_write ("filled", s);
%! r = ambrix_read ("filled", {}, "fill");
%! assert (r.data.t, [NaN, NaN; 5, 0; -1e31, 7]);
%! assert (r.data.v, s.data.v);
%! for records = {"first", "last"}
%!   ambrix_write ("again", ambrix_read ("filled", {}, "fill", "records", records{1}), "overwrite");
%!   r = ambrix_read ("again");
%!   assert (r.data, s.data);
%! endfor
