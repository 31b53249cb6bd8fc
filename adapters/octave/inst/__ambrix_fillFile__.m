## -*- texinfo -*-
## @deftypefn {} {} __ambrix_fillFile__ (@var{id}, @var{s})
## Write everything in a complete struct to a new file. Errors name the variable or the attribute.
## @end deftypefn

function __ambrix_fillFile__ (id, s)
  applySettings (id, s.file);
  rowMajor = strcmp (__ambrix__ ("getMajority", id), "ROW_MAJOR");
  numbers = struct ();
  for [v, name] = s.variables
    try
      [v, data] = __ambrix_completeVariable__ (name, v, s, rowMajor);
      numbers.(name) = __ambrix_writeVariable__ (id, v, data, rowMajor);
    catch err
      __ambrix_raiseFor__ ("ambrix_write", sprintf ("variable \"%s\"", name), err);
    end_try_catch
    s.variables.(name) = v;
  endfor
  __ambrix_writeAttributes__ (id, s, numbers);
endfunction

## In the order that the library wants: format and compression before there are variables.
function applySettings (id, file)
  ambrix_setFormat (id, file.format);
  ambrix_setMajority (id, file.majority);
  if (! strcmpi (file.checksum, "NO_CHECKSUM"))
    ambrix_setChecksum (id, file.checksum);
  endif
  compression = __ambrix_compressionArguments__ (file);
  if (! isempty (compression))
    ambrix_setCompression (id, compression{:});
  endif
endfunction

%!function err = failed (s)
%!  [id, restore] = __ambrix_example__ ();
%!  new = ambrix_create ("new");
%!  err = __ambrix_raised__ (@() __ambrix_fillFile__ (new, __ambrix_completeStruct__ (s)));
%!  cellfun (@ambrix_close, {id, new});
%!endfunction

%!test  # errors of commands name the variable
%! s.data = struct ("good", 1, "bad", 2);
%! s.variables.bad.datatype = "CDF_INT4";
%! err = failed (s);
%! assert (err.identifier, "TOLVEX:ambrix:cdflib:datatypeMismatch");
%! assert (strncmp (err.message, "ambrix_write: variable \"bad\": ", 30));
%!test  # what names it already stays
%! err = failed (struct ("bad", 1i));
%! assert (err.message, "ambrix_write: variable \"bad\" is complex, and no datatype is");
%!test  # or the attribute
%! s.data = struct ("x", int16 (1));
%! s.variables.x.attributes.note = "one\ntwo";
%! s.variables.x.attributes.(repmat ("n", 1, 300)) = "too long";
%! err = failed (s);
%! assert (strncmp (err.message, "ambrix_write: attribute \"nnn", 28));
