"""Files."""
import difflib
import os
import weakref
from collections.abc import Iterator, Mapping
from types import TracebackType
from typing import Any

from ambrix import _core
from ambrix.attributes import Attributes, Entry, entry_of
from ambrix.display import file_as_html, file_as_text
from ambrix.errors import Error
from ambrix.variable import Variable

_files: "weakref.WeakSet[File]" = weakref.WeakSet()


class File(Mapping[str, Variable]):
    """A file that is open for reading: a mapping of its variables by name.

    What the file tells of itself is read when it is opened, and known also when it is closed.
    Values are read when they are asked for.

    Attributes:
        path: the file, as an absolute path; "<bytes>" for one in memory.
        name: the path as it was given.
        attrs: the global attributes.
        variable_attributes: the names of the attributes of variables.
        version: the version of the library that has written it, such as "3.9.1".
        format: "SINGLE_FILE" or "MULTI_FILE".
        encoding: how its numbers are encoded, such as "IBMPC_ENCODING".
        majority: "ROW_MAJOR" or "COLUMN_MAJOR".
        checksum: "NO_CHECKSUM" or "MD5_CHECKSUM".
        compression: the type of compression of the whole file, its parameter, and percentage.
    """

    def __init__(self, source: "str | os.PathLike[str] | bytes | bytearray | memoryview") -> None:
        self._descriptor: int | None = None
        self._process = os.getpid()
        self._closed = True
        if isinstance(source, (bytes, bytearray, memoryview)):
            self.path, name = "<bytes>", self._keep(source)
            self.name = self.path
        else:
            self.name = os.fspath(source)
            self.path = on_disk(os.path.abspath(os.fspath(source)))
            name = self._nameable(self.path)
        self._handle = self._open(name)
        self._closed = False
        _files.add(self)
        self._describe()

    def _keep(self, source: "bytes | bytearray | memoryview") -> str:
        """Puts the bytes of a file where the library finds them. Returns their name."""
        self._descriptor = os.memfd_create("cdf")
        with os.fdopen(os.dup(self._descriptor), "wb") as memory:
            memory.write(source)
        return f"/proc/self/fd/{self._descriptor}"

    def _nameable(self, path: str) -> str:
        """A name for the library, which knows names in UTF-8 only."""
        if path.isprintable():
            return path
        self._descriptor = os.open(path, os.O_RDONLY)
        return f"/proc/self/fd/{self._descriptor}"

    def _open(self, name: str) -> _core.OpenFile:
        try:
            return _core.OpenFile(name)
        except Error as error:
            self._forget()
            error.add_note(f"file: {self.path}")
            raise

    def _describe(self) -> None:
        facts, variables, attributes = self._handle.describe()
        self.version: str = facts["version"]
        self.format: str = facts["format"]
        self.encoding: str = facts["encoding"]
        self.majority: str = facts["majority"]
        self.checksum: str = facts["checksum"]
        self.compression: tuple[str, str, float] = facts["compression"]
        of_variables: list[dict[str, list[Entry]]] = [{} for _ in variables]
        of_file: dict[str, list[Entry]] = {}
        self.variable_attributes = [name for name, is_global, _ in attributes if not is_global]
        for name, is_global, entries in attributes:
            if is_global:
                of_file[name] = [entry_of(entry) for entry in entries]
                continue
            for entry in entries:
                if entry[0] < len(of_variables):
                    of_variables[entry[0]][name] = [entry_of(entry)]
        self.attrs = Attributes(of_file)
        # Variables hold the file, so the file must not hold them: it is closed with the last.
        self._variables = {facts["name"]: (facts, Attributes(entries))
                           for facts, entries in zip(variables, of_variables)}

    def __getitem__(self, name: str) -> Variable:
        """The variable of a name; blanks at the end need not be given."""
        found = self._variables.get(name) or next(
            (described for known, described in self._variables.items()
             if known.rstrip() == name.rstrip()), None)
        if found:
            return Variable(self, *found)
        near = difflib.get_close_matches(name, self._variables, 3)
        hint = f"; did you mean {' or '.join(map(repr, near))}?" if near else ""
        raise KeyError(f"no variable {name!r} in {self.path}{hint}")

    def __iter__(self) -> Iterator[str]:
        return iter(self._variables)

    def __len__(self) -> int:
        return len(self._variables)

    def __hash__(self) -> int:
        return id(self)

    def __eq__(self, other: object) -> bool:
        return self is other

    @property
    def closed(self) -> bool:
        return self._closed

    def close(self) -> None:
        """Closes the file. Its values can't be read any more; what else is known of it stays."""
        if self._closed:
            return
        self._closed = True
        _files.discard(self)
        if os.getpid() == self._process:
            self._handle.close()
        self._forget()

    def _forget(self) -> None:
        if self._descriptor is not None:
            os.close(self._descriptor)
            self._descriptor = None

    def _opened(self) -> _core.OpenFile:
        """The file, for a read."""
        if self._closed:
            raise ValueError(f"{self.path} is closed")
        if os.getpid() != self._process:
            raise RuntimeError(f"{self.path} was opened by the parent process: open it again here")
        return self._handle

    def __enter__(self) -> "File":
        return self

    def __exit__(self, kind: type[BaseException] | None, error: BaseException | None,
                 trace: TracebackType | None) -> None:
        self.close()

    def __del__(self) -> None:
        if not getattr(self, "_closed", True):
            self.close()

    def __reduce__(self) -> Any:
        if self.path == "<bytes>" or self._closed:
            raise TypeError("only a file that is open, by a path, can be pickled")
        return File, (self.path,)

    def __repr__(self) -> str:
        return file_as_text(self)

    def _repr_html_(self) -> str:
        return file_as_html(self)


def on_disk(path: str) -> str:
    """The file of a path, which may lack its extension."""
    for extension in ("", ".cdf", ".CDF"):
        if os.path.isfile(path + extension):
            return path + extension
    raise FileNotFoundError(2, "there is no such file", path)


def open(source: "str | os.PathLike[str] | bytes | bytearray | memoryview",
         mode: str = "r") -> File:
    """Opens a CDF file for reading.

    Args:
        source: the path of the file, with or without ".cdf", or the bytes of one.
        mode: "r".

    Raises:
        FileNotFoundError: there is no such file.
        ambrix.Error: the file is no CDF file, or a damaged one.
    """
    if mode != "r":
        raise ValueError(f"mode {mode!r}: files are opened for reading, 'r'")
    return File(source)


def close_all() -> None:
    """Closes the files that are still open, at the end of the program."""
    for file in list(_files):
        file.close()
