"""Two modules answer the same calls alike: one whose host offers no extension, and one without any.

usage: plain_test.py PROGRAM PROGRAM CALLS
"""
import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

CALLS = int(sys.argv.pop())
PROGRAMS = [pathlib.Path(sys.argv.pop()) for _ in range(2)]
SEED = 7  # another one than the fuzzer has by itself


def answers(program):
    """A line for each call."""
    with tempfile.TemporaryDirectory() as folder:
        environment = dict(os.environ)
        if "scripted" in program.name:  # this library leaves results unwritten: they get one content
            environment |= {"MALLOC_PERTURB_": "90",
                            "GLIBC_TUNABLES": "glibc.malloc.tcache_count=0"}
        # The CDF library gives the memory of a closed file to another, and so its identifier: the
        # programs use their memory alike if they have the same name, too.
        done = subprocess.run(
            ["program", "--calls", str(CALLS), "--seed", str(SEED), "--transcript",
             pathlib.Path(folder) / "part"], capture_output=True, text=True, check=False,
            env=environment, executable=program)
        if done.returncode != 0:
            raise AssertionError(done.stdout + done.stderr)
        parts = sorted(pathlib.Path(folder).iterdir(), key=lambda part: int(part.suffix[1:]))
        return b"".join(part.read_bytes() for part in parts).splitlines()


class PlainTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.answers = [answers(program) for program in PROGRAMS]

    def test_each_call_has_the_same_answer(self):
        first, second = self.answers
        self.assertGreaterEqual(len(first), CALLS)
        self.assertEqual(len(first), len(second))
        for number, (one, other) in enumerate(zip(first, second)):
            self.assertEqual(one, other, f"call {number}")

    def test_calls_ask_for_what_the_extension_has(self):
        """Else nothing was compared."""
        text = b"\n".join(self.answers[0])
        for asked in (b'"computeTT2000"', b'"tt2000Breakdown"', b'"CDF_TIME_TT2000"',
                      b"value 8 has no meaning as DATATYPE",
                      b"value 33 has no meaning as DATATYPE"):
            self.assertIn(asked, text)


if __name__ == "__main__":
    unittest.main()
