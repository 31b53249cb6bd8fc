"""The built module exports its two functions and finds its libraries wherever it is moved.

usage: module_binary_test.py MODULE
"""
import pathlib
import re
import subprocess
import sys
import unittest

MODULE = sys.argv.pop()
INFLATER = pathlib.Path(MODULE).with_name("libambrix_inflate.so")


def output(*command):
    return subprocess.run(command, check=True, stdout=subprocess.PIPE, text=True).stdout


class ModuleBinaryTest(unittest.TestCase):
    def test_exports_the_entry_point_and_the_handshake_only(self):
        symbols = output("nm", "-D", "--defined-only", "--format=posix", MODULE)
        names = sorted(line.split()[0] for line in symbols.splitlines())
        self.assertEqual(names, ["qvhFunction", "qvhfilerequiredapiversion"])

    def test_takes_the_array_interface_from_its_host(self):
        wanted = output("nm", "-D", "--undefined-only", "--demangle", MODULE)
        self.assertIn("qvErrMsgId", wanted)

    def test_names_libraries_without_a_folder(self):
        needed = re.findall(r"\(NEEDED\).*\[(.*)\]", output("readelf", "-d", "-W", MODULE))
        self.assertIn("libc.so.6", needed)
        self.assertEqual([name for name in needed if "/" in name], [])

    def test_needs_the_inflater_before_the_library_that_it_stands_before(self):
        if not INFLATER.exists():
            self.skipTest("the inflater is not built here")
        needed = re.findall(r"\(NEEDED\).*\[(.*)\]", output("readelf", "-d", "-W", MODULE))
        self.assertLess(needed.index(INFLATER.name), needed.index("libcdf.so"))
        symbols = output("nm", "-D", "--defined-only", "--format=posix", INFLATER)
        names = sorted(line.split()[0] for line in symbols.splitlines())
        self.assertEqual(names,
                         ["ambrixInflater", "z_inflate", "z_inflateEnd", "z_inflateInit2_"])

    def test_the_inflater_can_do_without_isa_l(self):
        if not INFLATER.exists():
            self.skipTest("the inflater is not built here")
        self.assertNotIn("libisal", output("readelf", "-d", "-W", INFLATER))

    def test_looks_beside_itself_first_and_never_in_the_current_folder(self):
        paths = re.findall(r"\((?:RUNPATH|RPATH)\).*\[(.*)\]", output("readelf", "-d", "-W", MODULE))
        self.assertEqual(len(paths), 1)
        folders = paths[0].split(":")
        self.assertEqual(folders[0], "$ORIGIN")
        self.assertNotIn("", folders)


if __name__ == "__main__":
    unittest.main()
