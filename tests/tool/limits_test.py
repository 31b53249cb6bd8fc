"""The limits on the time and the memory that reading may take."""

import os
import signal
import subprocess
import time
import unittest

from tool.processes import BUSY, ProtectionCase, is_running


class TimeLimitTest(ProtectionCase):
    def test_a_library_that_does_not_return_is_given_up(self):
        process, worker = self.converting("--time-limit", "0.5")
        os.kill(worker, signal.SIGSTOP)  # as if it did not return
        self.assertRegex(self.error_of(process), "^ambrix: ambrix:timeLimitReached: busy.cdf: nothing "
                         'was read for 0.5 seconds while reading [^;]*; .*--time-limit')
        self.assertFalse(is_running(worker))
        self.assert_nothing_left()

    def test_work_that_goes_on_may_take_any_time(self):
        process, worker = self.converting("--time-limit", "5")
        for _ in range(4):
            os.kill(worker, signal.SIGSTOP)
            time.sleep(1.4)
            os.kill(worker, signal.SIGCONT)
            time.sleep(0.6)  # long enough for a new step on a busy machine
        self.assertIsNone(process.poll())

    def test_time_that_the_reader_takes_does_not_count(self):
        process = self.start("dump", BUSY, "v", "--records", "0", "--format", "csv",
                             "--time-limit", "3", stdout=subprocess.PIPE)
        process.stdout.read(1)
        time.sleep(4)
        lines = process.stdout.read().count(b"\n")
        process.stdout.close()
        self.assertEqual((process.wait(), lines), (0, 1_000_001))

    def test_no_limit(self):
        process, worker = self.converting("--time-limit", "0")
        os.kill(worker, signal.SIGSTOP)
        with self.assertRaises(subprocess.TimeoutExpired):
            process.wait(0.5)

    def test_limits_that_are_none(self):
        for limit in ("-1", "x", ""):
            self.assert_misused("info", BUSY, "--time-limit", limit)


class MemoryLimitTest(ProtectionCase):
    def test_a_worker_that_takes_too_much_is_given_up(self):
        self.skip_with_sanitizer()
        process = self.start("dump", BUSY, "v", "--output", "out.csv", "--memory-limit", "16MB")
        self.assertRegex(self.error_of(process), r"(?m)^ambrix: (TOLVEX:host|ambrix):outOfMemory: "
                         r"busy\.cdf: .*--memory-limit .*may allow more$")
        self.assert_nothing_left()

    def test_the_limit_is_that_of_the_process_that_reads(self):
        for options, limit in ((("--memory-limit", "5GB"), 5 << 30), ((), None)):
            process, worker = self.converting(*options)
            with open(f"/proc/{worker}/limits", encoding="ascii") as limits:
                line = next(line for line in limits if line.startswith("Max address space"))
            if limit is None:
                limit = os.sysconf("SC_PHYS_PAGES") // 4 * 3 * os.sysconf("SC_PAGESIZE")
            if line.split()[3] == "unlimited":
                self.skipTest("the sanitizer needs all of the address space")
            self.assertEqual(int(line.split()[3]), limit)
            process.kill()
            process.wait()
            for path in self.unfinished():
                os.remove(path)

    def test_limits_that_are_none(self):
        for limit in ("-1", "x", ""):
            self.assert_misused("info", BUSY, "--memory-limit", limit)


if __name__ == "__main__":
    unittest.main()
