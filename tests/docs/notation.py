"""The notation of the examples in docs/commands.md: calls of commands, and the arrays they take.

    [datatype, elements] = inquireAttrEntry (id, 1, 1)
    putVarRecordData (id, 1, 0, single ([1, 2; 3, 4]));

A call may be an argument and then stands for its first result. A semicolon at the end hides the
results. Texts stand in single quotes; `single`, `int8` and so on make arrays of other classes.
"""
import re

from ambrix_session import Array

CLASSES = {"single", "int8", "uint8", "int16", "uint16", "int32", "uint32", "int64", "uint64",
           "logical", "char"}
TOKEN = re.compile(r"\s*(?:(?P<number>-?\d[\d.]*(?:e\d+)?)|(?P<text>'[^']*')|(?P<name>[A-Za-z]\w*)"
                   r"|(?P<mark>[\[\](),;=]))")


class Call:
    """A command with the expressions of its arguments."""

    def __init__(self, name, arguments):
        self.name = name
        self.arguments = arguments


class Name:
    """A variable of the example."""

    def __init__(self, name):
        self.name = name


class Statement:
    """One line: a call, what its results are called, and whether they are shown."""

    def __init__(self, line):
        self.silent = line.endswith(";")
        parser = _Parser(line.rstrip(";"))
        left, equals, _ = line.partition(" = ")
        self.targets = parser.targets() if equals and "(" not in left else []
        self.call = parser.expression()
        parser.end()


class _Parser:
    def __init__(self, line):
        self.line = line
        self.tokens = []
        position = 0
        while position < len(line):
            match = TOKEN.match(line, position)
            if not match:
                raise ValueError(f"what is {line[position:]!r} in {line!r}?")
            self.tokens.append((match.lastgroup, match.group(match.lastgroup)))
            position = match.end()

    def next(self):
        return self.tokens.pop(0) if self.tokens else (None, None)

    def accept(self, mark):
        found = self.tokens[:1] == [("mark", mark)]
        if found:
            self.next()
        return found

    def expect(self, mark):
        if not self.accept(mark):
            raise ValueError(f"{mark!r} is missing in {self.line!r}")

    def end(self):
        if self.tokens:
            raise ValueError(f"too much in {self.line!r}")

    def targets(self):
        names = self.list_until("]", self.next) if self.accept("[") else [self.next()]
        self.expect("=")
        return [name for _, name in names]

    def list_until(self, mark, element):
        elements = []
        while not self.accept(mark):
            if elements:
                self.expect(",")
            elements.append(element())
        return elements

    def expression(self):
        kind, text = self.next()
        if kind == "number":
            return Array("double", [1, 1], [float(text)])
        if kind == "text":
            return text_array(text[1:-1])
        if kind == "name":
            return self.named(text)
        if (kind, text) == ("mark", "["):
            return self.matrix()
        raise ValueError(f"an argument is missing in {self.line!r}")

    def named(self, name):
        if name in ("true", "false"):
            return Array("logical", [1, 1], [name == "true"])
        if not self.accept("("):
            return Name(name)
        arguments = self.list_until(")", self.expression)
        return convert(name, arguments[0]) if name in CLASSES else Call(name, arguments)

    def matrix(self):
        rows = [[]]
        while not self.accept("]"):
            if self.accept(";"):
                rows.append([])
            elif not self.accept(","):
                rows[-1].append(self.expression())
        size = [len(rows), len(rows[0])] if rows[0] else [0, 0]
        if any(len(row) != len(rows[0]) for row in rows):
            raise ValueError(f"rows differ in length in {self.line!r}")
        class_name = rows[0][0].class_name if rows[0] else "double"
        return Array(class_name, size, [item.data[0] for column in zip(*rows) for item in column])


def text_array(text):
    return Array("char", [1, len(text)] if text else [0, 0], text)


def convert(class_name, array):
    """The array in another class."""
    items = {"single": float, "logical": bool, "char": lambda item: chr(int(item))}
    data = [items.get(class_name, int)(item) for item in array.data]
    return Array(class_name, array.size, "".join(data) if class_name == "char" else data)
