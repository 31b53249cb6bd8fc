"""What the module writes, and real files, as jcdf reads them: it knows every compression."""

import os
import unittest

from readers import jcdf_reader
from readers.case import ReadersCase, unexplained
from readers.comparison import differences
from readers.known_faults import rows_for
from readers.sample_files import readable_files
from readers.written_files import ALL_COMPRESSIONS, everything

LARGE = 600000  # bytes; larger files are left to the other readers


@unittest.skipIf(jcdf_reader.why_not(), jcdf_reader.why_not())
class JcdfTest(ReadersCase):
    def compare(self, contents, names=None):
        """Contents by path: the module's, or what was written."""
        used = set()
        names = names or {path: os.path.basename(path) for path in contents}
        for (path, mine), theirs in zip(contents.items(), jcdf_reader.read_all(contents)):
            with self.subTest(file=path):
                found = differences(mine, theirs)
                rest, rows = unexplained(jcdf_reader, names[path], found)
                used |= rows
                self.assertEqual(rest, [])
        self.assertEqual(set(rows_for("jcdf", names.values())) - used, set(),
                         "known faults that are none any more")

    def test_written_files(self):
        contents = {}
        for number, compression in enumerate((None, None, *ALL_COMPRESSIONS)):
            path = os.path.join(self.folder, f"{number}.cdf")
            contents[path] = everything(self.session, path, number % 2 == 0, compression,
                                        ALL_COMPRESSIONS)
        self.compare(contents, {path: "written.cdf" for path in contents})

    def test_real_files(self):
        paths = [path for path in readable_files().values() if path.stat().st_size < LARGE]
        self.compare({str(path): self.read(path) for path in paths})


if __name__ == "__main__":
    unittest.main()
