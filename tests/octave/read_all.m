## usage: octave-cli read_all.m FOLDER FILE...
##
## Reads each file by ambrix_read, writes what it got to FOLDER/NAME.bin for other programs, and by
## ambrix_write to FOLDER/NAME.cdf, and makes the text that ambrix_info prints.
1;

## Each leaf of the struct: its path, its class, its sizes and its bytes. `path` ends in a
## separator.
function dump (stream, value, path)
  if (isstruct (value) && isscalar (value))
    leaf (stream, path, "struct", [], []);
    for [part, name] = value
      dump (stream, part, [path name "\x1f"]);
    endfor
  elseif (iscell (value) || isstruct (value))
    leaf (stream, path, "cell", [], []);
    for k = 1:numel (value)
      part = value(k);
      if (iscell (part))
        part = part{1};
      endif
      dump (stream, part, [path sprintf("%06d\x1f", k)]);
    endfor
  else
    leaf (stream, path, class (value), size (value), value(:).');
  endif
endfunction

function leaf (stream, path, class_name, sizes, value)
  if (ischar (value) || islogical (value))
    value = uint8 (value);
  endif
  numbers = uint32 ([numel(path), numel(class_name), numel(sizes), sizes]);
  fwrite (stream, [typecast(numbers, "uint8"), uint8([path class_name]), typecast(value, "uint8")]);
endfunction

## What was written back has all that can be told of what was read, but for what writing can't keep.
function assertSame (written, s, file)
  changing = {"name", "path", "version", "encoding"};
  assert (isequaln (rmfield (written.file, changing), rmfield (s.file, changing)), file);
  assert (isequaln (written.attributes, s.attributes), file);
  assert (isequal (fieldnames (written.variables), fieldnames (s.variables)), file);
  for [v, name] = written.variables
    assert (isequaln (v, s.variables.(name)), [file ": " name]);
    assert (class (written.data.(name)), class (s.data.(name)));
    assert (isequaln (written.data.(name), s.data.(name)), [file ": " name]);
  endfor
endfunction

warning ("error", "ambrix:unsupportedDatatype");
warning ("off", "TOLVEX:ambrix:cdflib:invalidCompressionParameter");
folder = argv (){1};
for file = argv ()(2:end)'
  [~, name] = fileparts (file{1});
  s = ambrix_read (file{1});
  ambrix_write (fullfile (folder, name), s);
  assertSame (ambrix_read (fullfile (folder, name)), s, name);
  assert (! isempty (__ambrix_descriptionText__ (s)), name);
  for [data, variable] = s.data
    if (iscell (data))  # many cells, slow to dump
      s.data.(variable) = ambrix_read (file{1}, variable, "text", "char");
    endif
  endfor
  [s.library(1), s.library(2)] = ambrix_getLibraryVersion ();
  stream = fopen (fullfile (folder, [name ".bin"]), "w");
  dump (stream, s, "");
  fclose (stream);
endfor
