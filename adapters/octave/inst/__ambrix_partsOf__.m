## -*- texinfo -*-
## @deftypefn {} {@var{parts} =} __ambrix_partsOf__ (@var{name})
## The files NAME.z0, NAME.z1, @dots{}, one for each variable, that a CDF of several files has
## beside NAME.cdf.
## @end deftypefn

function parts = __ambrix_partsOf__ (name)
  parts = {};
  while (! isempty (stat (sprintf ("%s.z%d", name, numel (parts)))))
    parts{end+1} = sprintf ("%s.z%d", name, numel (parts));
  endwhile
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s = struct ("data", struct ("a", 1, "b", 2), "file", struct ("format", "MULTI_FILE"));
%! ambrix_write ("several", s);
%! assert (__ambrix_partsOf__ ("several"), {"several.z0", "several.z1"});
%!assert (__ambrix_partsOf__ ("no such file"), {})
