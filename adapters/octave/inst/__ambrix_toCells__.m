## -*- texinfo -*-
## @deftypefn {} {@var{cells} =} __ambrix_toCells__ (@var{texts}, @var{order}, @var{filler})
## Turn texts, whose characters are along the first axis, into a cell array of texts without the
## fillers at their ends.
##
## @var{order} is the permutation of the axes to be applied; that of the characters is dropped.
## @end deftypefn

function cells = __ambrix_toCells__ (texts, order, filler)
  others = order(order != 1);
  texts = permute (texts, [1, others]);
  sizes = size (texts);
  sizes(end+1:numel (others)+1) = 1;
  rows = reshape (texts, sizes(1), []).';
  if (isempty (rows))
    cells = cell (0, 1);
  elseif (filler == " ")
    cells = cellstr (rows);
  else  # zeros change places with the blanks, which cellstr removes
    cells = strrep (cellstr (__ambrix_swapBlanks__ (rows)), "\0", " ");
  endif
  cells = reshape (cells, [sizes(2:end), 1, 1]);
endfunction

%!assert (__ambrix_toCells__ (["ab "; "c  "].', [2, 1], " "), {"ab"; "c"})
%!assert (__ambrix_toCells__ (["ab\0"; "c \0"].', [2, 1], "\0"), {"ab"; "c "})
%!assert (__ambrix_toCells__ (zeros (3, 0), [2, 1], " "), cell (0, 1))
%!test
%! texts = reshape ("abcdef", 1, 2, 3);
%! assert (__ambrix_toCells__ (texts, [3, 2, 1], " "), {"a", "b"; "c", "d"; "e", "f"});
