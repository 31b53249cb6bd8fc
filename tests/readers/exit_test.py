"""Programs that end with files open, as independent readers find those files afterwards."""

import os
import subprocess
import unittest
from pathlib import Path

from readers.case import READERS, ReadersCase


class ExitTest(ReadersCase):
    def make_kept(self):
        (file,) = self.session.call("create", "kept")
        self.session.call("createVar", file, "v", 4, 1, [], True, [])
        self.session.call("close", file)

    def test_files_left_open_are_whole(self):
        for way, values in {"scope": [1, 2], "static": [1, 2], "exit": [1, 2],
                            "child": [1, 2, 3], "own": [1, 2]}.items():
            self.make_kept()
            subprocess.run([os.environ["AMBRIX_EXIT_PROGRAM"], way], cwd=self.folder, check=True)
            for path in (Path(self.folder, "kept.cdf"), Path(self.folder, "made.cdf")):
                for reader in READERS:
                    with self.subTest(way=way, file=path.name, reader=reader.NAME):
                        variable = reader.read(str(path)).variables["v"]
                        self.assertEqual(variable.values.reshape(-1).tolist(), values)
                path.unlink()


if __name__ == "__main__":
    unittest.main()
