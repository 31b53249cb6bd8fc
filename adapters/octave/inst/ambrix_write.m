## -*- texinfo -*-
## @deftypefn  {} {} ambrix_write (@var{file}, @var{s})
## @deftypefnx {} {} ambrix_write (@var{file}, @var{s}, @var{option}, @dots{})
## Write a struct of arrays to a new CDF file.
##
## @var{file} is the path of the file; @code{.cdf} is added if it is missing. The new file appears
## complete or not at all. The options are:
##
## @table @asis
## @item @qcode{"overwrite"}
## Replace an existing file. Without this option it is the error @code{ambrix:fileExists}.
## @item @qcode{"incomplete"}
## Replace the file that @var{s} was read from even if @var{s} lacks parts of it, which are then
## lost. Without this option it is the error @code{ambrix:incomplete}. @code{s.leftOut} lists these
## parts.
## @end table
##
## @var{s} is a struct from @code{ambrix_read}, or a struct of arrays, one for each variable. The
## first dimension of an array is that of the records, and a text is a row of characters or a cell
## of a cell array. All other properties have the same fields as in the struct of
## @code{ambrix_read}. Only the data are necessary:
##
## @table @code
## @item s.data.(@var{name})
## the data of a variable
## @item s.variables.(@var{name}).datatype
## its datatype, such as @qcode{"CDF_EPOCH"}; the default is in the table below, by the class of the
## data
## @item s.variables.(@var{name}).attributes.(@var{attribute})
## an attribute of the variable
## @item s.variables.(@var{name}).recordVariance
## false for data that do not vary from record to record and have no dimension for records
## @item s.variables.(@var{name}).compression
## such as @qcode{"GZIP_COMPRESSION"}, with a level in @code{compressionParameter}
## @item s.attributes.(@var{name})
## a global attribute: one value, or a cell array of several
## @item s.file.majority
## and @code{format}, @code{checksum}, @code{compression} and @code{compressionParameter} of the
## file; without them it is column-major, a single file, not compressed
## @item s.options
## the form of the data, as in the options of @code{ambrix_read}: @code{records}, @qcode{"first"} or
## @qcode{"last"}; @code{time}, whether times are serial day numbers; @code{fill}, whether NaN
## stands for the attribute FILLVAL
## @end table
##
## The fields @code{sizes}, @code{elements}, @code{variances}, @code{sparseRecords}, @code{padValue}
## and @code{blockingFactor} of a variable are those of @code{ambrix_info}. Any other field is the
## error @code{ambrix:invalidData}.
##
## Without @code{s.options.time}, values of a CDF_EPOCH or CDF_EPOCH16 variable are serial day
## numbers if all are in the range of the years 0 to 9999. As epochs such numbers would be in the
## first hours of the year 0. Numbers that do not agree with @code{s.options.time} are the error
## @code{ambrix:invalidTime}. Day numbers are written with a precision of a millisecond.
##
## Values of a CDF_TIME_TT2000 variable are of class int64, as @code{ambrix_computeTT2000} makes
## them. Doubles are always taken for serial day numbers, of the years 1707 to 2292, and written to
## 20 microseconds. NaN is written as the fill value, @code{intmin ("int64")}.
##
## The datatypes by class: double CDF_DOUBLE, single CDF_FLOAT, int8 CDF_INT1, int16 CDF_INT2, int32
## CDF_INT4, int64 CDF_INT8, uint8 and logical CDF_UINT1, uint16 CDF_UINT2, uint32 CDF_UINT4, text
## CDF_CHAR.
##
## A struct from @code{ambrix_read} is written back the same, with three exceptions: the encoding
## becomes that of the computer, rVariables become zVariables, and parts that were left out are
## missing.
##
## @example
## @group
## s.data.Epoch = ambrix_computeEpoch ([2024 2024; 1 1; 1 1; 0 0; 0 1; 0 0; 0 0]).';
## s.data.B = single ([4.5 0.5 -2; 4 0 -1.5]);
## s.variables.Epoch.datatype = "CDF_EPOCH";
## s.variables.B.attributes.UNITS = "nT";
## s.variables.B.attributes.DEPEND_0 = "Epoch";
## s.attributes.Title = "Magnetic field";
## ambrix_write ("field", s);
## @end group
## @end example
## @seealso{ambrix_read, ambrix_info, ambrix_computeTT2000, ambrix_create}
## @end deftypefn

function ambrix_write (file, s, varargin)
  if (nargin < 2)
    print_usage ();
  endif
  defaults = struct ("overwrite", false, "incomplete", false);
  options = __ambrix_parseOptions__ ("ambrix_write", defaults, varargin);
  if (! ischar (file) || rows (file) != 1)
    error ("ambrix:invalidFile", "ambrix_write: give the path of the file as a text");
  endif
  s = __ambrix_completeStruct__ (s);
  target = targetOf (file);
  __ambrix_mayReplace__ (target, s, options);
  [temporary, discard] = __ambrix_temporaryFile__ (target);
  id = __ambrix__ ("create", temporary);
  giveUp = onCleanup (@() __ambrix__ ("-abandon", id));  # unless it was closed
  __ambrix_fillFile__ (id, s);
  try
    __ambrix__ ("close", id);
  catch err
    what = sprintf ("\"%s.cdf\" can't be finished, perhaps for lack of disk space", target);
    __ambrix_raiseFor__ ("ambrix_write", what, err);
  end_try_catch
  __ambrix_moveFile__ (temporary, target, options.overwrite);
endfunction

## The path without ".cdf", of the file itself where there is a link to it.
function target = targetOf (file)
  target = tilde_expand (file);
  if (strcmpi (target(max (end-3, 1):end), ".cdf"))
    target(end-3:end) = "";
  endif
  if (isempty (target) || target(end) == "/")
    error ("ambrix:invalidFile", "ambrix_write: \"%s\" holds no name of a file", file);
  endif
  there = lstat ([target ".cdf"]);
  if (! isempty (there) && S_ISLNK (there.mode))
    linked = regexp (canonicalize_file_name ([target ".cdf"]), '^(.+)\.cdf$', "tokens", "once");
    target = [linked, {target}]{1};
  endif
endfunction

%!function s = back (s, varargin)
%!  [id, restore] = __ambrix_example__ ();
%!  ambrix_close (id);
%!  ambrix_write ("written", s);
%!  s = ambrix_read ("written", varargin{:});
%!endfunction

%!test  # a plain struct of arrays
%! plain = struct ("a", [1; 2; 3], "b", single (magic (4)), "c", {{"one"; "three"}}, ...
%!                 "d", "text", "e", uint8 (reshape (1:24, 2, 3, 4)), "f", true, "x y", int16 (7));
%! s = back (plain);
%! plain.d = {"text"};
%! plain.f = uint8 (1);
%! assert (s.data, plain);
%! assert (s.file.majority, "COLUMN_MAJOR");
%! assert (s.variables.e.sizes, [3, 4]);

%!test  # a constant given by its number
%! s = struct ("data", struct ("a", reshape (1:24, 2, 3, 4)), "file", struct ("majority", 1));
%! r = back (s);
%! assert (r.file.majority, "ROW_MAJOR");
%! assert (r.data.a, s.data.a);
%! assert (r.variables.a.sizes, [3, 4]);

%!test  # what is described
%! s = struct ();
%! s.data.Epoch = ambrix_computeEpoch ([2024, 2024; 1, 1; 1, 1; 0, 0; 0, 1; 0, 0; 0, 0]).';
%! s.data.B = single ([4.5, 0.5, -2; 4, 0, -1.5]);
%! s.data.names = {"Bx"; "By"; "Bz"};
%! s.variables.names.recordVariance = false;
%! s.variables.Epoch.datatype = "cdf_epoch";
%! s.variables.B.attributes.UNITS = "nT";
%! s.variables.B.attributes.FILLVAL = single (-1e31);
%! s.variables.B.compression = "GZIP_COMPRESSION";
%! s.attributes.Title = "Magnetic field";
%! s.attributes.TEXT = {"line 1"; int16([1, 2]); ""};
%! s.file.majority = "ROW_MAJOR";
%! s.file.checksum = "MD5_CHECKSUM";
%! r = back (s);
%! assert (r.data, s.data);
%! assert (r.file.majority, "ROW_MAJOR");
%! assert (r.file.checksum, "MD5_CHECKSUM");
%! r.attributes.TEXT{3} = strtrim (r.attributes.TEXT{3});  # CDF 3.6 gives a blank
%! assert (r.attributes, s.attributes);
%! assert (r.variables.Epoch.datatype, "CDF_EPOCH");
%! assert (r.variables.B.attributes, s.variables.B.attributes);
%! assert (r.variables.B.compressionParameter, 6);
%! assert (r.attributeList(4).datatypes, {"CDF_FLOAT"});
%! assert (r.variables.names.recordVariance, false);

%!test  # options of reading are undone
%! days = [datenum(2024, 5, 6, 7, 8, 9.25); NaN];
%! s = struct ();
%! s.data = struct ("t", days, "u", days, "v", [1; NaN]);
%! s.variables.t.datatype = "CDF_EPOCH";
%! s.variables.u.datatype = "CDF_EPOCH16";
%! s.variables.v.attributes.FILLVAL = -99;
%! s.options = struct ("time", true, "fill", true);
%! r = back (s);
%! assert (r.data.t, [ambrix_computeEpoch([2024; 5; 6; 7; 8; 9; 250]); -1e31]);
%! assert (r.data.v, [1; -99]);
%! r = back (s, {}, "time", "fill");
%! assert (r.data.t, days, 1e-9);
%! assert (r.data.u, days, 1e-9);
%! assert (r.data.v, [1; NaN]);

%!test  # files that exist are replaced only when asked
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! err = __ambrix_raised__ (@() ambrix_write ("example.cdf", struct ("a", 1)));
%! assert (err.identifier, "ambrix:fileExists");
%! ambrix_write ("example", struct ("a", 1), "overwrite");
%! s = ambrix_read ("example");
%! assert (s.data, struct ("a", 1));

%!test  # a failure leaves nothing behind
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data = struct ("a", 1);
%! s.variables.a.datatype = "CDF_INT4";
%! err = __ambrix_raised__ (@() ambrix_write ("bad", s));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:datatypeMismatch");
%! assert (readdir ("."), {"."; ".."; "example.cdf"});

%!testif ; isunix ()  # a link stays one
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! symlink ("example.cdf", "link.cdf");
%! ambrix_write ("link", struct ("a", 1), "overwrite");
%! assert (ambrix_read ("example", "a"), 1);
%! assert (S_ISLNK (lstat ("link.cdf").mode));

%!test  # the home folder
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! home = getenv ("HOME");
%! unwind_protect
%!   setenv ("HOME", pwd ());
%!   ambrix_write ("~/mine", struct ("a", 1));
%!   assert (ambrix_read ("~/mine.cdf", "a"), 1);
%! unwind_protect_cleanup
%!   setenv ("HOME", home);
%! end_unwind_protect
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "mine.cdf"});

%!test  # no data are no records of a scalar variable
%! s = back (struct ("a", [], "t", "", "c", {{}}));
%! assert (s.data, struct ("a", zeros (0, 1), "t", {cell(0, 1)}, "c", {cell(0, 1)}));
%!error id=ambrix:invalidFile ambrix_write ("", struct ())
%!error id=ambrix:invalidFile ambrix_write ("/tmp/.cdf", struct ())
%!error id=ambrix:invalidFile ambrix_write (1, struct ())
%!error id=ambrix:invalidData ambrix_write ("x", 1)
%!error id=ambrix:invalidOption ambrix_write ("x", struct (), "force")
%!error id=TOLVEX:ambrix:cdflib:fileCreateError ambrix_write ("/no such folder/x", struct ("a", 1))
%!assert (exist ("/no such folder"), 0)
%!error id=Octave:invalid-fun-call ambrix_write ("x")

%!demo
%! # A magnetic field with its times, units and the names of its components
%! file = [tempname() ".cdf"];
%! s.data.Epoch = datenum (2024, 1, 1, 0, [0; 1], 0);
%! s.data.B = single ([4.5 0.5 -2; 4 0 -1.5]);
%! s.data.labels = {"Bx"; "By"; "Bz"};
%! s.variables.Epoch.datatype = "CDF_EPOCH";
%! s.variables.labels.recordVariance = false;
%! s.variables.B.attributes = struct ("UNITS", "nT", "DEPEND_0", "Epoch", "LABL_PTR_1", "labels");
%! ambrix_write (file, s);
%! ambrix_info (file)
%! delete (file);
