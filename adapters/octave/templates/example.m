## -*- texinfo -*-
## @deftypefn {} {[@var{id}, @var{restore}] =} ambrix.internal.example ()
## Make the file of the examples in a temporary folder, go there and open it.
##
## When @var{restore} is cleared the folder is removed, and the folder and modes that were in use
## before are again.
## @end deftypefn

## Made by script/octave-functions from docs/commands.json.
function [id, restore] = example ()
  folder = tempname ();
  mkdir (folder);
  back = cd (folder);
  [validate, backward] = deal (ambrix.getValidate (), ambrix.getFileBackward ());
  restore = onCleanup (@() leave (back, folder, validate, backward));
@STATEMENTS@
  id = ambrix.open ("example.cdf");
endfunction

function leave (back, folder, validate, backward)
  ambrix.setValidate (validate);
  ambrix.setFileBackward (backward);
  cd (back);
  confirm_recursive_rmdir (false, "local");
  rmdir (folder, "s");
endfunction

%!test
%! back = pwd ();
%! [id, restore] = ambrix.internal.example ();
%! folder = pwd ();
%! assert (ambrix.getName (id), "example");
%! ambrix.close (id);
%! clear restore
%! assert (pwd (), back);
%! assert (exist (folder), 0);
