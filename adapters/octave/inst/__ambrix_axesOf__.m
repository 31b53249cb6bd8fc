## -*- texinfo -*-
## @deftypefn {} {[@var{order}, @var{lead}] =} __ambrix_axesOf__ (@var{v}, @var{rowMajor}, @var{records})
## Tell how data from the commands become data of the comfortable functions.
##
## The commands have the axes of a single value first (@var{lead}: the characters of a text, the two
## numbers of an EPOCH16), then the dimensions, reversed in a row-major file, then the records.
## @var{order} is the permutation to records, dimensions in the file's order, @var{lead}; or to
## @var{lead}, dimensions, records where @var{records} is "last". Where records don't vary theirs is
## the last axis in both, and is one long, so that it does not show.
## @end deftypefn

function [order, lead] = __ambrix_axesOf__ (v, rowMajor, records)
  lead = [];
  if (any (strcmp (v.datatype, {"CDF_CHAR", "CDF_UCHAR"})))
    lead = v.elements;
  elseif (strcmp (v.datatype, "CDF_EPOCH16"))
    lead = 2;
  endif
  first = numel (lead);
  count = numel (v.sizes);
  dimensions = first + (1:count);
  if (rowMajor)
    dimensions = fliplr (dimensions);
  endif
  record = first + count + 1;
  if (strcmp (records, "last"))
    order = [1:first, dimensions, record];
  elseif (v.recordVariance)
    order = [record, dimensions, 1:first];
  else
    order = [dimensions, 1:first, record];
  endif
  order = [order, max(order)+1:2];  # there are two axes at least
endfunction

%!shared v, text, epoch16
%! v = struct ("datatype", "CDF_REAL4", "elements", 1, "sizes", [4, 5], "recordVariance", true);
%! text = setfield (setfield (v, "datatype", "CDF_CHAR"), "elements", 8);
%! epoch16 = setfield (setfield (v, "datatype", "CDF_EPOCH16"), "sizes", []);
%!assert (__ambrix_axesOf__ (v, false, "first"), [3, 1, 2])
%!assert (__ambrix_axesOf__ (v, true, "first"), [3, 2, 1])
%!assert (__ambrix_axesOf__ (v, true, "last"), [2, 1, 3])
%!assert (__ambrix_axesOf__ (setfield (v, "recordVariance", false), true, "first"), [2, 1, 3])
%!assert (__ambrix_axesOf__ (setfield (v, "sizes", []), false, "first"), [1, 2])
%!test
%! [order, lead] = __ambrix_axesOf__ (text, true, "first");
%! assert (order, [4, 3, 2, 1]);
%! assert (lead, 8);
%!test
%! [order, lead] = __ambrix_axesOf__ (epoch16, false, "first");
%! assert (order, [2, 1]);
%! assert (lead, 2);
%!assert (__ambrix_axesOf__ (epoch16, false, "last"), [1, 2])
