## -*- texinfo -*-
## @deftypefn {} {} __ambrix_moveFile__ (@var{from}, @var{to}, @var{overwrite})
## Rename a CDF file, whose names are given without @code{.cdf}, to where there may be another to be
## replaced. Files that are named like those of a CDF of several files, but belong to none, are
## somebody else's, and the error @code{ambrix:fileExists} where they are in the way.
## @end deftypefn

function __ambrix_moveFile__ (from, to, overwrite)
  parts = __ambrix_partsOf__ (from);
  targets = strrep (parts, from, to);
  replaced = {};
  if (overwrite && ! isempty (stat ([to ".cdf"])) && isOfSeveralFiles (to))
    replaced = __ambrix_partsOf__ (to);
  endif
  there = targets(! cellfun (@(name) isempty (stat (name)), targets));
  for taken = setdiff (there, replaced)(:)'
    error ("ambrix:fileExists", "ambrix_write: there is a file \"%s\"", taken{1});
  endfor
  moveOne ([from ".cdf"], [to ".cdf"]);  # the one that may fail comes first
  cellfun (@moveOne, parts, targets);
  cellfun (@unlink, setdiff (replaced, targets));
endfunction

function several = isOfSeveralFiles (name)
  try
    [id, closer] = __ambrix_openToRead__ (name);
    several = strcmp (__ambrix__ ("getFormat", id), "MULTI_FILE");
  catch
    several = false;  # no CDF file
  end_try_catch
endfunction

function moveOne (from, to)
  [status, message] = rename (from, to);
  if (status != 0)
    error ("ambrix:cannotRename", "ambrix_write: \"%s\" can't be written: %s", to, message);
  endif
endfunction

%!test  # neighbours whose names look like those of a CDF of several files
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! fclose (fopen ("near.z0", "w"));
%! ambrix_write ("near", struct ("a", 1));
%! ambrix_write ("near", struct ("a", 2), "overwrite");
%! assert (isempty (stat ("near.z0")), false);
%! s = struct ("data", struct ("a", 3), "file", struct ("format", "MULTI_FILE"));
%! err = __ambrix_raised__ (@() ambrix_write ("near", s, "overwrite"));
%! assert (err.identifier, "ambrix:fileExists");
%! assert (ambrix_read ("near", "a"), 2);
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "near.cdf"; "near.z0"});

%!test  # what can't be replaced stays whole
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! mkdir ("folder.cdf");
%! err = __ambrix_raised__ (@() ambrix_write ("folder", struct ("a", 1), "overwrite"));
%! assert (err.identifier, "ambrix:cannotRename");
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "folder.cdf"});

%!test  # several files
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s = struct ("data", struct ("a", 1, "b", 2), "file", struct ("format", "MULTI_FILE"));
%! ambrix_write ("several", s);
%! ambrix_write ("several", struct ("data", struct ("a", 1), "file", s.file), "overwrite");
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "several.cdf"; "several.z0"});
%! assert (ambrix_read ("several", "a"), 1);
