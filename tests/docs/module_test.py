"""The table of commands agrees with the running module."""
import pathlib
import sys
import tempfile
import unittest

sys.path.insert(0, str(pathlib.Path(__file__).parent))

from examples import PROMPT, CallError, Runner, Session, inputs  # noqa: E402
from ambrix_session import Array  # noqa: E402
import table_file  # noqa: E402

TABLE = table_file.read()
COMMANDS = TABLE["commands"]
LIBRARY_OF_EXAMPLES = [3, 9, 1]
INT8 = Array("int8", [1, 1], [5])
CELL = Array("cell", [1, 1], [1.0])
TOO_LARGE = 1e19

# What an argument of a kind is taken for, to reach the arguments behind it.
STAND_INS = {"number": 1.0, "numbers": [], "text": "x", "file name": "x", "variances": [],
             "times": [], "value": INT8}
# Arguments of a kind that cannot be converted, with the errors that they raise.
WRONG = {
    "file": [(0.0, "argumentNotUint64Scalar", True),
             (Array("uint64", [1, 1], [1]), "invalidFileId", False)],
    "number": [(INT8, "argumentNotDoubleScalar", True), ([], "argumentNotDoubleScalar", True),
               (TOO_LARGE, "argumentOutOfBounds", False)],
    "numbers": [(CELL, "argumentNotDoublePrecision", True),
                ([TOO_LARGE], "argumentOutOfBounds", False)],
    "variances": [("T", "badVarianceDatatype", False), (TOO_LARGE, "argumentOutOfBounds", False)],
    "text": [(0.0, "", False)],
    "file name": [(0.0, "", False), (Array("char", [1, 1], "\ud800"), "invalidCharError", False)],
}


def takes_file(command):
    return any(argument["kind"] == "file" for argument in command["arguments"])


def stand_ins(command, file):
    return [file if argument["kind"] == "file" else STAND_INS[argument["kind"]]
            for argument in command["arguments"]]


def wrong_arguments():
    for command in COMMANDS:
        for position, argument in enumerate(command["arguments"]):
            for wrong, name, labelled in WRONG.get(argument["kind"], []):
                yield command, position, wrong, name, [argument["label"]] if labelled else []


class RunningModuleTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.runner = Runner(TABLE)
        cls.session = Session(cwd=cls.runner.home)
        (cls.file,) = cls.session.call("open", "example.cdf")

    @classmethod
    def tearDownClass(cls):
        cls.session.close()
        cls.runner.__exit__()

    def error_of(self, command, *arguments):
        with self.assertRaises(CallError) as raised:
            self.session.call(command, *arguments)
        return raised.exception

    def test_commands_take_as_many_arguments_as_they_list(self):
        for command in COMMANDS:
            most = len(command["arguments"])
            least = sum(not argument.get("optional") for argument in command["arguments"])
            for count in {least - 1, most + 1} - {-1}:
                with self.subTest(command=command["name"], count=count):
                    error = self.error_of(command["name"], *[CELL] * count)
                    self.assertEqual(error.name, "wrongNumberOfInputs")
            for count in {least, most} - {0}:
                with self.subTest(command=command["name"], count=count):
                    error = self.error_of(command["name"], *[CELL] * count)
                    self.assertNotIn(error.name, ("wrongNumberOfInputs", "invalidOperation"))

    def test_there_is_no_command_of_another_spelling(self):
        for command in COMMANDS:
            other = command["name"].upper()
            self.assertEqual(self.error_of(other, CELL).name, "invalidOperation")

    def test_arguments_of_a_wrong_kind_raise_the_errors_of_the_kind_with_the_label(self):
        for command, position, wrong, name, values in wrong_arguments():
            with self.subTest(command=command["name"], position=position, wrong=wrong):
                arguments = stand_ins(command, self.file)
                arguments[position] = wrong
                error = self.error_of(command["name"], *arguments)
                self.assertEqual((error.name, error.values), (name, values))

    def test_a_file_that_the_library_refuses_is_reported_under_the_first_routine(self):
        with tempfile.TemporaryDirectory() as folder, Session(cwd=folder) as session:
            (file,) = session.call("create", "freed")
            session.call("setChecksum", file, session.constant("OTHER_CHECKSUM"))
            with self.assertRaises(CallError):  # but the library lets the file go
                session.call("close", file)
            for command in filter(takes_file, COMMANDS):
                with self.subTest(command=command["name"]):
                    arguments = stand_ins(command, file)
                    if command["name"] == "createVar":
                        arguments[5] = True  # one record variance there must be
                    self.check_refused(session, command, arguments)

    def check_refused(self, session, command, arguments):
        with self.assertRaises(CallError) as raised:
            session.call(command["name"], *arguments)
        self.assertEqual(raised.exception.name, "libraryFailure")
        self.assertEqual(raised.exception.values[0], command["routines"][0])

    def test_the_constants_are_those_listed(self):
        listed = {}
        for row in TABLE["constants"]:
            listed.update(row["values"])
        names = [cell.data for cell in self.session.call("getConstantNames")[0].data]
        self.assertEqual({name: self.session.constant(name) for name in names}, listed)

    def test_the_datatypes_have_the_classes_listed(self):
        with tempfile.TemporaryDirectory() as folder, Session(cwd=folder) as session:
            (file,) = session.call("create", "datatypes")
            for row in TABLE["datatypes"]:
                with self.subTest(datatype=row["name"]):
                    definition = (row["name"], row["code"], 1, [], True, [])
                    number = session.value("createVar", file, *definition)
                    datatype = session.values("inquireVar", file, number)[1]
                    self.assertEqual(datatype, row["name"].lower())
                    (pad,) = session.call("getVarPadValue", file, number)
                    self.assertEqual(pad.class_name, row["class"])

    def test_each_identifier_is_raised_by_its_cause_with_the_values_listed(self):
        kinds = {"integer": int, "text": str}
        for row in TABLE["identifiers"]:
            if row.get("warning") == "only":
                continue
            with self.subTest(identifier=row["identifier"]):
                error = self.cause(row["cause"][0])
                self.assertEqual(error.identifier, f"{row['component']}:{row['identifier']}")
                self.assertEqual([type(value) for value in error.values],
                                 [kinds[kind] for kind, _ in row["values"]])

    def cause(self, line):
        with tempfile.TemporaryDirectory() as folder:
            with self.assertRaises(CallError) as raised:
                self.runner.raise_from(line, folder)
            return raised.exception

    def test_open_files_are_warned_of_at_unload(self):
        with tempfile.TemporaryDirectory() as folder, Session(cwd=folder) as session:
            session.call("create", "left_open")
        (warning,) = session.unload_warnings
        self.assertEqual(warning["identifier"], "TOLVEX:ambrix:cdflib:closingFileHandle")
        self.assertEqual(warning["values"], [])


class ExamplesTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.runner = Runner(TABLE)
        with Session(cwd=cls.runner.home) as session:
            version = session.values("getLibraryVersion")
        cls.same_library = version == LIBRARY_OF_EXAMPLES
        cls.ran = {c["name"]: cls.runner.run(c["example"]) for c in COMMANDS}

    @classmethod
    def tearDownClass(cls):
        cls.runner.__exit__()

    def test_each_example_prints_what_the_manual_shows(self):
        for command in COMMANDS:
            if command.get("depends_on_library") and not self.same_library:
                continue
            with self.subTest(command=command["name"]):
                self.assertEqual(self.ran[command["name"]], command["example"])

    def test_each_example_calls_its_command_and_shows_something(self):
        called = {name for name, _, _ in self.runner.calls}
        for command in COMMANDS:
            with self.subTest(command=command["name"]):
                self.assertIn(command["name"], called)
                text = "\n".join(inputs(command["example"]))
                self.assertRegex(text, rf"\b{command['name']} \(")
                self.assertTrue(any(not line.startswith(PROMPT) for line in command["example"]))

    def test_results_are_as_many_and_of_the_classes_and_sizes_listed(self):
        documented = {command["name"]: command["results"] for command in COMMANDS}
        for name, _, results in self.runner.calls:
            with self.subTest(command=name):
                self.assertEqual(len(results), len(documented[name]))
                for result, row in zip(results, documented[name]):
                    self.check_result(result, row)

    def check_result(self, result, row):
        if not row["class"].startswith("that of"):
            self.assertIn(result.class_name, row["class"].split(" or "))
        first, by, second = row["size"].partition("-by-")
        if by and first.isdigit() and (second.isdigit() or second == "n"):
            sizes = [int(first), int(second) if second != "n" else result.size[1]]
            self.assertEqual(result.size, sizes)


if __name__ == "__main__":
    unittest.main()
