## The error that a function raises; an error of its own when it raises none.
function err = raised (action)
  try
    action ();
  catch err
    return;
  end_try_catch
  error ("nothing was raised");
endfunction
