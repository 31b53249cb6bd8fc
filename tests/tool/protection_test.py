"""What happens to the tool, its output and its users when the process that reads a file fails."""

import errno
import json
import itertools
import os
import resource
import signal
import struct
import subprocess
import time
import unittest

from support.ambrix_session import array
from tool.example_file import write_example
from tool.processes import BUSY, ProtectionCase, children_of, is_running, wait_until
from tool.support import ToolCase

CRASHES = (signal.SIGSEGV, signal.SIGABRT, signal.SIGBUS, signal.SIGFPE)


class CrashTest(ProtectionCase):
    def test_it_is_an_ordinary_error(self):
        for number in CRASHES:
            process, worker = self.converting()
            os.kill(worker, number)
            text = self.error_of(process)
            self.assertRegex(text, r"(?m)^ambrix: ambrix:libraryCrashed: busy\.cdf: the CDF library "
                             r".* while reading [^;]*; .*'ambrix check'")
            self.assert_nothing_left()

    def test_the_output_of_dump_appears_only_when_it_is_complete(self):
        process, worker = self.dumping()
        os.kill(worker, signal.SIGABRT)
        self.assertIn('while reading variable "v"', self.error_of(process))
        self.assert_nothing_left()

    def test_json_on_standard_output_breaks_off(self):
        process = self.start("dump", BUSY, "v", "--format", "json", stdout=subprocess.PIPE)
        process.stdout.read(1)
        os.kill(children_of(process.pid)[0], signal.SIGABRT)
        self.assertNotIn(b"]}", process.stdout.read())
        process.stdout.close()
        self.assertIn("ambrix:libraryCrashed", self.error_of(process))

    def test_no_core_file_is_written(self):
        resource_limit = (resource.RLIM_INFINITY, resource.RLIM_INFINITY)
        process = self.start(
            "convert", BUSY, "out.cdf", "--majority", "column",
            preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_CORE, resource_limit))
        worker = wait_until(lambda: children_of(process.pid))[0]
        wait_until(lambda: len(self.files()) > 1)
        with open(f"/proc/{worker}/limits", encoding="ascii") as limits:
            self.assertRegex(limits.read(), r"Max core file size +0 +0 ")

    def test_one_that_was_killed_is_no_damage(self):
        process, worker = self.converting()
        os.kill(worker, signal.SIGKILL)
        self.assertIn("ambrix:killed: busy.cdf: ", self.error_of(process))
        self.assert_nothing_left()


class DamagedFileTest(ToolCase):
    """Files whose damage is in the code of their compression, which validation does not see."""

    def setUp(self):
        super().setUp()
        write_example(self.session(), "example", "ROW_MAJOR")
        self.run_tool("convert", "example.cdf", "huff.cdf", "--compression", "huff")
        with open(self.path("huff.cdf"), "rb") as file:
            self.sound = file.read()

    def damage(self, place, word):
        content = bytearray(self.sound)
        content[place:place + 4] = struct.pack(">I", word)
        with open(self.path("huff.cdf"), "wb") as file:
            file.write(content)

    def errors_of(self, *arguments):
        done = self.run_tool(*arguments, status=1)
        return (done.stdout + done.stderr).decode(errors="replace")

    def test_each_command_survives(self):
        errors = []
        for place, word in itertools.product((60, 72, 80), (0, 1000, 0x7FFFFFFF)):
            self.damage(place, word)
            for arguments in (("info", "huff.cdf"), ("dump", "huff.cdf", "cube"),
                              ("convert", "huff.cdf", "out.cdf"), ("check", "huff.cdf")):
                errors.append(self.errors_of(*arguments))
                self.assertRegex(errors[-1], r"(?m)^(ambrix: |    )(TOLVEX:)?ambrix:\w+")
        self.assertEqual(sorted(os.listdir(self.folder)), ["example.cdf", "huff.cdf"])
        if not any("ambrix:libraryCrashed: " in text for text in errors):
            self.skipTest("this CDF library happens not to crash on such files")


class TimeLimitTest(ProtectionCase):
    def test_a_library_that_does_not_return_is_given_up(self):
        process, worker = self.converting("--time-limit", "0.5")
        os.kill(worker, signal.SIGSTOP)  # as if it did not return
        self.assertRegex(self.error_of(process), "^ambrix: ambrix:timeLimitReached: busy.cdf: nothing "
                         'was read for 0.5 seconds while reading [^;]*; .*--time-limit')
        self.assertFalse(is_running(worker))
        self.assert_nothing_left()

    def test_work_that_goes_on_may_take_any_time(self):
        process, worker = self.converting("--time-limit", "2.5")
        for _ in range(4):
            os.kill(worker, signal.SIGSTOP)
            time.sleep(0.8)
            os.kill(worker, signal.SIGCONT)
            time.sleep(0.2)
        self.assertIsNone(process.poll())

    def test_time_that_the_reader_takes_does_not_count(self):
        process = self.start("dump", BUSY, "v", "--records", "0", "--format", "csv",
                             "--time-limit", "8", stdout=subprocess.PIPE)
        process.stdout.read(1)
        time.sleep(9)
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
        process = self.start("dump", BUSY, "v", "--output", "out.csv", "--memory-limit", "40MB")
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


class FullDiskTest(ProtectionCase):
    def limited(self, *arguments):
        return self.start(*arguments, preexec_fn=lambda: resource.setrlimit(
            resource.RLIMIT_FSIZE, (1 << 20, 1 << 20)))

    def test_convert(self):
        session = self.session()
        (file,) = session.call("create", "large")
        session.call("createVar", file, "v", 45, 1, [1000, 1000], True, [True, True])
        session.call("putVarData", file, 0, 2, [0, 0], array("double", [1.5]))
        session.call("close", file)
        process = self.limited("convert", "large.cdf", "out.cdf", "--majority", "column")
        self.assertIn("TOLVEX:ambrix:cdflib:libraryFailure", self.error_of(process))
        self.assertEqual(self.files(), [BUSY, "large.cdf"])

    def test_dump(self):
        process = self.limited("dump", BUSY, "v", "--format", "csv", "--output", "out.csv")
        self.assertIn("out.csv: " + os.strerror(errno.EFBIG), self.error_of(process))
        self.assert_nothing_left()
        with open("/dev/full", "wb") as full:
            process = self.start("dump", BUSY, "v", "--records", "0", stdout=full)
        self.assertIn("standard output: " + os.strerror(errno.ENOSPC), self.error_of(process))


class TemporaryFileTest(ProtectionCase):
    """What is written before the output has its name."""

    def test_files_of_others_are_left_alone(self):
        process, _ = self.converting()
        foreign = [f".ambrix-{process.pid + i}-unfinished.cdf" for i in range(1, 200)]
        for name in foreign:
            os.symlink("victim", self.path(name))
        process.kill()
        process.wait()
        (unfinished,) = self.unfinished()
        write_example(self.session(), "example", "ROW_MAJOR")
        for name in ("a.cdf", "b.cdf"):
            self.output("convert", "example.cdf", name)
        self.output("dump", "example.cdf", "cube", "--output", "c.txt")
        self.assertFalse(os.path.exists(self.path("victim")))
        self.assertTrue(os.path.exists(unfinished))
        self.assertEqual(self.files(), sorted(
            [BUSY, "a.cdf", "b.cdf", "c.txt", "example.cdf",
             os.path.basename(os.path.dirname(unfinished)), *foreign]))

    def test_tools_with_the_same_number_do_not_meet(self):
        tool = subprocess.list2cmdline([os.environ["AMBRIX_TOOL"]])
        if subprocess.run(["unshare", "--pid", "--fork", "true"], capture_output=True).returncode:
            self.skipTest("no namespaces of process numbers here")
        write_example(self.session(), "example", "ROW_MAJOR")
        command = f"for i in $(seq 8); do {tool} convert example.cdf out$0-$i.cdf || exit 1; done"
        running = [subprocess.Popen(["unshare", "--pid", "--fork", "sh", "-c", command, str(i)],
                                    cwd=self.folder) for i in range(2)]
        self.assertEqual([process.wait() for process in running], [0, 0])
        self.assertEqual(len(self.files()), 2 + 16)

    def test_nobody_else_can_enter_its_folder_and_the_file_is_as_others(self):
        process, _ = self.converting()
        folder = os.path.dirname(self.unfinished()[0])
        self.assertEqual(os.stat(folder).st_mode & 0o777, 0o700)
        process.terminate()
        process.wait()
        mask = os.umask(0o027)
        self.addCleanup(os.umask, mask)
        self.output("dump", BUSY, "v", "--records", "60", "--output", "out.txt")
        self.assertEqual(os.stat(self.path("out.txt")).st_mode & 0o777, 0o640)

    def test_folders_that_cannot_be_written(self):
        if os.geteuid() == 0:
            self.skipTest("everything may be written here")
        os.mkdir(self.path("fixed"), 0o500)
        for command in (("convert", BUSY), ("dump", BUSY, "v", "--output")):
            message = self.assert_fails("ambrix:cannotWrite", *command, "fixed/out.cdf")
            self.assertEqual(message, "fixed: Permission denied")

    def test_a_name_that_is_too_long_is_refused_before_the_work(self):
        message = self.assert_fails("ambrix:cannotWrite", "dump", BUSY, "v", "--output", "x" * 300)
        self.assertIn(os.strerror(errno.ENAMETOOLONG), message)


class OutputTest(ProtectionCase):
    def test_dump_into_a_file_is_what_it_prints(self):
        write_example(self.session(), "example", "ROW_MAJOR")
        for variable in ("cube", "texts", "fine"):
            for form in ("table", "csv", "json"):
                arguments = ("dump", "example.cdf", variable, "--format", form)
                printed = self.run_tool(*arguments).stdout
                self.assertEqual(self.output(*arguments, "--output", "out"), "")
                with open(self.path("out"), "rb") as file:
                    self.assertEqual(file.read(), printed)
                os.remove(self.path("out"))

    def test_the_format_is_what_the_name_of_the_file_ends_with(self):
        write_example(self.session(), "example", "ROW_MAJOR")
        for name, form in (("out.csv", "csv"), ("out.json", "json"), ("out.txt", "table"),
                           ("out", "table"), ("json", "table")):
            with self.subTest(name):
                printed = self.output("dump", "example.cdf", "cube", "--format", form)
                self.output("dump", "example.cdf", "cube", "--output", name)
                with open(self.path(name), encoding="utf-8") as file:
                    self.assertEqual(file.read(), printed)
        self.output("dump", "example.cdf", "cube", "--format", "json", "--output", "other.csv")
        with open(self.path("other.csv"), encoding="utf-8") as file:
            json.load(file)

    def test_no_file_is_overwritten(self):
        message = self.assert_fails("ambrix:outputExists", "dump", BUSY, "v", "--output", BUSY)
        self.assertIn(BUSY, message)
        self.assert_fails("ambrix:noSuchFolder", "dump", BUSY, "v", "--output", "no/such.txt")
        self.assert_misused("dump", BUSY, "v", "--output", "")
        self.assert_misused("convert", BUSY, "")
        self.assert_fails("ambrix:noSuchVariable", "dump", BUSY, "w", "--output", "out.txt")
        self.assert_nothing_left()

    def test_other_folders(self):
        os.mkdir(self.path("d\u00e9j\u00e0"))
        out = os.path.join("d\u00e9j\u00e0", "\u6f22.csv")
        self.assertEqual(self.output("dump", BUSY, "v", "--records", "60", "--output", out), "")
        self.assertEqual(os.listdir(self.path("d\u00e9j\u00e0")), ["\u6f22.csv"])


if __name__ == "__main__":
    unittest.main()
