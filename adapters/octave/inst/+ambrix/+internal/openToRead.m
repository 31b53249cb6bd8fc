## -*- texinfo -*-
## @deftypefn {} {[@var{id}, @var{closer}] =} ambrix.internal.openToRead (@var{file})
## Open a file, or take one that is open, to be read.
##
## A file opened here is closed when @var{closer} is cleared. It is set read-only: the CDF library
## then finds variables and attributes faster.
## @end deftypefn

function [id, closer] = openToRead (file)
  closer = [];
  if (isa (file, "uint64"))
    id = file;
    return;
  endif
  if (! ischar (file) || rows (file) > 1)
    error ("ambrix:invalidFile",
           "ambrix: give the file as a path, or as an identifier from ambrix.open");
  endif
  id = __ambrix__ ("open", tilde_expand (file));
  closer = onCleanup (@() __ambrix__ ("close", id));
  __ambrix__ ("setReadOnlyMode", id, -1);
endfunction

%!test
%! [id, restore] = ambrix.internal.example ();
%! assert (ambrix.internal.openToRead (id), id);
%! ambrix.close (id);
%!test
%! [id, restore] = ambrix.internal.example ();
%! ambrix.close (id);
%! [id, closer] = ambrix.internal.openToRead ("example.cdf");
%! assert (ambrix.getName (id), "example");
%! clear closer
%! err = ambrix.internal.raised (@() ambrix.close (id));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidFileId");
%!error id=ambrix:invalidFile ambrix.internal.openToRead (1)
%!error id=ambrix:invalidFile ambrix.internal.openToRead (["a"; "b"])
%!error id=TOLVEX:ambrix:cdflib:fileOpenError ambrix.internal.openToRead ("no such file")
