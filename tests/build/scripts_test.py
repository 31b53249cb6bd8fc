"""The scripts configure a build anew when the environment names another CDF library, and only then.
They install nothing for a purpose that they do not know.
"""
import os
import pathlib
import shutil
import subprocess
import tempfile
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
FAKE_CMAKE = """#!/bin/sh
[ "$CDF_ROOT" != /wrong ] || exit 1
mkdir -p build/release
touch build/release/build.ninja
echo "CMAKE_HOME_DIRECTORY:INTERNAL=$PWD" >build/release/CMakeCache.txt
"""


class LibraryTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name).resolve()
        (self.folder / "script").mkdir()
        shutil.copy(ROOT / "script" / "lib.sh", self.folder / "script")
        cmake = self.folder / "bin" / "cmake"
        cmake.parent.mkdir()
        cmake.write_text(FAKE_CMAKE)
        cmake.chmod(0o755)

    def succeeds(self, command, **library):
        environment = {name: value for name, value in os.environ.items()
                       if not name.startswith("CDF_")}
        environment["PATH"] = f"{self.folder / 'bin'}:{environment['PATH']}"
        done = subprocess.run(["bash", "-c", f"set -euo pipefail; source script/lib.sh; {command}"],
                              cwd=self.folder, env=environment | library, capture_output=True)
        self.assertEqual(done.stderr, b"")
        return done.returncode == 0

    def configure(self, **library):
        return self.succeeds("configure release || exit 1", **library)

    def configured(self, **library):
        return self.succeeds("configured release", **library)

    def test_without_a_named_library(self):
        self.assertFalse(self.configured())
        self.assertTrue(self.configure())
        self.assertTrue(self.configured())

    def test_the_named_library_is_used_from_then_on(self):
        self.configure()
        for library in ({"CDF_ROOT": "/a"}, {"CDF_BASE": "/b"},
                        {"CDF_INC": "/c/include", "CDF_LIB": "/c/lib"}):
            self.assertFalse(self.configured(**library))
            self.assertTrue(self.configure(**library))
            self.assertTrue(self.configured(**library))
            self.assertTrue(self.configured())

    def test_half_a_name_is_none(self):
        self.configure()
        self.assertTrue(self.configured(CDF_INC="/c/include"))

    def test_a_library_that_could_not_be_used_is_refused_again(self):
        self.configure()
        for _ in range(2):
            self.assertFalse(self.configured(CDF_ROOT="/wrong"))
            self.assertFalse(self.configure(CDF_ROOT="/wrong"))
        self.assertTrue(self.configured())


class BootstrapTest(unittest.TestCase):
    def test_an_unknown_purpose_installs_nothing(self):
        with tempfile.TemporaryDirectory() as folder:
            for name in ("apt-get", "dpkg-query", "sudo"):
                program = pathlib.Path(folder) / name
                program.write_text(f"#!/bin/sh\ntouch '{folder}/called'\n")
                program.chmod(0o755)
            done = subprocess.run([ROOT / "script" / "bootstrap", "nonsense"], capture_output=True,
                                  env=os.environ | {"PATH": f"{folder}:{os.environ['PATH']}"})
            self.assertEqual(done.returncode, 1)
            self.assertIn(b"unknown purpose 'nonsense'", done.stderr)
            self.assertFalse((pathlib.Path(folder) / "called").exists())


if __name__ == "__main__":
    unittest.main()
