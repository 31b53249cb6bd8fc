## What calls leave behind, and that large arrays are not copied on their way. Ten times as many calls
## are made where AMBRIX_LONG_TESTS is set.
1;
addpath (fullfile (fileparts (mfilename ("fullpath")), "support"));

## A figure of this process in megabytes.
function megabytes = memory (name)
  status = fileread ("/proc/self/status");
  megabytes = str2double (regexp (status, [name ":\\s+(\\d+) kB"], "tokens", "once"){1}) / 1024;
endfunction

## By how much memory has grown at its peak while an action runs.
function megabytes = peak (action)
  file = fopen ("/proc/self/clear_refs", "w");
  fputs (file, "5");  # the peak is counted anew
  fclose (file);
  before = memory ("VmRSS");
  action ();
  megabytes = memory ("VmHWM") - before;
endfunction

## By how much memory has grown after repeating a step this often, once it has been warmed up.
function megabytes = growth (step, times)
  for k = 1:times / 10
    step ();
  endfor
  before = memory ("VmRSS");
  for k = 1:times
    step ();
  endfor
  megabytes = memory ("VmRSS") - before;
endfunction

function times = often (times)
  if (! isempty (getenv ("AMBRIX_LONG_TESTS")))
    times *= 10;
  endif
endfunction

function [calls, variable] = typicalCalls (id)
  variable = addVariable (id, 45, 4, 1:4);
  text = __ambrix__ ("createVar", id, "text", 51, 9, [], true, []);
  __ambrix__ ("putVarRecordData", id, text, 0, "some text");
  calls = {@() __ambrix__("getMajority", id), ...
           @() nthargout(1:6, @__ambrix__, "inquireVar", id, variable), ...
           @() __ambrix__("getVarRecordData", id, variable, 0), ...
           @() __ambrix__("putVarRecordData", id, variable, 0, 4:-1:1), ...
           @() __ambrix__("getVarRecordData", id, text, 0), ...
           @() __ambrix__("getConstantNames"), ...
           @() ignored("getVarName", id, 99), @() ignored(3)};
endfunction

function ignored (varargin)
  try
    __ambrix__ (varargin{:});
  catch
  end_try_catch
endfunction

function testCallsLeaveNothingBehind (id, folder)
  calls = typicalCalls (id);
  for k = 1:numel (calls)
    times = often (12500);
    grown = growth (calls{k}, times);
    printf ("  %7d calls of %s: %+.1f MB\n", times, func2str (calls{k}), grown);
    assert (grown < 2);
  endfor
endfunction

function testOpeningAndClosingLeavesNothingBehind (id, folder)
  name = fullfile (getenv ("AMBRIX_CDF_SAMPLES"), "example1.cdf");
  times = often (1000);
  files = @() numel (readdir ("/proc/self/fd"));
  before = files ();
  grown = growth (@() __ambrix__ ("close", __ambrix__ ("open", name)), times);
  printf ("  %7d times opened and closed: %+.1f MB\n", times, grown);
  assert (grown < 2);
  assert (files (), before);
endfunction

function testLargeArraysAreNotCopied (id, folder)
  count = 1e7;
  data = rand (count, 1);
  size = count * 8 / 2 ^ 20;
  variable = addVariable (id, 45, count);
  written = peak (@() __ambrix__ ("putVarRecordData", id, variable, 0, data));
  read = peak (@() __ambrix__ ("getVarRecordData", id, variable, 0));
  printf ("  %.0f MB: %+.1f MB while written, %+.1f MB while read\n", size, written, read);
  assert (written < 0.1 * size);
  assert (read < 1.1 * size);
  assert (isequal (__ambrix__ ("getVarRecordData", id, variable, 0), data));
endfunction

if (! exist ("/proc/self/clear_refs", "file"))
  disp ("skipped: this system does not tell what memory a process has");
  return;
endif
runTests ({@testCallsLeaveNothingBehind, @testOpeningAndClosingLeavesNothingBehind, ...
           @testLargeArraysAreNotCopied});
