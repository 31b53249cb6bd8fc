## -*- texinfo -*-
## @deftypefn {} {@var{times} =} ambrix_tt2000Breakdown (@var{values})
## Makes calendar times of @code{CDF_TIME_TT2000} values.
##
## Arguments:
##
## @table @var
## @item values
## (int64, any size) the values, in nanoseconds of terrestrial time.
## @end table
##
## Results:
##
## @table @var
## @item times
## (double, 9-by-n) in each column: year, month, day, hour, minute, second, millisecond,
## microsecond, nanosecond, of UTC. The second is 60 in a leap second.
## @end table
##
## The fill value gives 31 December 9999, 23:59:59.999999999, and the library's pad value 1 January
## of the year 0.
##
## Errors:
##
## @table @code
## @item TOLVEX:ambrix:validate:wrongNumberOfInputs
## The command takes another number of arguments.
## @item TOLVEX:ambrix:cdflib:datatypeMismatch
## The values are not of class int64.
## @end table
##
## @example
## @group
## times = ambrix_tt2000Breakdown (int64 (536500868184000000))'
##      @result{} times = [2016, 12, 31, 23, 59, 60, 0, 0, 0]
## @end group
## @end example
## @seealso{ambrix_computeTT2000, ambrix_epochBreakdown, ambrix_extended}
## @end deftypefn

function times = ambrix_tt2000Breakdown (varargin)
  times = __ambrix__ ("-extended", "tt2000Breakdown", varargin{:});
endfunction

%!assert (ambrix_tt2000Breakdown (int64 (536500868184000000))', [2016, 12, 31, 23, 59, 60, 0, 0, 0])
%!assert (ambrix_tt2000Breakdown (zeros (0, 1, "int64")), zeros (9, 0))
%!assert (ambrix_tt2000Breakdown (intmin ("int64"))', [9999, 12, 31, 23, 59, 59, 999, 999, 999])
%!assert (ambrix_computeTT2000 (ambrix_tt2000Breakdown (int64 ([1; -2; 3]))), int64 ([1, -2, 3]))
%!error id=TOLVEX:ambrix:cdflib:datatypeMismatch ambrix_tt2000Breakdown (5)
%!error id=TOLVEX:ambrix:validate:wrongNumberOfInputs ambrix_tt2000Breakdown ()
