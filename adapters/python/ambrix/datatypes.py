"""The datatypes of CDF files and what they are in NumPy."""
from typing import NamedTuple

import numpy as np


class Datatype(NamedTuple):
    """A datatype.

    Attributes:
        code: its number in the CDF library.
        name: its name there.
        raw: NumPy's type of its elements; of texts, one byte.
    """

    code: int
    name: str
    raw: str

    @property
    def is_text(self) -> bool:
        return self.raw == "S1"

    @property
    def is_time(self) -> bool:
        return self.code in (31, 32, 33)

    def dtype(self, elements: int) -> np.dtype[np.generic]:
        """The type of values as they are read: times and texts converted."""
        if self.is_time:
            return np.dtype("datetime64[ns]")
        return np.dtype(f"U{elements}" if self.is_text else self.raw)

    def raw_dtype(self, elements: int) -> np.dtype[np.generic]:
        """The type of values as they are in the file; EPOCH16 has two of them."""
        return np.dtype(f"S{elements}" if self.is_text else self.raw)


DATATYPES = {row[0]: Datatype(*row) for row in (
    (1, "CDF_INT1", "i1"), (2, "CDF_INT2", "i2"), (4, "CDF_INT4", "i4"), (8, "CDF_INT8", "i8"),
    (11, "CDF_UINT1", "u1"), (12, "CDF_UINT2", "u2"), (14, "CDF_UINT4", "u4"),
    (21, "CDF_REAL4", "f4"), (22, "CDF_REAL8", "f8"),
    (31, "CDF_EPOCH", "f8"), (32, "CDF_EPOCH16", "f8"), (33, "CDF_TIME_TT2000", "i8"),
    (41, "CDF_BYTE", "i1"), (44, "CDF_FLOAT", "f4"), (45, "CDF_DOUBLE", "f8"),
    (51, "CDF_CHAR", "S1"), (52, "CDF_UCHAR", "S1"))}


def datatype_of(code: int) -> Datatype:
    """The datatype of a code, also of one that this version does not know."""
    return DATATYPES.get(code, Datatype(code, f"datatype {code}", "V1"))
