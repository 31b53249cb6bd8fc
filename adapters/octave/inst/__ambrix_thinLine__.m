## -*- texinfo -*-
## @deftypefn {} {[@var{x}, @var{y}] =} __ambrix_thinLine__ (@var{x}, @var{y})
## Of a line of more than 4000 points leave the lowest and the highest of each of 2000 groups of
## neighbours, and the first and the last: as much as axes can show.
##
## A group without valid values keeps one that is not, so that gaps stay gaps.
## @end deftypefn

function [x, y] = __ambrix_thinLine__ (x, y)
  groups = 2000;
  count = numel (y);
  if (count <= 2 * groups)
    return;
  endif
  size = ceil (count / groups);
  groups = ceil (count / size);
  table = NaN (size, groups);
  table(1:count) = y;
  [~, lowest] = min (table);
  [~, highest] = max (table);
  kept = unique ([1, count, [lowest, highest] + repmat((0:groups - 1) * size, 1, 2)]);
  x = x(kept);
  y = y(kept);
endfunction

%!test  # extremes stay, at their places, also in a last group that is short
%! y = zeros (100001, 1);
%! y([4321, 50000, 100000]) = [7; -7; 9];
%! [x, thinned] = __ambrix_thinLine__ ((1:100001).', y);
%! assert (numel (x) <= 4002);
%! assert (x([1, end]), [1; 100001]);
%! assert (issorted (x));
%! assert (x(thinned == 7), 4321);
%! assert (x(thinned == -7), 50000);
%! assert (x(thinned == 9), 100000);
%!test  # so do gaps
%! y = [1:4000, NaN(1, 2000), 1:4000].';
%! [x, y] = __ambrix_thinLine__ ((1:10000).', y);
%! assert (any (isnan (y(x > 4000 & x <= 6000))));
%! assert (! any (isnan (y(x <= 4000 | x > 6000))));
%!test
%! [x, y] = __ambrix_thinLine__ (1:4000, 4000:-1:1);
%! assert (x, 1:4000);
%! assert (y, 4000:-1:1);
