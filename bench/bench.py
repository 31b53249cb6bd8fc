"""Runs the benchmark; script/bench builds what it needs and calls it."""

import argparse
import datetime
import json
import os
import pathlib
import platform
import shutil
import sys
import tempfile

import columns
import measure
import plot
import report
from workloads import SETTINGS, WORKLOADS, Workload

ROOT = pathlib.Path(__file__).resolve().parent.parent
MEMORY = pathlib.Path("/dev/shm")
BYTES_NEEDED = 600 << 20


def arguments():
    parser = argparse.ArgumentParser(prog="script/bench", description=__doc__)
    parser.add_argument("build", type=pathlib.Path, help=argparse.SUPPRESS)
    parser.add_argument("--quick", action="store_true",
                        help="a hundredth of the work, one round: to see that everything runs")
    parser.add_argument("--only", metavar="NAME", action="append",
                        help="only what has this in its name; may be given several times")
    parser.add_argument("--peers", action="store_true",
                        help="compare with SpacePy, pycdfpp and cdflib, where this Python has them")
    parser.add_argument("--rounds", type=int, help="rounds in each sitting (default 5)")
    parser.add_argument("--sittings", type=int, help="times that programs start anew (default 3)")
    parser.add_argument("--json", type=pathlib.Path, help="where the results go as JSON")
    parser.add_argument("--plot", metavar="FILE.svg", type=pathlib.Path,
                        help="draw the ratios, where gnuplot is installed")
    parser.add_argument("--document", action="store_true",
                        help="put the tables and the picture into docs/performance.md")
    options = parser.parse_args()
    if options.document and (options.only or options.quick):
        parser.error("--document is for all workloads in full")
    if not any(chosen(names, options.only) for names in map(names_of, (*WORKLOADS, *SETTINGS))):
        parser.error("no workload has that in its name: " +
                     ", ".join(workload.name for workload in WORKLOADS))
    return options


def working_folder():
    """Files in memory: what is measured is not the disk."""
    roomy = MEMORY.is_dir() and shutil.disk_usage(MEMORY).free > BYTES_NEEDED
    return tempfile.TemporaryDirectory(prefix="ambrix-bench-", dir=MEMORY if roomy else None)


def names_of(measured):
    """All by which a workload or a setting can be chosen."""
    if isinstance(measured, Workload):
        return [measured.name, measured.title]
    return [measured.before, measured.after, measured.title]


def chosen(names, only):
    return not only or any(part in name for part in only for name in names)


def all_columns(options, folder, divisor):
    """The reference first. The library does nothing for commands without a library call."""
    names = [workload.name for workload in WORKLOADS]
    module_only = {"get_constant", "unknown_command", "refused_argument"}
    found = [columns.native(options.build, "library", folder, divisor, set(names) - module_only),
             columns.native(options.build, "module", folder, divisor, None)]
    in_octave = columns.octave(options.build, folder, divisor, set(names) - {"widen", "narrow"})
    if in_octave:
        found.append(in_octave)
    if options.peers:
        found += columns.peers(folder, divisor, names)
    return found


def machine():
    processor = platform.processor()
    for line in pathlib.Path("/proc/cpuinfo").read_text().splitlines():
        if line.startswith("model name"):
            processor = line.split(":")[1].strip()
            break
    return {"date": datetime.date.today().isoformat(), "system": platform.platform(),
            "processor": processor, "processors": os.cpu_count(), "load": os.getloadavg()[0]}


def run(options, folder):
    divisor = 100 if options.quick else 1
    rounds = options.rounds or (1 if options.quick else 5)
    sittings = options.sittings or (1 if options.quick else 3)
    found = all_columns(options, folder, divisor)
    found[0].run("prepare")
    results, settings = {}, {}
    for workload in WORKLOADS:
        if not chosen(names_of(workload), options.only):
            continue
        print(f"  {workload.name}", end="", file=sys.stderr, flush=True)
        facts = measure.measure(workload.name, found, rounds, sittings)
        for column in facts.values():
            column["calls"] = (workload.calls or 1) // divisor or 1
        results[workload.name] = facts
    for setting in SETTINGS:
        if chosen(names_of(setting), options.only):
            print(f"  {setting.after}", end="", file=sys.stderr, flush=True)
            settings[setting.title] = measure.measure_setting(setting, found[1], rounds)
    print(file=sys.stderr)
    return {"machine": machine(), "quick": options.quick, "workloads": results,
            "settings": settings}


def main():
    options = arguments()
    with working_folder() as folder:
        results = run(options, folder)
    tables = {"workloads": report.main_rows(WORKLOADS, results["workloads"]),
              "settings": report.setting_rows(SETTINGS, results["settings"])}
    for rows in tables.values():
        if len(rows) > 1:
            print(report.terminal(rows), end="\n\n")
    if options.json:
        options.json.write_text(json.dumps(results, indent=1) + "\n")
    if options.plot:
        plot.draw(WORKLOADS, results["workloads"], options.plot)
    if options.document:
        plot.draw(WORKLOADS, results["workloads"], ROOT / "docs" / "performance.svg")
        parts = {name: report.markdown(rows) for name, rows in tables.items()}
        parts["workloads"] += "\n\n" + report.machine_text(results["machine"])
        report.put_into(ROOT / "docs" / "performance.md", parts)


if __name__ == "__main__":
    main()
