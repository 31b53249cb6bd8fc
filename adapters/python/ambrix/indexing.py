"""From an index of a NumPy array to one block of a variable."""
import operator
from typing import Any, NamedTuple

import numpy as np
import numpy.typing as npt

# The library takes longer to skip a record than to read a small one.
LARGEST_STEP_READ_WHOLE = 16


class Axis(NamedTuple):
    """What is read along a dimension, and what is taken of that."""

    start: int
    number: int
    step: int
    take: int | slice | npt.NDArray[np.intp] = slice(None)

    def thinned_later(self) -> "Axis":
        """The same with steps of 1, when the step is small enough."""
        if not 1 < self.step <= LARGEST_STEP_READ_WHOLE or self.number < 2:
            return self
        thin = np.arange(0, self.number * self.step, self.step)[self.take]
        return Axis(self.start, (self.number - 1) * self.step + 1, 1, thin)


def parse(key: Any, shape: tuple[int, ...]) -> list[Axis]:
    """The axes of an index. Lists along several dimensions each select along their own."""
    keys = key if isinstance(key, tuple) else (key,)
    ellipses = [place for place, item in enumerate(keys) if item is Ellipsis]
    if len(ellipses) > 1:
        raise IndexError("an index can have one ellipsis")
    if not ellipses:
        keys, ellipses = (*keys, Ellipsis), [len(keys)]
    missing = len(shape) - len(keys) + 1
    if missing < 0:
        raise IndexError(f"{len(keys) - 1} indices for {len(shape)} dimensions")
    place = ellipses[0]
    filled = (*keys[:place], *[slice(None)] * missing, *keys[place + 1:])
    return [_axis(item, size) for item, size in zip(filled, shape)]


def _axis(item: Any, size: int) -> Axis:
    if isinstance(item, slice):
        return _of_slice(item, size)
    if item is None:
        raise IndexError("a variable has no new dimensions: index the array that is read")
    if not isinstance(item, (list, np.ndarray)):
        return Axis(_in_range(operator.index(item), size), 1, 1, 0)
    return _of_list(np.asarray(item), size)


def _in_range(index: int, size: int) -> int:
    if not -size <= index < size:
        raise IndexError(f"index {index} is out of range for {size}")
    return index % size


def _of_slice(item: slice, size: int) -> Axis:
    items = range(size)[item]
    if len(items) == 0:
        return Axis(0, 0, 1)
    if items.step > 0:
        return Axis(items.start, len(items), items.step)
    return Axis(items[-1], len(items), -items.step, slice(None, None, -1))


def _of_list(items: npt.NDArray[Any], size: int) -> Axis:
    if items.dtype == bool:
        if items.shape != (size,):
            raise IndexError(f"a mask of shape {items.shape} for {size}")
        items = np.flatnonzero(items)
    if items.ndim != 1 or items.size and items.dtype.kind not in "iu":
        raise IndexError("a list of indices has one dimension, of integers")
    if items.size == 0:
        return Axis(0, 0, 1)
    places = np.array([_in_range(int(index), size) for index in items], np.intp)
    first = int(places.min())
    return Axis(first, int(places.max()) - first + 1, 1, places - first)


def taken(block: npt.NDArray[Any], axes: list[Axis]) -> npt.NDArray[Any]:
    """What the axes take of a block that was read for them."""
    for place, axis in enumerate(axes):
        if isinstance(axis.take, np.ndarray):
            block = np.take(block, axis.take, place)
    rest = tuple(slice(None) if isinstance(axis.take, np.ndarray) else axis.take for axis in axes)
    return block[(*rest, ...)]


def shape_of(axes: list[Axis]) -> tuple[int, ...]:
    """The shape of what the axes take."""
    return tuple(len(axis.take) if isinstance(axis.take, np.ndarray) else axis.number
                 for axis in axes if not isinstance(axis.take, int))
