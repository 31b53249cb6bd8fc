"""Times of CDF files as `datetime64`."""
import functools
from typing import Any

import numpy as np
import numpy.typing as npt

from ambrix import _core

EPOCH, EPOCH16, TT2000 = 31, 32, 33

# Leap seconds have been introduced at the beginnings of months, since 1972.
_FIRST_YEAR, _LAST_YEAR = 1972, 2261


def to_datetime64(raw: npt.NDArray[Any], datatype: int) -> npt.NDArray[np.datetime64]:
    """Times in nanoseconds of UTC; NaT where there is none, or none that nanoseconds can hold.

    Args:
        raw: values as they are in the file; those of EPOCH16 have a last dimension of 2.
        datatype: the code of their datatype.
    """
    shape = raw.shape[:-1] if datatype == EPOCH16 else raw.shape
    flat = np.ascontiguousarray(raw).reshape(-1)
    times = _of_tt2000(flat) if datatype == TT2000 else _core.epochs_to_nanoseconds(flat, datatype)
    return times.view("datetime64[ns]").reshape(shape)


def _of_tt2000(values: npt.NDArray[np.int64]) -> npt.NDArray[np.int64]:
    begins, offsets = _leap_seconds()
    times = _core.tt2000_to_nanoseconds(values, begins, offsets)
    early = np.flatnonzero((values < begins[0]) & (values > _core.LARGEST_TT2000_FILL))
    if early.size:  # when UTC drifted
        times[early] = _nanoseconds(_core.tt2000_breakdown(values[early]))
    return times


@functools.cache
def _leap_seconds() -> tuple[npt.NDArray[np.int64], npt.NDArray[np.int64]]:
    """The first TT2000 value of each period without a leap second, and what is to be taken off.

    They come from the CDF library's table, which is a file of the user's where the environment
    names one (CDF_LEAPSECONDSTABLE).
    """
    years = np.repeat(np.arange(_FIRST_YEAR, _LAST_YEAR + 1), 12)
    months = np.tile(np.arange(1, 13), len(years) // 12)
    days = np.ones(len(years))
    components = np.array([years, months, days, *np.zeros((6, len(years)))], order="F")
    values = _core.compute_tt2000(components)
    offsets = values - _nanoseconds(components)
    changes = np.flatnonzero(np.diff(offsets, prepend=offsets[0] - 1))
    return values[changes], offsets[changes]


def _nanoseconds(components: npt.NDArray[np.float64]) -> npt.NDArray[np.int64]:
    """Nanoseconds since 1970 of calendar times: year, month, ..., nanosecond, 9-by-n."""
    year, month, day, *rest = components.astype(np.int64)
    months = (year - 1970) * 12 + month - 1
    days = months.astype("datetime64[M]").astype("datetime64[D]").astype(np.int64) + day - 1
    total: npt.NDArray[np.int64] = days
    for size, part in zip((24, 60, 60, 1000, 1000, 1000), rest):
        total = total * size + part
    return total
