## -*- texinfo -*-
## @deftypefn {} {} __ambrix_raiseFor__ (@var{caller}, @var{what}, @var{err})
## Raise an error again, with a text that names what it is about unless a function of the package
## has said so.
## @end deftypefn

function __ambrix_raiseFor__ (caller, what, err)
  if (! strncmp (err.message, [caller ": "], numel (caller) + 2))
    err = struct ("identifier", err.identifier, "stack", err.stack, ...
                  "message", sprintf ("%s: %s: %s", caller, what, err.message));
  endif
  rethrow (err);
endfunction

%!error <f: variable "x": it is bad>
%! __ambrix_raiseFor__ ("f", 'variable "x"', __ambrix_raised__ (@() error ("a:b", "it is bad")));
%!error id=a:b
%! __ambrix_raiseFor__ ("f", 'variable "x"', __ambrix_raised__ (@() error ("a:b", "it is bad")));
%!error <^f: it is bad>
%! __ambrix_raiseFor__ ("f", 'variable "x"', __ambrix_raised__ (@() error ("a:b", "f: it is bad")));
