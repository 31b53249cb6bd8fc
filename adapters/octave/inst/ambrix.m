## -*- texinfo -*-
## @deftypefn {} {} ambrix ()
## Read, write and plot CDF files, the Common Data Format of space physics: an overview.
##
## Whole files and variables:
##
## @table @code
## @item ambrix_info (@var{file})
## the contents of a file
## @item @var{data} = ambrix_read (@var{file}, @var{name})
## the data of a variable
## @item @var{s} = ambrix_read (@var{file})
## all data and attributes, in a struct
## @item ambrix_write (@var{file}, @var{s})
## a new file from a struct
## @item ambrix_plot (@var{file}, @var{name})
## a plot of a variable, with axes by its attributes
## @item ambrix_check (@var{file})
## whether a file is sound, without risk to this Octave
## @end table
##
## The commands are one function for each operation of the CDF library, such as @code{ambrix_open},
## @code{ambrix_getVarData} and @code{ambrix_close}. @code{pkg describe -verbose ambrix} lists all
## of them by subject. The Tab key completes names, and @code{lookfor} finds words in their
## descriptions. The tutorial is @file{doc/octave.md} in the folder of the package.
##
## A damaged file can make the CDF library crash, which ends Octave. First use @code{ambrix_check}
## for files that you do not trust.
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
