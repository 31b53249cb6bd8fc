## usage: octave-cli --path PACKAGE contact_sheet.m SHEET FILE...
##
## Draws one variable of each CDF file, data rather than what belongs to them and with as many values
## as there are, and puts the small pictures into one, six in a row. Files without such are left out.
1;

## The best first; of equal ones the first in the file.
function names = candidates (s)
  names = fieldnames (s.variables);
  points = cellfun (@(name) pointsOf (s.variables.(name)), names);
  [points, order] = sort (points, "descend");
  names = names(order(points > 0));
endfunction

function points = pointsOf (v)
  texts = any (strcmp (v.datatype, {"CDF_CHAR", "CDF_UCHAR"}));
  times = strncmp (v.datatype, "CDF_EPOCH", 9);
  count = v.supported * v.recordVariance * (numel (v.sizes) < 3) * ! texts * ! times ...
    * v.records * prod (v.sizes);
  isData = isfield (v.attributes, "VAR_TYPE") && strcmp (v.attributes.VAR_TYPE, "data");
  isReal = any (regexp (v.datatype, "REAL|FLOAT|DOUBLE"));
  points = (count > 1) * (1e9 * isData + 1e6 * isReal + min (count, 1e6));
endfunction

function done = drawn (f, file)
  done = false;
  try
    s = ambrix_info (file);
  catch
    return;  # some files are no CDF files
  end_try_catch
  names = candidates (s);
  if (! isempty (names))
    clf (f);
    h = ambrix_plot (file, names{1});
    [~, base] = fileparts (file);
    title (get (h(1), "parent"), base(1:min (end, 36)), "interpreter", "none");
    done = true;
  endif
endfunction

## Half as large, so that lines become smooth.
function small = printed (f)
  file = [tempname(), ".png"];
  print (f, "-dpng", "-S480,360", file);
  large = double (imread (file)(1:360,1:480,:));
  delete (file);
  small = (large(1:2:end,1:2:end,:) + large(2:2:end,1:2:end,:)
           + large(1:2:end,2:2:end,:) + large(2:2:end,2:2:end,:)) / 4;
endfunction

function writeSheet (sheet, pictures)
  width = 6;
  [height, across, ~] = size (pictures{1});
  pictures(end+1:ceil (numel (pictures) / width) * width) = {255 * ones(height, across, 3)};
  imwrite (uint8 (cell2mat (reshape (pictures, width, []).')), sheet);
endfunction

arguments = argv ();
warning ("off", "all");
graphics_toolkit ("gnuplot");
f = figure ("visible", "off", "position", [0, 0, 480, 360]);
pictures = {};
for file = arguments(2:end).'
  if (drawn (f, file{1}))
    pictures{end+1} = printed (f);
  endif
endfor
close (f);
writeSheet (arguments{1}, pictures);
printf ("%d pictures\n", numel (pictures));
