"""The errors and warnings of the module."""


class Message(Exception):
    """What errors and warnings of the module tell.

    Attributes:
        identifier: what happened, such as "TOLVEX:ambrix:cdflib:fileOpenError". It never changes.
        values: the values in the text: numbers and texts.
    """

    identifier: str
    values: tuple[int | str, ...]

    def __init__(self, text: str, identifier: str = "", values: tuple[int | str, ...] = ()) -> None:
        super().__init__(text, identifier, values)  # as arguments, so that it can be pickled
        self.text = text
        self.identifier = identifier
        self.values = values

    def __str__(self) -> str:
        return self.text


class Error(Message):
    """An error that the module has raised."""


class OutOfMemoryError(Error, MemoryError):
    """Memory that could not be had."""


class CdfWarning(Message, UserWarning):
    """A warning of the module."""
