## Errors and warnings as Octave's users meet them, and how many results a call has.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

function testErrorsHaveIdentifierTextAndStack (id, folder)
  err = raised (@() __ambrix__ ("noSuchCommand"));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidOperation");
  assert (err.message, ["There is no command \"noSuchCommand\": see that it is spelled exactly, " ...
                        "upper and lower case included."]);
  assert (any (strcmp ({err.stack.name}, "testErrorsHaveIdentifierTextAndStack")));
  err = raised (@() __ambrix__ ("close", id, 1));
  assert (err.identifier, "TOLVEX:ambrix:validate:wrongNumberOfInputs");
endfunction

function testTheTextsOfTheLibraryAreTold (id, folder)
  err = raised (@() __ambrix__ ("getVarName", id, 7));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:libraryFailure");
  assert (strncmp (err.message, "The CDF library reports in CDFgetzVarName: NO_SUCH_VAR", 50));
  assert (! isspace (err.message(end)));
endfunction

## The characters of a name count in linear order, whatever its shape.
function testNamesOfAnyShapeReachTheModuleWithoutAWarning (id, folder)
  lastwarn ("");
  err = raised (@() __ambrix__ (["op"; "en"]));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidOperation");
  assert (! isempty (strfind (err.message, "\"oepn\"")));
  err = raised (@() __ambrix__ (["op"; "en"], id));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidOperation");
  err = raised (@() __ambrix__ (["-extended"; "xxxxxxxxx"]));
  assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidOperation");
  err = raised (@() __ambrix__ (reshape ("open", [1, 1, 4])));
  assert (err.identifier, "TOLVEX:ambrix:validate:wrongNumberOfInputs");
  assert (lastwarn (), "");
endfunction

function testTextsWithPercentSignsStayAsTheyAre (id, folder)
  err = raised (@() __ambrix__ ("100%s%d%n"));
  assert (! isempty (strfind (err.message, "\"100%s%d%n\"")));
endfunction

function testClassesAreToldByTheirOctaveNames (id, folder)
  variable = addVariable (id, 45, []);
  values = {single(1), "single"; int64(1), "int64"; true, "logical"; "x", "char"; {1}, "cell"; ...
            struct(), "struct"; @sin, "function_handle"; containers.Map(), "containers.Map"; ...
            sparse(true), "logical"; inputParser(), "inputParser"};
  for k = 1:rows (values)
    err = raised (@() __ambrix__ ("putVarRecordData", id, variable, 0, values{k,1}));
    assert (err.identifier, "TOLVEX:ambrix:cdflib:datatypeMismatch");
    assert (strncmp (err.message, ["Data of class " values{k,2} " don't fit"], 14));
    assert (! isempty (strfind (err.message, [" " values{k,2} " "])));
  endfor
endfunction

function testWhatHasNoNumbersIsRefusedWhereNumbersAreNeeded (id, folder)
  for value = {{1}, struct(), @sin, containers.Map()}
    err = raised (@() addVariable (id, 45, value{1}));
    assert (err.identifier, "TOLVEX:ambrix:validate:argumentNotDoublePrecision");
    err = raised (@() __ambrix__ ("getVarName", id, value{1}));
    assert (err.identifier, "TOLVEX:ambrix:validate:argumentNotDoubleScalar");
  endfor
  for value = {double(id), int64(id), [id, id], uint64([])}
    err = raised (@() __ambrix__ ("getMajority", value{1}));
    assert (err.identifier, "TOLVEX:ambrix:validate:argumentNotUint64Scalar");
  endfor
endfunction

## A command that is no text makes the standard library throw, which must not end the process.
function testForeignExceptionsBecomeErrors (id, folder)
  for command = {3, {}, struct(), @sin, true, int8(65)}
    err = raised (@() __ambrix__ (command{1}));
    assert (err.identifier, "TOLVEX:host:unexpectedFailure");
    assert (! isempty (strfind (err.message, "null not valid")));
  endfor
  err = raised (@() __ambrix__ ("open", 3));
  assert (err.identifier, "TOLVEX:host:unexpectedFailure");
endfunction

function testSizesThatCannotBeAreRefused (id, folder)
  variable = addVariable (id, 45, []);
  slab = @(records) __ambrix__ ("hyperGetVarData", id, variable, 0, records, 1, [], [], []);
  __ambrix__ ("putVarRecordData", id, variable, 0, 1);
  assert (raised (@() slab (-1)).identifier, "TOLVEX:host:badDimension");
  assert (raised (@() slab (2 ^ 62)).identifier, "TOLVEX:host:outOfMemory");
  assert (raised (@() slab (2 ^ 47)).identifier, "TOLVEX:host:outOfMemory");
  assert (slab (1), 1);
endfunction

function testWithoutACommandTheUsageIsTold (id, folder)
  assert (raised (@() __ambrix__ ()).identifier, "Octave:invalid-fun-call");
endfunction

function testAsManyResultsAsAskedFor (id, folder)
  variable = addVariable (id, 45, [2, 3]);
  name = __ambrix__ ("inquireVar", id, variable);
  assert (ischar (name));
  [name, datatype, elements] = __ambrix__ ("inquireVar", id, variable);
  assert ({datatype, elements}, {"cdf_double", 1});
  all = cell (1, 6);
  [all{:}] = __ambrix__ ("inquireVar", id, variable);
  assert (all(4:6), {[2, 3], true, [true, true]});
  [~, ~, ~, sizes] = __ambrix__ ("inquireVar", id, variable);
  assert (sizes, [2, 3]);
  err = raised (@() nthargout (7, 7, @__ambrix__, "inquireVar", id, variable));
  assert (! isempty (err.message));
  __ambrix__ ("inquireVar", id, variable);
  assert (ans, name);
endfunction

function testACommandWithoutResultsHasNone (id, folder)
  err = raised (@() numel (__ambrix__ ("closeVar", id, addVariable (id, 4, []))));
  assert (! strncmp (err.identifier, "TOLVEX", 6));
endfunction

function testAFailureLeavesTheModuleUsable (id, folder)
  before = __ambrix__ ("getMajority", id);
  for k = 1:100
    raised (@() __ambrix__ ("getVarName", id, k));
  endfor
  assert (__ambrix__ ("getMajority", id), before);
endfunction

runTests ({@testErrorsHaveIdentifierTextAndStack, @testTheTextsOfTheLibraryAreTold, ...
           @testNamesOfAnyShapeReachTheModuleWithoutAWarning, ...
           @testTextsWithPercentSignsStayAsTheyAre, @testClassesAreToldByTheirOctaveNames, ...
           @testWhatHasNoNumbersIsRefusedWhereNumbersAreNeeded, ...
           @testForeignExceptionsBecomeErrors, @testSizesThatCannotBeAreRefused, ...
           @testWithoutACommandTheUsageIsTold, @testAsManyResultsAsAskedFor, ...
           @testACommandWithoutResultsHasNone, @testAFailureLeavesTheModuleUsable});
