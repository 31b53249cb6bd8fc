"""Threads, forks and memory."""
import os
import subprocess
import sys
import textwrap
import threading
import time

import numpy as np
import pytest

from ambrix import commands

READS = 60


@pytest.fixture
def large(folder):
    """A file with 24 MB of doubles that count up."""
    file = commands.create("large")
    commands.createVar(file, "v", "CDF_REAL8", 1, [3000], True, [True])
    values = np.arange(3_000_000.0).reshape((3000, 1000), order="F")
    commands.hyperPutVarData(file, 0, 0, 1000, 1, [0], [3000], [1], values)
    commands.close(file)
    return "large"


def run(program, **settings):
    """Runs a program in a Python of its own. Returns what it prints."""
    done = subprocess.run([sys.executable, "-c", textwrap.dedent(program)], capture_output=True,
                          text=True, timeout=60, env={**os.environ, **settings}, check=False)
    assert done.returncode == 0, done.stderr
    return done.stdout.strip()


@pytest.mark.skipif(not os.path.exists("/proc/self/status"), reason="only Linux tells the peak")
def test_results_and_arguments_are_not_copied(large):
    peak = int(run("""
        from ambrix import commands as c
        def peak():  # of this program's memory, in kilobytes
            lines = open("/proc/self/status").read().split("\\n")
            return next(int(line.split()[1]) for line in lines if line.startswith("VmHWM"))
        file = c.open("large")
        read = lambda n: c.hyperGetVarData(file, 0, 0, n, 1, [0], [3000], [1])
        read(1)
        before = peak()
        values = read(1000)
        c.hyperPutVarData(file, 0, 0, 1000, 1, [0], [3000], [1], values)
        print(peak() - before)
        c.close(file)"""))
    assert 20_000 < peak < 30_000  # once


def test_a_result_outlives_its_file(large):
    file = commands.open(large)
    values = commands.hyperGetVarData(file, 0, 0, 1000, 1, [0], [3000], [1])
    commands.close(file)
    part = values[:, 999]
    del values
    assert part[2999] == 2_999_999


def test_threads_may_call_at_the_same_time(large):
    file = commands.open(large)
    wrong = []

    def read(first):
        for i in range(READS):
            record = (first + i) % 1000
            values = commands.getVarRecordData(file, 0, record)
            if values[0] != 3000 * record or values[-1] != 3000 * record + 2999:
                wrong.append(record)

    threads = [threading.Thread(target=read, args=(100 * i,)) for i in range(6)]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()
    commands.close(file)
    assert wrong == []


def test_other_threads_go_on_while_one_reads(large):
    file = commands.open(large)
    pauses = []
    done = threading.Event()

    def read():
        for _ in range(5):
            commands.hyperGetVarData(file, 0, 0, 1000, 1, [0], [3000], [1])
        done.set()

    reader = threading.Thread(target=read)
    begin = time.perf_counter()
    reader.start()
    while not done.is_set():
        before = time.perf_counter()
        time.sleep(0)
        pauses.append(time.perf_counter() - before)
    reader.join()
    commands.close(file)
    assert len(pauses) > 20  # turns that this thread had meanwhile
    assert max(pauses) < time.perf_counter() - begin


@pytest.mark.skipif(not hasattr(os, "fork"), reason="this system has no fork")
def test_children_made_while_threads_read_can_read(large):
    assert run("""
        import os, sys, threading, warnings
        from ambrix import commands as c
        warnings.simplefilter("ignore")
        file = c.open("large")
        going = True
        def read():
            while going:
                c.getVarRecordData(file, 0, 7)
        threads = [threading.Thread(target=read) for _ in range(3)]
        for thread in threads: thread.start()
        for i in range(15):
            child = os.fork()
            if child == 0:
                again = c.open("large")
                good = c.getVarRecordData(again, 0, i)[0] == 3000 * i
                c.close(again)
                os._exit(0 if good else 1)
            assert os.waitpid(child, 0)[1] == 0
        going = False
        for thread in threads: thread.join()
        c.close(file)
        print("all")""") == "all"


@pytest.mark.skipif(not hasattr(os, "fork"), reason="this system has no fork")
def test_a_child_leaves_the_files_of_its_parent_alone(folder):
    assert run("""
        import os, sys
        from ambrix import commands as c
        file = c.create("parent")
        c.createVar(file, "v", "CDF_INT1", 1, [], True, [])
        size = os.path.getsize("parent.cdf")
        child = os.fork()
        if child == 0:
            sys.exit(0)  # with all that is done at the end
        assert os.waitpid(child, 0)[1] == 0
        assert os.path.getsize("parent.cdf") == size
        c.close(file)
        print("all")""") == "all"


def test_another_library_in_the_loaders_path_is_not_taken(folder):
    (folder / "libcdf.so").write_text("no library")
    assert run("""
        from ambrix import commands as c
        print(len(c.getLibraryVersion()))""", LD_LIBRARY_PATH=str(folder)) == "3"


@pytest.mark.skipif(sys.version_info < (3, 12), reason="such interpreters came with Python 3.12")
def test_another_interpreter_is_refused():
    assert "does not support" in run("""
        try:
            import _interpreters as interpreters
            made = interpreters.create()
            told = interpreters.exec(made, "import ambrix._core")
            print(told.msg)
        except ImportError:
            import _xxsubinterpreters as interpreters
            made = interpreters.create()
            try: interpreters.run_string(made, "import ambrix._core")
            except interpreters.RunFailedError as error: print(error)""")
