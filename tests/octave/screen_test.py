"""Plots over time have their lines, cells and axes where they belong, on the screen and printed.

Graphics cards count in single precision, where times in days since the year 0 lie minutes apart:
only a picture shows whether a plot has them. The screen is a virtual one, drawn by Mesa.
"""

import os
import shutil
import subprocess
import tempfile
import unittest
from pathlib import Path

SCRIPT = Path(__file__).with_name("check_pictures.m")
SAMPLES = Path(os.environ.get("AMBRIX_CDF_SAMPLES", ""))
NO_TOOLKIT = 77


def start_screen():
    """A virtual screen of this test's own, and its name."""
    server = subprocess.Popen(
        ["Xvfb", "-displayfd", "1", "-screen", "0", "1280x1024x24", "-nolisten", "tcp"],
        stdout=subprocess.PIPE, stderr=subprocess.DEVNULL)
    number = server.stdout.readline().decode().strip()
    return server, f":{number}"


@unittest.skipUnless((SAMPLES / "geocpi0.cdf").is_file(), "the CDF library's samples are missing")
class ScreenTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = Path(folder.name)
        shutil.copy(SAMPLES / "geocpi0.cdf", self.folder)

    def check(self, octave, toolkit, **environment):
        done = subprocess.run(
            [octave, "--norc", "--no-history", "--path", os.environ["AMBRIX_OCTAVE"], str(SCRIPT),
             toolkit, str(self.folder)],
            cwd=self.folder, env={**os.environ, **environment}, stdout=subprocess.PIPE,
            stderr=subprocess.STDOUT, check=False, timeout=300)
        if done.returncode == NO_TOOLKIT:
            self.skipTest(f"this Octave has no graphics toolkit {toolkit}")
        self.assertEqual(done.returncode, 0, done.stdout.decode())
        for name in ("lines.png", "cells.png"):
            self.assertGreater((self.folder / name).stat().st_size, 5000)

    def test_plots_over_time_in_qt(self):
        for program, package in (("Xvfb", "xvfb"), ("octave", "octave")):
            if not shutil.which(program):
                self.skipTest(f"there is no {program} here; the package {package} has it")
        server, display = start_screen()
        try:
            self.check("octave", "qt", DISPLAY=display, LIBGL_ALWAYS_SOFTWARE="1",
                       XDG_RUNTIME_DIR=str(self.folder))
        finally:
            server.terminate()
            server.wait()
            server.stdout.close()

    def test_plots_over_time_in_gnuplot(self):
        self.check(os.environ["AMBRIX_OCTAVE_CLI"], "gnuplot")


if __name__ == "__main__":
    unittest.main()
