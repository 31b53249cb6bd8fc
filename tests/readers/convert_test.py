"""Converted files hold what the originals do, as independent readers see both."""

import os
import subprocess
import unittest

from readers import spacepy_reader
from readers.case import READERS, ReadersCase, reference, unexplained
from readers.comparison import differences
from readers.content import attempt
from readers.sample_files import FOLDER, UNREADABLE, needs_folder, readable_files

TOOL = os.environ["AMBRIX_TOOL"]
SMALL = 200000  # bytes; the options are tried on the files that are smaller


class ConvertTest(ReadersCase):
    def convert(self, path, *options):
        out = os.path.join(self.folder, path.name)
        if os.path.exists(out):
            os.remove(out)
        done = subprocess.run([TOOL, "convert", str(path), out, *options], capture_output=True,
                              text=True, cwd=self.folder)
        return done, out

    def check(self, path, *options, row_major=None):
        """Compares the converted file with the original, read through the module, which was itself
        compared with the readers."""
        original = self.read(path)
        done, out = self.convert(path, *options)
        self.assertEqual(done.returncode, 0, done.stderr)
        expected = self.with_declared_pads(original, path)
        if row_major is not None:
            expected.row_major = row_major
        for reader in (*READERS, spacepy_reader):
            found = differences(expected, attempt(reader.read, out))
            rest, _ = unexplained(reader, "converted_" + path.name, found)
            self.assertEqual(rest, [], reader.NAME)
        self.assertEqual(differences(expected, self.read(out)), [])
        return out

    @staticmethod
    def with_declared_pads(content, path):
        """A pad value that the file leaves to the library is not compared."""
        for name, theirs in reference(content, path).items():
            if theirs.pad is None and name in content.variables:
                content.variables[name].pad = None
        return content

    def test_every_file(self):
        for name, path in readable_files().items():
            with self.subTest(file=name):
                self.check(path)

    def small_files(self):
        return [path for path in readable_files().values() if path.stat().st_size < SMALL]

    def test_compressed(self):
        for path in self.small_files()[::4]:
            with self.subTest(file=path.name):
                out = self.check(path, "--compression", "gzip:6")
                with open(out, "rb") as file:  # a compressed file begins so
                    self.assertEqual(file.read(8).hex(), "cdf30001cccc0001")

    def test_the_other_majority(self):
        for path in self.small_files()[1::4]:
            for majority in ("row", "column"):
                with self.subTest(file=path.name, majority=majority):
                    self.check(path, "--majority", majority, row_major=majority == "row")

    @needs_folder
    def test_both_majorities_of_many_dimensions(self):
        for name in ("a_cdf.cdf", "a_col_major_cdf.cdf"):
            for majority in ("row", "column"):
                with self.subTest(file=name, majority=majority):
                    self.check(FOLDER / name, "--majority", majority, row_major=majority == "row")

    @needs_folder
    def test_an_unreadable_file(self):
        for name in UNREADABLE:
            done, out = self.convert(FOLDER / name)
            self.assertEqual(done.returncode, 1)
            self.assertIn("fileOpenError", done.stderr)
            self.assertFalse(os.path.exists(out))


if __name__ == "__main__":
    unittest.main()
