"""What a CDF file holds, in one form whichever reader it comes from.

Values are numpy arrays of the shape (records, d1, ..., dn), with the dimensions as the file
declares them, whatever the file's majority. A last axis is added for the bytes of a character
value and for the two doubles of an epoch16. Names are the file's bytes, as Latin-1 text.
"""

from dataclasses import dataclass, field

import numpy as np

# code: the module's name for it, the type of its values, the class of the host's arrays
DATATYPES = {
    1: ("cdf_int1", "i1", "int8"),
    2: ("cdf_int2", "<i2", "int16"),
    4: ("cdf_int4", "<i4", "int32"),
    11: ("cdf_uint1", "u1", "uint8"),
    12: ("cdf_uint2", "<u2", "uint16"),
    14: ("cdf_uint4", "<u4", "uint32"),
    21: ("cdf_real4", "<f4", "single"),
    22: ("cdf_real8", "<f8", "double"),
    31: ("cdf_epoch", "<f8", "double"),
    32: ("cdf_epoch16", "<f8", "double"),
    41: ("cdf_byte", "i1", "int8"),
    44: ("cdf_float", "<f4", "single"),
    45: ("cdf_double", "<f8", "double"),
    51: ("cdf_char", "u1", "char"),
    52: ("cdf_uchar", "u1", "char"),
}
INT8, TT2000 = 8, 33  # in many files, and supported by extended hosts only
EXTENDED_DATATYPES = {
    INT8: ("cdf_int8", "<i8", "int64"),
    TT2000: ("cdf_time_tt2000", "<i8", "int64"),
}
CODES = {name: code for code, (name, _, _) in {**DATATYPES, **EXTENDED_DATATYPES}.items()}
EPOCH16 = 32
CHARACTERS = (51, 52)


def datatype(code):
    """Name, numpy type and class of the host's arrays."""
    return DATATYPES.get(code) or EXTENDED_DATATYPES[code]


def dtype_of(code):
    """The numpy type of one stored number or byte."""
    return np.dtype(datatype(code)[1])


def leading_of(code, elements):
    """The axes that one value adds: its characters, or the two doubles of an epoch16."""
    if code in CHARACTERS:
        return (elements,)
    return (2,) if code == EPOCH16 else ()


@dataclass
class Variable:
    code: int
    elements: int
    sizes: tuple  # d1, ..., dn
    varies: tuple  # dimension variances
    record_varies: bool
    values: np.ndarray = None  # None: not read
    pad: np.ndarray = None  # one value, flat; None: the file declares none
    sparse: str = "no"  # "no", "pad" or "previous"

    @property
    def shape(self):
        """The shape of the values but for the number of records."""
        return tuple(self.sizes) + leading_of(self.code, self.elements)


@dataclass
class Attribute:
    is_global: bool
    # By gEntry number or by variable name: (code, values), characters as bytes.
    entries: dict = field(default_factory=dict)


@dataclass
class Content:
    row_major: bool
    keeps_entry_numbers: bool = True  # of gEntries, where some were never written
    keeps_blanks_of_names: bool = True  # at the end
    variables: dict = field(default_factory=dict)
    attributes: dict = field(default_factory=dict)
    # What the reader makes of a text's bytes from the first 0 on.
    nul_reads_as: int = 0


class Unread:
    """In the place of what a reader could not read."""

    def __init__(self, error):
        self.error = error


def attempt(function, *arguments):
    """The result, or `Unread` when the reader fails on this item."""
    try:
        return function(*arguments)
    except Exception as error:  # readers fail in whatever way; what they may miss is listed
        return Unread(error)


def fill_texts(values, filler):
    """Texts of fixed length with their bytes from the first 0 on replaced."""
    after = np.maximum.accumulate(values == 0, axis=-1)
    return np.where(after, np.uint8(filler), values)


def text_bytes(texts, elements):
    """The bytes of fixed-length texts, each byte a character of a Latin-1 text."""
    texts = np.asarray(texts)
    flat = [text.encode("latin-1").ljust(elements, b"\0") for text in texts.reshape(-1).tolist()]
    data = np.frombuffer(b"".join(flat), "u1")
    return data.reshape(texts.shape + (elements,))


def expand(values, variable):
    """Values without the axes of dimensions that do not vary, repeated along these."""
    leading = leading_of(variable.code, variable.elements)
    kept = tuple(size if vary else 1 for size, vary in zip(variable.sizes, variable.varies))
    values = values.reshape((-1,) + kept + leading)
    return np.broadcast_to(values, (values.shape[0],) + tuple(variable.sizes) + leading)


def seen_as_zvariable(variable):
    """An rVariable as the CDF library shows it among zVariables: without the dimensions that do
    not vary."""
    single = tuple(slice(None) if vary else 0 for vary in variable.varies)
    variable.values = variable.values[(slice(None), *single)]
    variable.sizes = tuple(size for size, vary in zip(variable.sizes, variable.varies) if vary)
    variable.varies = (True,) * len(variable.sizes)
    return variable
