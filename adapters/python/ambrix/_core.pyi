"""The compiled part of the package."""
from types import ModuleType

__version__: str
commands: ModuleType

def leaks() -> tuple[int, int]: ...
def unload() -> None: ...
