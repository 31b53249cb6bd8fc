## -*- texinfo -*-
## @deftypefn {} {@var{number} =} __ambrix_numberOf__ (@var{id}, @var{name})
## The number of a variable. The library's own words for a name that there is not are hard to
## understand, so that the error says what they mean.
## @end deftypefn

function number = __ambrix_numberOf__ (id, name)
  try
    number = __ambrix__ ("getVarNum", id, name);
  catch err
    error (err.identifier, "ambrix_read: there is no variable \"%s\" in \"%s\"; %s",
           name, __ambrix__ ("getName", id), err.message);
  end_try_catch
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! assert (__ambrix_numberOf__ (id, "Flux"), 1);
%! err = __ambrix_raised__ (@() __ambrix_numberOf__ (id, "None"));
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:libraryFailure");
%! assert (strncmp (err.message, "ambrix_read: there is no variable \"None\" in \"example\"; ", 55));
%! ambrix_close (id);
