## -*- texinfo -*-
## @deftypefn {} {@var{classes} =} __ambrix_datatypes__ ()
## The class of each datatype, by its name.
## @end deftypefn

function classes = __ambrix_datatypes__ ()
  persistent all = struct ("CDF_INT1", "int8", "CDF_INT2", "int16", "CDF_INT4", "int32", ...
                           "CDF_UINT1", "uint8", "CDF_UINT2", "uint16", "CDF_UINT4", "uint32", ...
                           "CDF_REAL4", "single", "CDF_REAL8", "double", "CDF_EPOCH", "double", ...
                           "CDF_EPOCH16", "double", "CDF_BYTE", "int8", "CDF_FLOAT", "single", ...
                           "CDF_DOUBLE", "double", "CDF_CHAR", "char", "CDF_UCHAR", "char", ...
                           "CDF_INT8", "int64", "CDF_TIME_TT2000", "int64");
  classes = all;
endfunction

%!test  # a variable of each has data of this class
%! [id, restore] = __ambrix_example__ ();
%! for [class_name, name] = __ambrix_datatypes__ ()
%!   code = __ambrix__ ("-extended", "getConstantValue", name);
%!   number = __ambrix__ ("-extended", "createVar", id, name, code, 1, [], true, []);
%!   value = __ambrix__ ("-extended", "getVarPadValue", id, number);
%!   assert (class (value), class_name);
%! endfor
%! ambrix_close (id);
