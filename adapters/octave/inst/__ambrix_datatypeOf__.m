## -*- texinfo -*-
## @deftypefn {} {@var{datatype} =} __ambrix_datatypeOf__ (@var{value}, @var{what})
## The datatype that data of this class are written in where none is given. @var{what} names the
## data in the error for a class that no datatype has.
## @end deftypefn

function datatype = __ambrix_datatypeOf__ (value, what)
  persistent all = struct ("double", "CDF_DOUBLE", "single", "CDF_FLOAT", "int8", "CDF_INT1", ...
                           "int16", "CDF_INT2", "int32", "CDF_INT4", "int64", "CDF_INT8", ...
                           "uint8", "CDF_UINT1", "logical", "CDF_UINT1", "uint16", "CDF_UINT2", ...
                           "uint32", "CDF_UINT4", "char", "CDF_CHAR");
  name = class (value);
  if (iscellstr (value))
    name = "char";
  endif
  if (! isfield (all, name))
    error ("ambrix:unsupportedClass", ["ambrix_write: no datatype holds %s of class %s; use " ...
           "double, single, signed integers, unsigned integers of up to 32 bits, or text"], ...
           what, name);
  endif
  datatype = all.(name);
endfunction

%!assert (__ambrix_datatypeOf__ (1, "x"), "CDF_DOUBLE")
%!assert (__ambrix_datatypeOf__ ({"a"}, "x"), "CDF_CHAR")
%!assert (__ambrix_datatypeOf__ (true, "x"), "CDF_UINT1")
%!assert (__ambrix_datatypeOf__ (int64 (1), "x"), "CDF_INT8")
%!error <no datatype holds variable "x" of class uint64>
%! __ambrix_datatypeOf__ (uint64 (1), 'variable "x"');
%!error id=ambrix:unsupportedClass __ambrix_datatypeOf__ ({1}, "x");
