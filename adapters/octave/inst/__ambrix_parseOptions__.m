## -*- texinfo -*-
## @deftypefn {} {@var{options} =} __ambrix_parseOptions__ (@var{caller}, @var{defaults}, @var{given})
## Put the options in the cell array @var{given} in the place of their defaults.
##
## Options whose default is a logical are flags: the name alone switches them on, a logical behind
## it says whether. The others are followed by their value; where the default is a cell array the
## value is one of its cells, and the first of these is the default.
## @end deftypefn

function options = __ambrix_parseOptions__ (caller, defaults, given)
  choices = structfun (@iscell, defaults);
  names = fieldnames (defaults);
  options = defaults;
  for name = names(choices)'
    options.(name{1}) = defaults.(name{1}){1};
  endfor
  k = 1;
  while (k <= numel (given))
    name = knownName (caller, names, given{k});
    if (! islogical (defaults.(name)))
      options.(name) = valueOf (caller, name, defaults.(name), given(k+1:end));
      k += 2;
    elseif (k < numel (given) && ! ischar (given{k+1}))
      options.(name) = flagOf (caller, name, given{k+1});
      k += 2;
    else
      options.(name) = true;
      k += 1;
    endif
  endwhile
endfunction

function name = knownName (caller, names, given)
  known = ischar (given) & strcmpi (names, given);
  if (! any (known))
    error ("ambrix:invalidOption", "%s: an option must be one of: %s",
           caller, strjoin (names', ", "));
  endif
  name = names{known};
endfunction

function flag = flagOf (caller, name, given)
  if (! isscalar (given) || ! any (cellfun (@(value) isequal (given, value), {true, false})))
    error ("ambrix:invalidOption", "%s: what is behind option \"%s\" must be true or false",
           caller, name);
  endif
  flag = logical (given);
endfunction

function value = valueOf (caller, name, default, rest)
  if (isempty (rest))
    error ("ambrix:invalidOption", "%s: option \"%s\" needs a value behind it", caller, name);
  endif
  value = rest{1};
  if (iscell (default) && ! (ischar (value) && any (strcmp (default, value))))
    error ("ambrix:invalidOption", "%s: option \"%s\" must be one of: %s",
           caller, name, strjoin (default, ", "));
  endif
endfunction

%!shared defaults
%! defaults = struct ("order", {{"up", "down"}}, "range", [], "deep", false);
%!test
%! options = __ambrix_parseOptions__ ("f", defaults, {});
%! assert (options, struct ("order", "up", "range", [], "deep", false));
%!test
%! options = __ambrix_parseOptions__ ("f", defaults, {"deep", "Order", "down", "range", 1:3});
%! assert (options, struct ("order", "down", "range", 1:3, "deep", true));
%!test
%! options = __ambrix_parseOptions__ ("f", defaults, {"deep", false});
%! assert (options.deep, false);
%!error <f: an option must be one of: order, range, deep>
%! __ambrix_parseOptions__ ("f", defaults, {"wide"});
%!error id=ambrix:invalidOption __ambrix_parseOptions__ ("f", defaults, {7});
%!error <"order" must be one of: up, down>
%! __ambrix_parseOptions__ ("f", defaults, {"order", "left"});
%!test
%! for value = {NaN, [true, false], {true}, 2}
%!   given = {"deep", value{1}};
%!   err = __ambrix_raised__ (@() __ambrix_parseOptions__ ("f", defaults, given));
%!   assert (err.identifier, "ambrix:invalidOption");
%! endfor
%!error <"range" needs a value> __ambrix_parseOptions__ ("f", defaults, {"range"});
