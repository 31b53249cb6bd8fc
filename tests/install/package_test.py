"""The packages work when they are unpacked elsewhere."""

import platform
import re
import shutil
import tempfile
import unittest
from pathlib import Path

from install.tree import BUILD, CPACK, VERSION, TreeChecks, run


class PackageTest(TreeChecks, unittest.TestCase):
    def setUp(self):
        self.folder = Path(tempfile.mkdtemp(prefix="ambrix-package-"))
        self.addCleanup(shutil.rmtree, self.folder)

    def make(self, generator, pattern):
        """The package that CPack makes."""
        run(CPACK, "--config", BUILD / "CPackConfig.cmake", "-G", generator, "-B", self.folder)
        packages = list(self.folder.glob(pattern))
        self.assertEqual(len(packages), 1)
        return packages[0]

    def check(self, tree):
        self.check_files(tree)
        self.check_libraries(tree)
        self.check_tool(tree)
        self.check_example(tree, self.folder / "example")

    def test_archive(self):
        package = self.make("TGZ", "*.tar.gz")
        self.assertEqual(package.name,
                         f"ambrix-{VERSION}-{platform.system()}-{platform.machine()}.tar.gz")
        unpacked = self.folder / "unpacked"
        unpacked.mkdir()
        run("tar", "-xf", package, "-C", unpacked)
        self.assertEqual(len(list(unpacked.iterdir())), 1)  # one folder, not a hundred files
        self.check(next(unpacked.iterdir()))

    @unittest.skipUnless(shutil.which("dpkg-shlibdeps") and shutil.which("file"),
                         "making a Debian package needs dpkg-dev and file")
    def test_debian_package(self):
        package = self.make("DEB", "*.deb")
        self.assertRegex(package.name, rf"^ambrix_{re.escape(VERSION)}_\w+\.deb$")
        run("dpkg", "-x", package, self.folder / "unpacked")
        self.check(self.folder / "unpacked/usr")
        self.check_control(package)

    def check_control(self, package):
        needs = run("dpkg-deb", "--field", package, "Depends")
        self.assertRegex(needs, r"\blibc6 \(>= ")
        self.assertRegex(needs, r"\blibstdc\+\+6 \(>= ")
        self.assertNotIn("-dev", needs)
        self.assertEqual(run("dpkg-deb", "--field", package, "Package").strip(), "ambrix")
        owners = {line.split()[1] for line in run("dpkg-deb", "--contents", package).splitlines()}
        self.assertEqual(owners, {"root/root"})


if __name__ == "__main__":
    unittest.main()
