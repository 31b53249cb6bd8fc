"""Writes a file through the module's commands, and tells what it must hold."""

import numpy as np

from readers.content import CHARACTERS, DATATYPES, EPOCH16, Attribute, Content, Variable, dtype_of
from readers.content import leading_of
from support.ambrix_session import array

COMPRESSIONS = {"RLE": [0], "HUFF": [0], "AHUFF": [0], "GZIP": [6]}


def host_array(data, code):
    """Numbers or bytes as an array of the class that the datatype wants, in a row."""
    class_name = DATATYPES[code][2]
    data = np.ravel(data)
    if class_name == "char":
        return array("char", data.astype("u1").tobytes().decode("latin-1"))
    return array(class_name, data.tolist())


class FileWriter:
    """An open new file. `content` is what it holds, as far as it was written."""

    def __init__(self, session, path, row_major=True, compression=None):
        self.session = session
        self.row_major = row_major
        self.content = Content(row_major)
        self.numbers = {}
        (self.file,) = session.call("create", str(path))
        majority = session.constant("ROW_MAJOR" if row_major else "COLUMN_MAJOR")
        session.call("setMajority", self.file, majority)
        if compression:
            session.call("setCompression", self.file, *self.compression(compression))

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.session.call("close", self.file)

    def compression(self, name):
        return self.session.constant(name + "_COMPRESSION"), COMPRESSIONS[name]

    def host_order(self, per_dimension):
        return list(per_dimension)[::-1] if self.row_major else list(per_dimension)

    def to_host(self, values, code):
        """Values of the shape (records, d1, ..., dn, leading) in the host's storage order."""
        if self.row_major:
            return host_array(values, code)
        leading = values.ndim - 1 if leading_of(code, 1) else values.ndim
        axes = [0, *reversed(range(1, leading)), *range(leading, values.ndim)]
        return host_array(values.transpose(axes), code)

    def create(self, name, code, sizes=(), varies=None, record_varies=True, elements=1,
               compression=None, sparse="no", pad=None):
        """Creates a variable with its settings; its values are those of no record."""
        varies = (True,) * len(sizes) if varies is None else varies
        variable = Variable(code, elements, tuple(sizes), tuple(varies), record_varies,
                            sparse=sparse)
        variable.values = np.empty((0,) + variable.shape, dtype_of(code))
        (number,) = self.session.call(
            "createVar", self.file, name, code, elements, self.host_order(sizes), record_varies,
            self.host_order(varies))
        if compression:
            self.session.call("setVarCompression", self.file, number,
                              *self.compression(compression))
        if sparse != "no":
            word = {"pad": "PAD", "previous": "PREV"}[sparse]
            self.session.call("setVarSparseRecords", self.file, number,
                              self.session.constant(word + "_SPARSERECORDS"))
        if pad is not None:
            variable.pad = np.asarray(pad, dtype_of(code)).reshape(-1)
            self.session.call("setVarPadValue", self.file, number, host_array(pad, code))
        self.content.variables[name] = variable
        self.numbers[name] = number
        return variable

    def put(self, name, values):
        """Writes whole records from the first on."""
        variable = self.content.variables[name]
        values = np.asarray(values, dtype_of(variable.code)).reshape((-1,) + variable.shape)
        count = len(variable.sizes)
        self.session.call(
            "hyperPutVarData", self.file, self.numbers[name], 0, len(values), 1, [0] * count,
            self.host_order(variable.sizes), [1] * count, self.to_host(values, variable.code))
        variable.values = values

    def put_record(self, name, record, value):
        """Writes one record; the caller tells what the variable then holds."""
        variable = self.content.variables[name]
        values = np.asarray(value, dtype_of(variable.code)).reshape((1,) + variable.shape)
        self.session.call("putVarRecordData", self.file, self.numbers[name], record,
                          self.to_host(values, variable.code))

    def put_value(self, name, record, place, value):
        """Writes one value at a place in the file's order of dimensions."""
        variable = self.content.variables[name]
        self.session.call("putVarData", self.file, self.numbers[name], record,
                          self.host_order(place), host_array(value, variable.code))

    def attribute(self, name, is_global):
        (number,) = self.session.call("createAttr", self.file, name, 1 if is_global else 2)
        self.content.attributes[name] = Attribute(is_global)
        return number

    def entry(self, name, key, code, value):
        """Writes the entry of a gEntry number or of a variable's name."""
        attribute = self.content.attributes[name]
        number = self.session.value("getAttrNum", self.file, name)
        entry = key if attribute.is_global else self.numbers[key]
        command = "putAttrgEntry" if attribute.is_global else "putAttrEntry"
        if code in CHARACTERS:
            attribute.entries[key] = (code, bytes(value))
            value = np.frombuffer(value, "u1")
        else:
            value = np.asarray(value, dtype_of(code)).reshape(-1)
            attribute.entries[key] = (code, value)
        assert code != EPOCH16 or len(value) % 2 == 0
        self.session.call(command, self.file, number, entry, code, host_array(value, code))
