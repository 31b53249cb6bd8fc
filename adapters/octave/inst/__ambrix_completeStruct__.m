## -*- texinfo -*-
## @deftypefn {} {@var{s} =} __ambrix_completeStruct__ (@var{s})
## Make a struct for @code{ambrix_write} one that has all the parts that @code{ambrix_read} returns,
## with a description of each variable that there are data of.
## @end deftypefn

function s = __ambrix_completeStruct__ (s)
  if (! isstruct (s) || ! isscalar (s))
    error ("ambrix:invalidData",
           "ambrix_write: give a struct of arrays, or what ambrix_read returns");
  endif
  areStructs = structfun (@isstruct, s);
  if (! any (areStructs))
    s = struct ("data", {s});
  endif
  parts = struct ("data", {struct()}, "variables", {struct()}, "attributes", {struct()}, ...
                  "file", {struct()}, "options", {struct()});
  parts.attributeList = struct ("name", {}, "scope", {}, "entries", {}, "datatypes", {});
  parts.leftOut = {};
  for unknown = setdiff (fieldnames (s), fieldnames (parts))'
    error ("ambrix:invalidData", ["ambrix_write: \"%s\" is no part of what is written, which " ...
           "are %s; and a struct of arrays holds no structs"],
           unknown{1}, strjoin (fieldnames (parts)', ", "));
  endfor
  s = withDefaults (s, parts);
  columns = fieldnames (parts.attributeList)';
  if (! all (isfield (s.attributeList, columns)))
    error ("ambrix:invalidData", "ambrix_write: \"attributeList\" must have the fields %s",
           strjoin (columns, ", "));
  endif
  s.file = withDefaults (s.file, struct ("format", "SINGLE_FILE", "majority", "COLUMN_MAJOR", ...
                                         "checksum", "NO_CHECKSUM"));
  s.options = withDefaults (s.options, struct ("records", "first", "time", [], "fill", false));
  if (! any (strcmp (s.options.records, {"first", "last"})))
    error ("ambrix:invalidData", "ambrix_write: records come \"first\" or \"last\"");
  endif
  s.variables = allVariables (s);
  checkFields (s);
endfunction

## A field that nothing is made of is a slip of the pen.
function checkFields (s)
  refuseOthers (s.file, {"name", "path", "version", "format", "encoding", "majority", ...
                         "checksum", "compression", "compressionParameter"}, ...
                "the file", "s.attributes");
  refuseOthers (s.options, {"records", "text", "time", "fill"}, "the options", "s.attributes");
  known = {"name", "number", "supported", "datatype", "elements", "sizes", "recordVariance", ...
           "variances", "records", "written", "sparseRecords", "compression", ...
           "compressionParameter", "blockingFactor", "padValue", "attributes", "filler"};
  for [v, name] = s.variables
    refuseOthers (v, known, sprintf ("variable \"%s\"", name), ...
                  sprintf ("s.variables.%s.attributes", name));
  endfor
endfunction

function refuseOthers (given, known, what, attributes)
  for unknown = setdiff (fieldnames (given), known)'
    error ("ambrix:invalidData", ["ambrix_write: \"%s\" is nothing that describes %s, but %s; " ...
           "an attribute has its place in %s"], unknown{1}, what, strjoin (known, ", "), ...
           attributes);
  endfor
endfunction

function s = withDefaults (s, defaults)
  for [value, name] = defaults
    if (! isfield (s, name))
      s.(name) = value;
    elseif (isstruct (value) && ! isstruct (s.(name)))
      error ("ambrix:invalidData", "ambrix_write: \"%s\" must be a struct", name);
    endif
  endfor
endfunction

## In the order of the file where they were read, else in that of the data. What could not be read
## can't be written either.
function variables = allVariables (s)
  described = s.variables;
  names = fieldnames (s.data);
  if (all (structfun (@(v) isfield (v, "number"), described)))
    names = [fieldnames(described); names];
  else
    names = [names; fieldnames(described)];
  endif
  variables = struct ();
  for name = unique (names, "stable")'
    v = struct ();
    if (isfield (described, name{1}))
      v = described.(name{1});
    endif
    if (! isstruct (v) || ! isscalar (v))
      error ("ambrix:invalidData", "ambrix_write: what describes variable \"%s\" must be a struct",
             name{1});
    endif
    isSupported = ! isfield (v, "supported") || v.supported;
    if (! isSupported && isfield (s.data, name{1}))
      error ("ambrix:unsupportedDatatype", ["ambrix_write: variable \"%s\" was read with a " ...
             "datatype that is not supported; set s.variables.%s = struct () for a new one"], ...
             name{1}, name{1});
    endif
    if (isSupported)
      variables.(name{1}) = withDefaults (v, struct ("attributes", {struct()}));
    endif
  endfor
endfunction

%!test  # a plain struct of arrays
%! s = __ambrix_completeStruct__ (struct ("a", 1, "b", "x"));
%! assert (fieldnames (s.variables), {"a"; "b"});
%! assert (s.data.b, "x");
%! assert (s.file.majority, "COLUMN_MAJOR");
%!test  # variables stay in the order of the data when only some are described
%! s.data = struct ("time", 1, "flux", 2);
%! s.variables.flux.attributes.UNITS = "nT";
%! s = __ambrix_completeStruct__ (s);
%! assert (fieldnames (s.variables), {"time"; "flux"});
%!error <"UNITS" is nothing that describes variable "x".*place in s.variables.x.attributes>
%! s = struct ("data", struct ("x", 1), "variables", struct ("x", struct ("UNITS", "nT")));
%! __ambrix_completeStruct__ (s);
%!error <"Majority" is nothing that describes the file>
%! __ambrix_completeStruct__ (struct ("data", struct (), "file", struct ("Majority", 1)));
%!error <"Time" is nothing that describes the options>
%! __ambrix_completeStruct__ (struct ("data", struct (), "options", struct ("Time", true)));
%!error id=ambrix:unsupportedDatatype
%! s = struct ("data", struct ("x", 1), "variables", struct ("x", struct ("supported", false)));
%! __ambrix_completeStruct__ (s);
%!error id=ambrix:invalidData __ambrix_completeStruct__ (1)
%!error <"position" is no part of what is written>
%! __ambrix_completeStruct__ (struct ("position", struct ("x", 1)));
%!error <records come "first" or "last">
%! s = struct ("data", struct (), "options", struct ("records", "third"));
%! __ambrix_completeStruct__ (s);
%!error <describes variable "a" must be a struct>
%! __ambrix_completeStruct__ (struct ("variables", struct ("a", 5)));
%!error <"attributeList" must have the fields name, scope,>
%! s = struct ("data", struct (), "attributeList", struct ("name", "x"));
%! __ambrix_completeStruct__ (s);
%!error <"attributes" must be a struct>
%! __ambrix_completeStruct__ (struct ("data", struct ("a", 1), "attributes", 2));
