## Octave as a host passes what every host must: the lists are in tests/conformance.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));
rmpath (getenv ("AMBRIX_OCTAVE"));
addpath (getenv ("AMBRIX_PROBE"));

function testEveryCheckPasses ()
  [names, findings] = __ambrix__ ("conformance");
  assert (rows (names) > 0);
  assert ([names(! strcmp (findings, "")), findings(! strcmp (findings, ""))], cell (0, 2));
endfunction

function testWhatCannotBeIsRefused ()
  [names, identifiers] = __ambrix__ ("refusals");
  assert (rows (names) > 0);
  for k = 1:rows (names)
    err = raised (@() __ambrix__ ("refuse", k - 1));
    assert ([names{k} ": " err.identifier], [names{k} ": " identifiers{k}]);
  endfor
endfunction

function testArraysComeBackAsTheyWent ()
  names = __ambrix__ ("samples");
  assert (rows (names) > 0);
  for k = 1:rows (names)
    found = __ambrix__ ("recognise", k - 1, __ambrix__ ("sample", k - 1));
    assert ([names{k} ": " found], [names{k} ": "]);
  endfor
endfunction

tests = {@testEveryCheckPasses, @testWhatCannotBeIsRefused, @testArraysComeBackAsTheyWent};
for k = 1:numel (tests)
  printf ("%s\n", func2str (tests{k}));
  tests{k} ();
endfor
printf ("%d tests passed\n", numel (tests));
