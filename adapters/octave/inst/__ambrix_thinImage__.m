## -*- texinfo -*-
## @deftypefn {} {[@var{x}, @var{values}] =} __ambrix_thinImage__ (@var{x}, @var{values})
## Make one row of neighbouring ones where there are more than 2000, which axes can't show: their
## means, without invalid values. Rows whose @var{x} is invalid are left out.
## @end deftypefn

function [x, values] = __ambrix_thinImage__ (x, values)
  valid = isfinite (x);
  x = x(valid)(:);
  values = values(valid,:);
  size = ceil (numel (x) / 2000);
  if (size <= 1)
    return;
  endif
  x = means (x, size);
  values = means (values, size);
endfunction

function values = means (values, size)
  [count, width] = deal (rows (values), columns (values));
  values(end+1:ceil (count / size) * size,:) = NaN;
  values = reshape (values, size, [], width);
  valid = isfinite (values);
  values(! valid) = 0;
  values = reshape (sum (values, 1) ./ sum (valid, 1), [], width);
endfunction

%!test
%! values = [1:5000; NaN(1, 5000)].';
%! values(5000,1) = NaN;
%! [x, thinned] = __ambrix_thinImage__ ((1:5000).', values);
%! assert (x([1, 2, end]), [2; 5; 4999.5]);
%! assert (thinned([1, 2, end],1), [2; 5; 4999]);
%! assert (all (isnan (thinned(:,2))));
%!test
%! [x, values] = __ambrix_thinImage__ ([1; NaN; 3], [1, 2; 3, 4; 5, 6]);
%! assert (x, [1; 3]);
%! assert (values, [1, 2; 5, 6]);
