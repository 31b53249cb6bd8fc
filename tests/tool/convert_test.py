"""`ambrix convert`."""

import itertools
import json
import os
import re
import unittest

from support.ambrix_session import array
from tool.example_file import write_example
from tool.support import ToolCase, sample

GROWTH = r"(\d+) bytes became (\d+), including space that the library reserves"
SETTINGS = ("version", "encoding", "file", "majority", "compression", "checksum")


def by_index(nested, sizes):
    """A record's values by their indices, from lists with the first index innermost."""
    values = {}
    for index in itertools.product(*map(range, sizes)):
        value = nested
        for i in reversed(index):
            value = value[i]
        values[index] = value
    return values


class ConvertCase(ToolCase):
    def info(self, file):
        return json.loads(self.output("info", "--json", "--attributes", file))

    def dump(self, file, variable):
        return json.loads(self.output("dump", file, str(variable), "--format", "json"))

    def convert(self, *arguments, file="example.cdf", out="out.cdf"):
        self.changes(file, out, *arguments)
        return self.info(out)

    def changes(self, file, out, *arguments):
        """What is told of them but for the growth of small files, which differs by library."""
        done = self.run_tool("convert", file, out, *arguments)
        self.assertEqual(done.stdout, b"")
        self.assertLessEqual(done.stderr.count(b"\n"), 1)
        begin, _, told = done.stderr.decode().partition(f"ambrix: changed in {out}: ")
        self.assertEqual(begin, "")
        return [change for change in told.strip().split("; ")
                if change and not re.fullmatch(GROWTH, change)]

    def files(self):
        return sorted(os.listdir(self.folder))


class CopyTest(ConvertCase):
    def setUp(self):
        super().setUp()
        write_example(self.session(), "example", "ROW_MAJOR")
        self.before = self.info("example.cdf")

    def assert_same_content(self, after):
        facts = [{k: v for k, v in f.items() if k not in SETTINGS} for f in (self.before, after)]
        for variable in facts[0]["variables"] + facts[1]["variables"]:
            variable["compression"].pop("percentage", None)
        self.assertEqual(facts[0], facts[1])
        for variable in facts[0]["variables"]:
            self.assertEqual(self.dump("example.cdf", variable["number"]),
                             self.dump("out.cdf", variable["number"]))

    def test_a_plain_copy(self):
        after = self.convert()
        self.assert_same_content(after)
        self.assertEqual({k: after[k] for k in ("majority", "checksum")},
                         {k: self.before[k] for k in ("majority", "checksum")})
        self.assertEqual(self.files(), ["example.cdf", "out.cdf"])

    def test_compression(self):
        for option, kind, parameter in (
                ("gzip", "GZIP_COMPRESSION", "6"), ("GZIP:1", "GZIP_COMPRESSION", "1"),
                ("rle", "RLE_COMPRESSION", "RLE_OF_ZEROS"),
                ("huff", "HUFF_COMPRESSION", "OPTIMAL_ENCODING_TREES"),
                ("ahuff", "AHUFF_COMPRESSION", "OPTIMAL_ENCODING_TREES"),
                ("none", "NO_COMPRESSION", None)):
            after = self.convert("--compression", option)
            self.assertEqual((after["compression"]["type"],
                              after["compression"].get("parameter")), (kind, parameter))
            self.assert_same_content(after)
            os.rename(self.path("out.cdf"), self.path("again.cdf"))
            again = self.convert(file="again.cdf")  # keeps what the file has
            self.assertEqual(again["compression"]["type"], kind)
            os.remove(self.path("out.cdf"))

    def test_checksum(self):
        self.assertEqual(self.convert("--checksum", "md5")["checksum"], "MD5_CHECKSUM")
        self.assertEqual(self.convert(file="out.cdf", out="kept.cdf")["checksum"], "MD5_CHECKSUM")
        after = self.convert("--checksum", "none", file="kept.cdf", out="gone.cdf")
        self.assertEqual(after["checksum"], "NO_CHECKSUM")

    def test_majority_keeps_each_element_at_its_index(self):
        after = self.convert("--majority", "column")
        self.assertEqual(after["majority"], "COLUMN_MAJOR")
        for old, new in zip(self.before["variables"], after["variables"]):
            self.assertEqual(old["dimensions"], new["dimensions"][::-1])
            self.assertEqual(old["padValue"], new["padValue"])
            self.assertEqual(old["recordsStored"], new["recordsStored"])
            before, behind = (self.dump(f, old["number"]) for f in ("example.cdf", "out.cdf"))
            self.assertEqual(len(before["data"]), len(behind["data"]))
            for one, other in zip(before["data"], behind["data"]):
                turned = {i[::-1]: v for i, v in by_index(other, new["dimensions"]).items()}
                self.assertEqual(by_index(one, old["dimensions"]), turned)
        self.convert("--majority", "row", file="out.cdf", out="back.cdf")
        for variable in self.before["variables"]:
            self.assertEqual(self.dump("example.cdf", variable["number"]),
                             self.dump("back.cdf", variable["number"]))

    def test_names_outside_ascii(self):
        os.mkdir(self.path("d\u00e9j\u00e0"))
        out = os.path.join("d\u00e9j\u00e0", "\u6f22.cdf")
        self.convert(out=out)
        self.assertEqual(os.listdir(self.path("d\u00e9j\u00e0")), ["\u6f22.cdf"])

    def test_the_extension_is_added_and_told(self):
        done = self.run_tool("convert", "example.cdf", "new")
        self.assertIn("new.cdf", done.stderr.decode())
        self.assertEqual(self.files(), ["example.cdf", "new.cdf"])
        self.convert(out="OTHER.CDF")
        self.assertIn("OTHER.CDF", self.files())

    def test_long_paths_are_alike_in_all_commands(self):
        folder = "/".join(["d" * 100] * 4)
        os.makedirs(self.path(folder))
        os.rename(self.path("example.cdf"), self.path(folder + "/example.cdf"))
        deep = self.path(folder)
        for name, ok in (("./" * 40 + "example.cdf", True),
                         (deep + "/" * (512 - len(deep) - 11) + "example.cdf", True),
                         (deep + "/" * (513 - len(deep) - 11) + "example.cdf", False),
                         (deep + "/" * (510 - len(deep) - 7) + "example", False)):
            for command in (("info", name), ("dump", name, "cube"), ("check", name),
                            ("convert", name, "out.cdf"), ("call", "--file", name, "inquire")):
                self.run_tool(*command, status=0 if ok else 1, cwd=deep)
            if ok:
                os.remove(deep + "/out.cdf")
        self.assertEqual(os.listdir(deep), ["example.cdf"])

    def test_sample_files(self):
        for name in ("cacsst2", "example1", "geocpi0"):
            self.convert(file=sample(name + ".cdf"), out=name + ".cdf")
            before, after = self.info(sample(name + ".cdf")), self.info(name + ".cdf")
            self.assertEqual(before["attributes"], after["attributes"])
            for variable in before["variables"]:
                self.assertEqual(self.dump(sample(name + ".cdf"), variable["number"]),
                                 self.dump(name + ".cdf", variable["number"]))


class ExtendedTest(ConvertCase):
    def test_everything_is_carried_over(self):
        self.write_times()
        before = self.info("times.cdf")
        values = [self.dump("times.cdf", name)["data"] for name in ("Epoch", "count")]
        for number, options in enumerate(([], ["--majority", "column", "--checksum", "md5"],
                                          ["--compression", "gzip:6"])):
            out = f"out{number}.cdf"
            self.output("convert", "times.cdf", out, *options)
            after = self.info(out)
            for kind in ("variables", "attributes"):
                self.assertEqual(before[kind], after[kind])
            self.assertEqual([self.dump(out, name)["data"] for name in ("Epoch", "count")], values)


class RefusalTest(ConvertCase):
    def setUp(self):
        super().setUp()
        session = self.session()
        (file,) = session.call("create", "example")
        session.call("createVar", file, "fine time", 33, 1, [], True, [])
        session.call("createVar", file, "v", 4, 1, [], True, [])
        session.call("putVarData", file, 1, 0, [], array("int32", [5]))
        session.call("createAttr", file, "UNITS", 2)
        for variable in (0, 1, 5):
            session.call("putAttrEntry", file, 0, variable, 51, f"unit{variable}")
        session.call("close", file)

    def test_entries_stay_with_their_variables(self):
        self.output("convert", "example.cdf", "out.cdf")
        before, after = self.info("example.cdf"), self.info("out.cdf")
        self.assertEqual(before["attributes"], after["attributes"])
        self.assertEqual([v["name"] for v in after["variables"]], ["fine time", "v"])

    def test_nothing_is_overwritten(self):
        for name in ("out.cdf", "out"):
            with open(self.path("out.cdf"), "w") as file:
                file.write("precious")
            done = self.run_tool("convert", "example.cdf", name, status=1)
            self.assertIn("ambrix: ambrix:outputExists: ", done.stderr.decode())
            with open(self.path("out.cdf")) as file:
                self.assertEqual(file.read(), "precious")
        os.symlink("nowhere", self.path("link.cdf"))
        self.run_tool("convert", "example.cdf", "link.cdf", status=1)
        self.run_tool("convert", "example.cdf", "example.cdf", status=1)
        self.assertEqual(self.files(), ["example.cdf", "link.cdf", "out.cdf"])

    def test_outputs_that_are_no_files(self):
        os.mkdir(self.path("folder"))
        os.mkfifo(self.path("pipe"))
        for name in ("folder/", "folder", "missing/", ".", "..", "/dev/null", "pipe"):
            self.assert_fails("ambrix:noFileName", "convert", "example.cdf", name)
        self.assertEqual(self.files(), ["example.cdf", "folder", "pipe"])
        self.assertFalse(os.path.exists("/dev/null.cdf"))

    def test_failures(self):
        self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "convert", "missing.cdf", "out.cdf")
        done = self.run_tool("convert", "example.cdf", "no/such/out.cdf",
                             status=1)
        self.assertIn("ambrix: ambrix:noSuchFolder: ", done.stderr.decode())
        for options in (["--compression", "zip"], ["--compression", "gzip:0"],
                        ["--compression", "gzip:10"], ["--compression", "gzip:"],
                        ["--compression", "rle:1"], ["--majority", "both"], ["--checksum", "sha"]):
            self.assert_misused("convert", "example.cdf", "out.cdf", *options)
        self.assert_misused("convert", "example.cdf")
        self.assertEqual(self.files(), ["example.cdf"])


if __name__ == "__main__":
    unittest.main()
