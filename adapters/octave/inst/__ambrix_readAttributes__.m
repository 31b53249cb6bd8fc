## -*- texinfo -*-
## @deftypefn {} {[@var{s}, @var{left}] =} __ambrix_readAttributes__ (@var{id}, @var{s}, @var{names}, @var{count})
## Put the attributes of a file into its description.
##
## @var{names} are the fields of the variables by number. @var{left} lists the entries that had to be
## left out because their datatype is not supported, but for those of variables of such a datatype.
## @end deftypefn

function [s, left] = __ambrix_readAttributes__ (id, s, names, count)
  list = struct ("name", cell (1, count), "scope", "", "entries", [], "datatypes", []);
  left = {};
  for k = 1:count
    [list(k).name, list(k).scope, lastGlobal, last] = __ambrix__ ("inquireAttr", id, k - 1);
    kind = "";
    if (strcmp (list(k).scope, "GLOBAL_SCOPE"))
      kind = "g";
      last = lastGlobal;
    endif
    field = __ambrix_fieldName__ (list(k).name);
    entries = readEntries (id, k - 1, kind, last);
    left = [left, unsupportedIn(list(k).name, entries, kind, names, s.variables)];
    entries = entries(! strcmp ({entries.datatype}, ""));
    if (isempty (kind))
      [s.variables, entries] = givenToVariables (s.variables, field, entries, names);
      list(k).entries = names([entries.number] + 1);
    else
      s.attributes.(field) = together ({entries.value});
      list(k).entries = [entries.number];
    endif
    list(k).datatypes = {entries.datatype};
  endfor
  s.attributeList = list;
endfunction

## All entries of an attribute; the datatype is empty where it is not supported.
function entries = readEntries (id, attribute, kind, last)
  entries = struct ("number", {}, "datatype", {}, "value", {});
  left = __ambrix__ (["getNumAttr" kind "Entries"], id, attribute);
  for number = 0:last
    if (left == 0)
      return;
    endif
    entry = struct ("number", number, "datatype", "", "value", []);
    try
      entry.datatype = upper (__ambrix__ (["inquireAttr" kind "Entry"], id, attribute, number));
      entry.value = __ambrix__ (["getAttr" kind "Entry"], id, attribute, number);
    catch err
      if (isMissing (err))
        continue;
      endif
    end_try_catch
    entries(end+1) = entry;
    left -= 1;
  endfor
endfunction

## Whether there is no such entry; errors other than that, and an unsupported datatype, go on.
function missing = isMissing (err)
  missing = any (strfind (err.message, "NO_SUCH_ENTRY"));
  if (! missing && ! strcmp (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue"))
    rethrow (err);
  endif
endfunction

function left = unsupportedIn (name, entries, kind, names, variables)
  left = {};
  for number = [entries(strcmp ({entries.datatype}, "")).number]
    if (! isempty (kind) || number >= numel (names))
      left{end+1} = sprintf ("entry %d of attribute \"%s\"", number, name);
    elseif (variables.(names{number+1}).supported)
      left{end+1} = sprintf ("attribute \"%s\" of \"%s\"", name, names{number+1});
    endif
  endfor
endfunction

## An entry may have the number of a variable that there is not; it belongs to nothing.
function [variables, entries] = givenToVariables (variables, name, entries, names)
  entries = entries([entries.number] < numel (names));
  for entry = entries
    variables.(names{entry.number+1}).attributes.(name) = entry.value;
  endfor
endfunction

## One entry is its value; several are a cell array of theirs, and so is none.
function value = together (values)
  value = values(:);
  if (numel (values) == 1)
    value = values{1};
  endif
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_putAttrgEntry (id, 0, 3, "CDF_INT2", int16 ([1, 2]));
%! ambrix_createAttr (id, "Empty", "GLOBAL_SCOPE");
%! s = ambrix_info (id);
%! assert (s.attributes, struct ("Title", {{"Solar wind"; int16([1, 2])}}, "Empty", {cell(0, 1)}));
%! assert (s.attributeList(1).entries, [0, 3]);
%! assert (s.attributeList(1).datatypes, {"CDF_CHAR", "CDF_INT2"});
%! assert (s.attributeList(3).entries, []);
%! ambrix_close (id);
