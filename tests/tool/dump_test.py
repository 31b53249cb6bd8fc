"""`ambrix dump`."""

import csv
import io
import json
import unittest

from support.ambrix_session import array
from tool.example_file import DATATYPES, write_example
from tool.support import INTEGERS, TIMES, TIME_TEXTS, ToolCase


class DumpTest(ToolCase):
    def setUp(self):
        super().setUp()
        write_example(self.session(), "example", "ROW_MAJOR")

    def dump(self, variable, *options):
        return self.output("dump", "example.cdf", variable, *options)

    def data(self, variable, *options):
        return json.loads(self.dump(variable, "--format", "json", *options))["data"]

    def rows(self, variable, *options):
        return list(csv.reader(io.StringIO(self.dump(variable, "--format", "csv", *options))))

    def test_values_of_every_datatype(self):
        for datatype, (class_name, values) in DATATYPES.items():
            expected = list(values)
            if datatype == "CDF_EPOCH":
                expected = ["1996-01-01T00:00:00.000", -1e31]
            self.assertEqual(self.data(datatype), expected, class_name)
        self.assertEqual(self.data("fine"), ["2004-05-13T15:08:11.022033044055"])

    def test_table(self):
        self.assertEqual(self.dump("CDF_INT2"),
                         "Record  CDF_INT2\n     0  -32768\n     1  5\n")
        lines = self.dump("cube", "--records", "1").splitlines()
        self.assertEqual(lines[0].split(), ["Record", "i1", "i2", "i3", "cube"])
        self.assertEqual(lines[1].split(), ["1", "0", "0", "0", "24"])
        self.assertEqual(lines[2].split(), ["1", "1", "0", "0", "25"])
        self.assertEqual(lines[3].split(), ["1", "0", "1", "0", "26"])
        self.assertEqual(len(lines), 25)

    def test_numbers_have_the_digits_that_tell_them_apart(self):
        numbers = {"double": [0.0, -0.0, 0.1, 1e15, 1e16, 123456789012345680, 1e-4, 1e-5, 1e300,
                              5e-324, 1.7976931348623157e308, float("nan"), float("-inf")],
                   "single": [0.1, 16777216, 1e16, 3.4028235e38, 1e-45]}
        texts = {"double": ["0", "-0", "0.1", "1000000000000000", "1e+16", "1.2345678901234568e+17",
                            "0.0001", "1e-05", "1e+300", "5e-324", "1.7976931348623157e+308",
                            "NaN", "-Inf"],
                 "single": ["0.1", "16777216", "1e+16", "3.4028235e+38", "1e-45"]}
        session = self.session()
        (file,) = session.call("create", "numbers")
        for number, (class_name, values) in enumerate(numbers.items()):
            session.call("createVar", file, class_name, (45, 44)[number], 1, [], True, [])
            session.call("hyperPutVarData", file, number, 0, len(values), 1, [], [], [],
                         array(class_name, values, [1, len(values)]))
        session.call("close", file)
        for name, expected in texts.items():
            for form, told in (("table", [f"{i:6}  {x}" for i, x in enumerate(expected)]),
                               ("csv", [f"{i},{x}" for i, x in enumerate(expected)])):
                lines = self.output("dump", "numbers.cdf", name, "--format", form).splitlines()
                self.assertEqual(lines[1:], told)

    def test_csv(self):
        rows = self.rows("texts")
        self.assertEqual(rows[0], ["record", "i1", "i2", "texts"])
        self.assertEqual(rows[1:], [["0", "0", "0", "caf\u00e9"], ["0", "1", "0", "b"],
                                    ["0", "0", "1", "c"], ["0", "1", "1", "d"]])

    def test_csv_for_terminals_and_spreadsheets(self):
        session = self.session()
        (file,) = session.call("create", "texts")
        call = session.call
        texts = ("=1+1  ", "+1    ", "-1    ", "@x    ", "\tx    ", "\rx    ", "a\nb   ",
                 "a\x1b[2J ", "\u00c2\u009b1m  ", "\u00e2\u0080\u00aex  ", "a=1   ")
        call("createVar", file, "=v", 51, 6, [], True, [])
        call("hyperPutVarData", file, 0, 0, len(texts), 1, [], [], [],
             array("char", "".join(texts), [6 * len(texts), 1]))
        call("createVar", file, "n", 45, 1, [], True, [])
        call("hyperPutVarData", file, 1, 0, 2, 1, [], [], [], array("double", [-1.5, float("-inf")]))
        call("close", file)
        plain = ["=1+1", "+1", "-1", "@x", "\tx", "\rx", "a\nb", "a\\x1b[2J", "\\x9b1m", "\\u202ex",
                 "a=1"]
        run = lambda *options: list(csv.reader(io.StringIO(self.output(
            "dump", "texts.cdf", *options, "--format", "csv"), newline="")))
        self.assertEqual([row[1] for row in run("0")], ["=v"] + plain)
        self.assertEqual([row[1] for row in run("0", "--defuse-formulas")],
                         ["'=v"] + ["'" + text for text in plain[:6]] + plain[6:])
        self.assertEqual([row[1] for row in run("n", "--defuse-formulas")], ["n", "-1.5", "-Inf"])
        self.assertIn("CSV", self.assert_misused("dump", "texts.cdf", "0", "--defuse-formulas"))

    def test_json_is_nested_with_the_first_index_innermost(self):
        cube = self.data("cube")
        self.assertEqual([len(cube), len(cube[0]), len(cube[0][0]), len(cube[0][0][0])],
                         [3, 4, 3, 2])
        self.assertEqual(cube[2][3][2], [70, 71])
        self.assertEqual(self.data("texts"), [[["caf\u00e9", "b    "], ["c    ", "d    "]]])

    def test_variables_are_known_by_number_too(self):
        self.assertEqual(self.dump("2"), self.dump("CDF_INT2"))

    def test_records(self):
        for records, expected in (("0:0", [0]), ("1:2", [24, 48]), ("2", [48]), (":1", [0, 24]),
                                  ("1:", [24, 48]), (":", [0, 24, 48]), ("1:99", [24, 48])):
            self.assertEqual([record[0][0][0] for record in self.data("cube", "--records", records)],
                             expected, records)
        for variable, records, message in (("cube", "3", "the variable has records 0 to 2"),
                                           ("texts", "1", "the variable has only record 0"),
                                           ("empty", "0", "the variable has no records")):
            self.assertEqual(self.assert_fails("ambrix:noSuchRecord", "dump", "example.cdf",
                                               variable, "--records", records),
                             "example.cdf: " + message)
        for records in ("2:1", "x", "1:x", "1:2:3", "1.5"):
            self.assert_misused("dump", "example.cdf", "cube", "--records", records)

    def test_records_that_are_not_stored(self):
        self.assertEqual(self.data("sparse PAD"), [[-9] * 3] * 2 + [[2, 1, 2]] + [[-9] * 3] * 2
                         + [[5, 1, 2]])
        self.assertEqual(self.data("sparse PREV"), [[-9] * 3] * 2 + [[2, 1, 2]] * 3 + [[5, 1, 2]])
        self.assertEqual(self.data("empty"), [])

    def test_a_record_too_large_to_be_read_at_once(self):
        session = self.session()
        call = session.call
        (file,) = call("create", "large")
        sizes = [3, 1000, 400]
        call("createVar", file, "v", session.constant("CDF_INT4"), 1, sizes, True, [True] * 3)
        for plane in (0, 250, 399):
            call("putVarData", file, 0, 1, [2, 999, plane], array("int32", [plane + 1]))
        call("close", file)
        rows = [r for r in csv.reader(io.StringIO(
            self.output("dump", "large.cdf", "v", "--records", "1", "--format", "csv")))]
        self.assertEqual(len(rows), 3 * 1000 * 400 + 1)
        self.assertEqual(rows[1 + 2 + 3 * (999 + 1000 * 250)], ["1", "2", "999", "250", "251"])
        self.assertEqual(rows[-1], ["1", "2", "999", "399", "400"])

    def dump_all(self, variable, *options):
        """Of "times.cdf": the values in a table, in CSV and in JSON."""
        run = lambda form: self.output("dump", "times.cdf", variable, "--format", form, *options)
        table, rows = (run(form).splitlines()[1:] for form in ("table", "csv"))
        return ([line.split()[-1] for line in table], [row.split(",")[-1] for row in rows],
                json.loads(run("json"))["data"])

    def test_integers_of_64_bits(self):
        self.write_times()
        texts = [str(value) for value in INTEGERS]
        self.assertEqual(self.dump_all("count"), (texts, texts, [INTEGERS[:2], INTEGERS[2:]]))

    def test_tt2000_times(self):
        """Fill and pad values are no times."""
        self.write_times()
        shown = [*map(str, TIMES[:2]), *TIME_TEXTS]
        self.assertEqual(self.dump_all("Epoch"), (shown, shown, TIMES[:2] + TIME_TEXTS))

    def test_raw_times(self):
        self.write_times()
        texts = [str(value) for value in TIMES]
        self.assertEqual(self.dump_all("Epoch", "--raw-times"), (texts, texts, TIMES))
        self.assertEqual(self.data("CDF_EPOCH", "--raw-times"), [62987673600000, -1e31])
        self.assertEqual(self.data("fine", "--raw-times"), ["63251680091 22033044055"])
        self.assertEqual(self.data("CDF_INT2", "--raw-times"), self.data("CDF_INT2"))

    def test_failures(self):
        message = self.assert_fails("ambrix:noSuchVariable", "dump", "example.cdf", "nonsense")
        self.assertIn('"nonsense"', message)
        self.assertIn("'ambrix info'", message)
        self.assert_fails("ambrix:noSuchVariable", "dump", "example.cdf", "99")
        self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "dump", "missing.cdf", "v")
        message = self.assert_fails("ambrix:noSuchVariable", "dump", "example.cdf", "\x1b[2J\u202e")
        self.assertTrue(message.startswith('example.cdf: there is no variable "\\x1b[2J\\u202e"'))
        self.assert_misused("dump", "example.cdf")
        self.assert_misused("dump", "example.cdf", "cube", "--format", "xml")


if __name__ == "__main__":
    unittest.main()
