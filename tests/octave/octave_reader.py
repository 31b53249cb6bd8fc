"""A file's content as Octave reads it: what read_all.m wrote."""

import math
import os
import subprocess
from pathlib import Path

import numpy as np

from readers.content import CHARACTERS, CODES, EPOCH16, Attribute, Content, Variable, dtype_of
from readers.content import leading_of

HERE = Path(__file__).parent
SPARSE = {"NO_SPARSERECORDS": "no", "PAD_SPARSERECORDS": "pad", "PREV_SPARSERECORDS": "previous"}
TYPES = {"double": "<f8", "single": "<f4", "char": "u1", "logical": "u1", "int8": "i1",
         "uint8": "u1", "int16": "<i2", "uint16": "<u2", "int32": "<i4", "uint32": "<u4",
         "int64": "<i8"}


def octave(*arguments):
    """Runs Octave with the built package."""
    command = [os.environ["AMBRIX_OCTAVE_CLI"], "--norc", "--no-history", "--path",
               os.environ["AMBRIX_OCTAVE"], *map(str, arguments)]
    done = subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, check=False)
    if done.returncode != 0:
        raise RuntimeError(done.stdout.decode("utf-8", "replace"))


def read_all(folder, files):
    """Reads the files, and writes them back, into a folder."""
    octave(HERE / "read_all.m", folder, *files)


def code_of(datatype):
    return CODES[datatype.lower()]


class _Stream:
    def __init__(self, data):
        self.data = memoryview(data)
        self.place = 0

    def take(self, count):
        self.place += count
        return self.data[self.place - count:self.place]

    def numbers(self, count):
        return np.frombuffer(self.take(4 * count), "<u4").tolist()

    def text(self, count):
        return bytes(self.take(count)).decode("latin-1")


def load(path):
    """The struct as dictionaries; cells as dictionaries, too, with keys in their order."""
    stream = _Stream(path.read_bytes())
    root = {}
    while stream.place < len(stream.data):
        *lengths, count = stream.numbers(3)
        sizes = stream.numbers(count)
        path, class_name = map(stream.text, lengths)
        *above, name, _ = ["", *path.split("\x1f")]
        place = root
        for key in above[1:]:
            place = place[key]
        if class_name in ("struct", "cell"):
            if path:
                place[name] = {}
            continue
        dtype = np.dtype(TYPES[class_name])
        values = np.frombuffer(stream.take(dtype.itemsize * math.prod(sizes)), dtype)
        place[name] = values.reshape(sizes, order="F")
    return root


def as_text(values):
    return values.tobytes().decode("latin-1")


def flat(values, kind=int):
    return tuple(kind(value) for value in values.reshape(-1, order="F"))


def _variable(described, values):
    code = code_of(as_text(described["datatype"]))
    elements = int(described["elements"].item())
    variances = flat(described["variances"], bool)
    variable = Variable(code, elements, flat(described["sizes"]), variances,
                        bool(described["recordVariance"].item()),
                        sparse=SPARSE[as_text(described["sparseRecords"])])
    variable.pad = described["padValue"].reshape(-1, order="F")
    records = int(described["records"].item())
    shape = list(variable.sizes) + list(leading_of(code, elements))
    if variable.record_varies or not records:
        shape.insert(0, records)
    squeezed = [size for size in shape if size != 1]
    if values.size and squeezed != [size for size in values.shape if size != 1]:
        raise AssertionError(f"size {values.shape}, not {shape}")
    if values.dtype != dtype_of(code):
        raise AssertionError(f"{values.dtype}, not {dtype_of(code)}")
    values = values.reshape(shape, order="F")
    variable.values = values if variable.record_varies or not records else values[np.newaxis]
    return variable


def _entry(datatype, value):
    code = code_of(as_text(datatype))
    value = value.reshape(-1, order="F")
    return code, value.tobytes() if code in CHARACTERS else value


def _attribute(listed, content):
    """Entries come by number or by name of the variable."""
    name = as_text(listed["name"])
    attribute = Attribute(as_text(listed["scope"]) == "GLOBAL_SCOPE")
    datatypes = list(listed["datatypes"].values())
    if attribute.is_global:
        keys = flat(listed["entries"])
        values = content["attributes"][name.rstrip(" ")]
        values = list(values.values()) if isinstance(values, dict) else [values]
    else:
        entries = listed["entries"]
        fields = [as_text(key) for key in entries.values()] if isinstance(entries, dict) else []
        keys = [as_text(content["variables"][field]["name"]) for field in fields]
        values = [content["variables"][field]["attributes"][name.rstrip(" ")] for field in fields]
    if not len(keys) == len(values) == len(datatypes):
        raise AssertionError(f"{name}: {len(keys)} keys, {len(values)} values")
    attribute.entries = {key: _entry(datatype, value)
                         for key, value, datatype in zip(keys, values, datatypes)}
    return name, attribute


def content(path):
    """What ambrix_read found."""
    read = load(path)
    found = Content(as_text(read["file"]["majority"]) == "ROW_MAJOR")
    if flat(read["library"]) < (3, 9):
        found.nul_reads_as = ord(" ")
    for field, described in read["variables"].items():
        if not described["supported"].item():
            raise AssertionError(f"{field}: {as_text(described['datatype'])} is not supported")
        found.variables[as_text(described["name"])] = _variable(described, read["data"][field])
    for listed in read["attributeList"].values():
        name, attribute = _attribute(listed, read)
        found.attributes[name] = attribute
    return found
