## -*- texinfo -*-
## @deftypefn {} {[@var{lines}, @var{interpreter}] =} __ambrix_labelText__ (@var{text}, @var{units}, @var{width})
## What is written beside axes: a text and its units in a cell array, in two lines where they are
## longer than @var{width} characters; what is longer by half is shortened.
##
## Files may have codes for the height of characters: @code{!E} and @code{!U} raise what follows,
## @code{!D}, @code{!I} and @code{!L} lower it, @code{!N} ends that. Only with such codes is the
## @var{interpreter} @qcode{"tex"}, else @qcode{"none"}: underscores are frequent in names. Double
## quotes become single ones and breaks blanks, which the toolkit gnuplot needs.
## @end deftypefn

function [lines, interpreter] = __ambrix_labelText__ (text, units, width)
  text = ended (regexprep (text, '[\x00-\x20]+', " "));
  lines = {text};
  if (! isempty (units))
    units = ["[" ended(units) "]"];
    lines = {[text " " units]};
    if (numel (plain (lines{1})) > width)
      lines = {text, units};
    endif
  endif
  lines = cellfun (@(line) shortened (strrep (line, "\"", "'"), width), lines, ...
                   "UniformOutput", false);
  interpreter = "none";
  if (any (cellfun (@hasCodes, lines)))
    interpreter = "tex";
    lines = cellfun (@inTex, lines, "UniformOutput", false);
  endif
endfunction

## What the last code does is not to go on in what is added.
function text = ended (text)
  if (hasCodes (text))
    text = [text "!N"];
  endif
endfunction

function text = shortened (text, width)
  short = plain (text);
  most = floor (1.5 * width);
  if (numel (short) > most)
    text = [strtrim(short(1:most - 3)) "..."];
  endif
endfunction

function found = hasCodes (text)
  found = ! isempty (regexp (text, '![EUDIL]', "once"));
endfunction

function text = plain (text)
  if (hasCodes (text))
    text = regexprep (text, '!\w', "");
  endif
endfunction

function text = inTex (text)
  text = regexprep (text, '([\\_^{}])', '\\$1');
  if (hasCodes (text))
    text = regexprep (text, '![EU](.*?)(?=!|$)', '^{$1}');
    text = regexprep (text, '![DIL](.*?)(?=!|$)', '_{$1}');
    text = regexprep (text, '!\w', "");
  endif
endfunction

%!function check (given, lines, interpreter)
%!  [found, how] = __ambrix_labelText__ (given{:});
%!  assert (found, lines);
%!  assert (how, interpreter);
%!endfunction

%!test
%! check ({"SW_P_Den", "/cm**3", 40}, {"SW_P_Den [/cm**3]"}, "none");
%! check ({"SW_P_Den", "", 40}, {"SW_P_Den"}, "none");
%! check ({"Flux", "s!E-1!N sr!U-1!N", 40}, {"Flux [s^{-1} sr^{-1}]"}, "tex");
%! check ({"T_i!Dperp", "eV", 40}, {'T\_i_{perp} [eV]'}, "tex");
%! check ({"B!Dx!N", "nT!E2", 40}, {"B_{x} [nT^{2}]"}, "tex");
%! check ({"Stop! Now", "", 40}, {"Stop! Now"}, "none");
%! check ({"a \"good\"\r\n  line", "", 40}, {"a 'good' line"}, "none");
%!test
%! check ({"Number density of ions", "/cm**3", 24}, {"Number density of ions", "[/cm**3]"}, "none");
%! check ({"Number density of ions", "/cm**3", 10}, {"Number densi...", "[/cm**3]"}, "none");
%! check ({"Number density of ions", "", 6}, {"Number..."}, "none");
%! check ({"Flux", "s!E-1!N sr!U-1!N", 10}, {"Flux", "[s^{-1} sr^{-1}]"}, "tex");
%! check ({"Fl_x", "s!E-1!N sr!U-1!N", 6}, {"Fl_x", "[s-1 s..."}, "none");
