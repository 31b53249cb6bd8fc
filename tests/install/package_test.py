"""The packages work when they are unpacked elsewhere."""

import gzip
import os
import platform
import re
import shutil
import tempfile
import unittest
from pathlib import Path

from install.tree import BUILD, CPACK, FILES, VERSION, TreeChecks, run

DEBIAN_ONLY = ["share/man/man1/ambrix.1.gz", "share/doc/ambrix/changelog.gz",
               "share/doc/ambrix/copyright"]
NOT_IN_DEBIAN = ["share/man/man1/ambrix.1", "share/doc/ambrix/LICENSE"]
NEEDS_DEBIAN = unittest.skipUnless(shutil.which("dpkg-shlibdeps") and shutil.which("file"),
                                   "making a Debian package needs dpkg-dev and file")


class PackageTest(TreeChecks, unittest.TestCase):
    def setUp(self):
        self.folder = Path(tempfile.mkdtemp(prefix="ambrix-package-"))
        self.addCleanup(shutil.rmtree, self.folder)

    def make(self, generator, pattern, **environment):
        """The package that CPack makes."""
        run(CPACK, "--config", BUILD / "CPackConfig.cmake", "-G", generator, "-B", self.folder,
            env=os.environ | environment)
        packages = list(self.folder.glob(pattern))
        self.assertEqual(len(packages), 1)
        return packages[0]

    def check(self, tree, files=FILES):
        self.check_files(tree, files)
        self.check_libraries(tree)
        self.check_tool(tree)
        self.check_example(tree, self.folder / "example")
        self.check_soname(tree)

    def test_archive(self):
        package = self.make("TGZ", "*.tar.gz")
        self.assertEqual(package.name,
                         f"ambrix-{VERSION}-{platform.system()}-{platform.machine()}.tar.gz")
        unpacked = self.folder / "unpacked"
        unpacked.mkdir()
        run("tar", "-xf", package, "-C", unpacked)
        self.assertEqual(len(list(unpacked.iterdir())), 1)  # one folder, not a hundred files
        self.check(next(unpacked.iterdir()))

    @NEEDS_DEBIAN
    def test_debian_package(self):
        package = self.make("DEB", "*.deb", DEBFULLNAME="Ada Packer", DEBEMAIL="ada@debian.org")
        self.assertRegex(package.name, rf"^ambrix_{re.escape(VERSION)}_\w+\.deb$")
        tree = self.folder / "unpacked/usr"
        run("dpkg", "-x", package, tree.parent)
        self.check(tree, [name for name in FILES + DEBIAN_ONLY if name not in NOT_IN_DEBIAN])
        self.assertEqual([name for name in NOT_IN_DEBIAN if (tree / name).exists()], [])
        self.check_terms(tree)
        self.check_control(package, tree)

    def check_terms(self, tree):
        terms = (tree / "share/doc/ambrix/copyright").read_text()
        self.assertIn("/usr/share/common-licenses/Apache-2.0", terms)
        self.assertIn("CLI11", terms)
        bundled = (tree / "share/doc/ambrix/CDF_copyright.txt").exists()
        self.assertEqual("as long as it is not sold" in terms, bundled)

    def check_control(self, package, tree):
        def field(name):
            return run("dpkg-deb", "--field", package, name).strip()

        self.assertRegex(field("Depends"), r"\blibc6 \(>= ")
        self.assertRegex(field("Depends"), r"\blibstdc\+\+6 \(>= ")
        self.assertNotIn("-dev", field("Depends"))
        faster = (tree / "lib/ambrix/libambrix_inflate.so").exists()
        self.assertEqual(field("Recommends"), "libisal2" if faster else "")
        self.assertEqual(field("Package"), "ambrix")
        self.assertEqual(field("Maintainer"), "Ada Packer <ada@debian.org>")
        bundled = (tree / "share/doc/ambrix/CDF_copyright.txt").exists()
        self.assertEqual(field("Section"), f"{'non-free' if bundled else 'contrib'}/science")
        with gzip.open(tree / "share/doc/ambrix/changelog.gz", "rt") as changelog:
            text = changelog.read()
        self.assertTrue(text.startswith(f"ambrix ({VERSION}) "), text)
        self.assertIn("\n -- Ada Packer <ada@debian.org>  ", text)
        owners = {line.split()[1] for line in run("dpkg-deb", "--contents", package).splitlines()}
        self.assertEqual(owners, {"root/root"})
        checksum = package.with_name(package.name + ".sha256").read_text().split()[0]
        self.assertEqual(run("sha256sum", package).split()[0], checksum)

    @NEEDS_DEBIAN
    @unittest.skipUnless(shutil.which("lintian"), "checking a Debian package needs lintian")
    def test_debian_package_has_no_faults(self):
        """But those of the CDF library as it was fetched, which the package tells itself."""
        package = self.make("DEB", "*.deb")
        self.assertEqual(run("lintian", "--allow-root", "--fail-on=error,warning", package), "")


if __name__ == "__main__":
    unittest.main()
