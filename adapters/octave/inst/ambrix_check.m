## -*- texinfo -*-
## @deftypefn  {} {} ambrix_check (@var{file})
## @deftypefnx {} {@var{sound} =} ambrix_check (@var{file})
## @deftypefnx {} {[@var{sound}, @var{report}] =} ambrix_check (@var{file})
## @deftypefnx {} {@dots{} =} ambrix_check (@var{file}, "timeout", @var{seconds})
## Check whether a CDF file is sound, by reading everything in it.
##
## A damaged file can make the CDF library crash, which ends Octave, or never return. This function
## reads the file in another Octave, so that this one is safe. Check a file that you do not trust
## before you read it. The check takes the time of reading the file and of starting an Octave.
##
## @var{file} is the path of the file, with or without @code{.cdf}. @var{sound} is true or false,
## and @var{report} describes what is wrong. Without outputs the report is printed. If nothing more
## was read for @var{seconds} (default 60), the other Octave is ended, and the file is not sound.
##
## @example
## @group
## if (ambrix_check ("download.cdf"))
##   s = ambrix_read ("download.cdf");
## endif
## @end group
## @end example
## @seealso{ambrix_info, ambrix_read}
## @end deftypefn

function [sound, report] = ambrix_check (file, varargin)
  if (nargin < 1)
    print_usage ();
  endif
  options = __ambrix_parseOptions__ ("ambrix_check", struct ("timeout", 60), varargin);
  seconds = options.timeout;
  if (! isnumeric (seconds) || ! isscalar (seconds) || ! (seconds > 0))
    error ("ambrix:invalidOption", "ambrix_check: option \"timeout\" must be a number of seconds");
  endif
  if (! ischar (file) || rows (file) != 1)
    error ("ambrix:invalidFile", "ambrix_check: give the path of the file as a text");
  endif
  log = tempname ();
  discard = onCleanup (@() unlink (log));
  code = sprintf ("__ambrix_readSteps__ (\"%s\");", undo_string_escapes (tilde_expand (file)));
  [status, isLate] = __ambrix_otherOctave__ (code, log, seconds);
  [isSound, said] = verdict (status, isLate, seconds, linesOf (log));
  if (nargout == 0)
    printf ("%s: %s\n", file, said);
  else
    [sound, report] = deal (isSound, said);
  endif
endfunction

## None where the other Octave was ended before it had begun to write.
function lines = linesOf (log)
  lines = "";
  if (! isempty (stat (log)))
    lines = fileread (log);
  endif
endfunction

## What the end of the other Octave and the lines that it has written tell.
function [isSound, said] = verdict (status, isLate, seconds, lines)
  steps = regexp (lines, '^at (.*)$', "tokens", "lineanchors", "dotexceptnewline");
  step = [{{"the start of another Octave"}}, steps]{end}{1};
  failure = regexp (lines, '^failed (.*)$', "tokens", "lineanchors", ...
                    "dotexceptnewline", "once");
  isSound = false;
  if (isLate)
    said = sprintf ("not sound: nothing was read for %g seconds at %s", seconds, step);
  elseif (WIFSIGNALED (status))
    number = WTERMSIG (status);
    said = sprintf ("not sound: the CDF library crashed (signal %d) at %s", number, step);
  elseif (! isempty (failure))
    said = ["not sound: " strtrim(failure{1})];
  elseif (strcmp (step, "end"))
    [isSound, said] = deal (true, "sound");
  else
    error ("ambrix:cannotCheck", "ambrix_check: another Octave can't read the file: %s", ...
           strtrim (lines));
  endif
endfunction

%!test
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! assert (ambrix_check ("example"));
%! [sound, report] = ambrix_check ("example.cdf");
%! assert ({sound, report}, {true, "sound"});
%! assert (evalc ("ambrix_check (\"example\")"), "example: sound\n");

%!test  # files whose damage makes some CDF libraries crash
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! s.data.x = magic (60);
%! s.file.compression = "HUFF_COMPRESSION";
%! ambrix_write ("it's", s);
%! for place = [60, 72, 80]
%!   stream = fopen ("it's.cdf", "r+");
%!   fseek (stream, place);
%!   fwrite (stream, 255 * ones (1, 4), "uint8");
%!   fclose (stream);
%!   [sound, report] = ambrix_check ("it's");
%!   assert (sound, false);
%!   assert (strncmp (report, "not sound: ", 11));
%! endfor

%!test  # no Octave starts so fast
%! [id, restore] = __ambrix_example__ ();
%! ambrix_close (id);
%! [sound, report] = ambrix_check ("example", "timeout", 0.001);
%! assert (sound, false);
%! assert (report, "not sound: nothing was read for 0.001 seconds at the start of another Octave");

%!test
%! [sound, report] = ambrix_check ("no such file");
%! assert (sound, false);
%! assert (any (strfind (report, "could not be opened")));
%!error id=ambrix:invalidFile ambrix_check (1)
%!error id=ambrix:invalidOption ambrix_check ("x", "timeout", 0)
%!error id=ambrix:invalidOption ambrix_check ("x", "seconds", 1)
%!error id=Octave:invalid-fun-call ambrix_check ()
