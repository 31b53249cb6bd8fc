## 64-bit integers and TT2000 times in the functions for whole files: no digit is lost, and the
## setting of `ambrix_extended` neither matters nor changes.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

## Values that are no doubles, the extremes and those next to them.
function values = demanding ()
  [least, most, precise] = deal (intmin ("int64"), intmax ("int64"), bitshift (int64 (1), 53));
  values = [least + (0:3), most - (0:3), precise + (-1:2)];
endfunction

function s = written (folder, s, varargin)
  file = fullfile (folder, "written");
  ambrix_write (file, s, "overwrite");
  s = ambrix_read (file, {}, varargin{:});
endfunction

## int64 == int64 compares all bits, where assert would make doubles of them.
function assertSame (found, expected)
  assert (class (found), "int64");
  assert (class (expected), "int64");
  assert (size (found), size (expected));
  assert (all (found(:) == expected(:)));
endfunction

function s = timesOf (values)
  s.data.t = values;
  s.variables.t.datatype = "CDF_TIME_TT2000";
endfunction

## Each datatype, in each majority, order of records and compression.
function testValuesAreWrittenAndReadBitForBit (folder)
  values = reshape (demanding (), 2, 3, 2);
  choices = {"CDF_INT8", "CDF_TIME_TT2000"; "ROW_MAJOR", "COLUMN_MAJOR"; "first", "last"; ...
             "NO_COMPRESSION", "GZIP_COMPRESSION"};
  for k = 0:15
    [datatype, majority, records, compression] = ...
      choices{sub2ind(size (choices), 1:4, bitget (k, 1:4) + 1)};
    s = struct ("data", struct ("v", values));
    s.variables.v = struct ("datatype", datatype, "compression", compression);
    s.file.majority = majority;
    s.options.records = records;
    r = written (folder, s, "records", records);
    assertSame (r.data.v, values);
    assert (r.variables.v.datatype, datatype);
    assert (r.variables.v.sizes, merge (strcmp (records, "first"), [3, 2], [2, 3]));
    assert (r.variables.v.compression, compression);
    assert (r.file.majority, majority);
    assert (r.leftOut, cell (0, 1));
    assertSame (written (folder, r, "records", records).data.v, values);
  endfor
endfunction

function testPartsAreRead (folder)
  values = reshape (demanding (), 4, 3);
  file = fullfile (folder, "parts");
  ambrix_write (file, struct ("v", values));
  assertSame (ambrix_read (file, "v", "range", [2, 4, 2]), values([2, 4],:));
  assertSame (ambrix_read (file, "v", "slab", {[1, 3, 2]}), values(:,[1, 3]));
  assertSame (ambrix_read (file, "v", "range", [2, 1]), zeros (0, 3, "int64"));
  assert (ambrix_info (file).variables.v.datatype, "CDF_INT8");
endfunction

## Pad values, sparse records and entries, of the datatype that they had.
function testWhatBelongsToVariablesIsKept (folder)
  fill = intmin ("int64") + 9;
  for datatype = {"CDF_INT8", "CDF_TIME_TT2000"}
    v = struct ("datatype", datatype{1}, "padValue", fill, "written", 2, ...
                "sparseRecords", "PAD_SPARSERECORDS");
    v.attributes = struct ("FILLVAL", fill, "VALIDMIN", fill + 2, "note", demanding ());
    s = struct ("data", struct ("v", [fill + 1; fill; fill; 9]), ...
                "variables", struct ("v", v), "attributes", struct ("all", demanding ()));
    r = written (folder, s);
    for k = 1:2
      assertSame (r.data.v, s.data.v);
      assertSame (r.variables.v.padValue, fill);
      assert (r.variables.v.written, 2);
      assertSame (r.variables.v.attributes.FILLVAL, fill);
      assertSame (r.variables.v.attributes.VALIDMIN, fill + 2);
      assertSame (r.variables.v.attributes.note, demanding ());
      assertSame (r.attributes.all, demanding ());
      assert ({r.attributeList.name}, {"all", "FILLVAL", "VALIDMIN", "note"});
      assert ([r.attributeList.datatypes], {"CDF_INT8", datatype{1}, datatype{1}, "CDF_INT8"});
      r = written (folder, r);
    endfor
  endfor
endfunction

## The value that the library pads with where none was set is a time, too.
function testPadValuesOfTheLibrary (folder)
  v = struct ("datatype", "CDF_TIME_TT2000", "sparseRecords", "PAD_SPARSERECORDS");
  r = written (folder, struct ("data", struct ("v", int64 (5)), "variables", struct ("v", v)));
  assertSame (r.variables.v.padValue, intmin ("int64") + 1);
  r.data.v = r.variables.v.padValue;
  assert (written (folder, r, "time").data.v, datenum (0, 1, 1));
  assertSame (written (folder, written (folder, r, "time")).data.v, r.data.v);
endfunction

## As day numbers: with fill values, before there were leap seconds, and at the last of them.
function testTimesAreDayNumbers (folder)
  days = [datenum(1968, 12, 24, 9, 30, 0.5), datenum(2016, 12, 31, 23, 59, 59); ...
          datenum(2017, 1, 1), NaN];
  s = timesOf (days);
  r = written (folder, s);
  expected = ambrix_computeTT2000 ([1968, 2017, 2016; 12, 1, 12; 24, 1, 31; 9, 0, 23; 30, 0, 59; ...
                                    0, 0, 59; 500, 0, 0; zeros(2, 3)]);
  assertSame (r.data.t(1:3), expected);
  assertSame (r.data.t(4), intmin ("int64"));
  for records = {"first", "last"}
    r = written (folder, s, "time", "records", records{1});
    assert (r.data.t, merge (strcmp (records{1}, "first"), days, days.'));
    assert (r.options.time);
    assertSame (written (folder, r, "records", records{1}).data.t(1), expected(1));
  endfor
endfunction

function testTimesInALeapSecondAreThoseOfTheNextDay (folder)
  leap = ambrix_computeTT2000 ([2016; 12; 31; 23; 59; 60; 500; 0; 0]);
  s = timesOf (leap);
  assertSame (written (folder, s).data.t, leap);
  assert (written (folder, s, "time").data.t, datenum (2017, 1, 1, 0, 0, 0.5));
  assertSame (written (folder, written (folder, s, "time")).data.t, leap + int64 (1e9));
endfunction

function testWhatIsNoTimeIsAnError (folder)
  file = fullfile (folder, "bad");
  for value = {1e15, datenum(1600, 1, 1), datenum(2300, 1, 1), Inf, -1e31}
    s = timesOf (value{1});
    err = __ambrix_raised__ (@() ambrix_write (file, s));
    assert (err.identifier, "ambrix:invalidTime");
    assert (any (strfind (err.message, "variable \"t\" must be of class int64, or serial day")));
  endfor
  s.data.t = single (7e5);
  err = __ambrix_raised__ (@() ambrix_write (file, s));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:datatypeMismatch");
  s.variables.t.datatype = "CDF_INT8";
  s.data.t = 5;
  err = __ambrix_raised__ (@() ambrix_write (file, s));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:datatypeMismatch");
endfunction

## Also after errors. The functions of the commands go on refusing the datatypes.
function testTheSettingNeitherMattersNorChanges (folder)
  file = fullfile (folder, "setting");
  s = struct ("data", struct ("v", int64 (7)), "attributes", struct ("a", int64 (8)));
  calls = {@() ambrix_write(file, s, "overwrite"), @() ambrix_read(file), ...
           @() ambrix_read(file, "v"), @() fieldnames(ambrix_info (file)), ...
           @() isequal(ambrix_check (file), true), ...
           @() ambrix_read(file, "none"), @() ambrix_read(file, "v", "range", [0, 1]), ...
           @() ambrix_write(file, struct ("data", struct ("v", {{1}})), "overwrite"), ...
           @() ambrix_plot(file, "none")};
  for setting = [false, true, false]
    ambrix_extended (setting);
    for call = calls
      __ambrix_raised__ (call{1});
      assert (ambrix_extended (), setting);
    endfor
    assertSame (ambrix_read (file).data.v, int64 (7));
  endfor
  id = ambrix_open (file);
  err = __ambrix_raised__ (@() ambrix_getVarData (id, 0, 0));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue");
  ambrix_close (id);
endfunction

## The axis of such times, and 64-bit integers over it; `ambrix_plot` draws what this tells.
function testPlotsAreOverTimes (folder)
  file = fullfile (folder, "plotted");
  times = ambrix_computeTT2000 ([2024; 5; 6; 7; 8; 9; 0; 0; 0]) + int64 ([0; 5e8; 0; 1e9]);
  s.data = struct ("Epoch", times, "counts", int64 ([3; 5; -1; 4]));
  s.data.Epoch(3) = intmin ("int64");
  s.variables.Epoch.datatype = "CDF_TIME_TT2000";
  s.variables.counts.attributes = struct ("FILLVAL", int64 (-1), "UNITS", "1");
  ambrix_write (file, s);
  id = ambrix_open (file);
  closing = onCleanup (@() ambrix_close (id));
  picture = __ambrix_plotData__ (id, "counts", []);
  assert (picture.values, [3; 5; NaN; 4]);
  assert (picture.x.isTime);
  assert (picture.x.label, "Epoch");
  assert (picture.x.first, "2024-05-06 07:08");
  assert (picture.x.values, datenum (2024, 5, 6, 7, 8, [9; 9.5; NaN; 10]), 1e-9);
  picture = __ambrix_plotData__ (id, "Epoch", [2, 4]);
  assert (picture.units, "days since 2024-05-06");
  assert (isnan (picture.values), [false; true; false]);
endfunction

function testFilesAreChecked (folder)
  file = fullfile (folder, "checked");
  s.data.t = int64 (1:5000).';
  s.variables.t = struct ("datatype", "CDF_TIME_TT2000", "compression", "GZIP_COMPRESSION");
  ambrix_write (file, s);
  assert (nthargout (2, @ambrix_check, file), "sound");
  bytes = fileread ([file ".cdf"]);
  place = strfind (bytes, "\x1f\x8b")(1) + 15;  # in the compressed values
  stream = fopen ([file ".cdf"], "r+");
  fseek (stream, place);
  fwrite (stream, 255 * ones (1, 20), "uint8");
  fclose (stream);
  [sound, report] = ambrix_check (file);
  assert (sound, false);
  assert (strncmp (report, "not sound: ", 11));
endfunction

[folder, cleanup] = scratchFolder ();
testValuesAreWrittenAndReadBitForBit (folder);
testPartsAreRead (folder);
testWhatBelongsToVariablesIsKept (folder);
testPadValuesOfTheLibrary (folder);
testTimesAreDayNumbers (folder);
testTimesInALeapSecondAreThoseOfTheNextDay (folder);
testWhatIsNoTimeIsAnError (folder);
testTheSettingNeitherMattersNorChanges (folder);
testPlotsAreOverTimes (folder);
testFilesAreChecked (folder);
