"""Lines of the functions for Octave, and the calls in the examples."""
import re

PROMPT = "> "
CONSTANT = re.compile(r"(?:(?<=\()|(?<=, ))getConstantValue \('(\w+)'\)")


def prefixed(lines, prefix):
    return "".join((prefix + line).rstrip() + "\n" for line in lines)


class Calls:
    """Calls of commands, written as calls of the package's functions."""

    def __init__(self, commands):
        names = "|".join(sorted((c["name"] for c in commands), key=len, reverse=True))
        self.call = re.compile(rf"(?<![\w.'])({names}) \(")

    def in_octave(self, line, by_name=True):
        """A line of an example with the package's functions; constants by name, or number."""
        if by_name:
            line = CONSTANT.sub(r"'\1'", line)
        return self.call.sub(r"ambrix_\1 (", line)
