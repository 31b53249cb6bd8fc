"""Reads and writes CDF files, the Common Data Format of space physics."""
import atexit

from ambrix import _core, commands
from ambrix.errors import CdfWarning, Error, OutOfMemoryError

__all__ = ["CdfWarning", "Error", "OutOfMemoryError", "commands"]
__version__: str = _core.__version__

# Files that are still open are closed while warnings can still be shown.
atexit.register(_core.unload)
