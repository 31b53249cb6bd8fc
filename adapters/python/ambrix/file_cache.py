"""Open files for those who know them by their paths."""
import os
import threading
from collections import OrderedDict

from ambrix.file import File, on_disk

_SEVERAL = 64

_open: "OrderedDict[tuple[str, int, int], File]" = OrderedDict()
_lock = threading.Lock()


def set_cache_size(files: int) -> None:
    """Sets how many files are kept open for lazy arrays, 64 at first.

    A file that has read compressed values keeps up to 4 MB of memory in the CDF library.
    """
    global _SEVERAL
    with _lock:
        _SEVERAL = files
        _shrink()


def _shrink() -> None:
    while len(_open) > max(_SEVERAL, 0):
        _open.popitem(last=False)  # it is closed when the last who reads from it lets it go


def _forget_all() -> None:
    """In a child: the files are those of its parent."""
    global _lock
    _lock = threading.Lock()
    _open.clear()


os.register_at_fork(after_in_child=_forget_all)


class Source:
    """A file by its path, its size and its time, or by its bytes.

    With a path it can be pickled.
    """

    def __init__(self, content: "str | bytes") -> None:
        self._memory = File(content) if isinstance(content, bytes) else None
        self.path = os.path.abspath(on_disk(content)) if isinstance(content, str) else ""
        self._stamp = self._stamped() if self.path else (0, 0)

    def _stamped(self) -> tuple[int, int]:
        facts = os.stat(self.path)
        return facts.st_size, facts.st_mtime_ns

    def file(self) -> File:
        """The file, open. Raises OSError when it is not the one that it was."""
        if self._memory is not None:
            return self._memory
        if self._stamped() != self._stamp:
            raise OSError(f"{self.path} has changed since it was opened")
        key = (self.path, *self._stamp)
        with _lock:
            found = _open.pop(key, None)
            if found is None:  # not merely without variables, and so empty
                found = File(self.path)
            _open[key] = found
            _shrink()
        return found

    def close(self) -> None:
        """Lets the file go."""
        if self._memory is not None:
            self._memory.close()
        with _lock:
            _open.pop((self.path, *self._stamp), None)

    def __reduce__(self) -> "tuple[object, ...]":
        if self._memory is not None:
            raise TypeError("a file in memory can't be pickled")
        return _restored, (self.path, self._stamp)


def _restored(path: str, stamp: tuple[int, int]) -> Source:
    source = Source.__new__(Source)
    source._memory, source.path, source._stamp = None, path, stamp
    return source
