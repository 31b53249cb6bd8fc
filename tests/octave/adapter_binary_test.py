"""The oct-file as the loader sees it: one name for others, and none of the hosts' interface open."""
import os
import pathlib
import re
import subprocess
import unittest


def names(kind):
    oct_file = pathlib.Path(os.environ["AMBRIX_OCTAVE"], "__ambrix__.oct")
    listed = subprocess.run(["nm", "-D", kind, oct_file], stdout=subprocess.PIPE, text=True,
                            check=True)
    return [line.split()[-1] for line in listed.stdout.splitlines()]


class BinaryTest(unittest.TestCase):
    def test_only_the_entry_is_exported(self):
        self.assertEqual(names("--defined-only"), ["G__ambrix__"])

    def test_the_interface_is_inside(self):
        wanted = names("--undefined-only")
        self.assertGreater(len(wanted), 0)
        self.assertEqual([name for name in wanted if name.startswith("qv")], [])

    def test_the_inflater_comes_before_the_library(self):
        oct_file = pathlib.Path(os.environ["AMBRIX_OCTAVE"], "__ambrix__.oct")
        listed = subprocess.run(["readelf", "-d", "-W", oct_file], stdout=subprocess.PIPE,
                                text=True, check=True)
        needed = re.findall(r"\(NEEDED\).*\[(.*)\]", listed.stdout)
        if "libambrix_inflate.so" not in needed:
            self.skipTest("the inflater is not built here")
        self.assertLess(needed.index("libambrix_inflate.so"), needed.index("libcdf.so"))


if __name__ == "__main__":
    unittest.main()
