"""The package passes mypy's strict checks, and its stubs find wrong arguments."""
import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

PACKAGE = next(pathlib.Path(path) for path in os.environ["PYTHONPATH"].split(os.pathsep)
               if (pathlib.Path(path) / "ambrix").is_dir())
WRONG = {
    "commands.getVarName(1)": "Missing positional argument",
    "commands.getVarName('a', 1)": "incompatible type",
    "commands.getVarName(1, 1) + 1": "Unsupported operand types",
    "commands.setCompression(1, None)": "incompatible type",
    "commands.putVarData(1, 2, 3, 'x', data=1, more=2)": "Unexpected keyword argument",
    "ambrix.open(3)": "incompatible type",
    "ambrix.open('a')[0]": "Invalid index type",
    "commands.noSuchCommand()": "has no attribute",
}
RIGHT = """
import numpy as np
import ambrix
from ambrix import Error, commands
with ambrix.open("a") as opened:
    variable: ambrix.Variable = opened["b"]
    size: int = variable.shape[0] + len(opened)
    values = np.asarray(variable)
    variable.raw.read((0, slice(2, 4)), out=values)
file: int = commands.open("a")
name, datatype, elements, sizes, varies, variances = commands.inquireVar(file, 0)
count: int = sizes[0] + elements
commands.setMajority(file, "ROW_MAJOR")
commands.setCompression(file, "GZIP_COMPRESSION", 6)
commands.hyperPutVarData(file, 0, 0, 1, 1, [], [], [], np.zeros(3))
try:
    commands.close(file)
except Error as error:
    text: str = error.identifier
"""


class TypesTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)

    def mypy(self, *arguments):
        done = subprocess.run([sys.executable, "-m", "mypy", "--strict", "--cache-dir",
                               self.folder / "cache", *arguments], cwd=self.folder,
                              capture_output=True, text=True, check=False)
        return done.returncode, done.stdout + done.stderr

    def test_the_package_and_what_uses_it_well_pass(self):
        (self.folder / "right.py").write_text(RIGHT)
        package = PACKAGE / "ambrix"
        sources = [path for path in package.glob("*.py") if not (path.with_suffix(".pyi")).exists()]
        stubs = list(package.glob("*.pyi"))
        status, told = self.mypy("right.py", *sources, *stubs)
        self.assertEqual(status, 0, told)

    def test_wrong_arguments_are_found(self):
        lines = ["import ambrix; from ambrix import commands", *WRONG]
        (self.folder / "wrong.py").write_text("\n".join(lines) + "\n")
        _, told = self.mypy("wrong.py")
        for number, text in enumerate(WRONG.values(), 2):
            found = [line for line in told.split("\n") if line.startswith(f"wrong.py:{number}:")]
            self.assertTrue(any(text in line for line in found), (text, told))


if __name__ == "__main__":
    unittest.main()
