## -*- texinfo -*-
## @deftypefn {} {} __ambrix_mayReplace__ (@var{target}, @var{s}, @var{options})
## Raise an error where a file must not be replaced: one that exists, when that was not asked for;
## or one that @var{s} was read from in part only, when it was not said that the rest may go.
## @end deftypefn

function __ambrix_mayReplace__ (target, s, options)
  there = canonicalize_file_name ([target ".cdf"]);
  if (isempty (there))
    return;
  endif
  if (! options.overwrite)
    error ("ambrix:fileExists",
           "ambrix_write: there is a file \"%s.cdf\"; option \"overwrite\" replaces it", target);
  endif
  isSource = ! isfield (s.file, "path") || any (strcmp (s.file.path, {there, ""}));
  if (! isempty (s.leftOut) && isSource && ! options.incomplete)
    parts = s.leftOut(1:min (end, 3))(:)';
    if (numel (s.leftOut) > 3)
      parts{end+1} = sprintf ("and %d more", numel (s.leftOut) - 3);
    endif
    error ("ambrix:incomplete", ["ambrix_write: \"%s.cdf\" holds more than was read from it, " ...
           "which would be lost: %s. Write to another file; option \"incomplete\" replaces " ...
           "this one nevertheless"], target, strjoin (parts, ", "));
  endif
endfunction

%!test  # a file is replaced by a part of it only when that is said
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s = ambrix_read ("example", {"Time", "Mode"});
%! err = __ambrix_raised__ (@() ambrix_write ("./example.cdf", s, "overwrite"));
%! assert (err.identifier, "ambrix:incomplete");
%! assert (any (strfind (err.message, "would be lost: variable \"Flux\". Write")));
%! assert (ambrix_read ("example").leftOut, cell (0, 1));
%! ambrix_write ("other", s);
%! ambrix_write ("other", s, "overwrite");
%! ambrix_write ("example", s, "overwrite", "incomplete");
%! assert (fieldnames (ambrix_read ("example").data), {"Time"; "Mode"});
