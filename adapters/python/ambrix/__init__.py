"""Reads CDF files, the Common Data Format of space physics, and has the 91 commands of ambrix.

    with ambrix.open("a.cdf") as file:
        times, flux = file["Epoch"][:], file["Flux"][-100:, 0]
"""
import atexit

from ambrix import _core, commands
from ambrix.attributes import Attributes, Entry
from ambrix.errors import CdfWarning, Error, OutOfMemoryError
from ambrix.file import File, close_all, open
from ambrix.file_cache import set_cache_size
from ambrix.variable import Variable

__all__ = ["Attributes", "CdfWarning", "Entry", "Error", "File", "OutOfMemoryError", "Variable",
           "commands", "open", "set_cache_size"]
__version__: str = _core.__version__

# The last is done first. Files of commands are closed while warnings of them can still be shown.
atexit.register(_core.unload)
atexit.register(close_all)
