## usage: octave-cli run_tutorial.m FILE
##
## Runs the lines of a file as if they were typed, and prints what each prints behind a zero byte.

graphics_toolkit ("gnuplot");
set (0, "defaultfigurevisible", "off");
for line__ = strsplit (strtrim (fileread (argv (){1})), "\n")
  try
    printed__ = evalc (line__{1});
  catch err__
    printed__ = ["error: " err__.message];
  end_try_catch
  printf ("%c%s", 0, printed__);
endfor
close all
