## Runs each function of a test script under its name, in a folder of its own with a new CDF file.
function runTests (tests)
  for k = 1:numel (tests)
    printf ("%s\n", func2str (tests{k}));
    [folder, cleanup] = scratchFolder ();
    id = __ambrix__ ("create", fullfile (folder, "new"));
    tests{k} (id, folder);
    __ambrix__ ("close", id);
    clear cleanup
  endfor
  printf ("%d tests passed\n", numel (tests));
endfunction
