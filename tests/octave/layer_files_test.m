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
           @() ambrix_write(fullfile (folder, "new"), struct ("a", int64 (1))), ...
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

function testWhatIsNotSupportedIsNamedInAWarning (folder)
  root = fileparts (fileparts (fileparts (mfilename ("fullpath"))));
  samples = getenv ("AMBRIX_SAMPLES");
  if (isempty (samples))
    samples = fullfile (fileparts (root), "shared", "samples");
  endif
  file = fullfile (samples, "nasajava_test.cdf");
  if (isempty (stat (file)))
    printf ("skipped: there is no %s\n", file);
    return;
  endif
  evalc ("s = ambrix_read (file);");  # which keeps the warning from being shown
  [text, identifier] = lastwarn ();
  assert (identifier, "ambrix:unsupportedDatatype");
  assert (regexprep (strtrim (text), '^.*": ', ""), ...
          ["entry 2 of attribute \"TestDate\", variable \"newI8\" (CDF_INT8), " ...
           "variable \"tt2000\" (CDF_TIME_TT2000)"]);
  assert (! any (isfield (s.data, {"newI8", "tt2000"})));
  assert (numel (fieldnames (s.data)), 19);
  assert (s.variables.tt2000.supported, false);
  err = __ambrix_raised__ (@() ambrix_read (file, "tt2000"));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue");
  assert (any (strfind (err.message, "\"tt2000\"")));
  assert (any (strfind (err.message, "the datatype CDF_TIME_TT2000, which is not supported")));
endfunction

[folder, cleanup] = scratchFolder ();
testFilesAreClosedAlsoAfterErrors (folder);
testFailuresLeaveNoFiles (folder);
testNamesOfFilesAreAnyText (folder);
testNamesOfVariablesAndAttributesAreAnyText (folder);
testWhatIsNotSupportedIsNamedInAWarning (folder);
