## -*- texinfo -*-
## @deftypefn {} {} ambrix ()
## Read, write and plot CDF files, the Common Data Format of space physics: an overview.
##
## Whole files and variables:
##
## @table @code
## @item ambrix_info (@var{file})
## what is in a file
## @item @var{data} = ambrix_read (@var{file}, @var{name})
## the data of a variable
## @item @var{s} = ambrix_read (@var{file})
## all data and attributes, in a struct
## @item ambrix_write (@var{file}, @var{s})
## a new file of a struct
## @item ambrix_plot (@var{file}, @var{name})
## a plot of a variable, with axes as its attributes tell
## @item ambrix_check (@var{file})
## whether a file is sound, without danger to this Octave
## @end table
##
## The commands are one function for each operation of the CDF library, such as @code{ambrix_open},
## @code{ambrix_getVarData} and @code{ambrix_close}. @code{pkg describe -verbose ambrix} lists all
## of them by subject; a part of a name and the Tab key complete it, and @code{lookfor} finds words
## in their descriptions. The tutorial is @file{doc/octave.md} in the folder of the package.
##
## A damaged file can make the CDF library crash, which ends Octave. Use @code{ambrix_check} for
## files that you don't trust before anything else.
##
## @example
## @group
## ambrix_info ("geocpi0")
## density = ambrix_read ("geocpi0", "HP_P_Den", "fill");
## times = ambrix_read ("geocpi0", "Epoch", "time");
## @end group
## @end example
## @seealso{ambrix_info, ambrix_read, ambrix_write, ambrix_plot, ambrix_check, ambrix_open}
## @end deftypefn

function ambrix ()
  help ambrix
endfunction

%!test
%! [text, form] = get_help_text ("ambrix");
%! assert (form, "texinfo");
%! for name = {"info", "read", "write", "plot", "check"}
%!   assert (any (strfind (text, ["ambrix_" name{1} " ("])), name{1});
%! endfor
%!assert (any (strfind (evalc ("ambrix"), "ambrix_info")))
