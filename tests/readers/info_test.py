"""`ambrix info` and `ambrix dump` of real files, against independent readers."""

import json
import os
import subprocess
import unittest

import numpy as np

from readers.case import ReadersCase
from readers.content import CHARACTERS, EPOCH16, TT2000, datatype
from readers.sample_files import FOLDER, UNREADABLE, needs_folder, readable_files

TOOL = os.environ["AMBRIX_TOOL"]
DUMPED = 3  # records of each variable


def run(*arguments):
    return subprocess.run([TOOL, *map(str, arguments)], capture_output=True)


class InfoTest(ReadersCase):
    def test_every_file(self):
        for name, path in readable_files().items():
            with self.subTest(file=name):
                done = run("info", path, "--json", "--attributes")
                self.assertEqual(done.returncode, 0, done.stderr)
                shown = json.loads(done.stdout)
                mine, right = self.read_sample(path)
                self.assertEqual(shown["majority"].startswith("ROW"), mine.row_major)
                self.assertEqual(len(shown["attributes"]), len(mine.attributes))
                self.check_variables(shown["variables"], mine, right)

    def check_variables(self, shown, mine, right):
        self.assertEqual([one["name"] for one in shown], [as_utf8(name) for name in mine.variables])
        for one, name in zip(shown, mine.variables):
            self.assertTrue(one["supported"])
            theirs = right.get(name)
            if theirs is None:
                continue
            self.assertEqual(one["datatype"], datatype(theirs.code)[0])
            self.assertEqual(one["elements"], theirs.elements)
            self.assertEqual(one["recordVariance"], theirs.record_varies)
            self.assertEqual(one["records"], len(theirs.values))
            sizes = [size for size, vary in zip(one["dimensions"], one["dimensionVariances"])
                     if vary and size != 1]
            kept = [size for size, vary in zip(theirs.sizes, theirs.varies) if vary and size != 1]
            self.assertEqual(sizes, kept[::-1] if mine.row_major else kept)

    def test_people_s_table_names_every_variable(self):
        for name, path in readable_files().items():
            with self.subTest(file=name):
                done = run("info", path)
                self.assertEqual((done.returncode, done.stderr), (0, b""))
                for variable in self.read_sample(path)[0].variables:
                    self.assertIn(as_utf8(variable.rstrip()), done.stdout.decode())

    @needs_folder
    def test_an_unreadable_file_is_an_error(self):
        for name in UNREADABLE:
            for command in (["info"], ["info", "--json"], ["dump"]):
                rest = ["x"] if command == ["dump"] else []
                done = run(*command, FOLDER / name, *rest)
                self.assertEqual((done.returncode, done.stdout), (1, b""))
                self.assertRegex(done.stderr.decode(), r"^ambrix: \S+:fileOpenError: \S.*\n$")


class CheckTest(unittest.TestCase):
    def test_every_file_is_sound(self):
        done = run("check", "--json", *readable_files().values())
        self.assertEqual((done.returncode, done.stderr), (0, b""))
        for verdict in json.loads(done.stdout):
            self.assertEqual({**verdict, "file": ""},
                             {"file": "", "sound": True, "problems": [], "unread": [],
                              "unsupported": [], "unlisted": 0}, verdict["file"])


def as_utf8(name):
    return name.encode("latin-1").decode("utf-8", "replace")


class DumpTest(ReadersCase):
    def test_every_file(self):
        """The first records of one variable of each kind, against those of an independent
        reader."""
        for name, path in readable_files().items():
            mine, right = self.read_sample(path)
            kinds = set()
            for number, (variable_name, variable) in enumerate(mine.variables.items()):
                kind = (variable.code, len(variable.sizes), len(variable.values) > 0)
                if kind not in kinds:
                    with self.subTest(file=name, variable=variable_name):
                        self.check(path, number, variable, right.get(variable_name),
                                   mine.row_major)
                kinds.add(kind)

    def check(self, path, number, variable, theirs, row_major):
        records = len(variable.values)
        rows = ["--records", f"0:{min(DUMPED, records) - 1}"] if records else []
        raw = ["--raw-times"] if variable.code == TT2000 else []
        done = run("dump", path, number, "--format", "json", *rows, *raw)
        self.assertEqual((done.returncode, done.stderr), (0, b""))
        shown = json.loads(done.stdout)
        self.assertEqual(shown["datatype"], datatype(variable.code)[0])
        self.assertEqual(len(shown["data"]), min(DUMPED, records))
        if theirs and records and variable.code not in (*CHARACTERS, 31, EPOCH16):
            self.check_numbers(shown["data"], variable, theirs, row_major)

    def check_numbers(self, data, variable, theirs, row_major):
        """Nested with the first index of the host innermost."""
        numbers = np.array(data, object)
        special = {"NaN": np.nan, "Inf": np.inf, "-Inf": -np.inf, None: np.nan}
        flat = [special.get(item, item) for item in numbers.reshape(-1).tolist()]
        mine = np.array(flat, theirs.values.dtype).reshape(numbers.shape)
        wanted = theirs.values[:DUMPED]
        if not row_major:
            wanted = wanted.transpose([0, *reversed(range(1, wanted.ndim))])
        if wanted.size != mine.size:  # dimensions that do not vary, which not every reader shows
            self.assertNotEqual(all(variable.varies), True)
            return
        np.testing.assert_array_equal(mine, wanted.reshape(mine.shape))


if __name__ == "__main__":
    unittest.main()
