"""What users see when the process that reads a file crashes."""

import itertools
import os
import resource
import signal
import struct
import subprocess
import unittest

from tool.example_file import write_example
from tool.processes import BUSY, ProtectionCase, children_of, wait_until
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


if __name__ == "__main__":
    unittest.main()
