## -*- texinfo -*-
## @deftypefn  {} {@var{on} =} ambrix_extended ()
## @deftypefnx {} {@var{before} =} ambrix_extended (@var{on})
## Tell or set whether the functions of the commands support two more datatypes.
##
## Without it, which is the default, @code{ambrix_getVarData} and the other functions of the
## commands know 15 datatypes and raise @code{unrecognizedValue} for @code{CDF_INT8} and
## @code{CDF_TIME_TT2000}, as they do in every host of the commands. With it, values of both are
## arrays of class int64, and both names are constants. The functions for whole files, such as
## @code{ambrix_read}, always support both, and do not change the setting.
##
## @var{on} is true or false. The setting holds until Octave ends or clears the function
## @code{__ambrix__}. @code{ambrix_computeTT2000} and @code{ambrix_tt2000Breakdown} work either way.
##
## @example
## @group
## before = ambrix_extended (true);
## code = ambrix_getConstantValue ("CDF_TIME_TT2000")
##      @result{} code = 33
## ambrix_extended (before);
## @end group
## @end example
## @seealso{ambrix_computeTT2000, ambrix_tt2000Breakdown, ambrix_getVarData, ambrix_read}
## @end deftypefn

function before = ambrix_extended (on)
  if (nargin > 0 && ! (islogical (on) && isscalar (on)))
    error ("ambrix:invalidOption", "ambrix_extended: give true or false");
  endif
  told = __ambrix__ ("-extended");
  if (nargin > 0)
    __ambrix__ ("-extended", on);
  endif
  if (nargin == 0 || nargout > 0)
    before = told;
  endif
endfunction

%!function restore = extendedForNow ()
%!  before = ambrix_extended (true);
%!  restore = onCleanup (@() ambrix_extended (before));
%!endfunction

%!test <*extended is off unless it is asked for>
%! assert (ambrix_extended (), false);
%! err = __ambrix_raised__ (@() ambrix_getConstantValue ("CDF_INT8"));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedConstantName");

%!test
%! restore = extendedForNow ();
%! assert (ambrix_extended ());
%! assert (ambrix_getConstantValue ("CDF_INT8"), 8);
%! assert (ambrix_getConstantValue ("CDF_TIME_TT2000"), 33);
%! assert (numel (ambrix_getConstantNames ()), 59);

%!test
%! restore = extendedForNow ();
%! folder = tempname ();
%! mkdir (folder);
%! removal = onCleanup (@() rmdir (folder, "s"));
%! [~] = confirm_recursive_rmdir (false, "local");
%! id = ambrix_create (fullfile (folder, "new"));
%! variable = ambrix_createVar (id, "v", "CDF_INT8", 1, [], true, []);
%! ambrix_putVarData (id, variable, 0, [], int64 (9007199254740993));
%! assert (ambrix_getVarData (id, variable, 0), int64 (9007199254740993));
%! [~, datatype] = ambrix_inquireVar (id, variable);
%! assert (datatype, "cdf_int8");
%! ambrix_extended (false);
%! err = __ambrix_raised__ (@() ambrix_getVarData (id, variable, 0));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue");
%! ambrix_close (id);

%!error id=ambrix:invalidOption ambrix_extended (1)
%!error id=ambrix:invalidOption ambrix_extended ("on")
