## -*- texinfo -*-
## @deftypefn {} {@var{epochs} =} __ambrix_fromDays__ (@var{days}, @var{datatype}, @var{records})
## Turn Octave's serial day numbers into epochs, to the millisecond, and NaN into their fill value.
## @end deftypefn

function epochs = __ambrix_fromDays__ (days, datatype, records)
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

%!test
%! days = [datenum(2024, 2, 29, 12, 30, 15.25); NaN];
%! epochs = __ambrix_fromDays__ (days, "CDF_EPOCH", "first");
%! assert (epochs, [ambrix_computeEpoch([2024; 2; 29; 12; 30; 15; 250]); -1e31]);
%!test
%! days = [datenum(2024, 2, 29, 12, 30, 15.25); NaN];
%! expected = [ambrix_computeEpoch16([2024; 2; 29; 12; 30; 15; 250; 0; 0; 0]).'; -1e31, -1e31];
%! assert (__ambrix_fromDays__ (days, "CDF_EPOCH16", "first"), expected);
%! assert (__ambrix_fromDays__ (days, "CDF_EPOCH16", "last"), expected.');
