## usage: octave check_pictures.m TOOLKIT FOLDER
##
## Plots over time as they are to be seen, by their pixels: the first picture of the tutorial and a
## spectrogram of ten minutes, printed into the folder, and with the toolkit qt on the screen, too.
1;

## How much of each column of pixels is blue, within the axes and outside at their height.
function [inside, outside] = blueColumns (picture, ax)
  [x, y] = pixels (picture, ax);
  part = double (picture(y(1):y(2),:,:));
  blue = any (part(:,:,3) - part(:,:,1) > 60, 1);
  inside = blue(x(1) + 3:x(2) - 3);
  outside = blue([1:x(1) - 3, x(2) + 3:end]);
endfunction

## The first and last column and row of axes.
function [x, y] = pixels (picture, ax)
  [height, width, ~] = size (picture);
  box = get (ax, "position");
  x = round ([box(1), box(1) + box(3)] * width);
  y = round ([1 - box(2) - box(4), 1 - box(2)] * height);
endfunction

## The line has no gaps, and is nowhere else; old files' times have as many digits as these.
function checkLines (picture, panels)
  for ax = panels
    [inside, outside] = blueColumns (picture, ax);
    assert (mean (inside) > 0.97, "the line is in %.0f %% of the columns", 100 * mean (inside));
    assert (mean (outside), 0);
    checkFrame (picture, ax);
  endfor
endfunction

function checkFrame (picture, ax)
  [x, y] = pixels (picture, ax);
  for side = x
    columns = picture(y(1) + 3:y(2) - 3,side - 2:side + 2,:);
    dark = any (all (columns < 170, 3), 2);
    assert (mean (dark) > 0.95, "the axes have no side at %d", side);
  endfor
endfunction

## Each tenth cell of a row has the color of its value.
function checkCells (picture, ax, values)
  [x, y] = pixels (picture, ax);
  limits = caxis (ax);
  colors = colormap (ax);
  row = round (y * [0.4; 0.6]);  # between ticks
  count = numel (values);
  for k = 6:10:count
    column = round (x(1) + (k - 1) / (count - 1) * diff (x));
    index = ceil ((values(k) - limits(1)) / diff (limits) * rows (colors));
    seen = double (squeeze (picture(row,column,:)));
    assert (seen, 255 * colors(max (1, index),:).', 25);
  endfor
endfunction

function file = writeSpectrogram (values)
  seconds = 10 * (0:numel (values) - 1);
  s.data.Epoch = ambrix_computeEpoch ([2024; 5; 6; 12; 0; 0; 0]) + 1000 * seconds(:);
  s.data.energy = (1:5).';
  s.data.flux = repmat (values(:), 1, 5);
  s.variables.Epoch.datatype = "CDF_EPOCH";
  s.variables.energy.recordVariance = false;
  s.variables.flux.attributes = struct ("DEPEND_0", "Epoch", "DEPEND_1", "energy");
  file = tempname ();
  ambrix_write (file, s);
endfunction

function pictures = seen (f, file)
  print (f, "-dpng", "-S800,600", file);
  pictures = {imread(file)};
  if (strcmp (graphics_toolkit (), "qt"))
    pictures{2} = shown (f);
  endif
endfunction

## What the screen shows once it shows anything.
function picture = shown (f)
  set (f, "visible", "on");
  for attempt = 1:50
    pause (0.2);
    picture = getframe (f).cdata;
    if (any (picture(:) != picture(1)))
      return;
    endif
  endfor
endfunction

function checkTutorial (folder)
  f = figure ("visible", "off", "position", [50, 50, 800, 600]);
  lines = ambrix_plot ("geocpi0", {"HP_P_Den", "HP_V", "HP_P_AVGE"});
  panels = cell2mat (get (lines([1, end]), "parent")).';
  for picture = seen (f, fullfile (folder, "lines.png"))
    checkLines (picture{1}, panels);
  endfor
  close (f);
endfunction

function checkSpectrogram (folder)
  values = mod ((0:60) * 7, 61);
  file = writeSpectrogram (values);
  f = figure ("visible", "off", "position", [50, 50, 800, 600]);
  ax = get (ambrix_plot (file, "flux"), "parent");
  for picture = seen (f, fullfile (folder, "cells.png"))
    checkCells (picture{1}, ax, values);
    checkFrame (picture{1}, ax);
  endfor
  close (f);
  delete ([file ".cdf"]);
endfunction

[toolkit, folder] = argv (){:};
warning ("off", "all");
if (! any (strcmp (available_graphics_toolkits (), toolkit)))
  printf ("no toolkit %s\n", toolkit);
  exit (77);
endif
graphics_toolkit (toolkit);
checkTutorial (folder);
checkSpectrogram (folder);
