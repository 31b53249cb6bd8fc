"""A file's content through the module's commands."""

import numpy as np

from readers.content import CHARACTERS, CODES, Attribute, Content, Variable, datatype, dtype_of
from readers.content import leading_of
from support.ambrix_session import CallError

SPARSE = {"NO_SPARSERECORDS": "no", "PAD_SPARSERECORDS": "pad", "PREV_SPARSERECORDS": "previous"}


def to_numpy(result, code):
    """The data of a result, flat, after a check of its class; characters as bytes."""
    expected = datatype(code)[2]
    if result.class_name != expected:
        raise AssertionError(f"class {result.class_name}, not {expected}")
    if result.class_name != "char":
        return np.array(result.data, dtype_of(code))
    units = np.frombuffer(result.data.encode("utf-16-le", "surrogatepass"), "<u2")
    if np.any((units >= 0x80) & (units < 0xFF80)):
        raise AssertionError("a byte was not widened with its sign")
    return units.astype("u1")


def host_size(sizes):
    """The sizes that a host array made with a list of dimensions has."""
    sizes = list(sizes) + [1] * (2 - len(sizes))
    while len(sizes) > 2 and sizes[-1] == 1:
        sizes.pop()
    return sizes


class ModuleReader:
    """Reads an open file of a session."""

    def __init__(self, session, path):
        self.session = session
        (self.file,) = session.call("open", path)
        self.row_major = session.value("getMajority", self.file) == "ROW_MAJOR"

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.session.call("close", self.file)

    def host_order(self, per_dimension):
        """What the module takes and gives for values per dimension in the file's order."""
        return list(per_dimension)[::-1] if self.row_major else list(per_dimension)

    def from_host(self, result, code, elements, counts, records):
        """The values of a result of those counts per dimension (in the file's order).

        The result must have exactly the size that the host sees: the characters or doubles of one
        value, the dimensions in host order, the records.
        """
        leading = leading_of(code, elements)
        host = list(leading) + self.host_order(counts) + [records]
        if result.size != host_size(host):
            raise AssertionError(f"size {result.size}, not {host_size(host)}")
        data = to_numpy(result, code).reshape(host, order="F")
        first = len(leading)
        dimensions = self.host_order(range(first, first + len(counts)))
        return data.transpose([data.ndim - 1] + dimensions + list(range(first)))

    def names(self):
        """The names of the variables, by number."""
        count = int(self.session.values("inquire", self.file)[3])
        return [self.session.value("getVarName", self.file, n) for n in range(count)]

    def definition(self, number):
        """The variable without values; None when its datatype is not supported."""
        try:
            name, kind, elements, sizes, record_varies, varies = self.session.call(
                "inquireVar", self.file, number)
        except CallError as error:
            if error.name == "unrecognizedValue" and error.values[1:] == ["DATATYPE"]:
                return None
            raise
        sparse = self.session.value("getVarSparseRecords", self.file, number)
        return Variable(
            CODES[kind.value], int(elements.value),
            tuple(int(size) for size in self.host_order(sizes.data)),
            tuple(self.host_order(varies.data)), record_varies.value, sparse=SPARSE[sparse])

    def hyper(self, number, variable, start, count):
        """Whole records."""
        zeros, ones = [0] * len(variable.sizes), [1] * len(variable.sizes)
        (result,) = self.session.call(
            "hyperGetVarData", self.file, number, start, count, 1, zeros,
            self.host_order(variable.sizes), ones)
        return self.from_host(result, variable.code, variable.elements, variable.sizes, count)

    def variable(self, number):
        """The variable with all of its values and its pad value; None when not supported."""
        variable = self.definition(number)
        if variable is None:
            return None
        records = int(self.session.value("getVarMaxWrittenRecNum", self.file, number)) + 1
        if records > 0:
            variable.values = self.hyper(number, variable, 0, records)
        else:
            variable.values = np.empty((0,) + variable.shape, dtype_of(variable.code))
        (pad,) = self.session.call("getVarPadValue", self.file, number)
        variable.pad = to_numpy(pad, variable.code)
        return variable

    def entry(self, attribute, number, is_global):
        """An entry as (code, values); None when there is none, code None when not supported."""
        letter = "g" if is_global else ""
        try:
            (value,) = self.session.call(f"getAttr{letter}Entry", self.file, attribute, number)
        except CallError as error:
            if error.name == "unrecognizedValue" and error.values[1:] == ["DATATYPE"]:
                return (None, error.values[0])
            if error.name == "libraryFailure":
                return None
            raise
        kind, elements = self.session.values(
            f"inquireAttr{letter}Entry", self.file, attribute, number)
        code = CODES[kind]
        if code in CHARACTERS:
            return code, value.data.encode("latin-1")
        data = to_numpy(value, code)
        if len(data) != int(elements) * (2 if code == 32 else 1):
            raise AssertionError(f"{len(data)} values for {elements} elements")
        return code, data

    def attribute(self, number, names):
        """The attribute's name and its entries."""
        name, scope, last_g, last_z = self.session.values("inquireAttr", self.file, number)
        attribute = Attribute(scope == "GLOBAL_SCOPE")
        for entry in range(int(last_g if attribute.is_global else last_z) + 1):
            value = self.entry(number, entry, attribute.is_global)
            if value is not None:
                key = entry if attribute.is_global else names[entry]
                attribute.entries[key] = value
        count = "getNumAttrgEntries" if attribute.is_global else "getNumAttrEntries"
        if len(attribute.entries) != int(self.session.value(count, self.file, number)):
            raise AssertionError(f"{name}: not the number of entries that {count} gives")
        return name, attribute

    def content(self):
        """Everything in the file."""
        names = self.names()
        content = Content(self.row_major)
        if self.session.values("getLibraryVersion") < [3, 9]:
            content.nul_reads_as = ord(" ")
        for number, name in enumerate(names):
            content.variables[name] = self.variable(number)
        for number in range(int(self.session.values("inquire", self.file)[4])):
            name, attribute = self.attribute(number, names)
            content.attributes[name] = attribute
        return content


def read(session, path):
    """A file's content; variables of an unsupported datatype are None."""
    with ModuleReader(session, path) as reader:
        return reader.content()
