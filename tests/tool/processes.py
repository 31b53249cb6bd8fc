"""The processes of the tool, and a file that keeps them busy."""

import glob
import os
import subprocess
import time

from support.ambrix_session import array
from tool.support import TOOL, ToolCase

BUSY = "busy.cdf"  # small, and still takes hours to be read


def children_of(pid):
    """The children of a process that are still alive."""
    found = []
    for name in filter(str.isdigit, os.listdir("/proc")):
        try:
            with open(f"/proc/{name}/stat", "rb") as file:
                fields = file.read().rpartition(b")")[2].split()
        except OSError:
            continue
        if int(fields[1]) == pid and fields[0] not in b"ZX":
            found.append(int(name))
    return found


def write_busy(session, name):
    """A file whose records, but for the first and the last, have the pad value and no place."""
    (file,) = session.call("create", name)
    session.call("createVar", file, "v", 45, 1, [1000, 1000], True, [True, True])
    session.call("setVarSparseRecords", file, 0, session.constant("PAD_SPARSERECORDS"))
    for record in (0, 1 << 20):
        session.call("putVarData", file, 0, record, [0, 0], array("double", [1.5]))
    session.call("close", file)


def wait_until(condition):
    deadline = time.monotonic() + 60
    while not (result := condition()):
        if time.monotonic() > deadline:
            raise TimeoutError(condition)
        time.sleep(0.002)
    return result


def is_running(pid):
    try:
        with open(f"/proc/{pid}/stat", "rb") as file:
            return file.read().rpartition(b")")[2].split()[0] not in b"ZX"
    except OSError:
        return False


class ProtectionCase(ToolCase):
    def setUp(self):
        super().setUp()
        write_busy(self.session(), BUSY)

    def start(self, *arguments, **options):
        process = subprocess.Popen([TOOL, *arguments], cwd=self.folder, stderr=subprocess.PIPE,
                                   **options)
        self.addCleanup(process.stderr.close)
        self.addCleanup(process.wait)
        self.addCleanup(process.kill)
        return process

    def converting(self, *options):
        """A conversion that has begun to write, and its worker."""
        process = self.start("convert", BUSY, "out.cdf", "--majority", "column", *options)
        wait_until(self.unfinished)
        return process, wait_until(lambda: children_of(process.pid))[0]

    def dumping(self, *options):
        """A dump into a file, and its worker."""
        process = self.start("dump", BUSY, "v", "--format", "csv", "--output", "out.csv", *options)
        wait_until(lambda: any(os.path.getsize(path) > 0 for path in self.unfinished()))
        return process, wait_until(lambda: children_of(process.pid))[0]

    def unfinished(self):
        """The paths of outputs that are being written."""
        return glob.glob(self.path(".ambrix-*/unfinished*"))

    def files(self):
        return sorted(os.listdir(self.folder))

    def error_of(self, process):
        self.assertEqual(process.wait(), 1)
        return process.stderr.read().decode()

    def assert_nothing_left(self):
        self.assertEqual(self.files(), [BUSY])
