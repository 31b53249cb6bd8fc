## The functions of the package: those of the commands against the table of commands and the running
## module, and the tests and help texts in all of them.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

function files = functionFiles ()
  files = glob (fullfile (getenv ("AMBRIX_OCTAVE"), "*.m"));
endfunction

## All functions that users call: for whole files, and one for each command.
function names = expectedFunctions (commands)
  names = cellfun (@(command) ["ambrix_" command.name], commands, "UniformOutput", false);
  names = sort ([names; {"ambrix"; "ambrix_info"; "ambrix_read"; "ambrix_write"; "ambrix_plot"; ...
                        "ambrix_check"; "ambrix_extended"; "ambrix_computeTT2000"; ...
                        "ambrix_tt2000Breakdown"}]);
endfunction

function commands = table ()
  root = fileparts (fileparts (fileparts (mfilename ("fullpath"))));
  commands = jsondecode (fileread (fullfile (root, "docs", "commands.json"))).commands;
endfunction

## At least and at most.
function [least, most] = counts (command)
  most = numel (command.arguments);
  least = 0;
  for k = 1:most
    argument = command.arguments(k);
    if (iscell (argument))
      argument = argument{1};
    endif
    least += ! (isfield (argument, "optional") && isequal (argument.optional, true));
  endfor
endfunction

function identifier = raisedWith (name, count)
  identifier = "";
  try
    feval (["ambrix_" name], repmat ({{}}, 1, count){:});
  catch err
    identifier = err.identifier;
  end_try_catch
endfunction

function testThereIsAFunctionForEachCommand (commands)
  [~, names] = cellfun (@fileparts, functionFiles (), "UniformOutput", false);
  isInternal = strncmp (names, "__ambrix_", 9);
  assert (numel (commands), 91);
  assert (sort (names(! isInternal)), expectedFunctions (commands));
  assert (all (strncmp (flip (names(isInternal){1})(1:2), "__", 2)));
endfunction

## INDEX tells users what there is.
function testTheIndexListsEachFunction (commands)
  index = fileread (fullfile (getenv ("AMBRIX_OCTAVE"), "INDEX"));
  listed = regexp (index, '^ (ambrix\w*)$', "tokens", "lineanchors");
  assert (sort ([listed{:}]'), expectedFunctions (commands));
endfunction

function testFunctionsTakeAndReturnAsManyAsTheTableSays (commands)
  wrong = "TOLVEX:ambrix:validate:wrongNumberOfInputs";
  for k = 1:numel (commands)
    [least, most] = counts (commands{k});
    name = commands{k}.name;
    assert (nargout (["ambrix_" name]) == numel (commands{k}.results), name);
    for count = setdiff ([least - 1, most + 1, most + 9], -1)
      assert (raisedWith (name, count), wrong, name);
    endfor
    for count = setdiff ([least, most], 0)
      assert (! strcmp (raisedWith (name, count), wrong), name);
    endfor
  endfor
endfunction

function testEveryFunctionHasHelp ()
  for file = functionFiles ()'
    [~, name] = fileparts (file{1});
    [text, form] = get_help_text (name);
    assert (form, "texinfo", name);
    assert (any (strfind (text, [" " name " ("])), name);
  endfor
endfunction

## What users do at the prompt.
function testFunctionsAreFoundAndTheirResultsIndexed ()
  assert (strtrim (completion_matches ("ambrix_hyperG")), "ambrix_hyperGetVarData");
  found = evalc ("lookfor CDF");
  for name = {"ambrix", "ambrix_read", "ambrix_create"}
    assert (any (regexp (found, ["^" name{1} " +\\w"], "once", "lineanchors")), name{1});
  endfor
  assert (any (strfind (evalc ("help ambrix"), "ambrix_plot (FILE, NAME)")));
  [id, restore] = __ambrix_example__ ();
  assert (ambrix_read (id, "Flux")(2,1), single (7));
  ambrix_close (id);
endfunction

## Demonstrations run, and leave nothing behind.
function testDemosRun ()
  [folder, cleanup] = scratchFolder ();
  back = cd (folder);
  for name = {"ambrix_info", "ambrix_read", "ambrix_write"}
    shown = evalc (["demo " name{1} " 1"]);
    assert (isempty (strfind (shown, "error")), shown);
    assert (any (strfind (shown, "file = [tempname() \".cdf\"]")), shown);
  endfor
  assert (numel (readdir (folder)), 2);
  cd (back);
endfunction

function testTestsInFunctionsPass ()
  for file = functionFiles ()'
    [passed, count] = test (file{1}, "quiet", stdout);
    assert (count > 0, "%s has no tests", file{1});
    assert (passed == count, "%d of %d tests in %s passed", passed, count, file{1});
  endfor
endfunction

commands = table ();
testThereIsAFunctionForEachCommand (commands);
testTheIndexListsEachFunction (commands);
testFunctionsTakeAndReturnAsManyAsTheTableSays (commands);
testEveryFunctionHasHelp ();
testFunctionsAreFoundAndTheirResultsIndexed ();
testDemosRun ();
testTestsInFunctionsPass ();
