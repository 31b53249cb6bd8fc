"""Runs the benchmark on little work: every column does every workload, and the table and the JSON
file say so. Times are not looked at."""

import json
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
sys.path.insert(0, str(ROOT / "bench"))

import measure  # noqa: E402
import report  # noqa: E402
import workloads  # noqa: E402


# Commands that call no routine of the CDF library.
WITHOUT_LIBRARY = {"get_constant", "unknown_command", "refused_argument"}


class QuickRun(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        with tempfile.TemporaryDirectory() as folder:
            results, plot = pathlib.Path(folder) / "results.json", pathlib.Path(folder) / "plot.svg"
            run = subprocess.run(
                [sys.executable, ROOT / "bench" / "bench.py", BUILD, "--quick", "--json", results,
                 "--plot", plot], capture_output=True, text=True, check=True)
            cls.table = run.stdout
            cls.results = json.loads(results.read_text())
            cls.plot = plot.read_text() if plot.exists() else None

    def test_every_workload_is_measured_in_both_columns(self):
        for workload in workloads.WORKLOADS:
            facts = self.results["workloads"][workload.name]
            self.assertGreater(facts["module"]["median"], 0, workload.name)
            if workload.name in WITHOUT_LIBRARY:
                self.assertNotIn("library", facts, workload.name)
            else:
                self.assertGreater(facts["module"]["ratio"], 0, workload.name)

    def test_every_setting_is_measured(self):
        titles = [setting.title for setting in workloads.SETTINGS]
        self.assertEqual(list(self.results["settings"]), titles)

    def test_the_table_has_a_line_for_each(self):
        for workload in workloads.WORKLOADS:
            self.assertIn(workload.title, self.table)
        for setting in workloads.SETTINGS:
            self.assertIn(setting.title, self.table)

    @unittest.skipUnless(shutil.which("gnuplot"), "gnuplot was not found")
    def test_the_picture_has_a_line_for_each_that_has_a_ratio(self):
        self.assertTrue(self.plot.rstrip().endswith("</svg>"))
        for workload in workloads.WORKLOADS:
            drawn = workload.title.replace('"', "") in self.plot
            self.assertEqual(drawn, "ratio" in self.results["workloads"][workload.name]["module"],
                             workload.title)

    def test_the_results_tell_the_machine(self):
        self.assertTrue(self.results["machine"]["processor"])
        self.assertTrue(self.results["quick"])


class Choosing(unittest.TestCase):
    def failure_of(self, *options):
        run = subprocess.run([sys.executable, ROOT / "bench" / "bench.py", BUILD, "--quick", *options],
                             capture_output=True, text=True, check=False)
        self.assertNotEqual(run.returncode, 0)
        return run.stderr

    def test_a_name_that_no_workload_has_is_an_error_that_lists_them(self):
        self.assertIn("read_gzip", self.failure_of("--only", "everything"))

    def test_the_document_is_for_complete_results(self):
        self.assertIn("all workloads", self.failure_of("--document", "--only", "read"))


class Arithmetic(unittest.TestCase):
    def test_runs_take_turns_and_the_first_round_does_not_count(self):
        order = []
        runs = {name: lambda name=name: order.append(name) or len(order) for name in "ab"}
        seconds = measure.taking_turns(runs, 3)
        self.assertEqual("".join(order), "baabbaab")
        self.assertEqual(seconds, {"a": [3, 6, 7], "b": [4, 5, 8]})

    def test_what_takes_long_is_done_once_and_counts(self):
        seconds = measure.taking_turns({"a": lambda: 1, "b": lambda: measure.LONG + 1}, 2)
        self.assertEqual(seconds, {"a": [1, 1], "b": [measure.LONG + 1]})
        self.assertEqual(measure.Times([60], [1, 2, 3]).facts()["ratio"], 30)

    def test_a_ratio_is_the_median_of_those_of_the_rounds(self):
        facts = measure.Times([2.0, 9.0, 4.0], [1.0, 3.0, 1.0]).facts()
        self.assertEqual((facts["median"], facts["ratio"]), (4.0, 3.0))
        self.assertEqual(facts["ratio_quartiles"], [2.5, 3.5])

    def test_times_are_told_in_units_that_people_read(self):
        told = [report.time_text(seconds) for seconds in (1.5, 0.0123, 5e-6, 9e-9)]
        self.assertEqual(told, ["1.50 s", "12.3 ms", "5.00 us", "9 ns"])

    def test_only_what_is_between_the_markers_is_replaced(self):
        with tempfile.TemporaryDirectory() as folder:
            document = pathlib.Path(folder) / "a.md"
            begin, end = report.BEGIN.format("x"), report.END.format("x")
            document.write_text(f"before\n{begin}\nold\n{end}\nafter\n")
            report.put_into(document, {"x": "new"})
            self.assertEqual(document.read_text(), f"before\n{begin}\n\nnew\n\n{end}\nafter\n")
            with self.assertRaises(SystemExit):
                report.put_into(document, {"y": "new"})


if __name__ == "__main__":
    BUILD = sys.argv.pop(1)
    unittest.main()
