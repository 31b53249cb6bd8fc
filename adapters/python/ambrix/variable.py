"""Variables of a file."""
from typing import TYPE_CHECKING, Any

import numpy as np
import numpy.typing as npt

from ambrix import _core, indexing
from ambrix.attributes import Attributes, shortened
from ambrix.conversion import convert, fill_of, out_of_range
from ambrix.datatypes import datatype_of

if TYPE_CHECKING:
    from ambrix.file import File


class Variable:
    """A variable: its facts, and its values as they are asked for.

    `variable[...]` reads like an array: any basic index is one read of the library. Records come
    first, then the dimensions as the file has them.

    Attributes:
        name: its name.
        number: its number in the file.
        datatype: the name of its datatype, such as "CDF_REAL4".
        shape: the number of records, unless they do not vary, and the sizes of the dimensions.
        dtype: NumPy's type of its values; times are `datetime64[ns]`, texts `str`.
        attrs: its attributes.
        sizes: the sizes of the dimensions.
        records: the number of records; of a variable without, 1, or 0 when it has no value.
        record_varies: whether it has records.
        varies: for each dimension, whether values differ along it.
        compression: the type of compression, its parameter, and the size in percent.
        sparse_records: how records that were not written are read.
        pad_value: the value of those, as it is in the file.
    """

    def __init__(self, file: "File", facts: dict[str, Any], attrs: Attributes) -> None:
        self._file = file
        self._type = datatype_of(facts["datatype"])
        self._elements: int = facts["elements"]
        self._row_major = file.majority == "ROW_MAJOR"
        sizes: tuple[int, ...] = facts["sizes"]
        self.name: str = facts["name"]
        self.number: int = facts["number"]
        self.datatype = self._type.name
        self.record_varies: bool = facts["record_varies"]
        self.records: int = facts["records"]
        self.sizes = sizes[::-1] if self._row_major else sizes
        self.varies: tuple[bool, ...] = facts["varies"][::-1 if self._row_major else 1]
        self.shape = (self.records, *self.sizes) if self.record_varies else self.sizes
        self.dtype = self._type.dtype(self._elements)
        self.attrs = attrs
        self.compression: tuple[str, str, float] = facts["compression"]
        self.sparse_records: str = facts["sparse_records"]
        self.pad_value: Any = facts["pad_value"]

    @property
    def ndim(self) -> int:
        return len(self.shape)

    @property
    def size(self) -> int:
        return int(np.prod(self.shape, dtype=np.int64))

    @property
    def nbytes(self) -> int:
        """The size of all its values in memory."""
        return self.size * self.dtype.itemsize

    @property
    def blocking_factor(self) -> int:
        """The records that lie together in the file, and are compressed together."""
        return self._file._handle.blocking_factor(self.number)

    @property
    def raw(self) -> "RawVariable":
        """The same values as they are in the file: times as numbers, texts as bytes."""
        return RawVariable(self)

    def __len__(self) -> int:
        if not self.shape:
            raise TypeError(f"the variable {self.name} has no dimensions")
        return self.shape[0]

    def __getitem__(self, key: Any) -> Any:
        return self.read(key)

    def __array__(self, dtype: npt.DTypeLike | None = None,
                  copy: bool | None = None) -> npt.NDArray[Any]:
        if copy is False:
            raise ValueError("values are read from a file, which is a copy")
        return np.asarray(self.read(), dtype)

    def read(self, key: Any = Ellipsis, *, fill: bool = False, valid: bool = False,
             out: npt.NDArray[Any] | None = None) -> Any:
        """Reads values.

        Args:
            key: what is read, as in `variable[key]`; all, unless it is given. A list or mask of
                indices selects along its own dimension.
            fill: whether values equal to FILLVAL become NaN or NaT. Integers and texts stay.
            valid: whether to return a masked array, which masks what is equal to FILLVAL, below
                VALIDMIN or above VALIDMAX.
            out: an array that takes the values and is returned.
        """
        raw = self._read_raw(indexing.parse(key, self.shape))
        values = convert(raw, self._type, self._elements)
        if fill or valid:
            values = self._without_fill(values, raw, fill, valid)
        return given(values, out)

    def _without_fill(self, values: Any, raw: Any, fill: bool, valid: bool) -> Any:
        value = fill_of(self.attrs, self._type)
        filled = (np.zeros(np.shape(values), bool) if value is None
                  else equal(raw, value, self._type))
        if fill and self.dtype.kind in "fM":
            values = np.where(filled, np.array("NaT" if self.dtype.kind == "M" else "nan",
                                               self.dtype), values)
        if not valid:
            return values
        return np.ma.masked_array(values, filled | out_of_range(raw, self.attrs, self._type))

    def _read_raw(self, axes: list[indexing.Axis]) -> npt.NDArray[Any]:
        """The values that the axes take, as they are in the file."""
        axes = self._as_read(axes)
        pair = (2,) if self.datatype == "CDF_EPOCH16" else ()
        if any(axis.number == 0 for axis in axes):
            return np.zeros(indexing.shape_of(axes) + pair, self._type.raw_dtype(self._elements))
        block = self._file._opened().read(self.number, self._block(axes))
        return indexing.taken(self._natural(block), axes)

    def _as_read(self, axes: list[indexing.Axis]) -> list[indexing.Axis]:
        """With an axis of records, which variables without have too in the file."""
        if not self.record_varies:
            return [indexing.Axis(0, 1, 1, 0), *axes]
        return [axes[0].thinned_later(), *axes[1:]]

    def _block(self, axes: list[indexing.Axis]) -> _core.Block:
        records, *rest = axes
        inner = rest[::-1] if self._row_major else rest
        return _core.Block(records.start, records.number, records.step,
                           [axis.start for axis in inner], [axis.number for axis in inner],
                           [axis.step for axis in inner])

    def _natural(self, block: npt.NDArray[Any]) -> npt.NDArray[Any]:
        """Records first, then the dimensions of the file, the two of EPOCH16 last: a view."""
        if self._row_major:
            return block.T
        if self.datatype == "CDF_EPOCH16":
            block = np.moveaxis(block, 0, -1)
            return np.moveaxis(block, -2, 0)
        return np.moveaxis(block, -1, 0)

    def __repr__(self) -> str:
        units = self.attrs.get("UNITS", "")
        text = f", {shortened(units)}" if isinstance(units, str) and units.strip() else ""
        return f"<ambrix.Variable {self.name!r}: {self.datatype} {self.shape}{text}>"


class RawVariable:
    """The values of a variable as they are in the file.

    Times are numbers, two for each of EPOCH16 along a last dimension; texts are bytes.
    """

    def __init__(self, variable: Variable) -> None:
        self._variable = variable
        pair = (2,) if variable.datatype == "CDF_EPOCH16" else ()
        self.shape = (*variable.shape, *pair)
        self.dtype = variable._type.raw_dtype(variable._elements)

    def __getitem__(self, key: Any) -> Any:
        return self.read(key)

    def __array__(self, dtype: npt.DTypeLike | None = None,
                  copy: bool | None = None) -> npt.NDArray[Any]:
        if copy is False:
            raise ValueError("values are read from a file, which is a copy")
        return np.asarray(self.read(), dtype)

    def read(self, key: Any = Ellipsis, *, out: npt.NDArray[Any] | None = None) -> Any:
        """Reads values, of EPOCH16 always both numbers. `out` is an array that takes them.

        An array that has the order and the type of the values in memory is read into directly.
        """
        variable = self._variable
        axes = indexing.parse(key, variable.shape)
        if out is not None and self._read_into(axes, out):
            return out
        return given(variable._read_raw(axes)[()], out)

    def _read_into(self, axes: list[indexing.Axis], out: npt.NDArray[Any]) -> bool:
        """Reads into an array if its memory is what the library would fill."""
        variable = self._variable
        plain = all(isinstance(axis.take, int) or isinstance(axis.take, slice)
                    and axis.take == slice(None) for axis in axes)
        pair = self.shape[variable.ndim:]
        if not plain or out.dtype != self.dtype or self.dtype.kind == "S":
            return False
        if out.shape != indexing.shape_of(axes) + pair or not (out.size and out.flags.carray):
            return False
        if not variable._row_major and sum(size > 1 for size in out.shape) > 1:
            return False
        records = axes if variable.record_varies else [indexing.Axis(0, 1, 1, 0), *axes]
        variable._file._opened().read_into(variable.number, variable._block(records), out)
        return True


def equal(raw: npt.NDArray[Any], value: Any, datatype: Any) -> Any:
    """Where raw values are equal to one; both numbers of EPOCH16 must be."""
    found = raw == value
    return found.all(-1) if datatype.name == "CDF_EPOCH16" else found


def given(values: Any, out: npt.NDArray[Any] | None) -> Any:
    """The values, in an array where one is given."""
    if out is None:
        return values
    if out.shape != np.shape(values):
        raise ValueError(f"values of shape {np.shape(values)} for an array of shape {out.shape}")
    np.copyto(out, values, casting="same_kind")
    return out
