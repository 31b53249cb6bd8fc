"""The package for Octave, made, installed and tested as its users do, offline and from nothing."""
import os
import pathlib
import re
import shutil
import subprocess
import tarfile
import tempfile
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
OCTAVE = os.environ["AMBRIX_OCTAVE_CLI"]
SAMPLES = os.environ["AMBRIX_CDF_SAMPLES"]
# Whether processes can be started without a network here.
OFFLINE = ["unshare", "-rn"] if not shutil.which("unshare") or subprocess.run(
    ["unshare", "-rn", "true"], stderr=subprocess.DEVNULL, check=False).returncode == 0 else []
NOTHING_SET = {"PATH": "/usr/bin:/bin"}


def run(*command, **settings):
    return subprocess.run(command, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True,
                          check=False, **settings)


class PackageTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.shared = tempfile.TemporaryDirectory(prefix="ambrix-octave-package-")
        cls.addClassCleanup(cls.shared.cleanup)
        cls.package = cls.make("first")

    @classmethod
    def make(cls, name):
        folder = pathlib.Path(cls.shared.name, name)
        done = subprocess.run([ROOT / "script/octave-package", folder], stdout=subprocess.PIPE,
                              text=True, check=True,
                              env={**os.environ, "SOURCE_DATE_EPOCH": "1767225600"})
        package = pathlib.Path(done.stdout.strip())
        assert package.parent == folder
        return package

    def setUp(self):
        folder = tempfile.TemporaryDirectory(prefix="ambrix-octave-home-")
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)

    def unpack(self):
        run("tar", "-xf", self.package, "-C", self.folder)
        return self.folder / self.package.name.removesuffix(".tar.gz")

    def configure(self, **environment):
        """What configure prints and, when it succeeds, the settings that it writes."""
        folder = self.unpack() / "src"
        done = run("./configure", cwd=folder, env={**NOTHING_SET, **environment})
        settings = folder / "settings.mk"
        self.assertEqual(settings.exists(), done.returncode == 0, done.stdout)
        return done.stdout, settings.read_text() if settings.exists() else ""

    def test_the_same_sources_make_the_same_package(self):
        self.assertEqual(self.make("second").read_bytes(), self.package.read_bytes())

    def test_it_holds_sources_only(self):
        with tarfile.open(self.package) as tar:
            members = {member.name.partition("/")[2]: member for member in tar}
        for name in ("DESCRIPTION", "COPYING", "NEWS", "INDEX", "src/configure", "src/Makefile",
                     "src/gateway/entry/entry_point.cc", "src/adapters/octave/__ambrix__.cc",
                     "src/inflate/exports.cc",
                     "inst/ambrix_read.m", "inst/ambrix_hyperGetVarData.m"):
            self.assertIn(name, members)
        kinds = {pathlib.Path(name).suffix for name, member in members.items() if member.isfile()}
        self.assertEqual(kinds, {"", ".c", ".cc", ".h", ".m", ".map", ".md", ".png"})
        with tarfile.open(self.package) as tar:
            named = [member.name for member in tar
                     if member.isfile() and str(ROOT).encode() in tar.extractfile(member).read()]
        self.assertEqual(named, [])
        self.assertEqual({(m.uid, m.gid, m.mtime) for m in members.values()},
                         {(0, 0, members["NEWS"].mtime)})

    def test_every_function_is_in_the_index(self):
        folder = self.unpack()
        listed = re.findall(r"^ (ambrix\w*)$", (folder / "INDEX").read_text(), re.M)
        functions = [path.stem for path in (folder / "inst").glob("ambrix*.m")]
        self.assertEqual(sorted(listed), sorted(functions))

    def test_documents_are_in_it_and_link_to_nothing_else(self):
        folder = self.unpack() / "doc"
        for name in ("octave.md", "commands.md"):
            text = (folder / name).read_text()
            links = set(re.findall(r"\]\(([^)#]+)[^)]*\)", text))
            self.assertTrue(links)
            self.assertEqual([link for link in links if not (folder / link).exists()], [])
        self.assertIn("ambrix_read", (folder / "octave.md").read_text())

    def test_installs_offline_and_passes_its_tests(self):
        code = f"""
            pkg load ambrix
            ambrix_info ("{SAMPLES}/example1.cdf");
            data = ambrix_read ("{SAMPLES}/example1.cdf", "Image");
            printf ("read %s\\n", class (data));
            pkg test ambrix
            disp (exist ("__ambrix__"));
            warning ("off", "TOLVEX:ambrix:cdflib:closingFileHandle");
            before = numel (glob ("/proc/self/fd/*"));
            ambrix_open ("{SAMPLES}/example1.cdf");
            pkg unload ambrix
            printf ("%d more files\\n", numel (glob ("/proc/self/fd/*")) - before);
            disp (exist ("__ambrix__"));
            pkg uninstall ambrix"""
        # Octave works in the repository, where a library is that was fetched.
        done = self.octave(f"pkg install -local {self.package}", cwd=ROOT)
        self.assertEqual(done.returncode, 0, done.stdout)
        self.assert_stands_alone()
        done = self.octave(code, cwd=self.folder)
        self.assertEqual(done.returncode, 0, done.stdout)
        for expected in ("Latitude", "read int32", r"\n3\n0 more files\n0\n$"):
            self.assertRegex(done.stdout, expected)
        passed = re.search(r"PASS +(\d+)\n +FAIL +(\d+)", done.stdout)
        self.assertIsNotNone(passed, done.stdout)
        self.assertGreater(int(passed[1]), 91, done.stdout)
        self.assertEqual(int(passed[2]), 0, done.stdout + self.log())
        self.assertNotIn("warning", done.stdout)

    def octave(self, code, cwd):
        return run(*OFFLINE, OCTAVE, "--norc", "--no-history", "--eval", code, cwd=cwd,
                   env={**NOTHING_SET, "HOME": str(self.folder)})

    def assert_stands_alone(self):
        """No installed file names the repository, and a shared library is taken along."""
        files = [path for path in (self.folder / ".local").rglob("*") if path.is_file()]
        named = [path.name for path in files if str(ROOT).encode() in path.read_bytes()]
        self.assertEqual(named, [])
        [octfile] = [path for path in files if path.suffix == ".oct"]
        loaded = subprocess.run(["ldd", octfile], stdout=subprocess.PIPE, text=True, check=True)
        library = re.search(r"libcdf\S* => (\S+)", loaded.stdout)
        if library:
            self.assertEqual(pathlib.Path(library[1]).resolve().parents[2],
                             octfile.resolve().parents[2])
        inflater = octfile.with_name("libambrix_inflate.so")
        if inflater in files:
            self.assertRegex(loaded.stdout, rf"libambrix_inflate.so => {octfile.parent}\S*/")
        elif library and pathlib.Path("/usr/include/isa-l/igzip_lib.h").exists():
            self.fail("the inflater was not built")
        provided = ROOT / "build/cdf/cdf-3.9.1/CDF_copyright.txt"
        if library and provided.exists():
            self.assertIn("CDF_copyright.txt", [path.name for path in files])

    def log(self):
        """What is known of tests that failed."""
        found = (self.folder / "fntests.log").read_text()
        return "\n".join(re.findall(r"^!!!!!.*\n.*", found, re.MULTILINE))

    def test_a_place_that_is_named_must_hold_the_library(self):
        empty = self.folder / "empty"
        for names in (["CDF_ROOT"], ["CDF_BASE"], ["CDF_INC", "CDF_LIB"]):
            with self.subTest(names):
                output, _ = self.configure(**{name: str(empty) for name in names})
                self.assertIn(f"there is no cdf.h in {empty}", output)
                self.assertIn("Name a folder that holds include/cdf.h and lib/libcdf.so", output)

    def test_what_is_wrong_with_a_place_is_told(self):
        place = self.folder / "place"
        (place / "include").mkdir(parents=True)
        (place / "lib").mkdir()
        header = place / "include/cdf.h"
        header.write_text("/* of version 2 */")
        output, _ = self.configure(CDF_ROOT=str(place))
        self.assertIn(f"{header} is not the header of CDF version 3", output)
        header.write_text("/* CDF_EPOCH16 */")
        output, _ = self.configure(CDF_ROOT=str(place))
        self.assertIn(f"there is no libcdf in {place}/lib {place}/lib64", output)
        (place / "lib/libcdf.so").write_text("nothing")
        output, _ = self.configure(CDF_ROOT=str(place))
        self.assertIn(f"the library in {place}/lib does not work with {header}", output)
        (place / "lib/libcdf.so").rename(place / "lib/libcdf.a")
        output, _ = self.configure(CDF_ROOT=str(place))
        self.assertIn(f"{place}/lib/libcdf.a is not usable here", output)
        (self.folder / "a place").symlink_to(place)
        output, _ = self.configure(CDF_ROOT=str(self.folder / "a place"))
        self.assertIn("mkoctfile cannot use folders of such names", output)

    def test_the_place_that_is_named_is_taken(self):
        place = self.place()
        for variables in ({"CDF_ROOT": place}, {"CDF_BASE": place},
                          {"CDF_INC": f"{place}/include", "CDF_LIB": f"{place}/lib"}):
            with self.subTest(variables):
                _, settings = self.configure(**variables)
                self.assertIn(f"-I{place}/include\n", settings)
                self.assertIn(f"libraries = -L{place}/lib ", settings)

    def test_a_static_library_is_preferred(self):
        library = pathlib.Path(os.environ.get("AMBRIX_STATIC_CDF", "none"))
        if not library.exists():
            self.skipTest("no static CDF library was built")
        place = self.folder / "place"
        (place / "lib").mkdir(parents=True)
        (place / "lib/libcdf.so").write_text("not looked at")
        (place / "lib/libcdf.a").symlink_to(library)
        (place / "include").symlink_to(ROOT / "build/cdf/cdf-3.6.3-source/src/include")
        output, settings = self.configure(CDF_ROOT=str(place))
        self.assertIn(f"libraries = {place}/lib/libcdf.a -lm\n", settings, output)

    def place(self):
        """A folder of its own with the library that was provided for the build."""
        provided = ROOT / "build/cdf/cdf-3.9.1"
        if not provided.is_dir():
            self.skipTest("the build has found an installed CDF library")
        place = self.folder / "place"
        place.symlink_to(provided)
        return place

    def test_without_a_library_it_is_told_what_to_do(self):
        folder = self.unpack() / "src"
        done = run("./configure", cwd=folder, env=NOTHING_SET)
        if (folder / "settings.mk").exists():
            self.skipTest("the CDF library is installed here")
        self.assertEqual(done.returncode, 1)
        self.assertIn("the CDF library of NASA was not found", done.stdout)
        self.assertIn("setenv CDF_ROOT /usr/local/cdf", done.stdout)


if __name__ == "__main__":
    unittest.main()
