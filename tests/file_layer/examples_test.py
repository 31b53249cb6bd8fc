"""The example programs that write and read a file.

usage: examples_test.py WRITE_FILE SHOW_TIMES
"""
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

SHOW, WRITE = sys.argv.pop(), sys.argv.pop()
SHOWN = """\
2024-05-10T12:00:00.000: 1.5 2.5 3.5
2024-05-10T12:00:01.000: 4.5 5.5 6.5
2024-05-10T12:00:02.000: 7.5 8.5 9.5
"""


def run(*command):
    return subprocess.run(command, capture_output=True, text=True, check=False)


class ExamplesTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.file = str(Path(folder.name) / "flux.cdf")

    def test_one_reads_what_the_other_has_written(self):
        done = run(WRITE, self.file)
        self.assertEqual((done.returncode, done.stderr), (0, ""))
        done = run(SHOW, self.file, "Flux")
        self.assertEqual((done.returncode, done.stdout, done.stderr), (0, SHOWN, ""))

    def test_they_tell_what_is_wrong(self):
        run(WRITE, self.file)
        done = run(WRITE, self.file)
        self.assertEqual(done.returncode, 1)
        self.assertIn("write_file: ", done.stderr)
        done = run(SHOW, self.file, "flux")
        self.assertEqual(done.returncode, 1)
        self.assertIn('there is no variable "flux"; the file has "Epoch", "Flux"', done.stderr)
        self.assertEqual(run(SHOW, self.file).returncode, 2)
        self.assertEqual(run(WRITE).returncode, 2)


if __name__ == "__main__":
    unittest.main()
