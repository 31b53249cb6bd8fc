"""Files that are open when the oct-file goes, in each way that it can go, are closed and whole."""
import os
import pathlib
import signal
import subprocess
import tempfile
import unittest

OCTAVE = [os.environ["AMBRIX_OCTAVE_CLI"], "--norc", "--no-history", "--path",
          os.environ["AMBRIX_OCTAVE"]]
WARNING = "Files were still open when the module was unloaded"
WARNING_ID = "TOLVEX:ambrix:cdflib:closingFileHandle"

# A file with one value, which the library keeps in memory until the file is closed.
WRITE = """
id = __ambrix__ ("create", "left.cdf");
variable = __ambrix__ ("createVar", id, "v", 4, 1, [], true, []);
__ambrix__ ("putVarRecordData", id, variable, 0, int32 (42));
"""
READ = """
id = __ambrix__ ("open", "left.cdf");
printf ("value %d\\n", __ambrix__ ("getVarRecordData", id, 0, 0));
__ambrix__ ("close", id);
"""


class UnloadTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory(prefix="ambrix-octave-")
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)

    def start(self, code):
        script = self.folder / "script.m"
        script.write_text(code)
        return subprocess.Popen([*OCTAVE, script.name], cwd=self.folder, stdout=subprocess.PIPE,
                                stderr=subprocess.PIPE, stdin=subprocess.DEVNULL, text=True)

    def run_octave(self, code, status=0):
        process = self.start(code)
        output, errors = process.communicate(timeout=60)
        self.assertEqual(process.returncode, status, output + errors)
        return output, errors

    def check_file(self):
        output, errors = self.run_octave(READ)
        self.assertEqual((output, errors), ("value 42\n", ""))

    def check(self, ending, status=0, warnings=1):
        output, errors = self.run_octave(WRITE + ending, status)
        self.assertEqual(errors.count(WARNING), warnings, errors)
        self.check_file()
        return output, errors

    def test_clear_of_the_function(self):
        output, _ = self.check("clear __ambrix__; disp ('still here');" + READ)
        self.assertEqual(output, "still here\nvalue 42\n")

    def test_clear_all(self):
        self.check("clear all;" + READ)

    def test_clear_functions(self):
        self.check("clear functions;" + READ)

    def test_each_unloading_warns(self):
        self.check("clear all; id = __ambrix__ ('open', 'left.cdf'); clear all", warnings=2)

    def test_a_closed_file_is_not_warned_of(self):
        self.check("__ambrix__ ('close', id); clear all", warnings=0)

    def test_a_handle_keeps_the_module(self):
        output, _ = self.check("f = @__ambrix__; clear __ambrix__; disp (f ('getMajority', id))")
        self.assertEqual(output, "ROW_MAJOR\n")

    def test_end_of_the_script(self):
        self.check("")

    def test_exit(self):
        self.check("exit (3)", status=3)

    def test_error_at_top_level(self):
        _, errors = self.check("error ('the end')", status=1)
        self.assertIn("error: the end", errors)

    def test_functions_that_run_at_exit_may_still_call(self):
        output, _ = self.check("""
            function last ()
              id = __ambrix__ ("open", "left.cdf");
              __ambrix__ ("close", id);
              disp ("called");
            endfunction
            __ambrix__ ("close", id);
            atexit ("last");""", warnings=0)
        self.assertEqual(output, "called\n")

    def test_a_warning_that_is_off_is_not_shown(self):
        self.check(f"warning ('off', '{WARNING_ID}'); clear all", warnings=0)

    def test_a_warning_that_is_an_error_keeps_no_file_open(self):
        for ending in ("clear all; disp ('cleared')", "exit", ""):
            with self.subTest(ending):
                (self.folder / "left.cdf").unlink(missing_ok=True)
                self.check(f"warning ('error', '{WARNING_ID}');" + ending, warnings=0)

    def test_termination_by_a_signal(self):
        for number in (signal.SIGTERM, signal.SIGHUP, signal.SIGINT):
            with self.subTest(number):
                (self.folder / "left.cdf").unlink(missing_ok=True)
                process = self.start(WRITE + "disp ('ready'); fflush (stdout); pause (50)")
                self.assertEqual(process.stdout.readline(), "ready\n")
                process.send_signal(number)
                process.communicate(timeout=60)
                self.check_file()

    def test_a_child_process_leaves_the_files_to_its_parent(self):
        output, errors = self.check("""
            child = fork ();
            if (child == 0)
              exit (0);
            endif
            waitpid (child);
            __ambrix__ ("putVarRecordData", id, variable, 1, int32 (43));
            __ambrix__ ("close", id);
            clear all;
            id = __ambrix__ ("open", "left.cdf");
            printf ("%d ", __ambrix__ ("hyperGetVarData", id, 0, 0, 2, 1, [], [], []));
            __ambrix__ ("close", id);""", warnings=0)
        self.assertEqual(output, "42 43 ")

    def test_an_interrupt_during_a_call_waits_for_its_end(self):
        process = self.start(WRITE + """
            big = __ambrix__ ("createVar", id, "big", 45, 1, 4e6, true, true);
            __ambrix__ ("setVarCompression", id, big, 5, 9);
            values = rand (4e6, 1);
            unwind_protect
              system (sprintf ("(sleep 0.2; kill -INT %d) &", getpid ()));
              __ambrix__ ("putVarRecordData", id, big, 0, values);
              pause (20);
              disp ("not interrupted");
            unwind_protect_cleanup
              printf ("%d ", isequal (__ambrix__ ("getVarRecordData", id, big, 0), values));
              __ambrix__ ("close", id);
            end_unwind_protect""")
        output, errors = process.communicate(timeout=60)
        self.assertEqual(output, "1 ", errors)
        self.assertNotIn(WARNING, errors)
        self.check_file()


if __name__ == "__main__":
    unittest.main()
