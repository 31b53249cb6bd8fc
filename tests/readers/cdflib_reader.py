"""A file's content as cdflib reads it."""

import cdflib
import numpy as np

from readers.content import CHARACTERS, CODES, EPOCH16, Attribute, Content
from readers.content import Variable, attempt, dtype_of, expand, seen_as_zvariable, text_bytes

NAME = "cdflib"
SPARSE = {"No_sparse": "no", "Pad_sparse": "pad", "Prev_sparse": "previous"}


def _numbers(data, code):
    data = np.asarray(data)
    if code == EPOCH16:
        return np.ascontiguousarray(data).view("<f8").reshape(data.shape + (2,))
    return data.astype(dtype_of(code))


def _variable(cdf, name):
    info = cdf.varinq(name)
    zvariable = info.Var_Type == "zVariable"
    sizes = tuple(info.Dim_Sizes)
    varies = tuple(bool(vary) for vary in info.Dim_Vary)
    if len(varies) > len(sizes):  # of an rVariable it leaves out sizes that do not vary
        varies = (True,) * len(sizes)
    variable = Variable(info.Data_Type, info.Num_Elements, sizes, varies, bool(info.Rec_Vary),
                        sparse=SPARSE[info.Sparse])
    data = np.asarray(cdf.varget(name))
    text = info.Data_Type in CHARACTERS
    data = text_bytes(data, info.Num_Elements) if text else _numbers(data, info.Data_Type)
    variable.values = expand(data, variable)
    if info.Pad is not None:
        variable.pad = _pad(info.Pad, variable)
    return variable if zvariable else seen_as_zvariable(variable)


def _pad(pad, variable):
    if variable.code in CHARACTERS:
        return text_bytes(str(pad), variable.elements).reshape(-1)
    return _numbers(pad, variable.code).reshape(-1)


def _entry(cdf, attribute, number):
    data = cdf.attget(attribute, number)
    name = data.Data_Type
    if name in ("CDF_CHAR", "CDF_UCHAR"):
        strings = [data.Data] if isinstance(data.Data, str) else data.Data
        return (51 if name == "CDF_CHAR" else 52), "\\N ".join(strings).encode("latin-1")
    code = CODES[name.lower()]
    return code, np.atleast_1d(_numbers(data.Data, code)).reshape(-1)


def _entries(cdf, number):
    """By entry number; the library tells a gap from the end by the kind of error."""
    entries = {}
    for entry in range(100000):
        try:
            entries[entry] = _entry(cdf, number, entry)
        except KeyError:
            continue
        except ValueError as error:
            if "does not exist" not in str(error):
                raise
            break
    return entries


def read(path):
    cdf = cdflib.CDF(path, string_encoding="latin-1")
    info = cdf.cdf_info()
    content = Content(info.Majority == "Row_major")
    names = info.rVariables + info.zVariables
    for name in names:
        content.variables[name] = attempt(_variable, cdf, name)
    for number, listed in enumerate(info.Attributes):
        ((name, scope),) = listed.items()
        attribute = Attribute(scope == "Global", _entries(cdf, number))
        if not attribute.is_global:
            attribute.entries = {names[n]: entry for n, entry in attribute.entries.items()}
        content.attributes[name] = attribute
    return content
