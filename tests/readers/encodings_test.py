"""The same content in all of the CDF library's encodings, some of which no other reader knows."""

import unittest

from readers import pycdfpp_reader
from readers.case import ReadersCase
from readers.comparison import differences
from readers.sample_files import FOLDER, needs_folder

ORIGINALS = {"alltypes": "nasajava_test.cdf", "a_cdf": "a_cdf.cdf"}


@needs_folder
class EncodingsTest(ReadersCase):
    def test_values_are_those_of_the_original(self):
        """As pycdfpp reads the originals, which are in the encoding of this machine."""
        files = sorted((FOLDER / "encodings").glob("*.cdf"))
        self.assertGreaterEqual(len(files), 12)
        originals = {prefix: pycdfpp_reader.read(str(FOLDER / name))
                     for prefix, name in ORIGINALS.items()}
        for path in files:
            with self.subTest(file=path.name):
                prefix = path.name.rpartition("_")[0]
                self.assertEqual(differences(self.read(path), originals[prefix]), [])

    def test_inquire_names_the_encoding(self):
        expected = {"vax": "VAX", "decstation": "DECSTATION", "sgi": "SGI", "sun": "SUN",
                    "ibmrs": "IBMRS", "hp": "HP", "next": "NEXT", "alphaosf1": "ALPHAOSF1",
                    "alphavmsd": "ALPHAMVSD", "alphavmsg": "ALPHAMVSG", "alphavmsi": "ALPHAMVSI"}
        for suffix, name in expected.items():
            path = FOLDER / "encodings" / f"alltypes_{suffix}.cdf"
            (file,) = self.session.call("open", str(path))
            encoding = self.session.values("inquire", file)[0]
            self.session.call("close", file)
            self.assertEqual(encoding, name + "_ENCODING")


if __name__ == "__main__":
    unittest.main()
