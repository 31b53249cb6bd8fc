## -*- texinfo -*-
## @deftypefn {} {} ambrix.internal.moveFile (@var{from}, @var{to}, @var{overwrite})
## Rename a CDF file, whose names are given without @code{.cdf}, to where there may be another to be
## replaced. Files that are named like those of a CDF of several files, but belong to none, are
## somebody else's, and the error @code{ambrix:fileExists} where they are in the way.
## @end deftypefn

function moveFile (from, to, overwrite)
  parts = ambrix.internal.partsOf (from);
  targets = strrep (parts, from, to);
  replaced = {};
  if (overwrite && ! isempty (stat ([to ".cdf"])) && isOfSeveralFiles (to))
    replaced = ambrix.internal.partsOf (to);
  endif
  there = targets(! cellfun (@(name) isempty (stat (name)), targets));
  for taken = setdiff (there, replaced)(:)'
    error ("ambrix:fileExists", "ambrix.write: there is a file \"%s\"", taken{1});
  endfor
  moveOne ([from ".cdf"], [to ".cdf"]);  # the one that may fail comes first
  cellfun (@moveOne, parts, targets);
  cellfun (@unlink, setdiff (replaced, targets));
endfunction

function several = isOfSeveralFiles (name)
  try
    [id, closer] = ambrix.internal.openToRead (name);
    several = strcmp (__ambrix__ ("getFormat", id), "MULTI_FILE");
  catch
    several = false;  # no CDF file
  end_try_catch
endfunction

function moveOne (from, to)
  [status, message] = rename (from, to);
  if (status != 0)
    error ("ambrix:cannotRename", "ambrix.write: \"%s\" can't be written: %s", to, message);
  endif
endfunction

%!test  # neighbours whose names look like those of a CDF of several files
%! [id, restore] = ambrix.internal.example ();
%! ambrix.close (id);
%! fclose (fopen ("near.z0", "w"));
%! ambrix.write ("near", struct ("a", 1));
%! ambrix.write ("near", struct ("a", 2), "overwrite");
%! assert (isempty (stat ("near.z0")), false);
%! s = struct ("data", struct ("a", 3), "file", struct ("format", "MULTI_FILE"));
%! err = ambrix.internal.raised (@() ambrix.write ("near", s, "overwrite"));
%! assert (err.identifier, "ambrix:fileExists");
%! assert (ambrix.read ("near", "a"), 2);
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "near.cdf"; "near.z0"});

%!test  # what can't be replaced stays whole
%! [id, restore] = ambrix.internal.example ();
%! ambrix.close (id);
%! mkdir ("folder.cdf");
%! err = ambrix.internal.raised (@() ambrix.write ("folder", struct ("a", 1), "overwrite"));
%! assert (err.identifier, "ambrix:cannotRename");
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "folder.cdf"});

%!test  # several files
%! [id, restore] = ambrix.internal.example ();
%! ambrix.close (id);
%! s = struct ("data", struct ("a", 1, "b", 2), "file", struct ("format", "MULTI_FILE"));
%! ambrix.write ("several", s);
%! ambrix.write ("several", struct ("data", struct ("a", 1), "file", s.file), "overwrite");
%! assert (readdir ("."), {"."; ".."; "example.cdf"; "several.cdf"; "several.z0"});
%! assert (ambrix.read ("several", "a"), 1);
