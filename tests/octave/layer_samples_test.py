"""Everything in real files as ambrix_read gives it, and as ambrix_write writes it back, is what the
independent readers find."""

import tempfile
import unittest
import warnings
from pathlib import Path

from octave import octave_reader
from readers import cdflib_reader, pycdfpp_reader
from readers.case import unexplained
from readers.comparison import differences
from readers.content import INT8, TT2000, Unread, attempt
from readers.sample_files import readable_files

READERS = (cdflib_reader, pycdfpp_reader)


class LayerSamplesTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        warnings.simplefilter("ignore")  # the readers' own
        cls.folder = tempfile.TemporaryDirectory()
        cls.files = readable_files()
        octave_reader.read_all(cls.folder.name, cls.files.values())

    @classmethod
    def tearDownClass(cls):
        cls.folder.cleanup()

    def mine(self, path):
        return octave_reader.content(Path(self.folder.name) / f"{path.stem}.bin")

    def test_reads_what_the_independent_readers_read(self):
        for name, path in self.files.items():
            for reader in READERS:
                with self.subTest(file=name, reader=reader.NAME):
                    theirs = attempt(reader.read, str(path))
                    self.check(reader, name, self.mine(path), theirs)

    def test_writes_back_the_same(self):
        for name, path in self.files.items():
            written = Path(self.folder.name) / f"{path.stem}.cdf"
            for reader in READERS:
                with self.subTest(file=name, reader=reader.NAME):
                    mine = self.mine(path)
                    mine.variables = {key: variable for key, variable in mine.variables.items()
                                      if variable is not None}
                    self.drop_entries(mine)
                    theirs = attempt(reader.read, str(written))
                    self.check(reader, f"converted_{name}", mine, theirs)

    @staticmethod
    def drop_entries(content):
        """Those of variables that could not be read, and so are not written."""
        for attribute in content.attributes.values():
            if not attribute.is_global:
                attribute.entries = {key: entry for key, entry in attribute.entries.items()
                                     if key in content.variables}

    def check(self, reader, name, mine, theirs):
        if not isinstance(theirs, Unread):
            for attribute in theirs.attributes.values():
                attribute.entries = {key: entry for key, entry in attribute.entries.items()
                                     if isinstance(entry, Unread)
                                     or entry[0] not in (INT8, TT2000)}
        rest, _ = unexplained(reader, name, differences(mine, theirs))
        self.assertEqual(rest, [])


if __name__ == "__main__":
    unittest.main()
