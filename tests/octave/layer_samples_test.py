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
from readers.content import INT8, TT2000, attempt
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
                    theirs = attempt(reader.read, str(written))
                    self.check(reader, f"converted_{name}", self.mine(path), theirs)

    def test_reads_64_bit_integers_and_tt2000_times(self):
        found = {INT8: 0, TT2000: 0}
        for path in self.files.values():
            for variable in self.mine(path).variables.values():
                if variable.code in found:
                    found[variable.code] += variable.values.size > 0
        self.assertGreater(min(found.values()), 0, found)

    def check(self, reader, name, mine, theirs):
        rest, _ = unexplained(reader, name, differences(mine, theirs))
        self.assertEqual(rest, [])


if __name__ == "__main__":
    unittest.main()
