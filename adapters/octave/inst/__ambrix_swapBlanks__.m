## -*- texinfo -*-
## @deftypefn {} {@var{texts} =} __ambrix_swapBlanks__ (@var{texts})
## Replace blanks by zero bytes and zero bytes by blanks.
## @end deftypefn

function texts = __ambrix_swapBlanks__ (texts)
  blanks = texts == " ";
  texts(texts == 0) = " ";
  texts(blanks) = "\0";
endfunction

%!assert (double (__ambrix_swapBlanks__ ("a \0")), double ("a\0 "))
