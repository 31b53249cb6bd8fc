## -*- texinfo -*-
## @deftypefn {} {[@var{id}, @var{closer}] =} __ambrix_openToRead__ (@var{file})
## Open a file, or take one that is open, to be read.
##
## A file opened here is closed when @var{closer} is cleared. It is set read-only: the CDF library
## then finds variables and attributes faster.
## @end deftypefn

function [id, closer] = __ambrix_openToRead__ (file)
  closer = [];
  if (isa (file, "uint64"))
    id = file;
    return;
  endif
  if (! ischar (file) || rows (file) > 1)
    error ("ambrix:invalidFile",
           "ambrix: give the file as a path, or as an identifier from ambrix_open");
  endif
  id = __ambrix__ ("open", tilde_expand (file));
  closer = onCleanup (@() __ambrix__ ("-abandon", id));
  __ambrix__ ("setReadOnlyMode", id, -1);
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! assert (__ambrix_openToRead__ (id), id);
%! ambrix_close (id);
%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! [id, closer] = __ambrix_openToRead__ ("example.cdf");
%! assert (ambrix_getName (id), "example");
%! clear closer
%! err = __ambrix_raised__ (@() ambrix_close (id));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:invalidFileId");
%!error id=ambrix:invalidFile __ambrix_openToRead__ (1)
%!error id=ambrix:invalidFile __ambrix_openToRead__ (["a"; "b"])
%!error id=TOLVEX:ambrix:cdflib:fileOpenError __ambrix_openToRead__ ("no such file")
