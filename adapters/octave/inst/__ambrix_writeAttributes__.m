## -*- texinfo -*-
## @deftypefn {} {} __ambrix_writeAttributes__ (@var{id}, @var{s}, @var{numbers})
## Write the attributes of a complete struct, in the order of its list and then of their names.
##
## @var{numbers} are those of the variables by name.
## @end deftypefn

function __ambrix_writeAttributes__ (id, s, numbers)
  for attribute = allAttributes (s)
    what = sprintf ("attribute \"%s\"", attribute.name);
    try
      number = ambrix_createAttr (id, attribute.name, attribute.scope);
    catch err
      __ambrix_raiseFor__ ("ambrix_write", what, err);
    end_try_catch
    if (strcmp (attribute.scope, "GLOBAL_SCOPE"))
      writeGlobal (id, number, attribute, s.attributes.(attribute.field));
    else
      writeOfVariables (id, number, attribute, s.variables, numbers);
    endif
  endfor
endfunction

## The list, without the global attributes that were removed, and with those that were added; each
## with the field that its values are in.
function list = allAttributes (s)
  isGlobal = strcmp ({s.attributeList.scope}, "GLOBAL_SCOPE");
  names = {s.attributeList.name};
  fields = cellfun (@__ambrix_fieldName__, names, "UniformOutput", false);
  list = struct ("name", names, "field", fields, "scope", {s.attributeList.scope}, ...
                 "entries", {s.attributeList.entries}, "datatypes", {s.attributeList.datatypes});
  list = list(! isGlobal | isfield (s.attributes, fields));
  list = withMissing (list, fieldnames (s.attributes), "GLOBAL_SCOPE");
  for [v, name] = s.variables
    list = withMissing (list, fieldnames (v.attributes), "VARIABLE_SCOPE");
  endfor
endfunction

function list = withMissing (list, names, scope)
  fields = {list.field};
  for name = intersect (names, fields(! strcmp ({list.scope}, scope)))(:)'
    error ("ambrix:invalidData", ["ambrix_write: attribute \"%s\" is given for the file and " ...
           "for variables, and can be of one scope only"], name{1});
  endfor
  for name = setdiff (names, fields, "stable")(:)'
    list(end+1) = struct ("name", name{1}, "field", name{1}, "scope", scope, "entries", [], ...
                          "datatypes", {{}});
  endfor
endfunction

## Entries keep their numbers as long as there are as many as were read.
function writeGlobal (id, number, attribute, values)
  if (! iscell (values))
    values = {values};
  endif
  kept = numel (values) == numel (attribute.entries);
  for k = 1:numel (values)
    [entry, datatype] = deal (k - 1, "");
    if (kept)
      entry = attribute.entries(k);
      datatype = attribute.datatypes{k};
    endif
    what = sprintf ("attribute \"%s\"", attribute.name);
    put (id, number, entry, datatype, values{k}, what);
  endfor
endfunction

function writeOfVariables (id, number, attribute, variables, numbers)
  for [v, name] = variables
    if (! isfield (v.attributes, attribute.field))
      continue;
    endif
    what = sprintf ("attribute \"%s\" of \"%s\"", attribute.name, name);
    value = v.attributes.(attribute.field);
    datatype = [attribute.datatypes(strcmp (attribute.entries, name)), {""}]{1};
    isNewLimit = isempty (datatype) && isLimit (attribute.name);
    if (isNewLimit)
      datatype = v.datatype;
    endif
    if (isNewLimit || strcmp (datatype, "CDF_TIME_TT2000"))
      value = limitOf (datatype, value, what);
    endif
    put (id, number, numbers.(name), datatype, value, what);
  endfor
endfunction

## Values that readers compare with those of the variable are of its datatype.
function limit = isLimit (name)
  limit = any (strcmp (name, {"FILLVAL", "VALIDMIN", "VALIDMAX", "SCALEMIN", "SCALEMAX"}));
endfunction

## Times may be serial day numbers, as they may be in data.
function value = limitOf (datatype, value, what)
  if (isfloat (value) && __ambrix_isTime__ (datatype))
    value = __ambrix_toEpochs__ (value, datatype, struct ("records", "first", "time", []), what);
  endif
endfunction

## In the given datatype where the class of the value belongs to it.
function put (id, number, entry, datatype, value, what)
  if (islogical (value))
    value = uint8 (value);
  endif
  if (iscell (value) || (ischar (value) && rows (value) > 1))
    error ("ambrix:invalidData", "ambrix_write: %s must be one text or numbers", what);
  endif
  if (iscomplex (value))
    error ("ambrix:unsupportedClass", "ambrix_write: %s is complex, and no datatype is", what);
  endif
  classes = __ambrix_datatypes__ ();
  if (isempty (datatype) || ! strcmp (classes.(datatype), class (value)))
    datatype = __ambrix_datatypeOf__ (value, what);
  endif
  if (ischar (value) && isempty (value))
    value = "\0";  # an entry has one character at least
  endif
  try
    code = __ambrix__ ("-extended", "getConstantValue", datatype);
    __ambrix__ ("-extended", "putAttrEntry", id, number, entry, code, value);
  catch err
    __ambrix_raiseFor__ ("ambrix_write", what, err);
  end_try_catch
endfunction

%!test  # numbers and datatypes are kept as long as they fit
%! [id, restore] = __ambrix_example__ ();
%! ambrix_putAttrgEntry (id, 0, 3, "CDF_UCHAR", "more");
%! s = ambrix_read (id);
%! ambrix_close (id);
%! ambrix_write ("same", s);
%! r = ambrix_info ("same");
%! assert (r.attributeList, s.attributeList);
%! s.attributes.Title{end+1} = 7;
%! s.variables.Flux.attributes.Units = 8;
%! s.attributes.New = single (9);
%! ambrix_write ("other", s);
%! r = ambrix_info ("other");
%! assert (r.attributes, s.attributes);
%! assert (r.attributeList(1).entries, 0:2);
%! assert (r.attributeList(1).datatypes, {"CDF_CHAR", "CDF_CHAR", "CDF_DOUBLE"});
%! assert (r.variables.Flux.attributes.Units, 8);
%! assert (r.attributeList(3).name, "New");
%!test  # limits of times in serial day numbers
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data.t = datenum (2024, 1, [1; 2]);
%! s.variables.t.datatype = "CDF_EPOCH";
%! s.variables.t.attributes = struct ("VALIDMIN", datenum (2000, 1, 1), "FILLVAL", -1e31);
%! ambrix_write ("days", s);
%! r = ambrix_read ("days", {}, "time");
%! assert (r.data.t, s.data.t);
%! assert (r.variables.t.attributes.VALIDMIN, ambrix_computeEpoch ([2000; 1; 1; 0; 0; 0; 0]));
%! assert (r.variables.t.attributes.FILLVAL, -1e31);
%!test  # also those of a CDF_TIME_TT2000, and those that replace others
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data.t = datenum (2024, 1, [1; 2]);
%! s.variables.t.datatype = "CDF_TIME_TT2000";
%! s.variables.t.attributes = struct ("VALIDMIN", datenum (2000, 1, 1), "FILLVAL", NaN);
%! s.attributes.Serial = intmin ("int64") + 5;
%! ambrix_write ("days", s);
%! r = ambrix_read ("days");
%! assert (r.attributes.Serial, intmin ("int64") + 5);
%! limit = ambrix_computeTT2000 ([2000; 1; 1; zeros(6, 1)]);
%! assert (r.variables.t.attributes, struct ("VALIDMIN", limit, "FILLVAL", intmin ("int64")));
%! assert ([r.attributeList.datatypes], {"CDF_INT8", "CDF_TIME_TT2000", "CDF_TIME_TT2000"});
%! r.variables.t.attributes.VALIDMIN = datenum (2000, 1, 1, 0, 0, 0.5);
%! ambrix_write ("days", r, "overwrite");
%! assert (ambrix_info ("days").variables.t.attributes.VALIDMIN, limit + int64 (5e8));
%!test  # blanks at the end of new names
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data = struct ("x", 1);
%! s.attributes.("Title ") = "blank";
%! s.variables.x.attributes.("UNITS ") = "nT";
%! ambrix_write ("blanks", s);
%! r = ambrix_info ("blanks");
%! assert (r.attributes.Title, "blank");
%! assert (r.variables.x.attributes.UNITS, "nT");
%! assert ({r.attributeList.name}, {"Title ", "UNITS "});
%! ambrix_write ("again", ambrix_read ("blanks"));
%! again = ambrix_info ("again");
%! assert (again.attributeList, r.attributeList);
%!test  # a name belongs to the file or to variables
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data = struct ("x", 1);
%! s.attributes.UNITS = "km";
%! s.variables.x.attributes.UNITS = "nT";
%! err = __ambrix_raised__ (@() ambrix_write ("bad", s));
%! assert (err.identifier, "ambrix:invalidData");
%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s = struct ("data", struct (), "attributes", struct ("a", 1i));
%! err = __ambrix_raised__ (@() ambrix_write ("bad", s));
%! assert (err.identifier, "ambrix:unsupportedClass");
%!error <attribute "a" must be one text>
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! ambrix_write ("bad", struct ("data", struct (), "attributes", struct ("a", {{{1}}})));
