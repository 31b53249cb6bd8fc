"""What the module writes, as the CDF distribution's own tools see it, and what these write.

They know HUFF and AHUFF compression, which the other readers do not.
"""

import os
import subprocess
import unittest
from pathlib import Path

from readers.case import READERS, ReadersCase, unexplained
from readers.comparison import differences
from readers.content import attempt
from readers.file_writer import FileWriter
from readers.sample_files import distribution_files
from readers.written_files import ALL_COMPRESSIONS, everything

TOOLS = os.environ.get("AMBRIX_CDF_TOOLS", "")
# Where an address sanitizer was linked in: the tools never free what they have.
ENVIRONMENT = {**os.environ, "ASAN_OPTIONS": "detect_leaks=0"}


@unittest.skipUnless(TOOLS, "the CDF distribution's tools are not built; configure with "
                            "-DAMBRIX_CDF_TOOLS=ON or -DAMBRIX_CDF=source")
class ToolsTest(ReadersCase):
    def run_tool(self, name, *arguments):
        done = subprocess.run([Path(TOOLS) / name, *map(str, arguments)], cwd=self.folder,
                              env=ENVIRONMENT, capture_output=True, text=True, errors="replace")
        self.assertEqual((done.returncode, done.stderr), (0, ""), done.stdout)
        return done.stdout

    def written(self, row_major, compression=None):
        """A new file that holds everything, and what it holds."""
        path = os.path.join(self.folder, "written.cdf")
        if os.path.exists(path):
            os.remove(path)
        return path, everything(self.session, path, row_major, compression, ALL_COMPRESSIONS)

    def check(self, expected, path):
        for reader in READERS:
            found = differences(expected, attempt(reader.read, path))
            rest, _ = unexplained(reader, "written.cdf", found)
            self.assertEqual(rest, [], reader.NAME)

    def test_validate(self):
        for compression in (None, *ALL_COMPRESSIONS):
            for row_major in (True, False):
                with self.subTest(compression=compression, row_major=row_major):
                    path, _ = self.written(row_major, compression)
                    said = self.run_tool("cdfvalidate", path)
                    self.assertEqual(said.strip(), f'Validating "{path}"...')

    def test_values_after_a_conversion_to_no_compression(self):
        for compression in (None, *ALL_COMPRESSIONS):
            with self.subTest(compression=compression):
                path, expected = self.written(compression != "AHUFF", compression)
                plain = os.path.join(self.folder, "plain.cdf")
                self.run_tool("cdfcvt", "-compression", "cdf:none,vars:none", path, plain)
                self.check(expected, plain)
                os.remove(plain)

    def test_values_of_real_files_in_ahuff_after_a_conversion(self):
        for name in ("geocpi0.cdf", "geocpi1.cdf", "geocpi2.cdf"):
            plain = os.path.join(self.folder, name)
            self.run_tool("cdfcvt", "-compression", "cdf:none,vars:none",
                          distribution_files()[name], plain)
            mine = self.read(distribution_files()[name])
            for reader in READERS:
                self.assertEqual(differences(mine, attempt(reader.read, plain)), [], name)

    def test_what_the_converter_writes(self):
        path, expected = self.written(True)
        other = os.path.join(self.folder, "other.cdf")
        for options in (["-encoding", "network"], ["-encoding", "decstation"],
                        ["-compression", "cdf:huff.0"], ["-compression", "cdf:ahuff.0"],
                        ["-compression", "vars:ahuff.0"], ["-compression", "vars:gzip.9"]):
            with self.subTest(options=options):
                self.run_tool("cdfcvt", *options, path, other)
                self.assertEqual(differences(expected, self.read(other)), [])
                os.remove(other)

    def test_dump(self):
        path = os.path.join(self.folder, "small.cdf")
        with FileWriter(self.session, path) as writer:
            writer.create("numbers", 4, (2, 3))
            writer.put("numbers", [[[11, 12, 13], [21, 22, 23]], [[-1, -2, -3], [-4, -5, -6]]])
            writer.create("text", 51, elements=5)
            writer.put_record("text", 0, list(b"words"))
            writer.attribute("title", True)
            writer.entry("title", 0, 51, b"A title")
        said = " ".join(self.run_tool("cdfdump", "-dump", "all", path).split())
        self.assertIn('title (1 entry): 0 (CDF_CHAR/7): "A title"', said)
        self.assertIn("Record # 1: [11,12,13,21,22,23] Record # 2: [-1,-2,-3,-4,-5,-6]", said)
        self.assertIn('Record # 1: "words"', said)


if __name__ == "__main__":
    unittest.main()
