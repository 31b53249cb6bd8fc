## -*- texinfo -*-
## @deftypefn {} {@var{err} =} __ambrix_raised__ (@var{call})
## Call a function and return the error that it raises, without identifier when it raises none.
## @end deftypefn

function err = __ambrix_raised__ (call)
  err = struct ("identifier", "", "message", "");
  try
    call ();
  catch err
  end_try_catch
endfunction

%!test
%! err = __ambrix_raised__ (@() error ("a:b", "c"));
%! assert (err.identifier, "a:b");
%! assert (err.message, "c");
%!test
%! err = __ambrix_raised__ (@() 1);
%! assert (err.identifier, "");
