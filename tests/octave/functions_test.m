## The functions of the package: those of the commands against the table of commands and the running
## module, and the tests and help texts in all of them.
1;

function files = functionFiles ()
  package = fullfile (getenv ("AMBRIX_OCTAVE"), "+ambrix");
  files = [glob(fullfile (package, "*.m")); glob(fullfile (package, "+internal", "*.m"))];
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
    feval (["ambrix." name], repmat ({{}}, 1, count){:});
  catch err
    identifier = err.identifier;
  end_try_catch
endfunction

function testThereIsAFunctionForEachCommand (commands)
  names = cellfun (@(command) command.name, commands, "UniformOutput", false);
  [~, functions] = cellfun (@fileparts, functionFiles (), "UniformOutput", false);
  here = functions(! strcmp (cellfun (@fileparts, functionFiles (), "UniformOutput", false),
                             fullfile (getenv ("AMBRIX_OCTAVE"), "+ambrix", "+internal")));
  assert (numel (names), 91);
  assert (sort (here), sort ([names; {"info"; "read"; "write"; "plot"}]));
endfunction

## INDEX tells users what there is.
function testTheIndexListsEachFunction (commands)
  names = cellfun (@(command) command.name, commands, "UniformOutput", false);
  index = fileread (fullfile (getenv ("AMBRIX_OCTAVE"), "INDEX"));
  listed = regexp (index, '^ +ambrix\.(\w+)$', "tokens", "lineanchors");
  assert (sort ([listed{:}]'), sort ([names; {"info"; "read"; "write"; "plot"}]));
endfunction

function testFunctionsTakeAndReturnAsManyAsTheTableSays (commands)
  wrong = "TOLVEX:ambrix:validate:wrongNumberOfInputs";
  for k = 1:numel (commands)
    [least, most] = counts (commands{k});
    name = commands{k}.name;
    assert (nargout (["ambrix." name]), numel (commands{k}.results), name);
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
    [folder, name] = fileparts (file{1});
    [~, above] = fileparts (folder);
    whole = ["ambrix." strrep(above, "+internal", "internal.") name];
    whole = strrep (whole, "+ambrix", "");
    [text, form] = get_help_text (whole);
    assert (form, "texinfo", whole);
    assert (any (strfind (text, ["ambrix." ])), whole);
  endfor
endfunction

function testTestsInFunctionsPass ()
  for file = functionFiles ()'
    [passed, count] = test (file{1}, "quiet", stdout);
    assert (count > 0, "%s has no tests", file{1});
    assert (passed, count, file{1});
  endfor
endfunction

commands = table ();
testThereIsAFunctionForEachCommand (commands);
testTheIndexListsEachFunction (commands);
testFunctionsTakeAndReturnAsManyAsTheTableSays (commands);
testEveryFunctionHasHelp ();
testTestsInFunctionsPass ();
