"""Files read the same whichever inflater serves the CDF library, also when they are damaged.

Damage that zlib refuses may spare all that the stream needs: one file in some 100,000. More files
than usual are read when AMBRIX_DAMAGED_FILES says how many; AMBRIX_SEED makes others.
"""

import os
import pathlib
import random
import subprocess
import tempfile
import unittest

from inflate.compressed_files import damaged, make_files, streams_in
from inflate.file_contents import Reader
from readers.sample_files import readable_files

FILES = int(os.environ.get("AMBRIX_DAMAGED_FILES", 500))
SEED = int(os.environ.get("AMBRIX_SEED", 1))
KEPT = os.environ.get("AMBRIX_KEEP")  # a folder for the files that differ


def inflater(name):
    told = subprocess.run([os.environ["AMBRIX_TOOL"], "--version"], capture_output=True, text=True,
                          check=True, env=dict(os.environ, AMBRIX_INFLATER=name))
    return told.stdout.splitlines()[-1]


class SameContentsTest(unittest.TestCase):
    def setUp(self):
        if inflater("") != "Inflater ISA-L":
            self.skipTest("the CDF library inflates by itself here")
        folder = tempfile.TemporaryDirectory(prefix="ambrix-inflate-")
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)
        self.readers = [Reader("", self.folder), Reader("cdf", self.folder)]
        for reader in self.readers:
            self.addCleanup(reader.close)

    def contents(self, path):
        return [reader.contents(path) for reader in self.readers]

    def test_the_environment_chooses(self):
        self.assertEqual(inflater("cdf"), "Inflater CDF library")

    def test_sound_files(self):
        compressed = 0
        for path in [*make_files(self.folder, 10000), *readable_files().values()]:
            compressed += bool(streams_in(path.read_bytes()))
            with self.subTest(file=path.name):
                own, library = self.contents(path)
                self.assertEqual(own, library)
        self.assertGreater(compressed, 1)

    def test_damaged_files(self):
        chance = random.Random(SEED)
        sound = [path.read_bytes() for path in make_files(self.folder, 300)]
        path = self.folder / "damaged.cdf"
        refused = 0
        for number in range(FILES):
            content = damaged(chance.choice(sound), chance)
            path.write_bytes(content)
            own, library = self.contents(path)
            refused += any("ZLIB" in str(answer) for answer in library)
            if own != library and KEPT:
                pathlib.Path(KEPT, f"{SEED}-{number}.cdf").write_bytes(content)
            with self.subTest(number=number):
                self.assertEqual(own, library)
        self.assertGreater(refused, FILES / 10)


if __name__ == "__main__":
    unittest.main()
