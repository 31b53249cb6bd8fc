## A new folder that goes when the second result does.
function [folder, cleanup] = scratchFolder ()
  folder = tempname ();
  mkdir (folder);
  cleanup = onCleanup (@() remove (folder));
endfunction

function remove (folder)
  confirm_recursive_rmdir (false, "local");
  rmdir (folder, "s");
endfunction
