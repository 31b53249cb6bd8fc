"""Signals, and readers that go away."""

import os
import signal
import subprocess
import unittest

from tool.processes import BUSY, ProtectionCase, children_of, is_running, wait_until


class SignalTest(ProtectionCase):
    def test_the_tool_ends_by_the_signal_and_leaves_nothing(self):
        for begin in (self.converting, self.dumping):
            for number in (signal.SIGINT, signal.SIGTERM, signal.SIGHUP, signal.SIGQUIT,
                           signal.SIGUSR1, signal.SIGUSR2, signal.SIGALRM, signal.SIGVTALRM,
                           signal.SIGPROF, signal.SIGXCPU, signal.SIGIO, signal.SIGRTMIN):
                process, worker = begin()
                process.send_signal(number)
                self.assertEqual(process.wait(), -number)
                self.assertEqual(process.stderr.read(), b"")
                self.assertFalse(os.path.exists(f"/proc/{worker}"))
                self.assert_nothing_left()

    def test_the_terminal_signals_all_processes(self):
        process = self.start("convert", BUSY, "out.cdf", "--majority", "column",
                             start_new_session=True)
        wait_until(lambda: len(self.files()) > 1)
        os.killpg(process.pid, signal.SIGINT)
        self.assertEqual(process.wait(), -signal.SIGINT)
        self.assert_nothing_left()

    def test_ignored_signals_stay_ignored(self):
        process = self.start(
            "dump", BUSY, "v", "--records", "0", "--format", "csv", "--output", "out.csv",
            preexec_fn=lambda: signal.signal(signal.SIGHUP, signal.SIG_IGN))
        wait_until(lambda: len(self.files()) > 1)
        process.send_signal(signal.SIGHUP)
        self.assertEqual(process.wait(), 0)
        self.assertEqual(self.files(), [BUSY, "out.csv"])

    def test_the_worker_does_not_outlive_the_tool(self):
        process, worker = self.converting()
        process.kill()
        self.assertEqual(process.wait(), -signal.SIGKILL)
        wait_until(lambda: worker not in children_of(1) and not is_running(worker))
        self.assertEqual([os.path.basename(path) for path in self.unfinished()],
                         ["unfinished.cdf"])  # nobody could remove it

    def test_a_reader_that_goes_away(self):
        process = self.start("dump", BUSY, "v", "--format", "csv", stdout=subprocess.PIPE)
        process.stdout.read(1)
        process.stdout.close()
        self.assertEqual((process.wait(), process.stderr.read()), (0, b""))


if __name__ == "__main__":
    unittest.main()
