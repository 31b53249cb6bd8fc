## -*- texinfo -*-
## @deftypefn {} {} __ambrix_readSteps__ (@var{file})
## Read everything in a file, and print a line @samp{at WHAT} before each step and at the end; or
## @samp{failed MESSAGE} when an error ends it.
## @end deftypefn

function __ambrix_readSteps__ (file)
  at ("the beginning");
  try
    readAll (file);
    at ("end");
  catch err
    printf ("failed %s\n", strrep (err.message, "\n", " "));
  end_try_catch
endfunction

function readAll (file)
  before = warning ("off", "all");
  restore = onCleanup (@() warning (before));
  ambrix_setValidate (-1);
  [id, closer] = __ambrix_openToRead__ (file);
  at ("the descriptions");
  s = __ambrix_describeFile__ (id);
  for [v, name] = s.variables
    at (sprintf ("variable \"%s\"", name));
    if (v.supported)
      readVariable (id, v, inHostOrder (s.file.majority, v.sizes));
    endif
  endfor
endfunction

function sizes = inHostOrder (majority, sizes)
  if (strcmp (majority, "ROW_MAJOR"))
    sizes = fliplr (sizes);
  endif
endfunction

## Some records at a time, so that it can be seen that reading goes on.
function readVariable (id, v, sizes)
  for first = 0:1000:v.records - 1
    count = min (1000, v.records - first);
    __ambrix__ ("-extended", "hyperGetVarData", id, v.number, first, count, 1, 0 * sizes, sizes,
                ones (size (sizes)));
    printf (".\n");
    fflush (stdout);
  endfor
endfunction

function at (what)
  printf ("at %s\n", what);
  fflush (stdout);
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! before = warning ("query", "ambrix:unsupportedDatatype").state;
%! said = evalc ("__ambrix_readSteps__ (\"example\")");
%! assert (warning ("query", "ambrix:unsupportedDatatype").state, before);
%! assert (said, ["at the beginning\nat the descriptions\nat variable \"Time\"\n.\n" ...
%!                "at variable \"Flux\"\n.\nat variable \"Mode\"\n.\nat end\n"]);
%!test
%! said = evalc ("__ambrix_readSteps__ (\"no such file\")");
%! assert (strncmp (said, "at the beginning\nfailed The file could not be opened", 50));
