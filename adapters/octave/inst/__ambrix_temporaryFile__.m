## -*- texinfo -*-
## @deftypefn {} {[@var{temporary}, @var{discard}] =} __ambrix_temporaryFile__ (@var{target})
## The name of a new file in a folder of its own beside @var{target}. The folder also takes what the
## CDF library writes meanwhile and leaves behind when the disk is full; it goes when @var{discard}
## is cleared.
## @end deftypefn

function [temporary, discard] = __ambrix_temporaryFile__ (target)
  folder = fullfile (fileparts (target), [".ambrix" regexprep(tempname (), '.*-', "-")]);
  if (isfolder (fullfile (fileparts (target), ".")))
    [~, ~] = mkdir (folder);  # where there is none the library tells
  endif
  temporary = fullfile (folder, "new");
  before = getenv ("CDF_TMP");
  if (isempty (before))
    setenv ("CDF_TMP", folder);
  endif
  discard = onCleanup (@() removeFolder (folder, before));
endfunction

function removeFolder (folder, before)
  if (isempty (before))
    unsetenv ("CDF_TMP");
  endif
  confirm_recursive_rmdir (false, "local");
  [~, ~] = rmdir (folder, "s");
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! before = getenv ("CDF_TMP");
%! [name, discard] = __ambrix_temporaryFile__ ("new");
%! folder = fileparts (name);
%! assert (isfolder (folder));
%! fclose (fopen (fullfile (folder, "left"), "w"));
%! clear discard
%! assert (readdir ("."), {"."; ".."; "example.cdf"});
%! assert (getenv ("CDF_TMP"), before);
%!test
%! [name, discard] = __ambrix_temporaryFile__ ("/no such folder/new");
%! assert (exist ("/no such folder"), 0);
