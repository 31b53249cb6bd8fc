## -*- texinfo -*-
## @deftypefn {} {@var{epochs} =} __ambrix_fromDays__ (@var{days}, @var{datatype}, @var{records})
## Turn Octave's serial day numbers into epochs, to the millisecond, and NaN into their fill value.
##
## Times of a CDF_TIME_TT2000 are told to 20 microseconds. A day number is that of a time to 5
## microseconds, so that whole milliseconds stay whole.
## @end deftypefn

function epochs = __ambrix_fromDays__ (days, datatype, records)
  if (strcmp (datatype, "CDF_TIME_TT2000"))
    epochs = tt2000OfDays (days);
    return;
  endif
  epochs = round ((days - 1) * 86400e3);
  epochs(isnan (days)) = -1e31;
  if (strcmp (datatype, "CDF_EPOCH16"))
    seconds = floor (epochs / 1000);
    picoseconds = (epochs - 1000 * seconds) * 1e9;
    isFill = isnan (days);
    [seconds(isFill), picoseconds(isFill)] = deal (-1e31);
    if (strcmp (records, "last"))
      epochs = reshape ([seconds(:), picoseconds(:)].', [2, size(days)]);
    else
      sizes = size (days);
      epochs = reshape ([seconds(:), picoseconds(:)], [sizes(1:end - iscolumn (days)), 2]);
    endif
  endif
endfunction

function times = tt2000OfDays (days)
  times = repmat (intmin ("int64"), size (days));
  valid = find (! isnan (days));
  for first = 1:1e6:numel (valid)  # some at a time: there are nine numbers for each
    part = valid(first:min (first + 1e6 - 1, end));
    times(part) = ambrix_computeTT2000 (componentsOf (days(part)(:).'));
  endfor
endfunction

function components = componentsOf (days)
  perSecond = 5e4;
  whole = floor (days);
  units = round ((days - whole) * 86400 * perSecond);
  whole += floor (units / (86400 * perSecond));
  units = mod (units, 86400 * perSecond);
  seconds = floor (units / perSecond);
  micros = mod (units, perSecond) * 1e6 / perSecond;
  components = [datevec(whole)(:,1:3).'; floor(seconds / 3600); mod(floor (seconds / 60), 60); ...
                mod(seconds, 60); floor(micros / 1000); mod(micros, 1000); zeros(size (days))];
endfunction

%!test
%! days = [datenum(2024, 2, 29, 12, 30, 15.25); NaN];
%! epochs = __ambrix_fromDays__ (days, "CDF_EPOCH", "first");
%! assert (epochs, [ambrix_computeEpoch([2024; 2; 29; 12; 30; 15; 250]); -1e31]);
%!test
%! days = [datenum(2024, 2, 29, 12, 30, 15.25); NaN];
%! expected = [ambrix_computeEpoch16([2024; 2; 29; 12; 30; 15; 250; 0; 0; 0]).'; -1e31, -1e31];
%! assert (__ambrix_fromDays__ (days, "CDF_EPOCH16", "first"), expected);
%! assert (__ambrix_fromDays__ (days, "CDF_EPOCH16", "last"), expected.');
%!test
%! days = [datenum(2024, 2, 29, 12, 30, 15.25), NaN; datenum(1969, 7, 20), datenum(0, 1, 1)];
%! times = __ambrix_fromDays__ (days, "CDF_TIME_TT2000", "first");
%! expected = ambrix_computeTT2000 ([2024, 1969; 2, 7; 29, 20; 12, 0; 30, 0; 15, 0; 250, 0; ...
%!                                   zeros(2, 2)]);
%! assert (times, [expected(1), intmin("int64"); expected(2), intmin("int64") + 1]);
%!test  # all milliseconds of a minute, also those that are the next day's
%! days = datenum (2016, 12, 31, 23, 59, 0) + (0:59999) / 86400e3;
%! times = __ambrix_fromDays__ (days, "CDF_TIME_TT2000", "first");
%! assert (times - times(1), int64 ((0:59999) * 1e6));
%! times = __ambrix_fromDays__ ([736696, 736696 - 2^-33], "CDF_TIME_TT2000", "last");
%! assert (diff (times), int64 (0) - int64 (1e9 + 2e4));  # with the leap second between
%!test  # what reading gives is written back to 16 microseconds
%! times = ambrix_computeTT2000 ([2024; 5; 6; 7; 8; 9; 0; 0; 0]) + int64 (0:122070:1e9);
%! days = __ambrix_toDays__ (times, [1, 2], "CDF_TIME_TT2000");
%! assert (max (abs (__ambrix_fromDays__ (days, "CDF_TIME_TT2000", "first") - times)) <= 16000);
