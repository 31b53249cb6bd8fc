"""Attributes of files and of variables."""
from collections.abc import Iterator, Mapping
from typing import Any, NamedTuple

import numpy as np

from ambrix.datatypes import datatype_of
from ambrix.times import to_datetime64


class Entry(NamedTuple):
    """An entry of an attribute.

    Attributes:
        number: its number: of a variable's attribute, that of the variable.
        datatype: the name of its datatype, such as "CDF_REAL4".
        raw: its value as it is in the file: a text or an array; None where its datatype is unknown.
    """

    number: int
    datatype: str
    raw: Any

    @property
    def value(self) -> Any:
        """Its value: a `str`, a NumPy scalar, or an array; times are `datetime64`."""
        if self.raw is None or isinstance(self.raw, str):
            return self.raw
        values = _times(self.raw, self.datatype)
        return values[0] if values.shape == (1,) else values


_TIMES = {"CDF_EPOCH": 31, "CDF_EPOCH16": 32, "CDF_TIME_TT2000": 33}


def _times(raw: Any, datatype: str) -> Any:
    if datatype not in _TIMES:
        return raw
    return to_datetime64(raw.T if datatype == "CDF_EPOCH16" else raw, _TIMES[datatype])


class Attributes(Mapping[str, Any]):
    """Attributes by their names.

    `attributes[name]` is the value of the entry: a `str`, a NumPy scalar of exactly its datatype or
    an array. Of a global attribute with several entries it is a list of their values.
    """

    def __init__(self, entries: dict[str, list[Entry]]) -> None:
        self._entries = entries

    def __getitem__(self, name: str) -> Any:
        entries = self._entries[name]
        if len(entries) == 1:
            return entries[0].value
        return [entry.value for entry in entries]

    def __iter__(self) -> Iterator[str]:
        return iter(self._entries)

    def __len__(self) -> int:
        return len(self._entries)

    def entries(self, name: str) -> list[Entry]:
        """The entries of an attribute, with their numbers, datatypes and raw values."""
        return list(self._entries[name])

    def datatype(self, name: str) -> str:
        """The datatype of an attribute, that of its first entry."""
        return self._entries[name][0].datatype

    def __repr__(self) -> str:
        rows = [f"  {name}: {shortened(self[name])}" for name in self]
        return "\n".join([f"<ambrix.Attributes: {len(rows)}>", *rows])


def entry_of(described: tuple[int, int, Any]) -> Entry:
    """An entry as the file has described it."""
    number, datatype, raw = described
    return Entry(number, datatype_of(datatype).name, raw)


def shortened(value: Any, most: int = 70) -> str:
    """A value in one line."""
    text = value if isinstance(value, str) else np.array2string(value, threshold=6) \
        if isinstance(value, np.ndarray) else str(value)
    line = " ".join(text.split())
    return line if len(line) <= most else line[:most - 3] + "..."
