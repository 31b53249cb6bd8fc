"""`ambrix check`."""

import json
import os
import re
import signal
import struct
import subprocess
import time
import unittest

from support.ambrix_session import array
from tool.example_file import write_example
from tool.processes import children_of, wait_until, write_busy
from tool.support import TOOL, ToolCase, sample

OPEN_ERROR = "TOLVEX:ambrix:cdflib:fileOpenError"


class CheckCase(ToolCase):
    def check(self, *arguments, status=0):
        done = self.run_tool("check", *arguments, status=status)
        self.assertEqual(done.stderr, b"")
        return done.stdout.decode()

    def verdicts(self, *arguments, status=0):
        return json.loads(self.check("--json", *arguments, status=status))

    def write(self, name, content):
        with open(self.path(name), "wb") as file:
            file.write(content)

    def read(self, name):
        with open(self.path(name), "rb") as file:
            return file.read()


class SoundTest(CheckCase):
    def test_sound_files(self):
        for majority in ("ROW_MAJOR", "COLUMN_MAJOR"):
            write_example(self.session(), majority, majority)
        files = ("ROW_MAJOR.cdf", "COLUMN_MAJOR.cdf")
        self.assertEqual(self.check(*files), "ROW_MAJOR.cdf: sound\nCOLUMN_MAJOR.cdf: sound\n")
        self.assertEqual(self.check("--quiet", *files), "")
        self.assertEqual(self.verdicts(*files), [
            {"file": file, "sound": True, "problems": [], "unread": [], "unsupported": [],
             "unlisted": 0}
            for file in files])
        self.assertEqual(self.verdicts("--quiet", *files), [])
        self.assertEqual(self.check("ROW_MAJOR"), "ROW_MAJOR: sound\n")

    def test_every_compression(self):
        write_example(self.session(), "example", "ROW_MAJOR")
        for kind in ("rle", "huff", "ahuff", "gzip:9"):
            self.run_tool("convert", "example.cdf", "out.cdf", "--compression", kind,
                          "--checksum", "md5")
            self.assertEqual(self.check("out.cdf"), "out.cdf: sound\n")
            os.remove(self.path("out.cdf"))

    def test_values_that_are_compressed_twice(self):
        session = self.session()
        (file,) = session.call("create", "zeros")
        session.call("createVar", file, "v", session.constant("CDF_INT1"), 1, [4000000], True,
                     [True])
        session.call("setVarCompression", file, 0, session.constant("GZIP_COMPRESSION"), 9)
        session.call("setVarPadValue", file, 0, array("int8", [0]))
        session.call("putVarData", file, 0, 0, [0], array("int8", [0]))
        session.call("close", file)
        self.run_tool("convert", "zeros.cdf", "twice.cdf", "--compression", "gzip:9")
        self.assertLess(os.path.getsize(self.path("twice.cdf")), 1000)
        self.assertEqual(self.check("twice.cdf"), "twice.cdf: sound\n")

    def test_several_files_that_are_one(self):
        session = self.session()
        (file,) = session.call("create", "parts")
        session.call("setFormat", file, session.constant("MULTI_FILE"))
        session.call("createVar", file, "v", 4, 1, [], True, [])
        session.call("hyperPutVarData", file, 0, 0, 3, 1, [], [], [], array("int32", [1, 2, 3]))
        session.call("close", file)
        self.assertEqual(self.check("parts.cdf"), "parts.cdf: sound\n")
        os.remove(self.path("parts.z0"))
        (verdict,) = self.verdicts("parts.cdf", status=1)
        self.assertIn('variable "v"', [problem["place"] for problem in verdict["problems"]])

    def test_extended_datatypes(self):
        self.write_times()
        self.assertEqual(self.check("times.cdf"), "times.cdf: sound\n")

    def test_files_are_not_changed(self):
        write_example(self.session(), "example", "ROW_MAJOR")
        before = self.read("example.cdf")
        self.check("example.cdf")
        self.assertEqual(self.read("example.cdf"), before)
        self.assertEqual(os.listdir(self.folder), ["example.cdf"])

    def test_sample_files(self):
        names = [sample(f"{name}.cdf") for name in
                 ("cacsst2", "d103a2x", "example1", "example2", "geocpi0", "ij01r39", "zfia10x")]
        self.assertEqual(self.check("--quiet", *names), "")


class DamageTest(CheckCase):
    def setUp(self):
        super().setUp()
        write_example(self.session(), "example", "ROW_MAJOR")
        self.sound = self.read("example.cdf")

    def test_files_that_the_library_refuses(self):
        self.write("cut.cdf", self.sound[:-100])
        self.write("empty.cdf", b"")
        self.write("text.cdf", b"This is no CDF file.\n" * 100)
        verdicts = self.verdicts("cut.cdf", "empty.cdf", "text.cdf", status=1)
        for verdict in verdicts:
            self.assertFalse(verdict["sound"])
            (problem,) = verdict["problems"]
            self.assertEqual((problem["place"], problem["identifier"]), ("", OPEN_ERROR))
        text = self.check("cut.cdf", "example.cdf", status=1).splitlines()
        self.assertEqual([text[0], text[2]], ["cut.cdf: not sound", "example.cdf: sound"])
        self.assertTrue(text[1].startswith(f"    {OPEN_ERROR}: it is damaged"))
        self.assertEqual(self.check("--quiet", "example.cdf", "cut.cdf", status=1).splitlines(),
                         text[:2])

    def test_a_checksum_that_is_wrong(self):
        self.run_tool("convert", "example.cdf", "sum.cdf", "--checksum", "md5")
        content = bytearray(self.read("sum.cdf"))
        place = content.index(struct.pack("<d", 0.1))
        content[place] ^= 1
        self.write("sum.cdf", content)
        (verdict,) = self.verdicts("sum.cdf", status=1)
        self.assertEqual(verdict["problems"][0]["identifier"], OPEN_ERROR)

    def test_one_variable_of_many(self):
        content = bytearray(self.sound)
        place = content.index(b"\x1f\x8b")  # the compressed values of "cube"
        content[place + 10:place + 40] = bytes(30)
        self.write("bad.cdf", content)
        (verdict,) = self.verdicts("bad.cdf", status=1)
        (problem,) = verdict["problems"]
        self.assertEqual(problem["place"], 'variable "cube"')
        self.assertEqual(problem["identifier"], "TOLVEX:ambrix:cdflib:libraryFailure")
        self.assertIn("CDFhyperGetzVarData", problem["message"])
        self.assertRegex(self.check("bad.cdf", status=1),
                         r'\Abad.cdf: not sound\n    variable "cube": TOLVEX:[^\n]*\n\Z')

    def test_a_damaged_time_axis(self):
        self.write_times(compressed=True)
        content = bytearray(self.read("times.cdf"))
        place = content.index(b"\x1f\x8b")  # the compressed times
        content[place + 10:place + 30] = bytes(20)
        self.write("bad.cdf", content)
        (verdict,) = self.verdicts("bad.cdf", status=1)
        self.assertEqual((verdict["sound"], verdict["unsupported"]), (False, []))
        self.assertEqual([problem["place"] for problem in verdict["problems"]],
                         ['variable "Epoch"'])

    def test_more_problems_than_can_be_listed_are_counted(self):
        session = self.session()
        (file,) = session.call("create", "many")
        for number in range(600):
            name = f"{number:03} " + '"' * 240
            session.call("createVar", file, name, 1, 1, [200], True, [True])
            session.call("setVarCompression", file, number, session.constant("GZIP_COMPRESSION"), 6)
            session.call("putVarRecordData", file, number, 0, array("int8", [7] * 200, [200, 1]))
        session.call("close", file)
        content = self.read("many.cdf")
        self.write("many.cdf", re.sub(rb"(\x1f\x8b.{8}).{6}", rb"\1" + bytes(6), content,
                                      flags=re.DOTALL))
        (verdict,) = self.verdicts("many.cdf", status=1)
        self.assertGreater(len(verdict["problems"]), 100)
        self.assertGreater(verdict["unlisted"], 0)
        self.assertEqual(len(verdict["problems"]) + verdict["unlisted"], 600)
        self.assertEqual(verdict["unsupported"], [])

    def test_files_that_cannot_be_read(self):
        (verdict,) = self.verdicts("missing.cdf", status=1)
        self.assertEqual(verdict["problems"], [{"place": "", "identifier": "ambrix:unreadable",
                                                "message": "No such file or directory"}])
        self.assertEqual(self.check(".", status=1),
                         ".: not sound\n    ambrix:unreadable: Is a directory\n")
        os.mkdir(self.path("example"))
        self.assertEqual(self.check("example"), "example: sound\n")  # the library adds .cdf
        self.assert_misused("check")
        self.assert_misused("check", "--nonsense", "example.cdf")
        for wrong in ("-1", "soon", "", "nan", "1s"):
            self.assertIn(f"'{wrong}' is not a number of seconds",
                          self.assert_misused("check", "example.cdf", "--time-limit", wrong))

    def start_checking(self, *options):
        """A check that begins with a file that takes hours, and its worker."""
        write_busy(self.session(), "busy.cdf")
        process = subprocess.Popen([TOOL, "check", "busy.cdf", "example.cdf", *options],
                                   cwd=self.folder, stdout=subprocess.PIPE, stderr=subprocess.PIPE)
        self.addCleanup(process.communicate)
        self.addCleanup(process.kill)
        worker = wait_until(lambda: children_of(process.pid))[0]
        time.sleep(0.3)
        return process, worker

    def test_a_library_that_does_not_return(self):
        process, worker = self.start_checking("--time-limit", "3")
        os.kill(worker, signal.SIGSTOP)  # as if it did not return
        output, errors = process.communicate()
        self.assertEqual((process.returncode, errors), (3, b""))
        self.assertEqual(output.decode(), "busy.cdf: undecided\n    ambrix:timeLimitReached: nothing "
                         'was read for 3 seconds while reading variable "v"\n'
                         "example.cdf: sound\n")

    def test_a_crash_is_told_and_the_other_files_are_checked(self):
        process, worker = self.start_checking()
        time.sleep(0.1)
        os.kill(worker, signal.SIGABRT)
        output, errors = process.communicate()
        self.assertEqual((process.returncode, errors), (1, b""))
        self.assertTrue(re.match(r"busy.cdf: not sound\n    ambrix:libraryCrashed: the CDF library "
                                 r"crashed \(Aborted\)[^\n]*\nexample.cdf: sound\n\Z",
                                 output.decode()), output)

    def test_signals_end_it(self):
        process, worker = self.start_checking()
        process.send_signal(signal.SIGINT)
        output, errors = process.communicate()
        self.assertEqual((process.returncode, output, errors), (-signal.SIGINT, b"", b""))
        self.assertFalse(os.path.exists(f"/proc/{worker}"))


if __name__ == "__main__":
    unittest.main()
