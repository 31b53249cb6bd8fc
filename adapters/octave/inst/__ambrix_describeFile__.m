## -*- texinfo -*-
## @deftypefn {} {[@var{s}, @var{left}] =} __ambrix_describeFile__ (@var{id})
## Describe everything in a file but the data, as @code{ambrix_info} returns it.
##
## @var{left} lists the entries of attributes that had to be left out because the library does not
## know their datatype, but for those of variables of such a datatype.
## @end deftypefn

function [s, left] = __ambrix_describeFile__ (id)
  [s.file, variables, attributes] = describeItself (id);
  rowMajor = strcmp (s.file.majority, "ROW_MAJOR");
  s.attributes = struct ();
  s.variables = struct ();
  names = cell (1, 0);
  for number = 0:variables - 1
    try
      v = __ambrix_describeVariable__ (id, number, rowMajor);
      names{end+1} = __ambrix_fieldName__ (v.name);
      s.variables.(names{end}) = withStorage (id, v);
    catch err
      __ambrix_raiseFor__ ("ambrix", sprintf ("variable %d of \"%s\"", number, s.file.name), err);
    end_try_catch
  endfor
  [s, left] = __ambrix_readAttributes__ (id, s, names, attributes);
endfunction

function [file, variables, attributes] = describeItself (id)
  file.name = __ambrix__ ("getName", id);
  file.path = pathOf (file.name);
  [version, release, increment] = __ambrix__ ("getVersion", id);
  file.version = sprintf ("%d.%d.%d", version, release, increment);
  file.format = __ambrix__ ("getFormat", id);
  file.majority = __ambrix__ ("getMajority", id);
  [file.encoding, variables, attributes] = inquired (id);
  file.checksum = __ambrix__ ("getChecksum", id);
  [file.compression, file.compressionParameter] = __ambrix__ ("getCompression", id);
endfunction

## Where it is, whatever the folder that is worked in; empty where that can't be told.
function path = pathOf (name)
  path = "";
  for ending = {".cdf", "", ".CDF"}
    path = canonicalize_file_name ([name ending{1}]);
    if (! isempty (path))
      return;
    endif
  endfor
endfunction

## "inquire" knows no names for the encodings with the highest numbers, and fails.
function [encoding, variables, attributes] = inquired (id)
  try
    [encoding, ~, ~, variables, attributes] = __ambrix__ ("inquire", id);
  catch err
    if (! strcmp (err.identifier, "TOLVEX:ambrix:cdflib:unrecognizedValue"))
      rethrow (err);
    endif
    encoding = ["encoding " regexp(err.message, '\d+', "match", "once")];
    attributes = __ambrix__ ("getNumgAttributes", id) + __ambrix__ ("getNumvAttributes", id);
    variables = countedVariables (id);
  end_try_catch
endfunction

function count = countedVariables (id)
  count = 0;
  try
    while (true)
      __ambrix__ ("getVarName", id, count);
      count += 1;
    endwhile
  end_try_catch
endfunction

function v = withStorage (id, v)
  v.written = __ambrix__ ("getVarNumRecsWritten", id, v.number);
  v.sparseRecords = __ambrix__ ("getVarSparseRecords", id, v.number);
  [v.compression, v.compressionParameter] = __ambrix__ ("getVarCompression", id, v.number);
  v.blockingFactor = __ambrix__ ("getVarBlockingFactor", id, v.number);
  v.padValue = [];
  if (v.supported)
    v.padValue = __ambrix__ ("-extended", "getVarPadValue", id, v.number)(:).';
  endif
  v.attributes = struct ();
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! [s, left] = __ambrix_describeFile__ (id);
%! assert (s.file.majority, "ROW_MAJOR");
%! assert (s.file.path, canonicalize_file_name ("example.cdf"));
%! assert (fieldnames (s.variables), {"Time"; "Flux"; "Mode"});
%! assert (s.variables.Flux.padValue, single (-1e30));
%! assert (s.variables.Flux.attributes.Units, "km/s");
%! assert (s.attributes.Title, "Solar wind");
%! assert (left, {});
%! ambrix_close (id);
