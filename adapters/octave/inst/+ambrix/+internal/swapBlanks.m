## -*- texinfo -*-
## @deftypefn {} {@var{texts} =} ambrix.internal.swapBlanks (@var{texts})
## Replace blanks by zero bytes and zero bytes by blanks.
## @end deftypefn

function texts = swapBlanks (texts)
  blanks = texts == " ";
  texts(texts == 0) = " ";
  texts(blanks) = "\0";
endfunction

%!assert (double (ambrix.internal.swapBlanks ("a \0")), double ("a\0 "))
