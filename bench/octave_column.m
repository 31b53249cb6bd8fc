# usage: octave-cli octave_column.m FOLDER_OF_MODULE FOLDER DIVISOR
#
# The workloads in GNU Octave, by the calls of bench/module.
1;

function column = given (folder, divisor)
  column.folder = folder;
  column.records = floor (6400 / divisor);
  column.variables = floor (500 / divisor);
  column.singles = floor (100000 / divisor);
  column.texts = floor (100000 / divisor);
  column.images = floor (2000 / divisor);
  column.smallFiles = floor (1000 / divisor);
  column.times = floor (1000000 / divisor);
  column.calls = floor (20000 / divisor);
endfunction

function value = constant (name)
  value = __ambrix__ ("getConstantValue", name);
endfunction

function seconds = read_slab (column, name, records, counts, intervals)
  tic;
  file = __ambrix__ ("open", fullfile (column.folder, name));
  data = __ambrix__ ("hyperGetVarData", file, 0, 0, records, 1, zeros (size (counts)), counts,
                     intervals);
  clear data;
  __ambrix__ ("close", file);
  seconds = toc;
endfunction

function seconds = write_slab (column, data, majority, level, variable, counts, records)
  name = fullfile (column.folder, "octave_written");
  if (exist ([name ".cdf"], "file"))
    delete ([name ".cdf"]);
  endif
  tic;
  file = __ambrix__ ("create", name);
  __ambrix__ ("setMajority", file, constant (majority));
  vary = constant ("VARY");
  number = __ambrix__ ("createVar", file, "values", constant (variable{1}), variable{2}, counts,
                       vary, repmat (vary, size (counts)));
  if (level > 0)
    __ambrix__ ("setVarCompression", file, number, constant ("GZIP_COMPRESSION"), level);
  endif
  __ambrix__ ("hyperPutVarData", file, number, 0, records, 1, zeros (size (counts)), counts,
              ones (size (counts)), data);
  __ambrix__ ("close", file);
  seconds = toc;
endfunction

function seconds = read (column)
  seconds = read_slab (column, "row.cdf", column.records, [10, 100], [1, 1]);
endfunction

function seconds = read_column_major (column)
  seconds = read_slab (column, "column.cdf", column.records, [100, 10], [1, 1]);
endfunction

function seconds = read_gzip (column)
  seconds = read_slab (column, "gzip.cdf", column.records, [10, 100], [1, 1]);
endfunction

function seconds = read_gzip_file (column)
  seconds = read_slab (column, "gzip_file.cdf", column.records, [10, 100], [1, 1]);
endfunction

function seconds = read_small_files (column)
  seconds = 0;
  for i = 1:column.smallFiles
    seconds += read_slab (column, "small_gzip.cdf", 100, [], []);
  endfor
endfunction

function seconds = read_text (column)
  seconds = read_slab (column, "text.cdf", column.texts, [], []);
endfunction

function seconds = read_strided (column)
  seconds = read_slab (column, "image.cdf", column.images, [32, 32], [2, 2]);
endfunction

function data = numbers (column)
  data = 0:(1000 * column.records - 1);
  data += 0;  # a range is not yet an array
endfunction

function seconds = write (column)
  seconds = write_slab (column, numbers (column), "ROW_MAJOR", 0, {"CDF_REAL8", 1}, [10, 100],
                        column.records);
endfunction

function seconds = write_column_major (column)
  seconds = write_slab (column, numbers (column), "COLUMN_MAJOR", 0, {"CDF_REAL8", 1}, [100, 10],
                        column.records);
endfunction

function seconds = write_gzip (column)
  seconds = write_slab (column, numbers (column), "ROW_MAJOR", 6, {"CDF_REAL8", 1}, [10, 100],
                        column.records);
endfunction

function seconds = write_text (column)
  data = repmat ("a", 32, column.texts);
  seconds = write_slab (column, data, "ROW_MAJOR", 0, {"CDF_CHAR", 32}, [], column.texts);
endfunction

function seconds = walk_metadata (column)
  tic;
  file = __ambrix__ ("open", fullfile (column.folder, "metadata.cdf"));
  [~, ~, ~, variables, attributes] = __ambrix__ ("inquire", file);
  for attribute = 0:attributes-1
    [name, scope, entries, zEntries] = __ambrix__ ("inquireAttr", file, attribute);
  endfor
  for variable = 0:variables-1
    [name, type, elements, sizes, recordVaries, vary] = __ambrix__ ("inquireVar", file, variable);
    for attribute = 0:attributes-1
      value = __ambrix__ ("getAttrEntry", file, attribute, variable);
    endfor
  endfor
  __ambrix__ ("close", file);
  seconds = toc;
endfunction

function seconds = write_metadata (column)
  name = fullfile (column.folder, "octave_written");
  if (exist ([name ".cdf"], "file"))
    delete ([name ".cdf"]);
  endif
  text = "a text of some length, such as units";
  [texts, doubles, vary] = deal (constant ("CDF_CHAR"), constant ("CDF_REAL8"), constant ("VARY"));
  tic;
  file = __ambrix__ ("create", name);
  for attribute = 0:19
    __ambrix__ ("createAttr", file, sprintf ("attribute%d", attribute),
                constant ("VARIABLE_SCOPE"));
  endfor
  for i = 0:column.variables-1
    variable = __ambrix__ ("createVar", file, sprintf ("variable%d", i), doubles, 1, [], vary, []);
    for attribute = 0:2:18
      __ambrix__ ("putAttrEntry", file, attribute, variable, texts, text);
      __ambrix__ ("putAttrEntry", file, attribute + 1, variable, doubles, 1.5);
    endfor
  endfor
  __ambrix__ ("close", file);
  seconds = toc;
endfunction

function seconds = read_values (column)
  file = __ambrix__ ("open", fullfile (column.folder, "series.cdf"));
  tic;
  for record = 0:column.singles-1
    value = __ambrix__ ("getVarData", file, 0, record);
  endfor
  seconds = toc;
  __ambrix__ ("close", file);
endfunction

function seconds = read_values_hyper (column)
  file = __ambrix__ ("open", fullfile (column.folder, "series.cdf"));
  tic;
  for record = 0:column.singles-1
    value = __ambrix__ ("hyperGetVarData", file, 0, record, 1, 1, [], [], []);
  endfor
  seconds = toc;
  __ambrix__ ("close", file);
endfunction

function seconds = convert (command, data)
  tic;
  result = __ambrix__ (command, data);
  seconds = toc;
endfunction

function seconds = epoch_breakdown (column)
  seconds = convert ("epochBreakdown", repmat (63113904000000, 1, column.times));
endfunction

function seconds = epoch_compute (column)
  seconds = convert ("computeEpoch", repmat ([2000; 6; 15; 12; 30; 45; 500], 1, column.times));
endfunction

function seconds = epoch16_breakdown (column)
  seconds = convert ("epoch16Breakdown", repmat ([63113904000; 500], 1, column.times));
endfunction

function seconds = epoch16_compute (column)
  seconds = convert ("computeEpoch16", repmat ([2000; 6; 15; 12; 30; 45; 500; 250; 125; 62], 1,
                                               column.times));
endfunction

function seconds = get_constant (column)
  tic;
  for i = 1:column.calls
    value = __ambrix__ ("getConstantValue", "GZIP_COMPRESSION");
  endfor
  seconds = toc;
endfunction

function seconds = failures (column, varargin)
  tic;
  for i = 1:column.calls
    try
      __ambrix__ (varargin{:});
    end_try_catch
  endfor
  seconds = toc;
endfunction

function seconds = unknown_command (column)
  seconds = failures (column, "getEverything");
endfunction

function seconds = refused_argument (column)
  seconds = failures (column, "close", 1);
endfunction

function seconds = library_failure (column)
  file = __ambrix__ ("open", fullfile (column.folder, "series.cdf"));
  seconds = failures (column, "getVarName", file, 99);
  __ambrix__ ("close", file);
endfunction

arguments = argv ();
addpath (arguments{end-2});
column = given (arguments{end-1}, str2double (arguments{end}));
puts ("ready\n");
fflush (stdout);
while (true)
  try
    workload = input ("", "s");  # fgetl would wait for what follows the line
  catch
    break;  # the end of input
  end_try_catch
  printf ("%.9g\n", feval (workload, column));
  fflush (stdout);
endwhile
