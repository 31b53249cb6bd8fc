## How Octave's arrays reach the module and come back: every class and every special form.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

## Numbers and extremes, in the class of each datatype.
function values = samples ()
  values = {
     1, int8([-128, -1, 0, 127]);        2, int16([-32768, -1, 0, 32767]);
     4, [intmin("int32"), -1, 0, intmax("int32")];
    11, uint8([0, 1, 128, 255]);        12, uint16([0, 1, 32768, 65535]);
    14, uint32([0, 1, 2147483648, 4294967295]);
    21, single([-realmax("single"), NaN, -0, Inf]);
    22, [-realmax, NaN, -0, Inf];       31, [0, 1, 63e12, -1];
    41, int8([-128, -1, 0, 127]);       44, single([1.5, NaN, -Inf, 0]);
    45, [pi, NaN, -Inf, realmin]
  };
endfunction

function testEveryClassComesBackAsItWasGiven (id, folder)
  values = samples ();
  for k = 1:rows (values)
    variable = addVariable (id, values{k,1}, 4, values{k,2});
    back = __ambrix__ ("getVarRecordData", id, variable, 0);
    assert (class (back), class (values{k,2}));
    assert (back, values{k,2}.');
    if (isfloat (back))
      assert (1 ./ back, 1 ./ values{k,2}.');  # zeros with their sign
    endif
  endfor
endfunction

function testScalarsOfEveryClassComeBack (id, folder)
  values = samples ();
  for k = 1:rows (values)
    variable = addVariable (id, values{k,1}, [], values{k,2}(4));
    back = __ambrix__ ("getVarRecordData", id, variable, 0);
    assert (class (back), class (values{k,2}));
    assert (back, values{k,2}(4));
  endfor
endfunction

function testManyDimensionsKeepTheirOrder (id, folder)
  __ambrix__ ("setMajority", id, __ambrix__ ("getConstantValue", "COLUMN_MAJOR"));
  data = reshape (1:24, [2, 3, 4]);
  variable = addVariable (id, 45, [2, 3, 4], data);
  assert (__ambrix__ ("getVarRecordData", id, variable, 0), data);
  slab = __ambrix__ ("hyperGetVarData", id, variable, 0, 1, 1, [1, 0, 0], [1, 3, 2], [1, 1, 2]);
  assert (slab, data(2, :, [1, 3]));
endfunction

## What Octave keeps in a form of its own arrives as the numbers that it stands for.
function testSpecialFormsOfDoublesArriveAsNumbers (id, folder)
  [~, permutation] = sort ([3, 1, 2]);
  matrix = magic (3);
  found = find ([0, 1, 1, 0, 1]);  # Octave keeps indices lazily
  forms = {
    1:4, [1, 2, 3, 4]; 4:-1:1, [4, 3, 2, 1]; -(0:3), [-0, -1, -2, -3]; 0:0.5:1, [0, 0.5, 1];
    sparse([0, 7, 0]), [0, 7, 0]; diag([1, 2]), [1, 0; 0, 2]; eye(3)(permutation, :), [0, 1, 0; ...
    0, 0, 1; 1, 0, 0]; found, [2, 3, 5]; complex([1, 2], [3, 4]), [1, 2]; 5 + 6i, 5;
    sparse([1i, 2 + 3i]), [0, 2]; diag([1i, 2]), [0, 0; 0, 2]; complex(7, 0), 7; matrix(2, :), ...
    [3, 5, 7]; matrix(:, 2).', [1, 5, 9]; 2, 2
  };
  attribute = __ambrix__ ("createAttr", id, "forms", 1);
  for k = 1:rows (forms)
    __ambrix__ ("putAttrgEntry", id, attribute, k, 45, forms{k,1});
    assert (__ambrix__ ("getAttrgEntry", id, attribute, k)(:).', forms{k,2}(:).');
  endfor
endfunction

function testSpecialFormsOfSinglesArriveAsNumbers (id, folder)
  forms = {single(1:3), [1, 2, 3]; single([1i, 2]), [0, 2]; single(3 + 4i), 3;
           single(diag([1, 2])), [1, 0; 0, 2]};
  attribute = __ambrix__ ("createAttr", id, "forms", 1);
  for k = 1:rows (forms)
    __ambrix__ ("putAttrgEntry", id, attribute, k, 44, forms{k,1});
    assert (__ambrix__ ("getAttrgEntry", id, attribute, k)(:).', single (forms{k,2}(:).'));
  endfor
endfunction

function testIntegersAreTakenFromAnyClassOfNumbers (id, folder)
  classes = {"double", "single", "int8", "uint8", "int16", "uint16", "int32", "uint32", "int64", ...
             "uint64"};
  for k = 1:numel (classes)
    for sizes = {[2, 3], 4}
      variable = addVariable (id, 45, feval (classes{k}, sizes{1}));
      [~, ~, ~, there] = __ambrix__ ("inquireVar", id, variable);
      assert (there, sizes{1});
    endfor
  endfor
  for sizes = {true, [true, true], sparse([true, true]), char([2, 3]), 2:3, "\002\003"}
    variable = addVariable (id, 45, sizes{1});
    [~, ~, ~, there] = __ambrix__ ("inquireVar", id, variable);
    assert (there, double (full (sizes{1})));
  endfor
endfunction

function testLogicalsGoInAndComeOut (id, folder)
  for variances = {[true, false], sparse([true, false]), [-1, 0], [true; false]}
    variable = __ambrix__ ("createVar", id, sprintf ("%s%d%d", class (variances{1}), ...
                           issparse (variances{1}), iscolumn (variances{1})), ...
                           4, 1, [2, 3], false, variances{1});
    [~, ~, ~, ~, recordVariance, there] = __ambrix__ ("inquireVar", id, variable);
    assert (class (there), "logical");
    assert (there, [true, false]);
    assert (recordVariance, false);
  endfor
endfunction

function testEmptyArraysArrive (id, folder)
  for sizes = {[], zeros(1, 0), zeros(0, 3), "", int8([]), 1:0, sparse(0, 0)}
    variable = addVariable (id, 45, sizes{1});
    [~, ~, ~, there] = __ambrix__ ("inquireVar", id, variable);
    assert (class (there), "double");
    assert (isempty (there));
  endfor
endfunction

## All but the terminator: a narrowing that respects encodings would lose half of them.
function testAllBytesOfTextComeBack (id, folder)
  text = char (1:255);
  variable = __ambrix__ ("createVar", id, "text", 51, 255, [], true, []);
  __ambrix__ ("putVarRecordData", id, variable, 0, text);
  back = __ambrix__ ("getVarRecordData", id, variable, 0);
  assert (class (back), "char");
  assert (isequal (double (back(:).'), 1:255));
endfunction

function testTextsAreSingleQuotedRows (id, folder)
  name = __ambrix__ ("getVarName", id, addVariable (id, 4, []));
  assert (size (name), [1, numel(name)]);
  assert (typecast (name, "uint8")(1), uint8 ("v"));
  assert (is_sq_string (name));
  assert (__ambrix__ ("getConstantValue", "CDF_CHAR"), 51);   # text of either kind goes in
  assert (__ambrix__ ("getConstantValue", 'CDF_CHAR'), 51);
endfunction

function testCellsComeOut (id, folder)
  names = __ambrix__ ("getConstantNames");
  assert (iscellstr (names));
  assert (columns (names), 1);
  assert (any (strcmp (names, "GZIP_COMPRESSION")));
  assert (issorted (names));
endfunction

function testFileNamesAreUtf8 (id, folder)
  sample = fullfile (getenv ("AMBRIX_CDF_SAMPLES"), "example1.cdf");
  copyfile (sample, fullfile (folder, "Zürich.cdf"));
  opened = __ambrix__ ("open", fullfile (folder, "Zürich.cdf"));
  assert (__ambrix__ ("getVarName", opened, 0), "Time");
  __ambrix__ ("close", opened);
  err = raised (@() __ambrix__ ("open", [folder "/Z" char(252) "rich.cdf"]));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidCharError");
endfunction

function testWhatIsGivenStaysAsItWas (id, folder)
  values = int32 (1:6);
  copy = values;
  variable = addVariable (id, 4, 6, values);
  back = __ambrix__ ("getVarRecordData", id, variable, 0);
  back(1) = 99;
  assert (values, copy);
  assert (__ambrix__ ("getVarRecordData", id, variable, 0), copy.');
endfunction

runTests ({@testEveryClassComesBackAsItWasGiven, @testScalarsOfEveryClassComeBack, ...
           @testManyDimensionsKeepTheirOrder, @testSpecialFormsOfDoublesArriveAsNumbers, ...
           @testSpecialFormsOfSinglesArriveAsNumbers, ...
           @testIntegersAreTakenFromAnyClassOfNumbers, @testLogicalsGoInAndComeOut, ...
           @testEmptyArraysArrive, @testAllBytesOfTextComeBack, ...
           @testTextsAreSingleQuotedRows, @testCellsComeOut, @testFileNamesAreUtf8, ...
           @testWhatIsGivenStaysAsItWas});
