## -*- texinfo -*-
## @deftypefn {} {@var{epochs} =} __ambrix_toEpochs__ (@var{values}, @var{datatype}, @var{options}, @var{what})
## Epochs to be written, of values that are epochs or, if @var{options}.time says so, serial day
## numbers. Where that is empty it tells from the values. @var{what} names them in errors.
##
## Doubles are day numbers in any case where the datatype is CDF_TIME_TT2000, whose values are of
## class int64.
## @end deftypefn

function epochs = __ambrix_toEpochs__ (values, datatype, options, what)
  epochs = values;
  if (strcmp (datatype, "CDF_TIME_TT2000"))
    epochs = toTT2000 (values, options, what);
    return;
  endif
  given = values(! isnan (values) & values > -1e30);
  outside = given(given < 1 | given >= datenum (10000, 1, 1));
  given(given == 0) = [];  # the pad value
  areDays = ! isempty (given) && isempty (outside);
  if (isequal (options.time, true))
    if (! isempty (outside))
      error ("ambrix:invalidTime", ["ambrix_write: s.options.time says that %s is in serial " ...
             "day numbers, but %g is none of the years 0 to 9999"], what, outside(1));
    endif
    epochs = __ambrix_fromDays__ (values, datatype, options.records);
  elseif (areDays && isempty (options.time))
    epochs = __ambrix_fromDays__ (values, datatype, options.records);
  elseif (areDays)
    error ("ambrix:invalidTime", ["ambrix_write: s.options.time says that %s is in epochs, but " ...
           "%g is a serial day number, and no likely epoch; set s.options.time = true if all " ...
           "times are day numbers"], what, given(1));
  endif
endfunction

## Day 1 is the library's pad value.
function times = toTT2000 (values, options, what)
  times = values;
  if (! isa (values, "double"))
    return;
  endif
  isOutside = values < datenum (1707, 9, 22) | values >= datenum (2292, 4, 12);
  outside = values(isOutside & values != 1);
  if (! isempty (outside))
    error ("ambrix:invalidTime", ["ambrix_write: %s must be of class int64, or serial day " ...
           "numbers of the years 1707 to 2292, and %g is none"], what, outside(1));
  endif
  times = __ambrix_fromDays__ (values, "CDF_TIME_TT2000", options.records);
endfunction

%!shared days, epoch, first
%! days = datenum (2024, 2, 29, 12, 30, 15.25);
%! epoch = ambrix_computeEpoch ([2024; 2; 29; 12; 30; 15; 250]);
%! first = struct ("records", "first", "time", []);
%!assert (__ambrix_toEpochs__ ([days; NaN], "CDF_EPOCH", first, "x"), [epoch; -1e31])
%!assert (__ambrix_toEpochs__ ([epoch; -1e31; 0], "CDF_EPOCH", first, "x"), [epoch; -1e31; 0])
%!assert (__ambrix_toEpochs__ ([-1e31; 0], "CDF_EPOCH", first, "x"), [-1e31; 0])
%!assert (__ambrix_toEpochs__ ([], "CDF_EPOCH", first, "x"), [])
%!test
%! epoch16 = ambrix_computeEpoch16 ([2024; 2; 29; 12; 30; 15; 250; 0; 0; 0]).';
%! assert (__ambrix_toEpochs__ (days, "CDF_EPOCH16", first, "x"), epoch16);
%! assert (__ambrix_toEpochs__ (epoch16, "CDF_EPOCH16", first, "x"), epoch16);
%!test
%! asDays = struct ("records", "first", "time", true);
%! assert (__ambrix_toEpochs__ (1, "CDF_EPOCH", asDays, "x"), 0);
%! asEpochs = struct ("records", "first", "time", false);
%! assert (__ambrix_toEpochs__ ([epoch; days], "CDF_EPOCH", asEpochs, "x"), [epoch; days]);
%!error <says that variable "x" is in serial day numbers, but 6.3\d+e.13 is none>
%! options = struct ("records", "first", "time", true);
%! __ambrix_toEpochs__ ([days; epoch], "CDF_EPOCH", options, 'variable "x"');
%!error id=ambrix:invalidTime
%! __ambrix_toEpochs__ (days, "CDF_EPOCH", struct ("records", "first", "time", false), "x");
%!test  # day numbers of a CDF_TIME_TT2000 need not be announced
%! expected = ambrix_computeTT2000 ([2024; 2; 29; 12; 30; 15; 250; 0; 0]);
%! for time = {[], true, false}
%!   options = struct ("records", "first", "time", time);
%!   assert (__ambrix_toEpochs__ ([days; NaN; 1], "CDF_TIME_TT2000", options, "x"), ...
%!           [expected; intmin("int64"); intmin("int64") + 1]);
%!   assert (__ambrix_toEpochs__ (expected, "CDF_TIME_TT2000", options, "x"), expected);
%! endfor
%!error <variable "x" must be of class int64, or serial day numbers .* and 1e\+15 is none>
%! __ambrix_toEpochs__ ([days; 1e15], "CDF_TIME_TT2000", first, 'variable "x"');
%!error id=ambrix:invalidTime __ambrix_toEpochs__ (-1e31, "CDF_TIME_TT2000", first, "x")
