## -*- texinfo -*-
## @deftypefn {} {[@var{s}, @var{left}] =} __ambrix_readAttributes__ (@var{id}, @var{s}, @var{names}, @var{count})
## Put the attributes of a file into its description.
##
## @var{names} are the fields of the variables by number. @var{left} lists the entries that had to
## be left out because the library does not know their datatype, but for those of variables of such
## a datatype.
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
    if (isempty (kind))
      last = min (last, numel (names) - 1);
    endif
    [entries, unfound] = readEntries (id, k - 1, kind, last);
    left = [left, unsupportedIn(list(k).name, entries, kind, names, s.variables)];
    if (unfound > 0)
      why = merge (isempty (kind), "that belong to no variable", "whose numbers are far apart");
      left{end+1} = sprintf ("%d entries of attribute \"%s\" %s", unfound, list(k).name, why);
    endif
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

## The entries of an attribute, and how many could not be found. Only the library's look-up tells
## which numbers there are, up to some thousand millions. Entries are mostly together, at the
## beginning or at the end, so both are searched, each as long as there are entries. Those of
## variables have numbers of variables.
function [entries, unfound] = readEntries (id, attribute, kind, last)
  entries = struct ("number", {}, "datatype", {}, "value", {});
  unfound = __ambrix__ (["getNumAttr" kind "Entries"], id, attribute);
  most = merge (isempty (kind), Inf, 20000);
  [first, missed, fromEnd] = deal (0, 0, false);
  while (unfound > 0 && first <= last && missed < most)
    number = merge (fromEnd, last, first);
    entry = readEntry (id, attribute, kind, number);
    first += ! fromEnd;
    last -= fromEnd;
    if (isempty (entry))
      missed += 1;
      fromEnd = ! fromEnd;
    else
      entries(end+1) = entry;
      unfound -= 1;
    endif
  endwhile
  [~, order] = sort ([entries.number]);
  entries = entries(order);
endfunction

## Empty where there is none; its datatype is empty where that is not supported.
function entry = readEntry (id, attribute, kind, number)
  entry = struct ("number", number, "datatype", "", "value", []);
  try
    entry.datatype = upper (__ambrix__ ("-extended", ["inquireAttr" kind "Entry"], id, attribute,
                                         number));
    entry.value = __ambrix__ ("-extended", ["getAttr" kind "Entry"], id, attribute, number);
  catch err
    if (isMissing (err))
      entry = [];
    endif
  end_try_catch
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
%!test  # an entry of a variable that there is not
%! [id, restore] = __ambrix_example__ ();
%! ambrix_putAttrEntry (id, 1, 7, "CDF_CHAR", "of nothing");
%! [s, left] = __ambrix_describeFile__ (id);
%! assert (left, {"1 entries of attribute \"Units\" that belong to no variable"});
%! ambrix_close (id);
%!test  # numbers that are far apart
%! [id, restore] = __ambrix_example__ ();
%! ambrix_putAttrgEntry (id, 0, 20e6, "CDF_CHAR", "last");
%! ambrix_putAttrgEntry (id, 0, 20e6 - 2, "CDF_CHAR", "nearly");
%! [s, left] = __ambrix_describeFile__ (id);
%! assert (s.attributeList(1).entries, [0, 20e6 - 2, 20e6]);
%! assert (s.attributes.Title, {"Solar wind"; "nearly"; "last"});
%! assert (left, {});
%! ambrix_putAttrgEntry (id, 0, 10e6, "CDF_CHAR", "lost");
%! [s, left] = __ambrix_describeFile__ (id);
%! assert (numel (s.attributes.Title), 3);
%! assert (left, {"1 entries of attribute \"Title\" whose numbers are far apart"});
%! ambrix_close (id);
