"""What the tests of the tool share."""

import os
import subprocess
import tempfile
import unittest
from unittest import mock

from support.ambrix_session import Session

TOOL = os.environ["AMBRIX_TOOL"]
SAMPLES = os.environ.get("AMBRIX_CDF_SAMPLES", "")


def sample(name):
    """A sample file of the CDF distribution; the test is skipped where there is none."""
    path = os.path.join(SAMPLES, name)
    if not SAMPLES or not os.path.exists(path):
        raise unittest.SkipTest(f"no sample file {name} of the CDF distribution")
    return path


def has_sanitizer():
    """Whether the tool is built with the address sanitizer, which keeps memory that was freed."""
    linked = subprocess.run(["ldd", TOOL], capture_output=True, text=True, check=True).stdout
    return "libasan" in linked


class ToolCase(unittest.TestCase):
    """Runs the tool in a folder of its own."""

    def setUp(self):
        self.folder = self.new_folder()
        # A tool that is killed leaves its folder for scratch files.
        environment = mock.patch.dict(os.environ, TMPDIR=self.new_folder())
        environment.start()
        self.addCleanup(environment.stop)

    def skip_with_sanitizer(self):
        if has_sanitizer():
            self.skipTest("the sanitizer needs memory and descriptors of its own")

    def new_folder(self):
        folder = tempfile.TemporaryDirectory(ignore_cleanup_errors=True)
        self.addCleanup(folder.cleanup)
        return folder.name

    def path(self, name):
        return os.path.join(self.folder, name)

    def run_tool(self, *arguments, status=0, **options):
        done = subprocess.run([TOOL, *arguments], capture_output=True,
                              **{"cwd": self.folder, **options})
        self.assertEqual(done.returncode, status, done.stderr)
        return done

    def output(self, *arguments):
        done = self.run_tool(*arguments)
        self.assertEqual(done.stderr, b"")
        return done.stdout.decode()

    def assert_fails(self, identifier, *arguments, status=1):
        """The tool fails with one line on standard error; returns its message."""
        done = self.run_tool(*arguments, status=status)
        self.assertEqual(done.stdout, b"")
        text = done.stderr.decode()
        prefix = f"ambrix: {identifier}: "
        self.assertTrue(text.startswith(prefix), text)
        self.assertTrue(text.endswith("\n"))
        self.assertEqual(text.count("\n"), 1)
        return text[len(prefix):-1]

    def assert_misused(self, *arguments):
        done = self.run_tool(*arguments, status=2)
        self.assertEqual(done.stdout, b"")
        self.assertIn("--help", done.stderr.decode())
        self.assertNotIn("terminate", done.stderr.decode())
        return done.stderr.decode()

    def session(self):
        session = Session(cwd=self.folder)
        self.addCleanup(session.close)
        return session
