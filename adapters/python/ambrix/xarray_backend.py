"""CDF files as datasets of xarray: `xarray.open_dataset("a.cdf")`.

Nothing needs to be imported: xarray finds the engine `ambrix` in the installed package.
"""
import io
import os
from collections.abc import Iterable
from typing import Any

import numpy as np
import numpy.typing as npt
import xarray as xr
from xarray.backends import BackendArray, BackendEntrypoint
from xarray.core import indexing

from ambrix.dimensions import Dimensions
from ambrix.file import File
from ambrix.file_cache import Source
from ambrix.variable import Variable

BEGINNINGS = (bytes.fromhex("cdf300010000ffff"), bytes.fromhex("cdf30001cccc0001"),
              bytes.fromhex("cdf260020000ffff"), bytes.fromhex("cdf26002cccc0001"),
              bytes.fromhex("0000ffff0000ffff"))


class LazyArray(BackendArray):
    """The values of a variable, which are read when they are asked for.

    It carries the path of the file, not the file, so that it can be pickled and read elsewhere.
    """

    def __init__(self, source: Source, variable: Variable, fill: bool, raw: bool) -> None:
        self.source = source
        self.name = variable.name
        self.fill = fill
        self.raw = raw
        self.shape = variable.raw.shape if raw else variable.shape
        self.dtype = variable.raw.dtype if raw else variable.dtype

    def __getitem__(self, key: indexing.ExplicitIndexer) -> Any:
        return indexing.explicit_indexing_adapter(
            key, self.shape, indexing.IndexingSupport.OUTER, self._read)

    def _read(self, key: tuple[Any, ...]) -> npt.NDArray[Any]:
        variable = self.source.file()[self.name]
        if self.raw:
            return np.asarray(variable.raw.read(key[:variable.ndim])[(..., *key[variable.ndim:])])
        return np.asarray(variable.read(key, fill=self.fill))


class CdfBackend(BackendEntrypoint):
    """The engine `ambrix`."""

    description = "Open CDF files, the Common Data Format of space physics"
    open_dataset_parameters = ("filename_or_obj", "drop_variables", "mask_and_scale",
                               "decode_times")

    def open_dataset(
            self, filename_or_obj: Any, *, drop_variables: str | Iterable[str] | None = None,
            mask_and_scale: bool = True, decode_times: bool = True) -> xr.Dataset:
        """Opens a file as a dataset of lazy arrays.

        Args:
            filename_or_obj: a path, the bytes of a file, or an object to read them from.
            drop_variables: variables that are left out.
            mask_and_scale: whether values equal to FILLVAL become NaN or NaT.
            decode_times: whether times become `datetime64`; else they are numbers.
        """
        source = Source(content_of(filename_or_obj))
        file = source.file()
        dropped = {drop_variables} if isinstance(drop_variables, str) else set(drop_variables or ())
        dimensions = Dimensions(file)
        variables = {}
        for name, variable in file.items():
            if name in dropped or variable.datatype.startswith("datatype"):
                continue
            raw = not decode_times and variable.dtype.kind == "M"
            array = LazyArray(source, variable, mask_and_scale, raw)
            variables[name] = described(variable, dimensions, array)
        dataset = xr.Dataset(variables, attrs=dict(file.attrs))
        dataset = dataset.set_coords(dimensions.coordinates & set(variables))
        dataset.encoding["source"] = file.path
        dataset.set_close(source.close)
        return dataset

    def guess_can_open(self, filename_or_obj: Any) -> bool:
        """Whether it begins as CDF files do."""
        try:
            return first_bytes(filename_or_obj).startswith(BEGINNINGS)
        except (OSError, TypeError):
            return False


def content_of(given: Any) -> "str | bytes":
    """A path or bytes."""
    if isinstance(given, (bytes, memoryview)):
        return bytes(given)
    if hasattr(given, "read"):
        content = given.read()
        if isinstance(content, bytes):
            return content
        raise TypeError("the file is not open for bytes")
    return os.fspath(given)  # type: ignore[no-any-return]


def first_bytes(given: Any) -> bytes:
    if isinstance(given, (bytes, memoryview)):
        return bytes(given[:8])
    if isinstance(given, (str, os.PathLike)):
        with open(given, "rb") as file:
            return file.read(8)
    if isinstance(given, io.IOBase) and given.seekable():
        place = given.tell()
        found = given.read(8)
        given.seek(place)
        return bytes(found)
    return b""


def described(variable: Variable, dimensions: Dimensions, array: LazyArray) -> xr.Variable:
    """A variable with its dimensions, its attributes and what is known of its storage."""
    attrs = dict(variable.attrs)
    if variable.dtype.kind != "M":
        for name, of in (("units", "UNITS"), ("long_name", "CATDESC")):
            if isinstance(attrs.get(of), str) and name not in attrs:
                attrs[name] = attrs[of].strip()
    names = dimensions.of(variable)
    if array.raw and variable.datatype == "CDF_EPOCH16":
        names = (*names, f"{variable.name}_parts")
    encoding: dict[str, Any] = {"datatype": variable.datatype}
    if variable.record_varies and variable.compression[0] != "NO_COMPRESSION":
        encoding["preferred_chunks"] = {names[0]: max(variable.blocking_factor, 1)}
    return xr.Variable(names, indexing.LazilyIndexedArray(array), attrs, encoding)
