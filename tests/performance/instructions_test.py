"""usage: instructions_test.py PROGRAMS VALGRIND COMPILER CDF_VERSION BUILD_TYPE [--update]

Counts the instructions of calls, which do not depend on the machine's other work, and compares them
with those in instructions.json. A count is of one call: the difference between two runs, of which
one makes a known number of calls more. With --update the counts found become the expected ones."""

import json
import os
import pathlib
import re
import subprocess
import sys
import tempfile
import unittest

EXPECTED = pathlib.Path(__file__).with_name("instructions.json")
SKIPPED = 77
FEWER, MORE = 2000, 1000  # divisors of the work: the second does twice as much

# What a workload does so many times with a divisor of 1.
AMOUNTS = {"get_constant": 20_000, "unknown_command": 20_000, "refused_argument": 20_000,
           "library_failure": 20_000, "read_values": 100_000, "read_values_hyper": 100_000,
           "widen": 20_000_000, "narrow": 20_000_000, "epoch_compute": 1_000_000,
           "epoch_breakdown": 1_000_000}


def instructions(valgrind, program, folder, divisor, workload):
    environment = {name: value for name, value in os.environ.items()
                   if not name.startswith("CDF_")}
    run = subprocess.run(
        [valgrind, "--tool=callgrind", "--callgrind-out-file=/dev/null", program, folder,
         str(divisor), workload], capture_output=True, text=True, env=environment, check=False)
    found = re.search(r"Collected : (\d+)", run.stderr)
    if run.returncode != 0 or not found:
        raise RuntimeError(f"{workload} could not be counted: {run.stderr}")
    return int(found.group(1))


def count_all(programs, valgrind):
    counts = {}
    with tempfile.TemporaryDirectory() as folder:
        subprocess.run([programs / "bench_library", folder, str(MORE), "prepare"], check=True,
                       stdout=subprocess.DEVNULL)
        for workload, amount in AMOUNTS.items():
            runs = [instructions(valgrind, programs / "bench_module", folder, divisor, workload)
                    for divisor in (FEWER, MORE)]
            counts[workload] = round((runs[1] - runs[0]) / (amount // MORE - amount // FEWER), 2)
    return counts


class InstructionCounts(unittest.TestCase):
    def test_no_call_takes_more_or_far_fewer_than_expected(self):
        for workload, expected in EXPECTATION["counts"].items():
            with self.subTest(workload):
                found = COUNTS[workload]
                change = found / expected - 1
                self.assertLessEqual(
                    abs(change), TOLERANCE,
                    f"\n{workload}: {found} instructions, expected {expected} ({change:+.1%}). If "
                    "that is as it should be, run the command of this test (ctest -V -R "
                    "instruction_counts shows it) with --update behind it.")

    def test_everything_that_is_counted_is_expected(self):
        self.assertEqual(set(COUNTS), set(EXPECTATION["counts"]))


if __name__ == "__main__":
    update = "--update" in sys.argv
    programs, valgrind, compiler, library, build_type = sys.argv[1:6]
    if not pathlib.Path(valgrind).exists():
        print("valgrind was not found (script/bootstrap ci installs it): nothing is counted")
        sys.exit(SKIPPED)
    EXPECTATION = json.loads(EXPECTED.read_text()) if EXPECTED.exists() else {}
    here = {"compiler": compiler, "library": library, "build": build_type}
    if not update and EXPECTATION["counted_with"]["build"] != build_type:
        print(f"the counts are those of {EXPECTATION['counted_with']}, not of {here}")
        sys.exit(SKIPPED)
    COUNTS = count_all(pathlib.Path(programs), valgrind)
    print(json.dumps(COUNTS, indent=1))
    if update:
        content = {"counted_with": here, "counts": COUNTS}
        EXPECTED.write_text(json.dumps(content, indent=1) + "\n")
        sys.exit(0)
    # Another compiler or library makes other code of the same; a call that got twice as dear still
    # shows.
    TOLERANCE = 0.08 if EXPECTATION["counted_with"] == here else 0.6
    unittest.main(argv=sys.argv[:1])
