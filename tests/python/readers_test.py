"""Everything in real files as the package for Python reads it, against independent readers."""
import os
import sys
import tempfile
import unittest
import warnings

import numpy as np
import pycdfpp

import ambrix
import package_reader
from readers.case import READERS, read_by, unexplained
from readers.comparison import differences, same_numbers
from readers.sample_files import readable_files

# SpacePy has a CDF library of its own, and writes into a folder for its settings.
SETTINGS = tempfile.TemporaryDirectory()
os.environ["SPACEPY"] = SETTINGS.name

# Compressed with HUFF or AHUFF, or with numbers that are not IEEE 754's.
UNREAD_BY_PYCDFPP = ("a_cdf_huff.cdf", "geocpi0.cdf", "geocpi1.cdf", "geocpi2.cdf",
                     "alltypes_vax.cdf", "alltypes_alphavmsd.cdf", "alltypes_alphavmsg.cdf")


class IndependentReadersTest(unittest.TestCase):
    def test_all_that_is_in_files_is_what_others_read(self):
        for name, path in readable_files().items():
            mine = package_reader.read(str(path))
            for reader in READERS:
                with self.subTest(file=name, reader=reader.NAME):
                    rest, _ = unexplained(reader, name, differences(mine, read_by(reader, path)))
                    self.assertEqual(rest, [])

    def test_times_are_those_of_pycdfpp(self):
        compared = 0
        for name, path in readable_files().items():
            other = pycdfpp.load(str(path)) if name not in UNREAD_BY_PYCDFPP else {}
            with ambrix.open(path) as file:
                for variable in file.values():
                    if variable.dtype.kind == "M" and variable.size and variable.name in other:
                        with self.subTest(file=name, variable=variable.name):
                            self.compare_times(variable, other[variable.name])
                            compared += variable.size
        self.assertGreater(compared, 100)

    def compare_times(self, variable, other):
        """Of values that are no times pycdfpp makes what it likes; picoseconds it cuts off."""
        mine, theirs = variable[...], pycdfpp.to_datetime64(other)
        if theirs.size != mine.size:  # without the dimensions that do not vary
            theirs = theirs.reshape(len(mine), *[1] * (mine.ndim - 1))
        more = (mine - theirs.reshape(mine.shape) if theirs.size == mine.size else mine - theirs)
        cut = variable.datatype == "CDF_EPOCH16"
        self.assertTrue(np.all(np.isnat(mine) | (more >= np.timedelta64(0, "ns"))
                               & (more <= np.timedelta64(int(cut), "ns"))))

    def test_bytes_are_read_as_files_are(self):
        for name, path in readable_files().items():
            with self.subTest(file=name), ambrix.open(path) as file, \
                    ambrix.open(path.read_bytes()) as same:
                self.assertEqual(list(file), list(same))
                last = list(file)[-1]
                self.assertEqual(file[last].raw[...].tobytes(), same[last].raw[...].tobytes())


def spacepy_values(variable):
    """All values of a variable of SpacePy's; of one without records, as long as it has one."""
    return np.asarray(variable[...])


class SpacepyTest(unittest.TestCase):
    def setUp(self):
        warnings.simplefilter("ignore")  # SpacePy's own
        try:
            from spacepy import pycdf
        except ImportError as error:
            self.skipTest(f"SpacePy is not installed: {error}")
        self.pycdf = pycdf

    def test_raw_values_are_spacepys(self):
        compared = 0
        for name, path in readable_files().items():
            with ambrix.open(path) as file, self.pycdf.CDF(str(path)) as other:
                for variable in file.values():
                    with self.subTest(file=name, variable=variable.name):
                        theirs = spacepy_values(other.raw_var(variable.name))
                        self.compare(variable, theirs)
                        compared += 1
        self.assertGreater(compared, 20)

    def compare(self, variable, theirs):
        mine = np.asarray(variable.raw)
        if not variable.record_varies and variable.records == 0:
            self.assertEqual(theirs.size, 0)  # no record was written: the pad value is read
        elif variable.raw.dtype.kind == "S":
            if package_reader.GIVES_BLANKS:
                mine, theirs = np.char.rstrip(mine), np.char.rstrip(theirs)
            self.assertEqual(mine.tolist(), theirs.tolist())
        elif theirs.ndim == 0:  # which has lost its datatype
            self.assertEqual(mine.astype(theirs.dtype), theirs)
        else:
            self.assertTrue(same_numbers(mine, theirs.astype(mine.dtype.newbyteorder("="))))


if __name__ == "__main__":
    sys.exit(unittest.main())
