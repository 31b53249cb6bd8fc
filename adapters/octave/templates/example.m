## -*- texinfo -*-
## @deftypefn {} {[@var{id}, @var{restore}] =} __ambrix_example__ ()
## Make the file of the examples in a temporary folder, go there and open it.
##
## When @var{restore} is cleared the folder is removed, and the folder and modes that were in use
## before are again.
## @end deftypefn

## Made by script/octave-functions from docs/commands.json.
function [id, restore] = __ambrix_example__ ()
  folder = tempname ();
  mkdir (folder);
  back = cd (folder);
  [validate, backward] = deal (ambrix_getValidate (), ambrix_getFileBackward ());
  restore = onCleanup (@() leave (back, folder, validate, backward));
@STATEMENTS@
  id = ambrix_open ("example.cdf");
endfunction

function leave (back, folder, validate, backward)
  ambrix_setValidate (validate);
  ambrix_setFileBackward (backward);
  cd (back);
  confirm_recursive_rmdir (false, "local");
  rmdir (folder, "s");
endfunction

%!test
%! back = pwd ();
%! [id, restore] = __ambrix_example__ ();
%! folder = pwd ();
%! assert (ambrix_getName (id), "example");
%! ambrix_close (id);
%! clear restore
%! assert (pwd (), back);
%! assert (exist (folder), 0);
