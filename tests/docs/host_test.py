"""docs/writing-a-host.md lists the functions of the host interface, and says who writes them."""
import pathlib
import re
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
HEADERS = ("host/qv.h", "host/qvh.h")
FOLDERS = {"host": ("adapters/embedded", "adapters/octave"), "kit": ("adapters/common",),
           "module": ("gateway/entry", "file")}


def declared():
    """The functions that the headers declare, in their order."""
    text = "".join((ROOT / header).read_text() for header in HEADERS)
    code = re.sub(r"//.*", "", text)
    return re.findall(r"\b(qvh?\w+)\s*\([^()]*\);", code)


def rows():
    """The functions in the tables of the document, with who writes them."""
    text = (ROOT / "docs" / "writing-a-host.md").read_text()
    return re.findall(r"^\| `(qvh?\w+)` \| (\w+) \| \S", text, re.M)


def defined_in(folder):
    text = "\n".join(path.read_text() for path in sorted((ROOT / folder).glob("**/*.cc")))
    return set(re.findall(r"^(?:[\w:*&<>\[\]()\" ]+[ *&])(qvh?\w+)\([^;{}]*\) \{$", text, re.M))


OPTIONAL = {name for name, by in rows() if by == "optional"}


class HostTest(unittest.TestCase):
    def test_the_tables_have_the_declared_functions(self):
        self.assertGreater(len(declared()), 25)
        self.assertEqual([name for name, _ in rows()], declared())

    def test_each_is_written_by_whom_the_table_says(self):
        for writer, folders in FOLDERS.items():
            expected = {name for name, by in rows() if by == writer}
            found = [defined_in(folder) & set(declared()) for folder in folders]
            if writer == "module":
                found = [set().union(*found)]
            for folder, functions in zip(folders, found):
                with self.subTest(writer=writer, folder=folder):
                    self.assertEqual(functions - OPTIONAL, expected)

    def test_what_hosts_may_leave_out_is_in_one_of_them(self):
        written = set().union(*(defined_in(folder) for folder in FOLDERS["host"]))
        self.assertLessEqual(OPTIONAL, written)


if __name__ == "__main__":
    unittest.main()
