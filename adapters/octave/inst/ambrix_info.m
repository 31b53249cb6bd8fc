## -*- texinfo -*-
## @deftypefn  {} {} ambrix_info (@var{file})
## @deftypefnx {} {@var{s} =} ambrix_info (@var{file})
## Return everything in a CDF file except its data.
##
## @var{file} is the path of a file, with or without @code{.cdf}, or the identifier of an open one.
## Without an output the description is printed.
##
## @var{s} is a struct with these fields:
##
## @table @code
## @item file
## properties of the file: @code{name}, @code{path}, @code{version} of the CDF library that wrote
## it, @code{format}, @code{encoding}, @code{majority}, @code{checksum}, @code{compression} and
## @code{compressionParameter}
## @item attributes
## the global attributes by name: the value of a single entry, or a cell array of the values of all
## entries
## @item variables
## the variables by name, each a struct with its @code{name}, @code{number}, @code{datatype},
## number of @code{elements} (the characters of a text, else 1), @code{sizes} of its dimensions,
## @code{recordVariance} and dimension @code{variances}, number of @code{records} and of those
## @code{written}, @code{sparseRecords}, @code{compression} and @code{compressionParameter},
## @code{blockingFactor}, @code{padValue} and @code{attributes}, by name
## @item attributeList
## the attributes of both scopes in the order of the file: the numbers of their entries, or the
## names of the variables with an entry, and the datatypes of the entries
## @end table
##
## Sizes are in the order of the file for both majorities, as in the data of @code{ambrix_read}.
## Names that are not identifiers in Octave are also fields: @code{s.variables.("B field")}. Field
## names have no blanks at the end; @code{name} has them. A variable whose datatype the library does
## not know has @code{supported} false and no pad value. Entries of such a datatype are left out,
## with the warning @code{ambrix:unsupportedDatatype}.
##
## @example
## @group
## s = ambrix_info ("geocpi0");
## s.variables.Epoch.records
## s.variables.SC_pos_se.attributes.UNITS
## @end group
## @end example
## @seealso{ambrix_read, ambrix_write, ambrix_plot}
## @end deftypefn

function s = ambrix_info (file)
  if (nargin != 1)
    print_usage ();
  endif
  [id, closer] = __ambrix_openToRead__ (file);
  [description, left] = __ambrix_describeFile__ (id);
  clear closer
  __ambrix_warnOfUnsupported__ ("ambrix_info", description.file.name, left);
  if (nargout > 0)
    s = description;
  else
    fputs (stdout, __ambrix_descriptionText__ (description));
  endif
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s = ambrix_info ("example.cdf");
%! assert (fieldnames (s), {"file"; "attributes"; "variables"; "attributeList"});
%! assert (s.variables.Flux.sizes, [2, 3]);
%! assert (s.variables.Mode.elements, 4);
%! assert (s.attributeList(2).name, "Units");
%! assert (s.attributeList(2).entries, {"Flux"});
%! assert (s.attributeList(1).datatypes, {"CDF_CHAR"});

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! text = evalc ('ambrix_info ("example")');
%! assert (any (strfind (text, "Flux  CDF_REAL4   2-by-3")));

%!error id=TOLVEX:ambrix:cdflib:fileOpenError ambrix_info ("no such file")
%!error id=ambrix:invalidFile ambrix_info (1)
%!error id=Octave:invalid-fun-call ambrix_info ()

%!demo
%! # What is in a new file, printed and as a struct
%! file = [tempname() ".cdf"];
%! s.data.B = single ([4.5 0.5 -2; 4 0 -1.5]);
%! s.variables.B.attributes.UNITS = "nT";
%! s.attributes.Title = "Magnetic field";
%! ambrix_write (file, s);
%! ambrix_info (file)
%! units = ambrix_info (file).variables.B.attributes.UNITS
%! delete (file);
