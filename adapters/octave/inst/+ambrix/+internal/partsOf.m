## -*- texinfo -*-
## @deftypefn {} {@var{parts} =} ambrix.internal.partsOf (@var{name})
## The files NAME.z0, NAME.z1, @dots{}, one for each variable, that a CDF of several files has
## beside NAME.cdf.
## @end deftypefn

function parts = partsOf (name)
  parts = {};
  while (! isempty (stat (sprintf ("%s.z%d", name, numel (parts)))))
    parts{end+1} = sprintf ("%s.z%d", name, numel (parts));
  endwhile
endfunction

%!test
%! [id, restore] = ambrix.internal.example ();
%! ambrix.close (id);
%! s = struct ("data", struct ("a", 1, "b", 2), "file", struct ("format", "MULTI_FILE"));
%! ambrix.write ("several", s);
%! assert (ambrix.internal.partsOf ("several"), {"several.z0", "several.z1"});
%!assert (ambrix.internal.partsOf ("no such file"), {})
