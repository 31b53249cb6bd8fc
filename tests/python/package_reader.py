"""A file's content as the package for Python sees it."""
import numpy as np

import ambrix
from readers.content import CHARACTERS, EPOCH16, Attribute, Content, Variable, dtype_of

CODES = {datatype.name: code for code, datatype in ambrix.datatypes.DATATYPES.items()}
# From the first zero byte of a text on, versions of the library before 3.9 give blanks.
GIVES_BLANKS = ambrix.commands.getLibraryVersion() < (3, 9)
SPARSE = {"NO_SPARSERECORDS": "no", "PAD_SPARSERECORDS": "pad", "PREV_SPARSERECORDS": "previous"}


def read(path):
    """Everything in the file."""
    with ambrix.open(path) as file:
        content = Content(file.majority == "ROW_MAJOR")
        content.nul_reads_as = ord(" ") if GIVES_BLANKS else 0
        for name, variable in file.items():
            content.variables[as_bytes(name).decode("latin-1")] = variable_of(variable)
        names = [as_bytes(name).decode("latin-1") for name in file]
        for name in file.attrs:
            entries = file.attrs.entries(name)
            add(content, name, Attribute(True, {e.number: entry_of(e) for e in entries}))
        for name, entries in of_variables(file, names).items():
            add(content, name, Attribute(False, entries))
    return content


def add(content, name, attribute):
    content.attributes[as_bytes(name).decode("latin-1")] = attribute


def of_variables(file, names):
    """The entries of variables, by attribute and name of the variable."""
    found = {name: {} for name in file.variable_attributes}
    for shown, variable in zip(names, file.values()):
        for name in variable.attrs:
            found[name][shown] = entry_of(variable.attrs.entries(name)[0])
    return found


def as_bytes(text):
    return text.encode(errors="surrogateescape")


def variable_of(variable):
    raw = np.asarray(variable.raw)
    code = CODES[variable.datatype]
    if not variable.record_varies:
        raw = raw[np.newaxis][:variable.records]
    if code in CHARACTERS:
        length = variable.raw.dtype.itemsize
        raw = np.ascontiguousarray(raw).view("u1").reshape(raw.shape + (length,))
    pad = variable.pad_value
    pad = np.frombuffer(as_bytes(pad), "u1") if isinstance(pad, str) else np.atleast_1d(pad)
    elements = variable.raw.dtype.itemsize if code in CHARACTERS else 1
    return Variable(code, elements, variable.sizes, variable.varies, variable.record_varies,
                    raw.astype(dtype_of(code), copy=False), pad,
                    SPARSE[variable.sparse_records])


def entry_of(entry):
    """The datatype and the values, in the order of the file."""
    code = CODES[entry.datatype]
    if isinstance(entry.raw, str):
        return code, as_bytes(entry.raw)
    values = entry.raw.T.reshape(-1) if code == EPOCH16 else entry.raw
    return code, np.asarray(values, dtype_of(code))
