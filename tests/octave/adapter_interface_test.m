## What a module sees of Octave, asked for by a module that tells.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));
rmpath (getenv ("AMBRIX_OCTAVE"));
addpath (getenv ("AMBRIX_PROBE"));

function testEveryClassHasItsNumberAndName ()
  values = {
     1, "cell", {}; 2, "struct", struct(); 3, "logical", true; 4, "char", "a"; 6, "double", 1;
     7, "single", single(1); 8, "int8", int8(1); 9, "uint8", uint8(1); 10, "int16", int16(1);
    11, "uint16", uint16(1); 12, "int32", int32(1); 13, "uint32", uint32(1);
    14, "int64", int64(1); 15, "uint64", uint64(1);
     6, "double", 1:3; 6, "double", 1:0; 6, "double", sparse(1); 6, "double", eye(2);
     6, "double", eye(2)([2, 1],:); 6, "double", 1i; 6, "double", find([1, 1]); 6, "double", [];
     6, "double", sparse(1i); 7, "single", single(1i); 7, "single", single(eye(2));
     3, "logical", sparse(true); 3, "logical", [true, false]; 4, "char", 'a'; 4, "char", "";
     2, "struct", struct("a", {1, 2}); 8, "int8", int8([]);
     0, "function_handle", @sin; 0, "function_handle", @() 1; 0, "containers.Map", containers.Map();
     0, "inputParser", inputParser()
  };
  for k = 1:rows (values)
    [number, name] = __ambrix__ ("inspect", values{k,3});
    assert ({number, name}, values(k,1:2));
  endfor
endfunction

function testSizesAreOctaves ()
  for value = {1, "", "text", zeros(0, 3), ones(2, 3, 4), ones(2, 1, 1, 2), 1:5, sparse(2, 3), ...
               eye(3), {1, 2}, struct("a", {1, 2}), int8([1; 2]), true(3, 1)}
    [~, ~, count, sizes] = __ambrix__ ("inspect", value{1});
    assert (count, numel (value{1}));
    assert (sizes, size (value{1}));
  endfor
endfunction

function testClassesWithoutPlainElementsHaveNoData ()
  for value = {{1}, struct(), @sin, containers.Map()}
    [~, ~, ~, ~, hasData] = __ambrix__ ("inspect", value{1});
    assert (hasData, 0);
  endfor
endfunction

function testCharactersAreBytesWidened ()
  assert (__ambrix__ ("units", char (0:255)), 0:255);
  assert (__ambrix__ ("units", ["ab"; "cd"]), double ("acbd"));
  [text, copy] = __ambrix__ ("text", [65, 255, 256 + 66, 65536 - 23]);
  assert (double (text), [65, 255, 66, 233]);
  assert (copy, text);
endfunction

function testFileNamesAreBytesOfUtf8 ()
  assert (__ambrix__ ("narrow", double ("Zürich €")), "Zürich €");
  assert (__ambrix__ ("narrow", [90, 252, 114]), -1);
  assert (__ambrix__ ("narrow", [237, 160, 128]), -1);  # a surrogate
endfunction

function testCellsAreReached ()
  assert (__ambrix__ ("cells", {1, "a"; {}, int8(1)}), [6, 1, 4, 8, -1]);
  assert (__ambrix__ ("cells", 5), [-1, -1]);
endfunction

function testCellsAreMade ()
  assert (__ambrix__ ("nested"), {7, "text"; {int8(0)}, []});
  assert (raised (@() __ambrix__ ("outside")).identifier, "TOLVEX:host:unexpectedFailure");
endfunction

function testNewArraysAreZeroAndShapedAsOctaveDoes ()
  shapes = {[], [0, 0]; 3, [3, 1]; [2, 3], [2, 3]; [2, 3, 1, 1], [2, 3]; [1, 1, 2], [1, 1, 2];
            [0, 5], [0, 5]; [2, 0, 3], [2, 0, 3]; [1, 1], [1, 1]};
  classes = {6, "double"; 7, "single"; 8, "int8"; 9, "uint8"; 10, "int16"; 11, "uint16";
             12, "int32"; 13, "uint32"; 14, "int64"; 15, "uint64"};
  for k = 1:rows (shapes)
    for c = 1:rows (classes)
      assert (__ambrix__ ("zeros", shapes{k,1}, classes{c,1}, 0), zeros (shapes{k,2}, classes{c,2}));
    endfor
    assert (__ambrix__ ("falses", shapes{k,1}), false (shapes{k,2}));
  endfor
endfunction

function testAsManyResultsAsThereAreSlots ()
  all = cell (1, 8);
  [all{:}] = __ambrix__ ("many");
  assert (all, num2cell ([8, 1:7]));
  assert (__ambrix__ ("many"), 1);
  [~, second] = __ambrix__ ("many");
  assert (second, 1);
endfunction

function testWarningsGoOnAndCanBeTurnedOff ()
  state = warning ("on", "TEST:probe:told");
  quiet = evalc ('assert (__ambrix__ ("warns"), 1);');
  [text, identifier] = lastwarn ();
  assert (identifier, "TEST:probe:told");
  assert (text, "TEST:probe:told: -5, n%s, \342\202\254");
  lastwarn ("none");
  warning ("off", "TEST:probe:told");
  assert (__ambrix__ ("warns"), 1);
  assert (lastwarn (), "none");
  warning ("error", "TEST:probe:told");
  err = raised (@() __ambrix__ ("warns"));
  assert (err.identifier, "TEST:probe:told");
  warning (state);
endfunction

function testErrorsTellTheValuesOfTheirMessage ()
  err = raised (@() __ambrix__ ("raises"));
  assert (err.identifier, "TEST:probe:told");
  assert (err.message, "TEST:probe:told: -5, n%s, \342\202\254");
endfunction

function testForeignExceptionsBecomeErrors ()
  err = raised (@() __ambrix__ ("throws", 0));
  assert (err.identifier, "TOLVEX:host:unexpectedFailure");
  assert (! isempty (strfind (err.message, "(a foreign error)")));
  assert (raised (@() __ambrix__ ("throws", 1)).identifier, "TOLVEX:host:outOfMemory");
  err = raised (@() __ambrix__ ("throws", 2));
  assert (err.identifier, "TOLVEX:host:unexpectedFailure");
endfunction

function testMemoryThatTheModuleLeavesIsReclaimed ()
  assert (raised (@() __ambrix__ ("litters", 2 ^ 60)).identifier, "TOLVEX:host:outOfMemory");
  resident = @() str2double (regexp (fileread ("/proc/self/statm"), " (\\d+)", "tokens", "once"){1});
  before = resident ();
  for k = 1:200
    raised (@() __ambrix__ ("litters", 2 ^ 20));
  endfor
  assert ((resident () - before) * 4096 < 20e6);  # and not 200 MB
endfunction

tests = {@testEveryClassHasItsNumberAndName, @testSizesAreOctaves, ...
         @testClassesWithoutPlainElementsHaveNoData, @testCharactersAreBytesWidened, ...
         @testFileNamesAreBytesOfUtf8, @testCellsAreReached, @testCellsAreMade, ...
         @testNewArraysAreZeroAndShapedAsOctaveDoes, @testAsManyResultsAsThereAreSlots, ...
         @testWarningsGoOnAndCanBeTurnedOff, @testErrorsTellTheValuesOfTheirMessage, ...
         @testForeignExceptionsBecomeErrors, @testMemoryThatTheModuleLeavesIsReclaimed};
for k = 1:numel (tests)
  printf ("%s\n", func2str (tests{k}));
  tests{k} ();
endfor
printf ("%d tests passed\n", numel (tests));
