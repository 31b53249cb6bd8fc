"""The tutorial for Octave shows what its examples print."""

import re
import struct
import tempfile
import unittest
from pathlib import Path

from octave import tutorial


class TutorialTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.folder = tempfile.TemporaryDirectory()
        cls.document = tutorial.DOCUMENT.read_text()
        cls.ran = tutorial.run(cls.document, cls.folder.name)

    @classmethod
    def tearDownClass(cls):
        cls.folder.cleanup()

    def test_examples_print_what_the_tutorial_shows(self):
        self.maxDiff = None
        self.assertGreater(len(tutorial.BLOCK.findall(self.document)), 15)
        self.assertEqual(self.lines(self.ran), self.lines(self.document))

    @staticmethod
    def lines(document):
        """Without the version of the CDF library, which the files made here tell."""
        return re.sub(r": CDF 3\.\d+\.\d+,", ": CDF,", document).splitlines()

    def test_pictures_are_drawn(self):
        for name in tutorial.PICTURES:
            with self.subTest(picture=name):
                drawn = (Path(self.folder.name) / name).read_bytes()
                shown = (tutorial.DOCS / name).read_bytes()
                self.assertEqual(self.size(drawn), self.size(shown))
                self.assertGreater(len(drawn), 10000)  # a blank one has some 2000
                self.assertLess(len(shown), 100000)

    @staticmethod
    def size(png):
        """Width and height."""
        return struct.unpack(">II", png[16:24])


if __name__ == "__main__":
    unittest.main()
