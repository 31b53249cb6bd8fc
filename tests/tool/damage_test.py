"""Files that claim what they do not hold, and checks that cannot come to a verdict."""

import json
import os
import resource
import signal
import struct
import subprocess
import time
import unittest

from support.ambrix_session import array
from tool.example_file import write_example
from tool.processes import children_of, wait_until, write_busy
from tool.support import TOOL, ToolCase

FAR = 20_000_000  # a number that nobody reaches by counting


class DamageCase(ToolCase):
    def verdict(self, name, status):
        return json.loads(self.run_tool("check", "--json", name, status=status).stdout)[0]

    def read(self, name):
        with open(self.path(name), "rb") as file:
            return file.read()


class CountTest(DamageCase):
    """The highest record of a variable stands in its descriptor, before its name."""

    RECORDS = 50

    def write(self, compressed, sparse):
        session = self.session()
        (file,) = session.call("create", "v")
        session.call("createVar", file, "only one", 4, 1, [], True, [])
        if compressed:
            session.call("setVarCompression", file, 0, session.constant("GZIP_COMPRESSION"), 6)
        if sparse:
            session.call("setVarSparseRecords", file, 0, session.constant("PAD_SPARSERECORDS"))
        for record in range(self.RECORDS):
            session.call("putVarRecordData", file, 0, record, array("int32", [record]))
        session.call("close", file)

    def claim(self, last):
        place = self.read("v.cdf").index(b"only one") - 84 + 24
        with open(self.path("v.cdf"), "r+b") as file:
            file.seek(place)
            self.assertEqual(file.read(4), struct.pack(">i", self.RECORDS - 1))
            file.seek(place)
            file.write(struct.pack(">i", last))

    def test_records_that_the_index_has_no_room_for(self):
        for compressed in (False, True):
            for sparse in (False, True):
                for last in (1_000_000, 2**31 - 2):
                    with self.subTest(compressed=compressed, sparse=sparse, last=last):
                        self.write(compressed, sparse)
                        self.assertTrue(self.verdict("v.cdf", 0)["sound"])
                        self.claim(last)
                        self.assert_refused(last)
                    os.remove(self.path("v.cdf"))

    def assert_refused(self, last):
        (problem,) = self.verdict("v.cdf", 1)["problems"]
        self.assertEqual((problem["place"], problem["identifier"]),
                         ('variable "only one"', "ambrix:moreThanTheFile"))
        self.assertIn(str(last), problem["message"])
        done = self.run_tool("convert", "v.cdf", "out.cdf", status=1)
        self.assertIn(b"ambrix: ambrix:moreThanTheFile: ", done.stderr)
        self.assertEqual(os.listdir(self.folder), ["v.cdf"])
        done = self.run_tool("dump", "v.cdf", "0", status=1)
        self.assertIn(b"ambrix: ambrix:moreThanTheFile: ", done.stderr)
        self.assertIn("49", self.output("dump", "v.cdf", "0", "--records", "0:49"))


class EntryNumberTest(DamageCase):
    def setUp(self):
        super().setUp()
        session = self.session()
        (file,) = session.call("create", "far")
        session.call("createVar", file, "v", 4, 1, [], True, [])
        session.call("createAttr", file, "global", session.constant("GLOBAL_SCOPE"))
        session.call("createAttr", file, "variable", session.constant("VARIABLE_SCOPE"))
        self.numbers = {"global": [0, 3, 20_000, FAR, 2**31 - 2], "variable": [0, FAR]}
        for number in self.numbers["global"]:
            session.call("putAttrgEntry", file, 0, number, 4, array("int32", [number]))
        for number in self.numbers["variable"]:
            session.call("putAttrEntry", file, 1, number, 4, array("int32", [number]))
        session.call("putVarRecordData", file, 0, 0, array("int32", [5]))
        session.call("close", file)

    def assert_entries(self, name):
        facts = json.loads(self.output("info", "--attributes", "--json", name,
                                       "--time-limit", "20"))
        self.assertEqual({a["name"]: [e["number"] for e in a["entries"]]
                          for a in facts["attributes"]}, self.numbers)
        self.assertEqual([e["values"] for e in facts["attributes"][0]["entries"]],
                         [[number] for number in self.numbers["global"]])

    def test_every_command_finds_them(self):
        before = self.read("far.cdf")
        self.assert_entries("far.cdf")
        for options in ((), ("--compression", "gzip:6", "--checksum", "md5")):
            self.output("convert", "far.cdf", "out.cdf", "--time-limit", "20", *options)
            self.assert_entries("out.cdf")
            self.output("check", "--quiet", "out.cdf", "--time-limit", "20")
            os.remove(self.path("out.cdf"))
        self.assertIn("5", self.output("dump", "far.cdf", "v", "--time-limit", "20"))
        self.assertEqual(self.read("far.cdf"), before)
        self.assertEqual(os.listdir(self.folder), ["far.cdf"])
        self.assertEqual(os.listdir(os.environ["TMPDIR"]), [])

    def test_a_file_that_nobody_may_write(self):
        os.chmod(self.path("far.cdf"), 0o444)
        self.assert_entries("far")  # the library adds .cdf

    def test_several_files_that_are_one(self):
        session = self.session()
        (file,) = session.call("create", "parts")
        session.call("setFormat", file, session.constant("MULTI_FILE"))
        session.call("createVar", file, "v", 4, 1, [], True, [])
        session.call("putVarRecordData", file, 0, 0, array("int32", [5]))
        session.call("createAttr", file, "global", session.constant("GLOBAL_SCOPE"))
        session.call("putAttrgEntry", file, 0, FAR, 4, array("int32", [1]))
        session.call("close", file)
        facts = json.loads(self.output("info", "--attributes", "--json", "parts.cdf"))
        self.assertEqual([e["number"] for e in facts["attributes"][0]["entries"]], [FAR])
        self.output("check", "--quiet", "parts.cdf")


class UndecidedTest(DamageCase):
    def setUp(self):
        super().setUp()
        write_example(self.session(), "good", "ROW_MAJOR")

    def checks_within(self, kind, limits):
        for limit in limits:
            yield limit, subprocess.run(
                [TOOL, "check", "--json", "good.cdf"], cwd=self.folder, capture_output=True,
                preexec_fn=lambda: resource.setrlimit(kind, (limit, limit)))

    def assert_never_wrong(self, checks):
        """With less and less of something a sound file becomes undecided, never anything else."""
        statuses = set()
        for limit, done in checks:
            if not done.stdout:  # the tool itself could not be loaded
                continue
            (verdict,) = json.loads(done.stdout)
            self.assertEqual(verdict["problems"], [], limit)
            self.assertEqual((verdict["sound"], bool(verdict["unread"])),
                             (True, False) if done.returncode == 0 else (None, True))
            statuses.add(done.returncode)
        self.assertEqual(statuses, {0, 3})

    def test_too_few_descriptors(self):
        self.skip_with_sanitizer()
        self.assert_never_wrong(self.checks_within(resource.RLIMIT_NOFILE, range(3, 12)))

    def test_too_little_memory(self):
        self.skip_with_sanitizer()
        self.assert_never_wrong(
            self.checks_within(resource.RLIMIT_AS, range(8 << 20, 34 << 20, 1 << 20)))

    def test_a_worker_with_too_little_memory(self):
        self.skip_with_sanitizer()
        limits = (1, *range(4 << 20, 48 << 20, 1 << 20), 256 << 20)
        self.assert_never_wrong(
            (limit, subprocess.run([TOOL, "check", "--json", "good.cdf", "--memory-limit",
                                    str(limit)], cwd=self.folder, capture_output=True))
            for limit in limits)

    def check_killing_the_first_worker(self, number, *files):
        """The exit status and the output; what the worker is at takes hours."""
        if not os.path.exists(self.path("busy.cdf")):
            write_busy(self.session(), "busy.cdf")
        process = subprocess.Popen([TOOL, "check", "busy.cdf", *files], cwd=self.folder,
                                   stdout=subprocess.PIPE)
        worker = wait_until(lambda: children_of(process.pid))[0]
        time.sleep(0.3)
        os.kill(worker, number)
        output = process.communicate()[0]
        return process.returncode, output

    def test_damage_outweighs_what_is_undecided(self):
        with open(self.path("bad.cdf"), "wb") as file:
            file.write(b"no CDF")
        status, output = self.check_killing_the_first_worker(signal.SIGKILL, "bad.cdf", "good.cdf")
        self.assertEqual(status, 1)
        verdicts = [line for line in output.splitlines() if not line.startswith(b" ")]
        self.assertEqual(verdicts, [b"busy.cdf: undecided", b"bad.cdf: not sound",
                                    b"good.cdf: sound"])

    def test_a_worker_that_was_killed_has_decided_nothing(self):
        for number in (signal.SIGKILL, signal.SIGXCPU):
            status, output = self.check_killing_the_first_worker(number)
            self.assertEqual(status, 3)
            self.assertTrue(output.startswith(b"busy.cdf: undecided\n"), output)


class ExitStatusTest(DamageCase):
    def status(self, command):
        done = subprocess.run(["/bin/bash", "-c", command], cwd=self.folder, capture_output=True,
                              env=dict(os.environ, TOOL=TOOL))
        return int(done.stdout.splitlines()[-1]), done.stderr

    def test_it_does_not_depend_on_the_reader(self):
        write_example(self.session(), "good", "ROW_MAJOR")
        with open(self.path("bad.cdf"), "wb") as file:
            file.write(b"no CDF")
        for options in ("", "--json"):
            for files, expected in (("good.cdf bad.cdf", 1), ("good.cdf good.cdf", 0)):
                check = f'"$TOOL" check {options} {files}'
                for command in (f"{check} | true; echo ${{PIPESTATUS[0]}}",
                                f"{check} | head -n 1; echo ${{PIPESTATUS[0]}}",
                                f"({check} >&-); echo $?"):
                    self.assertEqual(self.status(command), (expected, b""), command)


if __name__ == "__main__":
    unittest.main()
