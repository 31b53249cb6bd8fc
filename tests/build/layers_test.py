"""A folder of the module can include the folders that it may, and no other: else it cannot compile.

Each include is tried with the very command that compiles a source of the folder.
usage: layers_test.py BUILD_FOLDER
"""
import json
import pathlib
import shlex
import subprocess
import sys
import tempfile
import unittest

BUILD = pathlib.Path(sys.argv.pop())
COMMANDS = json.loads((BUILD / "compile_commands.json").read_text())
ROOT = pathlib.Path(__file__).resolve().parents[2]
MAY_SEE = {
    "gateway": {"host", "gateway"},
    "constants": {"host", "gateway", "constants"},
    "variables": {"host", "gateway", "constants", "variables"},
    "attributes": {"host", "gateway", "constants", "variables", "attributes"},
    "file": {"host", "gateway", "constants", "file"},
    "epoch": {"host", "gateway", "epoch"},
    "extended": {"host", "gateway", "epoch", "extended"},
    "gateway/entry": {"host", "gateway", "constants", "variables", "attributes", "file", "epoch",
                      "gateway/entry"},
    "inflate": {"inflate"},
}


def header_of(folder):
    """A header of the folder, as an include names it."""
    headers = list((ROOT / folder).glob("*.h")) or (ROOT / folder).rglob("*.h")
    return min(headers).relative_to(ROOT)


def command_of(folder):
    """How the first source of the folder is compiled."""
    for entry in COMMANDS:
        source = pathlib.Path(entry["file"])
        if source.parent == ROOT / folder:
            arguments = shlex.split(entry["command"])
            return entry["directory"], arguments[:arguments.index("-o")]
    raise LookupError(f"no source of {folder}/ is compiled")


def sees(folder, other):
    """Whether the compiler, as called for a source of the folder, finds a header of the other."""
    directory, arguments = command_of(folder)
    with tempfile.NamedTemporaryFile("w", suffix=".cc") as probe:
        probe.write(f'#if !__has_include("{header_of(other)}")\n#error\n#endif\n')
        probe.flush()
        done = subprocess.run([*arguments, "-fsyntax-only", probe.name], cwd=directory,
                              stderr=subprocess.DEVNULL, check=False)
    return done.returncode == 0


def is_compiled(folder):
    """Whether it is: some need what not every system has."""
    return any(pathlib.Path(entry["file"]).parent == ROOT / folder for entry in COMMANDS)


class LayersTest(unittest.TestCase):
    def test_each_folder_sees_what_it_may_and_nothing_else(self):
        for folder, allowed in MAY_SEE.items():
            with self.subTest(folder=folder):
                if folder == "inflate" and not is_compiled(folder):
                    self.skipTest("the headers of ISA-L were not found")
                seen = {other for other in ("host", "adapters", *MAY_SEE) if sees(folder, other)}
                self.assertEqual(seen, allowed)


if __name__ == "__main__":
    unittest.main()
