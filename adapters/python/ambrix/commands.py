"""The 91 commands of ambrix as functions.

They are described in the manual of the commands; `help(ambrix.commands.getVarData)` tells about one
of them. What they take and return is strict: values have exactly the class of their datatype.
"""
from ambrix import _core

__all__ = [name for name in vars(_core.commands) if not name.startswith("_")]
globals().update({name: getattr(_core.commands, name) for name in __all__})
