"""The table of commands agrees with the sources, and the manual with the table."""
import pathlib
import re
import subprocess
import sys
import unittest

sys.path.insert(0, str(pathlib.Path(__file__).parent))

import table_file  # noqa: E402

ROOT = table_file.ROOT
TABLE = table_file.read()
COMMANDS = TABLE["commands"]
MODULE = ("gateway", "constants", "file", "attributes", "variables", "epoch")


def sources():
    files = [path for folder in MODULE for path in (ROOT / folder).rglob("*.[ch]*")]
    return "".join(path.read_text() for path in files)


def counts(command):
    """How many arguments it takes, at least and at most."""
    required = [a for a in command["arguments"] if not a.get("optional")]
    return len(required), len(command["arguments"])


def label_of(word, labels):
    """Of an argument in the table of the tests, such as "[record=STARTREC]": label and optional."""
    kind, _, label = word.strip("[]").partition("=")
    return label or labels[kind], word.startswith("[")


class TableTest(unittest.TestCase):
    def test_the_manual_is_what_the_table_gives(self):
        done = subprocess.run([ROOT / "script" / "docs", "--check"], check=False)
        self.assertEqual(done.returncode, 0)

    def test_the_table_is_in_its_own_layout(self):
        self.assertEqual(table_file.PATH.read_text(), table_file.layout(TABLE) + "\n")

    def test_has_each_command_once_with_its_counts(self):
        text = (ROOT / "gateway" / "entry" / "command_table.cc").read_text()
        rows = re.findall(r'\{ ?\d+, "(\w+)", +(\d), (\d), ', text)
        self.assertEqual(len(rows), 91)
        self.assertEqual(sorted((c["name"], *counts(c)) for c in COMMANDS),
                         sorted((name, int(least), int(most)) for name, least, most in rows))

    def test_the_table_of_the_tests_has_the_same_arguments_under_the_same_labels(self):
        text = (ROOT / "tests" / "support" / "command_signatures.cc").read_text()
        labels = dict(re.findall(r'\{"(\w+)", Conversion::\w+, "(\w*)"\}', text))
        rows = {name: [label_of(word, labels) for word in arguments.split()]
                for name, arguments in re.findall(r'\{\d+, "(\w+)",\s+"([^"]*)"', text)}
        for command in COMMANDS:
            with self.subTest(command=command["name"]):
                listed = [(argument.get("label", ""), argument.get("optional", False))
                          for argument in command["arguments"]]
                self.assertEqual(rows[command["name"]], listed)

    def test_each_message_has_a_text_and_its_text_a_test(self):
        listed = {f"{row['component']}:{row['identifier']}" for row in TABLE["identifiers"]}
        texts = (ROOT / "adapters/catalogue/message_texts.cc").read_text()
        worded = set(re.findall(r'\{"(TOLVEX:[\w:]+)",', texts))
        self.assertEqual({name for name in worded if ":host:" not in name}, listed)
        tests = (ROOT / "tests/support/known_messages.cc").read_text()
        components = dict(re.findall(r'(k\w+) = "(TOLVEX:[\w:]+)"', tests))
        tried = {f"{components[kind]}:{name}"
                 for kind, name in re.findall(r'\{\{(k\w+), "(\w+)"', tests)}
        self.assertEqual(tried, worded)

    def test_each_message_of_a_host_has_a_text(self):
        raised = {f"TOLVEX:host:{name}" for path in (ROOT / "adapters").rglob("*.cc")
                  for name in re.findall(r'"TOLVEX:host", "(\w+)"', path.read_text())}
        texts = (ROOT / "adapters/catalogue/message_texts.cc").read_text()
        self.assertEqual(raised, set(re.findall(r'\{"(TOLVEX:host:\w+)",', texts)))

    def test_has_each_identifier_once_with_as_many_values(self):
        text = (ROOT / "gateway" / "errors.h").read_text()
        found = []
        for component, body in re.findall(r'namespace TOLVEX::ambrix::(\w+) \{(.*?)\n\}  //', text,
                                          re.S):
            for name, parameters in re.findall(r"struct \w+ : Error \{\s+(?:explicit )?(\w+)"
                                               r"\((.*?)\)\s+:", body, re.S):
                count = parameters.count(",") + 1 if parameters else 0
                found.append((f"TOLVEX:ambrix:{component}", name, count))
        listed = [(row["component"], row["identifier"], len(row["values"]))
                  for row in TABLE["identifiers"]]
        self.assertEqual(sorted(listed), sorted(found))

    def test_commands_raise_identifiers_that_there_are_with_all_their_values(self):
        expected = {row["identifier"]: len(row["values"]) for row in TABLE["identifiers"]}
        rows = [row for command in COMMANDS
                for row in command["errors"] + command.get("warnings", [])]
        rows += [row for kind in TABLE["argument_kinds"] for row in kind["errors"]]
        for row in rows:
            with self.subTest(row=row):
                self.assertEqual(len(row["values"]), expected.get(row["identifier"]))

    def test_names_the_routines_that_the_module_names(self):
        in_sources = set(re.findall(r'"(CDF[a-z]\w+)"', sources()))
        in_table = {routine for command in COMMANDS for routine in command["routines"]}
        self.assertEqual(in_table, in_sources)

    def test_constants_that_arguments_take_are_listed(self):
        kinds = {row["kind"] for row in TABLE["constants"]}
        taken = {a["constant"] for command in COMMANDS for a in command["arguments"]
                 if "constant" in a}
        self.assertEqual(kinds - taken, {"encoding"})  # which no command sets
        self.assertEqual(taken - kinds, set())

    def test_names_the_labels_that_the_module_names(self):
        labels = {a["label"] for command in COMMANDS for a in command["arguments"] if "label" in a}
        for label in labels - {"VARIANCE"}:  # stands for a value there, not for an argument
            with self.subTest(label=label):
                self.assertIn(f'"{label}"', sources())


if __name__ == "__main__":
    unittest.main()
