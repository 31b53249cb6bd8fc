## -*- texinfo -*-
## @deftypefn {} {@var{edges} =} __ambrix_edges__ (@var{middles}, @var{isLog})
## The edges of cells whose middles are given: one more of them, half way between neighbours, by
## their logarithms where @var{isLog}.
## @end deftypefn

function edges = __ambrix_edges__ (middles, isLog)
  middles = double (middles(:));
  if (isLog)
    edges = exp (__ambrix_edges__ (log (middles), false));
  elseif (numel (middles) < 2)
    edges = [middles - 0.5; middles + 0.5];
  else
    between = (middles(1:end-1) + middles(2:end)) / 2;
    edges = [2 * middles(1) - between(1); between; 2 * middles(end) - between(end)];
  endif
endfunction

%!assert (__ambrix_edges__ ([1, 2, 4], false), [0.5; 1.5; 3; 5])
%!assert (__ambrix_edges__ ([1, 100], true), [0.1; 10; 1000], 1e-9)
%!assert (__ambrix_edges__ (7, false), [6.5; 7.5])
