"""The changes that script/mutants makes are those of today's module, and it tells which of them no test
notices without ever touching the tree."""
import os
import pathlib
import shutil
import signal
import subprocess
import tempfile
import time
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]

# "Builds" test programs that are content with any source that has "one" in it.
FAKE_CMAKE = """#!/bin/sh
[ "$1" = --build ] || exit 0
mkdir -p "$2/test-bin"
for program; do
  case $program in
    *_test)
      cat >"$2/test-bin/$program" <<END
#!/bin/sh
grep -q wait "$2/../../gateway/a.cc" && sleep 60
exec grep -q one "$2/../../gateway/a.cc"
END
      chmod +x "$2/test-bin/$program" ;;
  esac
done
"""
LIST = """# Changes of a file of two words.

a.cc: the first word is another
- one
+ 1

"""
SURVIVOR = """a.cc: the second word is another
- two
+ 2
"""
MODULE = ("gateway", "constants", "file", "attributes", "variables", "epoch")


class MutantsTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name).resolve()
        for name in MODULE + ("script", "tests/mutants", "bin"):
            (self.folder / name).mkdir(parents=True)
        (self.folder / "gateway/a.cc").write_text("one two")
        shutil.copy(ROOT / "script/mutants", self.folder / "script")
        self.program("script/bootstrap", "#!/bin/sh\n")
        self.program("bin/cmake", FAKE_CMAKE)

    def program(self, name, text):
        (self.folder / name).write_text(text)
        (self.folder / name).chmod(0o755)

    def start(self, changes, *arguments):
        (self.folder / "tests/mutants/gateway.txt").write_text(changes)
        environment = os.environ | {"PATH": f"{self.folder / 'bin'}:{os.environ['PATH']}"}
        running = subprocess.Popen([self.folder / "script/mutants", *arguments], text=True,
                                   stdout=subprocess.PIPE, stderr=subprocess.STDOUT,
                                   env=environment)
        self.addCleanup(running.stdout.close)
        return running

    def run_with(self, changes, *arguments):
        running = self.start(changes, *arguments)
        said = running.stdout.read()
        return running.wait(), said

    def check_files(self):
        for tree in (self.folder, self.folder / "build/mutants"):
            self.assertEqual((tree / "gateway/a.cc").read_text(), "one two")

    def test_changes_that_fail_a_test_are_found(self):
        status, said = self.run_with(LIST)
        self.assertEqual(status, 0, said)
        self.assertIn("1/1 scripted_gateway_test", said)
        self.assertIn("1 of 1 changes fail a test.", said)
        self.check_files()

    def test_others_are_told_and_fail_the_run(self):
        status, said = self.run_with(LIST + SURVIVOR)
        self.assertEqual(status, 1, said)
        self.assertIn("1 of 2 changes fail a test.", said)
        self.assertTrue(said.endswith("No test fails with: a.cc: the second word is another\n"))
        self.check_files()

    def test_some_can_be_chosen(self):
        status, said = self.run_with(LIST + SURVIVOR, "first word")
        self.assertEqual(status, 0, said)
        status, said = self.run_with(LIST + SURVIVOR, "third word")
        self.assertEqual((status, said), (1, "mutants: no change has this text\n"))

    def test_a_text_that_is_not_there_once_is_refused(self):
        for wrong in ("three", "o"):
            status, said = self.run_with(LIST.replace("- one", f"- {wrong}"))
            self.assertEqual(status, 1)
            self.assertIn("mutants: a.cc: the first word is another: the text is there", said)

    def test_tests_that_fail_anyway_prove_nothing(self):
        (self.folder / "gateway/a.cc").write_text("two")
        status, said = self.run_with(SURVIVOR)
        self.assertEqual(status, 1)
        self.assertIn("scripted_gateway_test fails without a change", said)

    def test_an_interruption_leaves_no_change(self):
        running = self.start(LIST.replace("+ 1", "+ wait"))
        copy = self.folder / "build/mutants/gateway/a.cc"
        while running.poll() is None and not (copy.exists() and "wait" in copy.read_text()):
            time.sleep(0.01)
        running.send_signal(signal.SIGINT)
        self.assertTrue(running.stdout.read().endswith("mutants: interrupted\n"))
        self.assertEqual(running.wait(), 1)
        self.check_files()

    def test_what_a_killed_run_has_left_is_put_right(self):
        copy = self.folder / "build/mutants"
        (copy / "gateway").mkdir(parents=True)
        (copy / "gateway/a.cc").write_text("1 two")
        (copy / "gateway/b.cc").write_text("no longer in the tree")
        self.assertEqual(self.run_with(LIST)[0], 0)
        self.assertFalse((copy / "gateway/b.cc").exists())
        self.check_files()


class ListsTest(unittest.TestCase):
    def test_every_change_can_be_made(self):
        done = subprocess.run([ROOT / "script/mutants", "--list"], capture_output=True, text=True)
        self.assertEqual(done.stderr, "")
        lines = done.stdout.splitlines()
        self.assertGreater(len(lines), 70)
        self.assertEqual(len(set(lines)), len(lines))
        self.assertEqual([line for line in lines if len(line) > 100], [])


if __name__ == "__main__":
    unittest.main()
