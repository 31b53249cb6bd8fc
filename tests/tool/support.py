"""What the tests of the tool share."""

import os
import subprocess
import tempfile
import unittest
from unittest import mock

from support.ambrix_session import Session, array

TOOL = os.environ["AMBRIX_TOOL"]
SAMPLES = os.environ.get("AMBRIX_CDF_SAMPLES", "")
# Of `write_times`: a fill and a pad value, the middle of a leap second, a time before 1972.
TIMES = [-2**63, -2**63 + 1, 536500868684000001, -1090234640957376994]
TIME_TEXTS = ["2016-12-31T23:59:60.500000001", "1965-06-15T01:02:03.004005006"]
INTEGERS = [2**63 - 1, -2**63, 9007199254740993, 0]
PAD = -9007199254740993


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

    def write_times(self, name="times", compressed=False):
        """A file with variables of the extended datatypes and their entries."""
        times = TIMES + list(range(1000)) if compressed else TIMES  # few do not become smaller
        with self.session("--extended") as session:
            call = session.call
            (file,) = call("create", name)
            call("createVar", file, "Epoch", 33, 1, [], True, [])
            if compressed:
                call("setVarCompression", file, 0, session.constant("GZIP_COMPRESSION"), 6)
            call("hyperPutVarData", file, 0, 0, len(times), 1, [], [], [], array("int64", times))
            call("createVar", file, "count", 8, 1, [2], True, [True])
            call("setVarPadValue", file, 1, array("int64", [PAD]))
            call("hyperPutVarData", file, 1, 0, 2, 1, [0], [2], [1], array("int64", INTEGERS))
            call("createAttr", file, "VALIDMAX", 2)
            call("putAttrEntry", file, 0, 0, 33, array("int64", TIMES[2:3]))
            call("putAttrEntry", file, 0, 1, 8, array("int64", INTEGERS))
            call("close", file)

    def session(self, *options):
        session = Session(options=options, cwd=self.folder)
        self.addCleanup(session.close)
        return session
