## -*- texinfo -*-
## @deftypefn  {} {@var{data} =} ambrix_read (@var{file}, @var{name})
## @deftypefnx {} {@var{s} =} ambrix_read (@var{file})
## @deftypefnx {} {@var{s} =} ambrix_read (@var{file}, @var{names})
## @deftypefnx {} {@dots{} =} ambrix_read (@var{file}, @dots{}, @var{option}, @var{value}, @dots{})
## Read variables of a CDF file, whole or in part.
##
## @var{file} is the path of a file, with or without @code{.cdf}, or the identifier of an open one.
## With the @var{name} of a variable, its data are returned. With a cell array of names, a struct is
## returned that describes the file. @code{@{@}} or no name stands for all variables. The fields
## are:
##
## @table @code
## @item data
## the data of the variables by name: @code{s.data.Flux}
## @item variables
## @itemx attributes
## @itemx file
## @itemx attributeList
## the description that @code{ambrix_info} returns: @code{s.variables.Flux.attributes.UNITS}
## @item options
## how the data were read
## @item leftOut
## a cell array of texts that name what the file has and the struct does not
## @end table
##
## @code{ambrix_write} makes the same file from this struct.
##
## The first dimension of data is that of the records, so that a scalar variable is a column. The
## dimensions of the variable follow in the order of the file for both majorities. If values do not
## vary from record to record, there is no dimension for records. Data have the class of the
## datatype, which is int64 for CDF_INT8 and CDF_TIME_TT2000. Texts are in a cell array, without
## trailing blanks. The two numbers of an EPOCH16, seconds and picoseconds, are along the last
## dimension.
##
## The options are:
##
## @table @asis
## @item @qcode{"records"}, @qcode{"first"} or @qcode{"last"}
## With @qcode{"last"} the dimension of the records is the last, and that of the characters or of
## the two numbers of an EPOCH16 is the first. This takes the least time and memory.
## @item @qcode{"range"}, [@var{first}, @var{last}] or [@var{first}, @var{last}, @var{step}]
## Read only these records, counted from 1.
## @item @qcode{"slab"}, @{@var{range}, @dots{}@}
## Read only these elements: a range for each dimension of the variable, empty for all elements.
## @item @qcode{"time"}
## Convert epochs and CDF_TIME_TT2000 times to Octave's serial day numbers, which @code{datestr}
## accepts, and their fill value to NaN.
## @item @qcode{"fill"}
## Convert values of floating point variables that equal their attribute FILLVAL to NaN.
## @item @qcode{"text"}, @qcode{"cell"} or @qcode{"char"}
## With @qcode{"char"} texts are arrays with all their characters along the last dimension.
## @end table
##
## Day numbers of our time have a resolution of 10 microseconds. Values of CDF_TIME_TT2000 are
## nanoseconds: to keep these, read the values without @qcode{"time"} and use
## @code{ambrix_tt2000Breakdown}. Times in a leap second have the day numbers of the next second:
## 23:59:60.5 has that of 00:00:00.5 of the next day. The pad value of the library is the day number
## 1.
##
## Variables and attribute entries whose datatype the library does not know are left out, with the
## warning @code{ambrix:unsupportedDatatype}. A wrong option is the error
## @code{ambrix:invalidOption}. Other
## errors are those of the commands.
##
## @example
## @group
## B = ambrix_read ("magnetometer", "B", "fill");
## t = ambrix_read ("magnetometer", "Epoch", "time");
## plot (t, B)
## @end group
## @end example
## @seealso{ambrix_info, ambrix_write, ambrix_plot, ambrix_tt2000Breakdown, ambrix_hyperGetVarData}
## @end deftypefn

function result = ambrix_read (file, names = {}, varargin)
  if (nargin < 1)
    print_usage ();
  endif
  defaults = struct ("records", {{"first", "last"}}, "range", [], "slab", {[]}, ...
                     "time", false, "fill", false, "text", {{"cell", "char"}});
  options = __ambrix_parseOptions__ ("ambrix_read", defaults, varargin);
  [id, closer] = __ambrix_openToRead__ (file);
  if (ischar (names) && rows (names) < 2)
    result = readOne (id, names, options);
  elseif (iscellstr (names) || (isempty (names) && ! ischar (names)))
    result = readSeveral (id, names, options);
  else
    error ("ambrix:invalidName",
           "ambrix_read: give the name of a variable, or a cell array of names");
  endif
endfunction

function data = readOne (id, name, options)
  rowMajor = strcmp (__ambrix__ ("getMajority", id), "ROW_MAJOR");
  number = __ambrix_numberOf__ (id, name);
  v = __ambrix_describeVariable__ (id, number, rowMajor);
  if (! v.supported)
    refuse (id, name, v);
  endif
  fill = fillOf (id, number, options.fill);
  try
    data = __ambrix_readData__ (id, v, rowMajor, options, fill);
  catch err
    __ambrix_raiseFor__ ("ambrix_read", sprintf ("variable \"%s\"", name), err);
  end_try_catch
endfunction

## The error of the command names a number of a datatype only.
function refuse (id, name, v)
  try
    __ambrix__ ("-extended", "inquireVar", id, v.number);
  catch err
    error (err.identifier,
           "ambrix_read: variable \"%s\" in \"%s\" has %s, which is not supported",
           name, __ambrix__ ("getName", id), v.datatype);
  end_try_catch
endfunction

## Most variables of most files have one, but none need.
function fill = fillOf (id, number, wanted)
  fill = [];
  try
    if (wanted)
      fill = __ambrix__ ("-extended", "getAttrEntry", id,
                         __ambrix__ ("getAttrNum", id, "FILLVAL"), number);
    endif
  end_try_catch
endfunction

function s = readSeveral (id, names, options)
  if (! isempty (options.slab))
    error ("ambrix:invalidOption", "ambrix_read: option \"slab\" needs the name of one variable");
  endif
  [description, left] = __ambrix_describeFile__ (id);
  all = description.variables;
  description.variables = chosen (id, all, names);
  rowMajor = strcmp (description.file.majority, "ROW_MAJOR");
  s.data = struct ();
  for [v, name] = description.variables
    fill = [];
    if (options.fill && isfield (v.attributes, "FILLVAL"))
      fill = v.attributes.FILLVAL;
    endif
    if (! v.supported)
      left{end+1} = sprintf ("variable \"%s\" (%s)", name, v.datatype);
    else
      try
        [s.data.(name), description.variables.(name)] = ...
          __ambrix_readData__ (id, v, rowMajor, options, fill);
      catch err
        __ambrix_raiseFor__ ("ambrix_read", sprintf ("variable \"%s\"", name), err);
      end_try_catch
    endif
  endfor
  for [part, name] = description
    s.(name) = part;
  endfor
  s.options = struct ("records", options.records, "text", options.text, "time", options.time, ...
                      "fill", options.fill);
  s.leftOut = [left, __ambrix_unwanted__(all, s.variables, options)](:);
  __ambrix_warnOfUnsupported__ ("ambrix_read", s.file.name, left);
endfunction

function variables = chosen (id, all, names)
  variables = all;
  if (! isempty (names))
    variables = struct ();
    for name = names(:)'
      number = __ambrix_numberOf__ (id, name{1});
      field = fieldnames (all){number+1};
      variables.(field) = all.(field);
    endfor
  endif
endfunction

%!shared file, closer
%! [id, closer] = __ambrix_example__ ();
%! ambrix_close (id);
%! file = fullfile (pwd (), "example.cdf");
%!assert (size (ambrix_read (file, "Time")), [2, 1])
%!test  # records first, then the dimensions of the file, here (2, 3)
%! flux = ambrix_read (file, "Flux");
%! assert (class (flux), "single");
%! assert (size (flux), [2, 2, 3]);
%! assert (squeeze (flux(1,:,:)), single ([1, 3, 5; 2, 4, 6]));
%!test
%! flux = ambrix_read (file, "Flux", "records", "last");
%! assert (flux(:,:,2), single ([7, 9, 11; 8, 10, 12]));
%!assert (ambrix_read (file, "Mode"), {"fast"; "slow"})
%!assert (ambrix_read (file, "Mode", "text", "char"), ["fast"; "slow"])
%!assert (datestr (ambrix_read (file, "Time", "time", "range", [2, 2]), 31), "2024-01-01 00:00:30")
%!assert (ambrix_read (file, "Mode", "range", [2, 2]), {"slow"})
%!test
%! flux = ambrix_read (file, "Flux", "slab", {[], [1, 3, 2]});
%! assert (size (flux), [2, 2, 2]);
%! assert (flux(1,:), single ([1, 2, 5, 6]));
%!test
%! s = ambrix_read (file);
%! assert (fieldnames (s), {"data"; "file"; "attributes"; "variables"; "attributeList"; ...
%!                          "options"; "leftOut"});
%! assert (s.leftOut, cell (0, 1));
%! assert (s.data.Mode, {"fast"; "slow"});
%! assert (s.variables.Flux.attributes.Units, "km/s");
%!test
%! s = ambrix_read (file, {"Mode", "Time"}, "range", [2, 2]);
%! assert (fieldnames (s.data), {"Mode"; "Time"});
%! assert (s.variables.Mode.records, 1);
%! assert (s.leftOut, {"1 of 2 records of variable \"Time\""; "variable \"Flux\""; ...
%!                     "1 of 2 records of variable \"Mode\""});
%!test  # an open file stays open
%! id = ambrix_open (file);
%! assert (ambrix_read (id, "Mode"), {"fast"; "slow"});
%! ambrix_close (id);
%!test  # fill values
%! [id, restore] = __ambrix_example__ ();
%! ambrix_createAttr (id, "FILLVAL", "VARIABLE_SCOPE");
%! ambrix_putAttrEntry (id, 2, 1, "CDF_REAL4", single (4));
%! flux = ambrix_read (id, "Flux", "fill");
%! assert (isnan (flux)(:), (1:12)(:) == 7);
%! s = ambrix_read (id, {}, "fill");
%! assert (s.data.Flux, flux);
%! ambrix_close (id);
%!error id=TOLVEX:ambrix:cdflib:libraryFailure ambrix_read (file, "None");
%!error id=TOLVEX:ambrix:cdflib:fileOpenError ambrix_read ("no such file");
%!error id=ambrix:invalidName ambrix_read (file, 1);
%!error id=ambrix:invalidName ambrix_read (file, ["Mode"; "Flux"]);
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "range", {1, 2});
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "slab", {[], "a"});
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "wrong");
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "slab", [1, 2]);
%!error id=ambrix:invalidOption ambrix_read (file, {}, "slab", {[]});
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "range", [0, 1]);
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "range", [1, 3]);
%!error id=ambrix:invalidOption ambrix_read (file, "Flux", "range", [1, 2, 0]);
%!error id=Octave:invalid-fun-call ambrix_read ()

%!demo
%! # Two variables of a new file: speeds, of which one is missing, and their times
%! file = [tempname() ".cdf"];
%! s.data = struct ("time", datenum (2024, 1, 1, 0:2, 0, 0).', "speed", single ([400; -1e31; 420]));
%! s.variables.time.datatype = "CDF_EPOCH";
%! s.variables.speed.attributes.FILLVAL = single (-1e31);
%! ambrix_write (file, s);
%! times = datestr (ambrix_read (file, "time", "time"))
%! speed = ambrix_read (file, "speed", "fill")
%! delete (file);
