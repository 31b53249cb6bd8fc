"""From values in a file to those that Python works with."""
from typing import Any

import numpy as np
import numpy.typing as npt

from ambrix.attributes import Attributes
from ambrix.datatypes import Datatype
from ambrix.times import to_datetime64


def convert(raw: npt.NDArray[Any], datatype: Datatype, elements: int) -> Any:
    """Times as `datetime64`, texts as `str`, other values as they are. A single one is a scalar."""
    if datatype.is_time:
        return to_datetime64(raw, datatype.code)[()]
    if datatype.is_text:
        return texts(np.asarray(raw), elements)[()]
    return raw[()]


def texts(raw: npt.NDArray[np.bytes_], length: int) -> npt.NDArray[np.str_]:
    """Texts of bytes that are UTF-8; other bytes become lone surrogates."""
    try:
        return raw.astype(f"U{length}")  # which takes ASCII only, and is ten times as fast
    except UnicodeDecodeError:
        return np.char.decode(raw, "utf-8", "surrogateescape").astype(f"U{length}")


def limit(attrs: Attributes, name: str, datatype: Datatype) -> Any:
    """The raw value of an attribute that says something of values; None unless it fits them."""
    if name not in attrs:
        return None
    entry = attrs.entries(name)[0]
    if not isinstance(entry.raw, np.ndarray) or datatype.is_text:
        return None
    if entry.datatype == "CDF_EPOCH16" or datatype.name == "CDF_EPOCH16":
        return entry.raw.T if entry.datatype == datatype.name else None
    return entry.raw


def fill_of(attrs: Attributes, datatype: Datatype) -> Any:
    """The raw FILLVAL; None where it is a list, or of another kind than the values."""
    value = limit(attrs, "FILLVAL", datatype)
    if value is None or len(value) != 1:
        return None
    kinds = {value.dtype.kind, np.dtype(datatype.raw).kind}
    same = len(kinds) == 1 or kinds <= {"i", "u"}
    return value[0] if same and _fits(value[0], datatype) else None


def _fits(value: Any, datatype: Datatype) -> bool:
    """Whether a value can be in an array of the datatype."""
    if np.ndim(value) or np.dtype(datatype.raw).kind == "f":
        return True
    range_of = np.iinfo(datatype.raw)
    return bool(range_of.min <= value <= range_of.max)


def out_of_range(raw: npt.NDArray[Any], attrs: Attributes, datatype: Datatype) -> Any:
    """Where values are below VALIDMIN or above VALIDMAX, which may have one for each component."""
    outside = np.zeros(raw.shape[:-1] if datatype.name == "CDF_EPOCH16" else raw.shape, bool)
    if datatype.name == "CDF_EPOCH16":
        return outside
    for name, beyond in (("VALIDMIN", np.less), ("VALIDMAX", np.greater)):
        value = limit(attrs, name, datatype)
        if value is None or len(value) != 1 and raw.shape[-1:] != (len(value),):
            continue
        outside |= beyond(raw, value if len(value) != 1 else value[0])
    return outside
