"""Columns of the benchmark: programs that do the workloads. Each is a process that says "ready",
then answers the name of a workload with the seconds that one round took."""

import os
import pathlib
import shutil
import subprocess
import sys

HERE = pathlib.Path(__file__).resolve().parent


class Column:
    """A running program. It is started when it is first asked, and stopped between sittings, so
    that no result depends on where one process happens to have its memory."""

    def __init__(self, name, command, workloads=None):
        self.name = name
        self.command = [str(word) for word in command]
        self.workloads = workloads  # None: all that it is asked for
        self.process = None

    def does(self, workload):
        return self.workloads is None or workload in self.workloads

    def run(self, workload):
        if self.process is None:
            self._start()
        self.process.stdin.write(workload + "\n")
        self.process.stdin.flush()
        return float(self._answer())

    def stop(self):
        if self.process is None:
            return
        self.process.stdin.close()
        self.process.wait()
        self.process.stdout.close()
        self.process = None

    def _start(self):
        environment = {name: value for name, value in os.environ.items()
                       if not name.startswith("CDF_")}
        self.process = subprocess.Popen(self.command, stdin=subprocess.PIPE, text=True,
                                        stdout=subprocess.PIPE, env=environment)
        if self._answer() != "ready":
            raise RuntimeError(f"{self.command[0]} does not work")

    def _answer(self):
        line = self.process.stdout.readline()
        if not line:
            raise RuntimeError(f"{' '.join(self.command)} has ended")
        return line.strip()


def native(build, name, folder, divisor, workloads):
    return Column(name, [build / "bench-bin" / f"bench_{name}", folder, divisor], workloads)


def octave(build, folder, divisor, workloads):
    """Octave with the module, when both are there."""
    program = shutil.which("octave-cli")
    module = build / "octave" / "__ambrix__.oct"
    if not program or not module.exists():
        return None
    return Column("octave", [program, "--norc", "--no-history", "--quiet", HERE / "octave_column.m",
                             module.parent, folder, divisor], workloads)


def peers(folder, divisor, workloads):
    """The other readers that this Python has."""
    found = []
    for package in ("spacepy", "pycdfpp", "cdflib"):
        command = [sys.executable, HERE / "peer_column.py", package, folder, divisor]
        known = subprocess.run([*map(str, command), "--list"], capture_output=True, text=True,
                               check=False)
        if known.returncode == 0:
            common = set(known.stdout.split()) & set(workloads)
            found.append(Column(package, command, common))
    return found
