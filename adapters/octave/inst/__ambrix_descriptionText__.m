## -*- texinfo -*-
## @deftypefn {} {@var{text} =} __ambrix_descriptionText__ (@var{s})
## What @code{ambrix_info} prints of a description: the file, its global attributes and its
## variables.
## @end deftypefn

function text = __ambrix_descriptionText__ (s)
  lines = [{headline(s.file)}; globalLines(s.attributes); variableLines(s.variables)];
  lines = cellfun (@shortened, lines, "UniformOutput", false);
  text = sprintf ("%s\n", lines{:});
endfunction

function line = headline (file)
  facts = {file.format, file.majority, file.encoding, file.compression, file.checksum};
  [~, name, extension] = fileparts (file.name);
  line = sprintf ("%s: CDF %s, %s", [name extension], file.version,
                  strjoin (facts(! strncmp (facts, "NO_", 3)), ", "));
endfunction

function lines = globalLines (attributes)
  table = cell (0, 2);
  for [value, name] = attributes
    if (! iscell (value))
      value = {value};
    endif
    values = cellfun (@shownValue, value(:), "UniformOutput", false);
    if (numel (values) > 5)
      values = [values(1:4); sprintf("... %d entries", numel (values))];
    endif
    values = [values; repmat({"no entries"}, isempty (values), 1)];
    table = [table; [{name}; repmat({""}, numel (values) - 1, 1)], values];
  endfor
  lines = titled ("Global attributes", table);
endfunction

function lines = variableLines (variables)
  table = {"name", "datatype", "sizes", "records", "units", "description"};
  for [v, name] = variables
    sizes = regexprep (sprintf ("-by-%d", v.sizes), '^-by-', "");
    table(end+1,:) = {name, shownDatatype(v), sizes, shownRecords(v), ...
                      shownValue(firstOf (v.attributes, {"UNITS", "Units", "units"})), ...
                      shownValue(firstOf (v.attributes, {"CATDESC", "FIELDNAM", "LABLAXIS"}))};
  endfor
  lines = titled ("Variables", table);
endfunction

function text = shownDatatype (v)
  text = v.datatype;
  if (! v.supported)
    text = [text ", not supported"];
  elseif (v.elements != 1)
    text = sprintf ("%s*%d", text, v.elements);
  endif
endfunction

function text = shownRecords (v)
  text = sprintf ("%d", v.records);
  if (! v.recordVariance)
    text = [text ", fixed"];
  endif
endfunction

function value = firstOf (attributes, names)
  value = "";
  here = names(isfield (attributes, names));
  if (! isempty (here))
    value = attributes.(here{1});
  endif
endfunction

function text = shownValue (value)
  if (ischar (value))
    blank = isspace (value);  # no regular expression: those refuse texts that are not UTF-8
    value(blank) = " ";
    text = value(! (blank & [false, blank](1:numel (blank))));
  elseif (isinteger (value))  # mat2str would make doubles of them
    text = sprintf (" %d", value)(2:end);
    if (! isscalar (value))
      text = ["[" text "]"];
    endif
  else
    text = mat2str (value, 7);
  endif
endfunction

## The rows with aligned columns under a blank line and a title, if there are any.
function lines = titled (title, table)
  lines = cell (0, 1);
  if (! isempty (table))
    parts = cell (1, columns (table));
    for k = 1:columns (table)
      parts{k} = [repmat("  ", rows (table), 1), char(table(:,k))];
    endfor
    lines = [{""}; title; cellstr(horzcat (parts{:}))];
  endif
endfunction

## Without half of a character at the end.
function line = shortened (line)
  if (numel (line) > 100)
    last = find (bitand (double (line(1:98)), 192) != 128, 1, "last") - 1;
    line = [line(1:last) "..."];
  endif
  line = deblank (line);
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! version = sprintf ("%d.%d.%d", nthargout (1:3, @ambrix_getVersion, id){:});
%! s = ambrix_info (id);
%! ambrix_close (id);
%! lines = {["example: CDF " version ", SINGLE_FILE, ROW_MAJOR, IBMPC_ENCODING"], "", ...
%!          "Global attributes", "  Title  Solar wind", "", "Variables", ...
%!          "  name  datatype    sizes   records  units  description", ...
%!          "  Time  CDF_EPOCH           2", ...
%!          "  Flux  CDF_REAL4   2-by-3  2        km/s", ...
%!          "  Mode  CDF_CHAR*4          2", ""};
%! assert (__ambrix_descriptionText__ (s), strjoin (lines, "\n"));
%!test  # all digits of integers
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! most = intmax ("int64");
%! ambrix_write ("digits", struct ("data", struct (), "attributes", ...
%!                                 struct ("a", most - 1, "b", int32 ([123456789, -1]))));
%! lines = ostrsplit (__ambrix_descriptionText__ (ambrix_info ("digits")), "\n");
%! assert (lines(4:5), {"  a  9223372036854775806", "  b  [123456789 -1]"});
%!test  # characters of two bytes, and bytes that are none
%! [id, restore] = __ambrix_example__ ();
%! ambrix_putAttrgEntry (id, 0, 0, "CDF_CHAR", ["a" repmat(char ([195, 169]), 1, 60)]);
%! ambrix_putAttrgEntry (id, 0, 1, "CDF_CHAR", char ([233, 10, 32, 66, 32]));
%! s = ambrix_info (id);
%! ambrix_close (id);
%! lines = ostrsplit (__ambrix_descriptionText__ (s), "\n");
%! assert (lines{4}, ["  Title  a" repmat(char ([195, 169]), 1, 43) "..."]);
%! assert (double (lines{5}), [repmat(32, 1, 9), 233, 32, 66]);
