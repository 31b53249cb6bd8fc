"""What `script/run` has built is all that an installation takes from the build."""

import re
import shutil
import tempfile
import unittest
from pathlib import Path

from install.tree import BUILD, CMAKE, FILES, SOURCE, run

# In place of compiler and linker: what it makes is a program that does nothing.
PRETENDER = """#!/bin/sh
while [ "$1" != -o ]; do shift; done
echo '#!/bin/sh' >"$2"
chmod +x "$2"
"""


def library_settings():
    """What names the CDF library of the build that is tested, which need not be fetched then."""
    cache = (BUILD / "CMakeCache.txt").read_text()
    return [f"-D{found[0]}" for found in re.finditer("^(AMBRIX_CDF|CDF_ROOT):.*", cache, re.M)]


class RunTest(unittest.TestCase):
    def setUp(self):
        self.folder = Path(tempfile.mkdtemp(prefix="ambrix-run-"))
        self.addCleanup(shutil.rmtree, self.folder)
        self.tree = self.folder / "tree"
        shutil.copytree(SOURCE, self.tree,
                        ignore=shutil.ignore_patterns("build", ".git", "__pycache__"))
        (self.tree / "build").mkdir()
        if (SOURCE / "build/cdf").exists():
            (self.tree / "build/cdf").symlink_to(SOURCE / "build/cdf")

    def configure(self):
        pretender = self.folder / "pretender"
        pretender.write_text(PRETENDER)
        pretender.chmod(0o755)
        launchers = [f"-DCMAKE_{language}_{stage}_LAUNCHER={pretender}"
                     for language in ("C", "CXX") for stage in ("COMPILER", "LINKER")]
        run("bash", "-c", 'source script/lib.sh; configure release "$@"', "bash", *launchers,
            *library_settings(), folder=self.tree)

    def test_can_be_installed(self):
        self.configure()
        run(self.tree / "script/run", "--version")
        prefix = self.folder / "prefix"
        run(CMAKE, "--install", self.tree / "build/release", "--prefix", prefix)
        self.assertEqual([name for name in FILES if not (prefix / name).is_file()], [])


if __name__ == "__main__":
    unittest.main()
