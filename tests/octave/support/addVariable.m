## A new variable of this datatype; with its first record when there is one.
function variable = addVariable (id, datatype, sizes, record)
  persistent count = 0;
  name = sprintf ("v%d", ++count);
  variable = __ambrix__ ("createVar", id, name, datatype, 1, sizes, true, true (size (sizes)));
  if (nargin > 3)
    __ambrix__ ("putVarRecordData", id, variable, 0, record);
  endif
endfunction
