## -*- texinfo -*-
## @deftypefn {} {@var{v} =} __ambrix_deduceSizes__ (@var{v}, @var{data}, @var{records})
## Add the number of elements and the sizes of the dimensions to the description of a variable, from
## the size of the data where they are not described.
## @end deftypefn

function v = __ambrix_deduceSizes__ (v, data, records)
  isText = any (strcmp (v.datatype, {"CDF_CHAR", "CDF_UCHAR"}));
  hasLead = isText || strcmp (v.datatype, "CDF_EPOCH16");
  isLast = strcmp (records, "last");
  sizes = size (data);
  lead = 1;
  if (hasLead && isLast)
    [lead, sizes] = deal (sizes(1), sizes(2:end));
  elseif (hasLead)
    [lead, sizes] = deal (sizes(end), sizes(1:end-1));
  endif
  if (! isfield (v, "elements"))
    v.elements = 1;
    if (isText)
      v.elements = max (lead, 1);
    endif
  endif
  if (! isfield (v, "sizes"))
    v.sizes = dimensions (sizes, v.recordVariance, isLast);
  endif
endfunction

## Octave's arrays have two dimensions at least: a column has one here.
function sizes = dimensions (sizes, recordVariance, isLast)
  if (isequal (sizes, [0, 0]) || isequal (sizes, 0))
    sizes = [];  # no data
  elseif (recordVariance && isLast && ! (numel (sizes) == 2 && sizes(2) == 1))
    sizes(end) = [];
  elseif (recordVariance)
    sizes(1) = [];
  elseif (numel (sizes) == 2)
    sizes(sizes == 1) = [];
  endif
  if (all (sizes == 1))
    sizes = [];  # a scalar variable
  endif
endfunction

%!function sizes = deduced (datatype, varies, data, records)
%!  v = struct ("datatype", datatype, "recordVariance", varies);
%!  v = __ambrix_deduceSizes__ (v, data, records);
%!  sizes = v.sizes;
%!endfunction
%!assert (deduced ("CDF_REAL8", true, zeros (5, 1), "first"), [])
%!assert (deduced ("CDF_REAL8", true, zeros (5, 3), "first"), 3)
%!assert (deduced ("CDF_REAL8", true, zeros (5, 3, 2), "first"), [3, 2])
%!assert (deduced ("CDF_REAL8", true, zeros (5, 1), "last"), [])
%!assert (deduced ("CDF_REAL8", true, zeros (3, 2, 5), "last"), [3, 2])
%!assert (deduced ("CDF_REAL8", false, zeros (3, 2), "first"), [3, 2])
%!assert (deduced ("CDF_REAL8", false, zeros (1, 3), "first"), 3)
%!assert (deduced ("CDF_REAL8", false, zeros (3, 1), "last"), 3)
%!assert (deduced ("CDF_CHAR", true, ["ab"; "cd"; "ef"], "first"), [])
%!assert (deduced ("CDF_CHAR", true, ["ab"; "cd"; "ef"].', "last"), [])
%!assert (deduced ("CDF_CHAR", true, repmat ("a", [5, 3, 2]), "first"), 3)
%!assert (deduced ("CDF_EPOCH16", true, zeros (5, 2), "first"), [])
%!assert (deduced ("CDF_REAL8", true, [], "first"), [])
%!assert (deduced ("CDF_REAL8", false, [], "last"), [])
%!assert (deduced ("CDF_CHAR", false, "", "last"), [])
%!assert (deduced ("CDF_REAL8", true, zeros (3, 0), "first"), 0)
%!assert (deduced ("CDF_REAL8", true, zeros (0, 3), "first"), 3)
