"""Where output goes: files that appear when they are complete, full disks."""

import errno
import json
import os
import resource
import subprocess
import unittest

from support.ambrix_session import array
from tool.example_file import write_example
from tool.processes import BUSY, ProtectionCase


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


if __name__ == "__main__":
    unittest.main()
