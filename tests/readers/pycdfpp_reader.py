"""A file's content as pycdfpp reads it."""

import numpy as np
import pycdfpp

from readers.content import CHARACTERS, EPOCH16, Attribute, Content, Variable, attempt, dtype_of

NAME = "pycdfpp"
SPARSE = {"no_sparse_records": "no", "pad_sparse_records": "pad",
          "prev_sparse_records": "previous"}


def bytes_as_text(name):
    return name.encode("utf-8", "surrogateescape").decode("latin-1")


# The parts of pycdfpp's own types of times.
TIMES = {31: ["mseconds"], 32: ["seconds", "picoseconds"], 33: ["nseconds"]}


def _numbers(data, code):
    data = np.ascontiguousarray(data)
    if code not in TIMES:
        return data.astype(dtype_of(code))
    numbers = data.view(dtype_of(code))
    return numbers.reshape(data.shape + (2,)) if code == EPOCH16 else numbers


def _listed_numbers(values, code):
    """Of attribute entries and pad values, whose times are objects in a list; flat."""
    if code not in TIMES:
        return np.atleast_1d(values).astype(dtype_of(code)).reshape(-1)
    rows = [[getattr(item, part) for part in TIMES[code]] for item in values]
    return np.array(rows, dtype_of(code)).reshape(-1)


def _characters(values, elements):
    if values.dtype.kind == "S":
        shape = values.shape
        flat = np.ascontiguousarray(values).astype(f"S{max(elements, 1)}")
        return flat.view("u1").reshape(shape + (elements,))
    return np.ascontiguousarray(values).view("u1")


def _variable(source):
    code = int(source.type.value)
    text = code in CHARACTERS
    shape = tuple(source.shape)
    elements = shape[-1] if text else 1
    sizes = shape[1:-1] if text else shape[1:]
    variable = Variable(code, elements, sizes, (True,) * len(sizes), not source.is_nrv,
                        sparse=SPARSE[source.sparse_records.name])
    values = source.values
    variable.values = _characters(values, elements) if text else _numbers(values, code)
    variable.values = variable.values.reshape((shape[0],) + variable.shape)
    pad = source.pad_value
    if pad is not None:
        variable.pad = _pad(pad, variable)
    return variable


def _pad(pad, variable):
    if variable.code in CHARACTERS:
        data = pad if isinstance(pad, bytes) else str(np.atleast_1d(pad)[0]).encode()
        return np.frombuffer(data.ljust(variable.elements, b"\0"), "u1")
    return _listed_numbers(pad, variable.code)


def _entry(value, datatype):
    code = int(datatype.value)
    if code in CHARACTERS:
        data = value if isinstance(value, bytes) else value.encode("utf-8", "surrogateescape")
        return code, data
    return code, _listed_numbers(value, code)


def _global_entry(attribute, number):
    return _entry(attribute[number], attribute.type(number))


def _variable_entry(entry):
    return _entry(entry.value, entry.type())


def read(path):
    source = pycdfpp.load(path, iso_8859_1_to_utf8=False)
    content = Content(source.majority == pycdfpp.Majority.row, keeps_entry_numbers=False)
    declared = source.declared_variable_attributes
    for name in declared:
        content.attributes[bytes_as_text(name)] = Attribute(False)
    for name in source:
        key = bytes_as_text(name)
        content.variables[key] = attempt(_variable, source[name])
        for attribute in source[name].attributes:
            entries = content.attributes[bytes_as_text(attribute)].entries
            entries[key] = attempt(_variable_entry, source[name].attributes[attribute])
    for name in source.attributes:
        attribute = source.attributes[name]
        content.attributes[bytes_as_text(name)] = Attribute(True, {
            number: attempt(_global_entry, attribute, number)
            for number in range(len(attribute))})
    return content
