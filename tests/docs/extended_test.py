"""The examples of docs/extended.md print what the document shows.

usage: extended_test.py            compares
       extended_test.py record     writes what they print into the document

The environment variable AMBRIX_TOOL is the path of the tool.
"""
import pathlib
import re
import sys
import unittest

import examples
import table_file

DOCUMENT = pathlib.Path(__file__).resolve().parents[2] / "docs" / "extended.md"
EXAMPLE = re.compile(r"^```\n(> .*?)^```$", re.M | re.S)


def run_all(text):
    """The examples in the text as they are, and as they should be."""
    found = [match.splitlines() for match in EXAMPLE.findall(text)]
    with examples.Runner(table_file.read(), ["--extended"]) as runner:
        return found, [runner.run(example) for example in found]


class ExtendedTest(unittest.TestCase):
    def test_examples_print_what_is_shown(self):
        found, expected = run_all(DOCUMENT.read_text())
        self.assertGreaterEqual(len(found), 3)
        self.assertEqual(found, expected)


def record():
    text = DOCUMENT.read_text()
    printed = iter(run_all(text)[1])
    text = EXAMPLE.sub(lambda _: "```\n" + "\n".join(next(printed)) + "\n```", text)
    DOCUMENT.write_text(text)


if __name__ == "__main__":
    record() if sys.argv[1:] == ["record"] else unittest.main()
