## -*- texinfo -*-
## @deftypefn {} {@var{values} =} ambrix_computeTT2000 (@var{times})
## Makes @code{CDF_TIME_TT2000} values, in nanoseconds of terrestrial time, of calendar times.
##
## Arguments:
##
## @table @var
## @item times
## (double, 9-by-n) in each column: year, month, day, hour, minute, second, millisecond,
## microsecond, nanosecond, of UTC. The second is 60 in a leap second. With month 0 or 1 the day may
## be the day of the year.
## @end table
##
## Results:
##
## @table @var
## @item values
## (int64, 1-by-n) the values: 0 is noon of 1 January 2000 in terrestrial time.
## @end table
##
## The leap seconds are those that the CDF library knows, or those of the file that the environment
## variable CDF_LEAPSECONDSTABLE names. 31 December 9999, 23:59:59.999999999, gives the fill value.
##
## Errors:
##
## @table @code
## @item TOLVEX:ambrix:validate:wrongNumberOfInputs
## The command takes another number of arguments.
## @item TOLVEX:ambrix:validate:argumentOutOfBounds
## @var{times}: a component beyond a signed 64-bit integer.
## @item TOLVEX:ambrix:cdflib:badEpochVector
## The number of elements is no multiple of 9, or their class is not double.
## @item TOLVEX:ambrix:cdflib:illegalEpochValue
## The components make no valid time, or one before 1707-09-22 or after 2292-04-11.
## @end table
##
## @example
## @group
## values = ambrix_computeTT2000 ([2016; 12; 31; 23; 59; 60; 0; 0; 0])
##      @result{} values = 536500868184000000
## @end group
## @end example
## @seealso{ambrix_tt2000Breakdown, ambrix_computeEpoch, ambrix_extended}
## @end deftypefn

function values = ambrix_computeTT2000 (varargin)
  values = __ambrix__ ("-extended", "computeTT2000", varargin{:});
endfunction

%!assert (ambrix_computeTT2000 ([2016; 12; 31; 23; 59; 60; 0; 0; 0]), int64 (536500868184000000))
%!assert (ambrix_computeTT2000 (zeros (9, 0)), zeros (1, 0, "int64"))
%!assert (ambrix_computeTT2000 ([9999; 12; 31; 23; 59; 59; 999; 999; 999]), intmin ("int64"))
%!assert (ambrix_extended (), false)  # they work either way, and change nothing
%!error id=TOLVEX:ambrix:cdflib:badEpochVector ambrix_computeTT2000 ([2016, 1, 1])
%!error id=TOLVEX:ambrix:cdflib:illegalEpochValue ambrix_computeTT2000 ([2016; 13; 1; zeros(6, 1)])
%!error id=TOLVEX:ambrix:validate:wrongNumberOfInputs ambrix_computeTT2000 ()
%!error id=TOLVEX:ambrix:validate:wrongNumberOfInputs ambrix_computeTT2000 (zeros (9, 1), 2)
