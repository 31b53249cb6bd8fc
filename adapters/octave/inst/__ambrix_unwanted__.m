## -*- texinfo -*-
## @deftypefn {} {@var{texts} =} __ambrix_unwanted__ (@var{all}, @var{read}, @var{options})
## What the caller of @code{ambrix_read} did not ask for, or asked to have less exactly, of
## @var{all} variables.
## @end deftypefn

function texts = __ambrix_unwanted__ (all, read, options)
  texts = cell (1, 0);
  for [v, name] = all
    if (! isfield (read, name))
      texts{end+1} = sprintf ("variable \"%s\"", name);
    elseif (read.(name).records < v.records)
      texts{end+1} = sprintf ("%d of %d records of variable \"%s\"", ...
                              v.records - read.(name).records, v.records, name);
    elseif (options.time && strcmp (v.datatype, "CDF_EPOCH16"))
      texts{end+1} = sprintf ("fractions of milliseconds in variable \"%s\"", name);
    endif
  endfor
endfunction

%!test
%! v = struct ("records", 3, "datatype", "CDF_EPOCH16");
%! all = struct ("a", v, "b", v, "c", v);
%! read = struct ("a", v, "c", setfield (v, "records", 1));
%! assert (__ambrix_unwanted__ (all, read, struct ("time", false)), ...
%!         {"variable \"b\"", "2 of 3 records of variable \"c\""});
%! assert (__ambrix_unwanted__ (all, all, struct ("time", true)){1}, ...
%!         "fractions of milliseconds in variable \"a\"");
