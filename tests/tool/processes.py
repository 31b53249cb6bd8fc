"""The processes of the tool, and a file that keeps them busy."""

import os
import time

from support.ambrix_session import array


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
