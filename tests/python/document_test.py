"""The examples in docs/python.md print what the document says."""
import doctest
import os
import pathlib
import re
import shutil
import tempfile
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
DOCUMENT = ROOT / "docs" / "python.md"
FLAGS = doctest.ELLIPSIS | doctest.NORMALIZE_WHITESPACE


class DocumentTest(unittest.TestCase):
    def test_the_examples_print_what_the_document_says(self):
        samples = os.environ.get("AMBRIX_CDF_SAMPLES")
        if not samples:
            self.skipTest("the CDF distribution's samples are not known")
        with tempfile.TemporaryDirectory() as folder:
            for name in set(re.findall(r"`(\w+\.cdf)`", DOCUMENT.read_text())):
                shutil.copy(pathlib.Path(samples) / name, folder)
            os.chdir(folder)
            failed, tried = doctest.testfile(str(DOCUMENT), module_relative=False,
                                             optionflags=FLAGS)
            os.chdir(ROOT)
        self.assertGreater(tried, 4)
        self.assertEqual(failed, 0)


if __name__ == "__main__":
    unittest.main()
