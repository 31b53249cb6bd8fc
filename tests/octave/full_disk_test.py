"""What ambrix_write does where the disk is full: nothing is left, on the disk or open."""
import os
import shutil
import subprocess
import tempfile
import unittest

# Octave works in a new file system of 64 KiB.
MOUNT = 'mount -t tmpfs -o size=64k none "$0" && cd "$0" && exec "$@"'
CODE = """
ambrix_write ("there", struct ("a", 1));
open = @() numel (glob ("/proc/self/fd/*"));
before = open ();
for compression = {"NO_COMPRESSION", "GZIP_COMPRESSION"}
  for count = [20000, 50000]  # fails in closing, or while writing
    s = struct ("data", struct ("a", rand (count, 1)));
    s.file.compression = compression{1};
    for name = {"new", "there"}
      err = __ambrix_raised__ (@() ambrix_write (name{1}, s, "overwrite"));
      disp (err.message);
      assert (err.identifier, "TOLVEX:ambrix:cdflib:libraryFailure");
      assert (strncmp (err.message, "ambrix_write: ", 14));
      assert (open (), before);
      assert (readdir ("."), {"."; ".."; "there.cdf"});
      assert (ambrix_read ("there", "a"), 1);
    endfor
  endfor
endfor
"""


def run(*command, **settings):
    return subprocess.run(["unshare", "-rm", "sh", "-c", MOUNT, *command], stdout=subprocess.PIPE,
                          stderr=subprocess.STDOUT, text=True, check=False, **settings)


class FullDiskTest(unittest.TestCase):
    def test_a_failure_leaves_nothing_open_and_no_file(self):
        with tempfile.TemporaryDirectory() as folder:
            if not shutil.which("unshare") or run(folder, "true").returncode != 0:
                self.skipTest("a file system cannot be mounted here")
            done = run(folder, os.environ["AMBRIX_OCTAVE_CLI"], "--norc", "--no-history", "--path",
                       os.environ["AMBRIX_OCTAVE"], "--eval", CODE)
        self.assertEqual(done.returncode, 0, done.stdout)
        self.assertIn("perhaps for lack of disk space", done.stdout)
        self.assertNotIn("warning", done.stdout)  # of files that were still open


if __name__ == "__main__":
    unittest.main()
