## -*- texinfo -*-
## @deftypefn {} {@var{time} =} __ambrix_isTime__ (@var{datatype})
## Whether values of the datatype are times.
## @end deftypefn

function time = __ambrix_isTime__ (datatype)
  time = any (strcmp (datatype, {"CDF_EPOCH", "CDF_EPOCH16", "CDF_TIME_TT2000"}));
endfunction

%!assert (__ambrix_isTime__ ("CDF_EPOCH"))
%!assert (__ambrix_isTime__ ("CDF_EPOCH16"))
%!assert (__ambrix_isTime__ ("CDF_TIME_TT2000"))
%!assert (__ambrix_isTime__ ("CDF_INT8"), false)
