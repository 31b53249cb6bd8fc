## -*- texinfo -*-
## @deftypefn {} {[@var{texts}, @var{v}] =} __ambrix_fromCells__ (@var{cells}, @var{v}, @var{records})
## Turn a cell array of texts into an array of characters, along the last dimension or, where
## records come last, along the first. All are filled up to the same number, that of the variable
## at least.
## @end deftypefn

function [texts, v] = __ambrix_fromCells__ (cells, v, records)
  if (any (cellfun ("size", cells(:), 1) > 1))
    error ("ambrix:invalidData",
           "ambrix_write: the texts of variable \"%s\" must be rows of characters", v.name);
  endif
  if (! isfield (v, "elements"))
    v.elements = 1;
  endif
  v.elements = max ([v.elements; cellfun(@numel, cells(:))]);
  filler = " ";
  if (isfield (v, "filler"))
    filler = v.filler;
  endif
  if (isempty (cells))
    texts = repmat (" ", 0, v.elements);
  elseif (filler == " ")
    texts = char (cells(:));
  else  # zeros change places with the blanks, which char fills up with
    texts = __ambrix_swapBlanks__ (char (strrep (cells(:), " ", "\0")));
  endif
  texts(:,end+1:v.elements) = filler;
  sizes = size (cells);
  sizes = sizes(1:end - iscolumn (cells));
  if (strcmp (records, "last"))
    texts = reshape (texts.', [v.elements, sizes]);
  else
    texts = reshape (texts, [sizes, v.elements]);
  endif
endfunction

%!test
%! [texts, v] = __ambrix_fromCells__ ({"ab"; "c"}, struct (), "first");
%! assert (texts, ["ab"; "c "]);
%! assert (v.elements, 2);
%!test
%! v = struct ("elements", 3, "filler", "\0");
%! texts = __ambrix_fromCells__ ({"a "; "bc"}, v, "last");
%! assert (double (texts), double (["a \0"; "bc\0"].'));
%!test
%! texts = __ambrix_fromCells__ ({"a", "bc"; "d", "e"}, struct (), "first");
%! assert (size (texts), [2, 2, 2]);
%! assert (squeeze (texts(1,2,:)).', "bc");
%!error id=ambrix:invalidData
%! __ambrix_fromCells__ ({["ab"; "cd"]; "e"}, struct ("name", "x"), "first");
%!assert (size (__ambrix_fromCells__ (cell (0, 1), struct ("elements", 4), "first")), [0, 4])
