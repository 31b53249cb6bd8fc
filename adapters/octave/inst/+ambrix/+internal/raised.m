## -*- texinfo -*-
## @deftypefn {} {@var{err} =} ambrix.internal.raised (@var{call})
## Call a function and return the error that it raises, without identifier when it raises none.
## @end deftypefn

function err = raised (call)
  err = struct ("identifier", "", "message", "");
  try
    call ();
  catch err
  end_try_catch
endfunction

%!test
%! err = ambrix.internal.raised (@() error ("a:b", "c"));
%! assert (err.identifier, "a:b");
%! assert (err.message, "c");
%!test
%! err = ambrix.internal.raised (@() 1);
%! assert (err.identifier, "");
