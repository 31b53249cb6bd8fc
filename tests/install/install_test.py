"""What `cmake --install` lays out works after it was moved."""

import shutil
import tempfile
import unittest
from pathlib import Path

from install.tree import BUILD, CMAKE, SOURCE, VERSION, TreeChecks, configure_example, run


class InstallTest(TreeChecks, unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.folder = Path(tempfile.mkdtemp(prefix="ambrix-install-"))
        cls.addClassCleanup(shutil.rmtree, cls.folder)
        cls.prefix = cls.folder / "first"
        cls.tree = cls.folder / "moved here"
        run(CMAKE, "--install", BUILD, "--prefix", cls.prefix)
        cls.prefix.rename(cls.tree)

    def test_everything_has_its_place(self):
        self.check_files(self.tree)

    def test_nothing_private_is_laid_out(self):
        headers = {path.relative_to(self.tree / "include").as_posix()
                   for path in (self.tree / "include").rglob("*.h")}
        public = {path.relative_to(folder).as_posix()
                  for folder in (SOURCE / "adapters").glob("*/include")
                  for path in folder.rglob("*.h")}
        self.assertEqual(headers, public | {"ambrix/host/message_id.h"})
        self.assertEqual(list(self.tree.rglob("*.a")), [])

    def test_texts_do_not_know_where_they_were_made(self):
        for path in self.tree.rglob("*"):
            is_text = path.suffix in (".cmake", ".h", ".1", ".md", ".pc")
            if path.is_dir() or ".so." in path.name or not is_text:
                continue
            for place in (self.prefix, BUILD, SOURCE):
                self.assertNotIn(str(place), path.read_text(), path)

    def test_libraries_are_found_in_the_tree(self):
        self.check_libraries(self.tree)

    def test_the_tool_runs(self):
        self.check_tool(self.tree)

    def test_the_example_is_built_and_runs(self):
        self.check_example(self.tree, self.folder / "example")

    def test_a_program_is_built_with_pkg_config(self):
        self.check_pkg_config(self.tree, self.folder)

    def test_the_library_has_a_version(self):
        self.check_soname(self.tree)

    def test_another_version_is_not_found(self):
        wanted = self.tree / "share/doc/ambrix/examples/CMakeLists.txt"
        text = wanted.read_text()
        self.addCleanup(wanted.write_text, text)
        wanted.write_text(text.replace("find_package(ambrix 0.1 ", "find_package(ambrix 99.1 "))
        with self.assertRaisesRegex(AssertionError, f"version: {VERSION}"):
            configure_example(self.tree, self.folder / "other version")


if __name__ == "__main__":
    unittest.main()
