## -*- texinfo -*-
## @deftypefn {} {[@var{status}, @var{isLate}] =} __ambrix_otherOctave__ (@var{code}, @var{log}, @var{seconds})
## Run code in another Octave, which has the package, and wait for its end. What it prints goes to
## the file @var{log}. When that has not grown for so many @var{seconds} it is ended, and
## @var{isLate}.
## @end deftypefn

function [status, isLate] = __ambrix_otherOctave__ (code, log, seconds)
  folders = unique ({fileparts(mfilename ("fullpath")), ...
                     fileparts(file_in_loadpath ("__ambrix__.oct"))});
  [in, out, pid] = popen2 ("/bin/sh", {"-c", "exec \"$@\" >\"$0\" 2>&1", log, ownProgram(), ...
                                       "--norc", "--no-history", "--path", ...
                                       strjoin(folders, pathsep ()), "--eval", ...
                                       ["crash_dumps_octave_core (false); " code]});
  fclose (in);
  fclose (out);
  isLate = true;  # also when waiting is interrupted
  unwind_protect
    [status, isLate] = awaited (pid, log, seconds);
  unwind_protect_cleanup
    if (isLate)
      kill (pid, SIG ().KILL);
      [~, status] = waitpid (pid);
    endif
  end_unwind_protect
endfunction

function [status, isLate] = awaited (pid, log, seconds)
  [size, since, isLate] = deal (-1, tic (), false);
  [ended, status] = waitpid (pid, WNOHANG ());
  while (ended == 0 && ! isLate)
    pause (0.02);
    [ended, status] = waitpid (pid, WNOHANG ());
    info = stat (log);
    if (! isempty (info) && info.size != size)
      [size, since] = deal (info.size, tic ());
    endif
    isLate = ended == 0 && toc (since) > seconds;
  endwhile
  if (ended < 0)
    error ("ambrix:cannotCheck", "ambrix_check: the end of another Octave was not told");
  endif
endfunction

function program = ownProgram ()
  folder = fullfile (OCTAVE_EXEC_HOME (), "bin");
  names = {["octave-cli-" OCTAVE_VERSION()], "octave-cli"};
  found = names(cellfun (@(name) ! isempty (stat (fullfile (folder, name))), names));
  if (isempty (found))
    error ("ambrix:cannotCheck", "ambrix_check: there is no program octave-cli in %s", folder);
  endif
  program = fullfile (folder, found{1});
endfunction

%!function [status, isLate, printed] = run (code, seconds)
%!  log = tempname ();
%!  discard = onCleanup (@() unlink (log));
%!  [status, isLate] = __ambrix_otherOctave__ (code, log, seconds);
%!  printed = fileread (log);
%!endfunction
%!test
%! [status, isLate, printed] = run ("disp (ambrix_getConstantValue ('CDF_INT4')); exit (7)", 60);
%! assert (WEXITSTATUS (status), 7);
%! assert (isLate, false);
%! assert (strtrim (printed), "4");
%!test
%! [status, isLate] = run ("kill (getpid (), SIG ().SEGV); pause (9)", 60);
%! assert (WTERMSIG (status), SIG ().SEGV);
%! assert (isLate, false);
%!test  # what goes on may take longer than the limit
%! code = "for k = 1:5, disp (k), fflush (stdout); pause (0.6), endfor";
%! [status, isLate, printed] = run (code, 2);
%! assert (isLate, false);
%! assert (printed(end-1), "5");
%!test
%! [status, isLate] = run ("pause (60)", 1);
%! assert (isLate);
%! assert (WTERMSIG (status), SIG ().KILL);
