## What the functions for whole files do with files: they close them, name them and leave out of them
## what can't be read.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

function file = someFile (folder)
  file = fullfile (folder, "some.cdf");
  s.data = struct ("a", (1:3).', "b", {{"x"; "y"; "z"}});
  ambrix_write (file, s, "overwrite");
endfunction

## How many files this process has open, where the system tells.
function count = openFiles ()
  count = numel (glob ("/proc/self/fd/*"));
endfunction

function testFilesAreClosedAlsoAfterErrors (folder)
  file = someFile (folder);
  before = openFiles ();
  calls = {@() fieldnames(ambrix_info (file)), "";
           @() ambrix_read(file), "";
           @() ambrix_read(file, "none"), "TOLVEX:ambrix:cdflib:libraryFailure";
           @() ambrix_read(file, {"a", "none"}), "TOLVEX:ambrix:cdflib:libraryFailure";
           @() ambrix_read(file, "a", "range", [0, 9]), "ambrix:invalidOption";
           @() ambrix_plot(file, "none"), "TOLVEX:ambrix:cdflib:libraryFailure";
           @() ambrix_plot(file, "b"), "ambrix:cannotPlot";
           @() ambrix_write(fullfile (folder, "new"), struct ("a", uint64 (1))), ...
             "ambrix:unsupportedClass"};
  for k = 1:rows (calls)
    err = __ambrix_raised__ (calls{k,1});
    assert (err.identifier, calls{k,2});
    assert (openFiles (), before);
  endfor
endfunction

function testFailuresLeaveNoFiles (folder)
  file = someFile (folder);
  before = readdir (folder);
  s.data = struct ("a", 1, "b", {{1}});
  err = __ambrix_raised__ (@() ambrix_write (fullfile (folder, "new"), s));
  assert (err.identifier, "ambrix:unsupportedClass");
  assert (readdir (folder), before);
  err = __ambrix_raised__ (@() ambrix_write (file, s, "overwrite"));
  assert (err.identifier, "ambrix:unsupportedClass");
  assert (ambrix_read (file, "a"), [1; 2; 3]);
endfunction

function testNamesOfFilesAreAnyText (folder)
  for name = {"plain", "with blanks", "ünïcödé", "with.dots.cdf", "UPPER.CDF"}
    file = fullfile (folder, name{1});
    ambrix_write (file, struct ("a", 5));
    assert (ambrix_read (file, "a"), 5);
    err = __ambrix_raised__ (@() ambrix_write (file, struct ("a", 6)));
    assert (err.identifier, "ambrix:fileExists");
  endfor
endfunction

function testNamesOfVariablesAndAttributesAreAnyText (folder)
  file = fullfile (folder, "names");
  s.data = struct ("a-b", 1, "c d", 2, "1st", 3, "end", 4);
  s.attributes = struct ("e f", "text", "for", 7);
  s.variables.("c d").attributes = struct ("g.h", single (8));
  ambrix_write (file, s);
  r = ambrix_read (file);
  assert (r.data, s.data);
  assert (r.attributes, s.attributes);
  assert (r.variables.("c d").attributes, s.variables.("c d").attributes);
endfunction

## A file with two variables, the first with a datatype that there is not.
function file = fileWithUnknownDatatype (folder)
  file = fullfile (folder, "unknown");
  s.data = struct ("odd", int32 ([1; 2]), "even", 5);
  s.variables.odd.attributes.UNITS = "nT";
  ambrix_write (file, s);
  stream = fopen ([file ".cdf"], "r+");
  bytes = fread (stream, Inf);
  number = @(at, count) 256 .^ (count - 1:-1:0) * bytes(at+1:at+count);
  file_record = number (20, 8);
  variable = number (file_record + 20, 8);  # the first
  assert (number (variable + 20, 4), 4);
  fseek (stream, variable + 23);
  fwrite (stream, 99);
  fclose (stream);
endfunction

function testWhatIsNotSupportedIsNamedInAWarning (folder)
  file = fileWithUnknownDatatype (folder);
  before = ambrix_getValidate ();
  restore = onCleanup (@() ambrix_setValidate (before));
  ambrix_setValidate (0);  # else the library refuses the file
  evalc ("s = ambrix_read (file);");  # which keeps the warning from being shown
  [text, identifier] = lastwarn ();
  assert (identifier, "ambrix:unsupportedDatatype");
  assert (regexprep (strtrim (text), '^.*": ', ""), "variable \"odd\" (datatype 99)");
  assert (s.leftOut, {"variable \"odd\" (datatype 99)"});
  assert (s.data, struct ("even", 5));
  assert (s.variables.odd.supported, false);
  assert (s.variables.odd.attributes.UNITS, "nT");
  err = __ambrix_raised__ (@() ambrix_read (file, "odd"));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue");
  assert (any (strfind (err.message, "\"odd\"")));
  assert (any (strfind (err.message, "has datatype 99, which is not supported")));
  ambrix_write (fullfile (folder, "rest"), s);
  assert (ambrix_read (fullfile (folder, "rest")).data, s.data);
endfunction

[folder, cleanup] = scratchFolder ();
testFilesAreClosedAlsoAfterErrors (folder);
testFailuresLeaveNoFiles (folder);
testNamesOfFilesAreAnyText (folder);
testNamesOfVariablesAndAttributesAreAnyText (folder);
testWhatIsNotSupportedIsNamedInAWarning (folder);
