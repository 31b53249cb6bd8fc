## -*- texinfo -*-
## @deftypefn {} {@var{v} =} __ambrix_describeVariable__ (@var{id}, @var{number}, @var{rowMajor})
## Describe a variable: the definition that reading and writing need. Sizes and variances are in the
## file's order.
##
## Of a variable whose datatype the library does not know @var{v}.supported is false.
## @end deftypefn

function v = __ambrix_describeVariable__ (id, number, rowMajor)
  v.name = __ambrix__ ("getVarName", id, number);
  v.number = number;
  v.supported = true;
  try
    [~, v.datatype, v.elements, v.sizes, v.recordVariance, v.variances] = ...
      __ambrix__ ("-extended", "inquireVar", id, number);
    v.datatype = upper (v.datatype);
  catch err
    v = unsupported (v, err);
  end_try_catch
  if (rowMajor)
    v.sizes = fliplr (v.sizes);
    v.variances = fliplr (v.variances);
  endif
  v.records = __ambrix__ ("getVarMaxWrittenRecNum", id, number) + 1;
endfunction

function v = unsupported (v, err)
  if (! strcmp (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue"))
    rethrow (err);
  endif
  v.supported = false;
  v.datatype = ["datatype " regexp(err.message, '\d+', "match", "once")];
  [v.elements, v.sizes, v.recordVariance, v.variances] = deal (1, [], true, logical ([]));
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! v = __ambrix_describeVariable__ (id, 1, true);
%! assert (v.name, "Flux");
%! assert (v.datatype, "CDF_REAL4");
%! assert (v.sizes, [2, 3]);
%! assert (v.records, 2);
%! assert (v.supported);
%! v = __ambrix_describeVariable__ (id, 1, false);
%! assert (v.sizes, [3, 2]);
%! ambrix_close (id);
