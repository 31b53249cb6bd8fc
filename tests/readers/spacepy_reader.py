"""A file's content as SpacePy reads it, with the CDF library that its wheel brings."""

import os
import tempfile
from itertools import count

import numpy as np

from readers.content import CHARACTERS, Attribute, Content, Variable, attempt, dtype_of

# SpacePy writes its settings into a folder, and would take the CDF library that these two name.
SETTINGS = tempfile.TemporaryDirectory()
os.environ["SPACEPY"] = SETTINGS.name
os.environ.pop("CDF_LIB", None)
os.environ.pop("CDF_BASE", None)
from spacepy import pycdf  # noqa: E402

NAME = "spacepy"
SPARSE = {pycdf.const.NO_SPARSERECORDS.value: "no", pycdf.const.PAD_SPARSERECORDS.value: "pad",
          pycdf.const.PREV_SPARSERECORDS.value: "previous"}


def _array(data, code, elements, shape):
    """Also of a single value, which SpacePy gives as a Python object without its datatype."""
    if code in CHARACTERS:
        texts = np.ascontiguousarray(np.asarray(data, f"S{elements}"))
        return texts.reshape(-1).view("u1").reshape(shape)
    return np.ascontiguousarray(np.asarray(data, dtype_of(code))).reshape(shape)


def _variable(source):
    code, elements, varies = source.type(), source.nelems(), source.rv()
    sizes = tuple(source.shape[1:] if varies else source.shape)
    variable = Variable(code, elements, sizes, tuple(source.dv()), varies,
                        sparse=SPARSE[source.sparse().value])
    variable.values = _array(source[...], code, elements, (len(source),) + variable.shape)
    pad = source.pad()
    if pad is not None:
        variable.pad = _array(pad, code, elements, -1)
    return variable


def _entry(value, code):
    if code in CHARACTERS:
        return code, value
    return code, _array(value, code, 1, -1)


def _entries(attribute):
    """By entry number."""
    attribute._raw = True  # SpacePy offers this for variables only
    return {number: attempt(lambda: _entry(attribute[number], attribute.type(number)))
            for number in range(attribute.max_idx() + 1) if attribute.has_entry(number)}


def _attributes(source):
    """All of them: SpacePy's own lists leave out those without entries."""
    for number in count():
        try:
            attribute = pycdf.gAttr(source, number)
        except pycdf.CDFError as error:
            if error.status != pycdf.const.NO_SUCH_ATTR:
                raise
            return
        is_global = attribute.global_scope()
        if not is_global:
            attribute = pycdf.zAttr(source, number)
        yield attribute._name.decode("latin-1"), Attribute(is_global, _entries(attribute))


def read(path):
    with pycdf.CDF(path) as source:
        content = Content(not source.col_major(), keeps_blanks_of_names=False)
        names = []
        for number in range(len(source)):
            variable = source.raw_var(number)
            names.append(variable.name().encode("utf-8").decode("latin-1"))
            content.variables[names[-1]] = attempt(_variable, variable)
        for name, attribute in _attributes(source):
            if not attribute.is_global:
                attribute.entries = {names[n]: entry for n, entry in attribute.entries.items()}
            content.attributes[name] = attribute
        return content
