"""`ambrix info`."""

import json
import os
import subprocess
import unittest

from tool.example_file import DATATYPES, write_example
from tool.support import INTEGERS, PAD, TIMES, TIME_TEXTS, TOOL, ToolCase, sample

NOBODY = 65534


class InfoTest(ToolCase):
    def setUp(self):
        super().setUp()
        write_example(self.session(), "example", "ROW_MAJOR")

    def info(self, *options, file="example.cdf"):
        return json.loads(self.output("info", "--json", file, *options))

    def test_settings(self):
        facts = self.info()
        self.assertEqual(facts["file"], "example.cdf")
        self.assertEqual(facts["format"], "SINGLE_FILE")
        self.assertEqual(facts["majority"], "ROW_MAJOR")
        self.assertEqual(facts["checksum"], "NO_CHECKSUM")
        self.assertEqual(facts["compression"]["type"], "NO_COMPRESSION")
        self.assertEqual(facts["records"], 6)
        self.assertEqual((facts["globalAttributes"], facts["variableAttributes"]), (1, 2))
        self.assertNotIn("attributes", facts)

    def test_variables(self):
        variables = {v["name"]: v for v in self.info()["variables"]}
        self.assertEqual(list(variables)[:13], list(DATATYPES))
        self.assertEqual([v["number"] for v in variables.values()], list(range(19)))
        for datatype in DATATYPES:
            self.assertEqual(variables[datatype]["datatype"], datatype.lower())
        cube = variables["cube"]
        self.assertEqual(cube["dimensions"], [2, 3, 4])
        self.assertEqual(cube["padValue"], [-7])
        self.assertEqual((cube["records"], cube["recordsStored"]), (3, 3))
        self.assertEqual(cube["compression"]["type"], "GZIP_COMPRESSION")
        self.assertEqual(cube["compression"]["parameter"], "7")
        self.assertEqual(variables["texts"]["elements"], 5)
        self.assertEqual(variables["texts"]["recordVariance"], False)
        self.assertEqual(variables["sparse PAD"]["sparseRecords"], "PAD_SPARSERECORDS")
        sparse = variables["sparse PREV"]
        self.assertEqual((sparse["records"], sparse["recordsStored"]), (6, 2))
        self.assertEqual(variables["empty"]["records"], 0)

    def test_attributes(self):
        unit, empty = self.info("--attributes")["attributes"][1:]
        self.assertEqual(unit["scope"], "VARIABLE_SCOPE")
        self.assertEqual([e["number"] for e in unit["entries"]], [0, 13])
        self.assertEqual(unit["entries"][0]["values"], ["caf\u00e9"])
        self.assertEqual(empty["entries"], [])
        entries = {e["datatype"]: e for e in self.info("--attributes")["attributes"][0]["entries"]}
        self.assertEqual([e["number"] for e in entries.values()], list(range(0, 26, 2)))
        self.assertEqual(entries["cdf_real8"]["values"], [0.1, 1e300])
        self.assertEqual(entries["cdf_epoch"]["values"], ["1996-01-01T00:00:00.000", -1e31])

    def test_tables_for_people(self):
        text = self.output("info", "--attributes", "example.cdf")
        self.assertIn("Majority    ROW_MAJOR\n", text)
        (cube,) = [line for line in text.splitlines() if line.split()[:2] == ["13", "cube"]]
        self.assertEqual(cube.split()[:7], ["13", "cube", "cdf_int4", "1", "2x3x4", "3", "T/TTT"])
        self.assertIn("6 (2 stored)", text)
        self.assertIn("caf\u00e9", text)
        self.assertIn("Global attributes\n", text)
        self.assertNotIn("\033", text)
        self.assertNotIn("Attribute ", self.output("info", "example.cdf"))

    def test_columns_are_aligned_whatever_the_characters(self):
        session = self.session()
        (file,) = session.call("open", "example.cdf")
        session.call("putAttrEntry", file, 1, 0, 51, "\u00e6\u00bc\u00a2\u00e5\u00ad\u0097")
        session.call("close", file)
        lines = self.output("info", "--attributes", "example.cdf").splitlines()
        self.assertTrue(any(line.endswith("\u6f22\u5b57") for line in lines))

    def test_extended_datatypes(self):
        self.write_times()
        info = self.info("--attributes", file="times.cdf")
        time, count = info["variables"]
        self.assertEqual([(v["datatype"], v["supported"], v["elements"], v["dimensions"],
                           v["records"], v["padValue"]) for v in (time, count)],
                         [("cdf_time_tt2000", True, 1, [], 4, [TIMES[1]]),
                          ("cdf_int8", True, 1, [2], 2, [PAD])])
        self.assertEqual([entry["values"] for entry in info["attributes"][0]["entries"]],
                         [TIME_TEXTS[:1], INTEGERS])
        table = self.output("info", "--attributes", "times.cdf")
        self.assertNotIn("not supported", table)
        self.assertIn(TIME_TEXTS[0], table)
        self.assertIn(", ".join(map(str, INTEGERS)), table)

    def test_sample_files(self):
        facts = self.info(file=sample("example1.cdf"))
        self.assertEqual([v["name"] for v in facts["variables"]], ["Time", "Latitude", "Image"])
        self.assertEqual(facts["version"], "3.2.1")

    def test_failures(self):
        self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "info", "missing.cdf")
        with open(self.path("junk.cdf"), "wb") as file:
            file.write(b"junk" * 1000)
        self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "info", "junk.cdf")
        self.assert_misused("info")
        os.mkfifo(self.path("pipe"))
        os.mkdir(self.path("folder"))
        with open(self.path("example.cdf"), "rb") as file:
            sound = file.read()
        for name, content, cause in (
                ("missing", None, "there is no such file"), ("folder", None, "it is a folder"),
                ("pipe", None, "it is a device or a pipe"), ("empty", b"", "it is empty"),
                ("text", b"text" * 99, "it is not a CDF file"),
                ("netcdf", b"CDF\x01" + bytes(99), "it is not a CDF file but a netCDF file"),
                ("hdf", b"\x89HDF\r\n\x1a\n" + bytes(99), "it is not a CDF file but an HDF5 or netCDF file"),
                ("gzip", b"\x1f\x8b" + bytes(99), "it is not a CDF file but is packed by gzip"),
                ("cut", sound[:-2000], "it is damaged: it ends after"),
                ("later", sound[:28] + b"\0\0\0\4" + sound[32:], "it was written by version 4."),
                ("new", b"\xcd\xf4" + sound[2:], "it was written by a later version"),
                ("x" * 600, None, "the path has 600 bytes, and the CDF library accepts at most 512"),
                ("\x1b", None, "there is no such file")):
            if content is not None:
                with open(self.path(name), "wb") as file:
                    file.write(content)
            shown = name.replace("\x1b", "\\x1b")
            for command in (("info", name), ("dump", name, "v"), ("convert", name, "out.cdf"),
                            ("call", "--file", name, "inquire")):
                message = self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", *command)
                self.assertTrue(message.startswith(f"{shown}: {cause}"), message)
        self.assert_misused("info", "example.cdf", "more")
        self.assert_misused("info", "example.cdf", "--nonsense")

    def test_times_by_another_table_of_leap_seconds(self):
        with open(self.path("example.cdf"), "rb") as file:
            content = bytearray(file.read())
        leap = int.from_bytes(content[20:28], "big") + 76  # in the record of the file's own facts
        datatype = content.index(b"CDF_EPOCH\0") - 84 + 20  # in the variable's, before its name
        self.assertEqual(content[leap:leap + 4], (20170101).to_bytes(4, "big"))
        self.assertEqual(content[datatype:datatype + 4], (31).to_bytes(4, "big"))
        content[datatype:datatype + 4] = (33).to_bytes(4, "big")  # CDF_TIME_TT2000
        content[leap:leap + 4] = (20991231).to_bytes(4, "big")
        with open(self.path("times.cdf"), "wb") as file:
            file.write(content)
        message = self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "info", "times.cdf")
        self.assertEqual(message, "times.cdf: it has times by a table of leap seconds of 20991231, "
                         "and the table of the CDF library is outdated; name a newer one in the "
                         "environment variable CDF_LEAPSECONDSTABLE")

    def test_files_that_may_not_be_read(self):
        os.chmod(self.path("example.cdf"), 0)
        for folder in (self.folder, os.environ["TMPDIR"]):
            os.chmod(folder, 0o777)
        options = {}
        if os.geteuid() == 0:
            options = {"user": NOBODY, "group": NOBODY, "extra_groups": []}
            try:
                self.run_tool("--version", **options)
            except (PermissionError, AssertionError):
                self.skipTest("only this user may run the tool here")
        for command in (("info", "example.cdf"), ("dump", "example.cdf", "v"),
                        ("convert", "example.cdf", "out.cdf"),
                        ("call", "--file", "example.cdf", "inquire")):
            done = self.run_tool(*command, status=1, **options)
            self.assertEqual(done.stderr.decode(),
                             "ambrix: TOLVEX:ambrix:cdflib:fileOpenError: example.cdf: "
                             "it cannot be read: Permission denied\n")
        done = self.run_tool("check", "example.cdf", status=3, **options)
        self.assertIn(b"example.cdf: undecided\n    ambrix:unreadable: Permission denied\n",
                      done.stdout)

    def test_json_is_ascii(self):
        session = self.session()
        (file,) = session.call("open", "example.cdf")
        text = "\u009b\u202e\x1b\x7f"
        session.call("putAttrEntry", file, 1, 0, 51,
                     "".join(chr(byte) for byte in text.encode("utf-8")))
        session.call("close", file)
        printed = self.output("info", "--attributes", "--json", "example.cdf")
        self.assertTrue(printed.isascii() and "\x7f" not in printed)
        self.assertEqual(json.loads(printed)["attributes"][1]["entries"][0]["values"], [text])
        printed = self.run_tool("check", "--json", "\u202e", status=1).stdout.decode()
        self.assertTrue(printed.isascii())
        self.assertEqual(json.loads(printed)[0]["file"], "\u202e")

    def test_a_reader_that_goes_away_is_no_failure(self):
        done = subprocess.run(f"'{TOOL}' info --attributes example.cdf | head -n 1; "
                              "echo ${PIPESTATUS[0]}", shell=True, executable="/bin/bash",
                              capture_output=True, cwd=self.folder)
        self.assertEqual(done.stderr, b"")
        self.assertTrue(done.stdout.endswith(b"\n0\n"))


if __name__ == "__main__":
    unittest.main()
