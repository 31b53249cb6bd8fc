"""The ratios as a picture, drawn by gnuplot."""

import shutil
import subprocess

from report import PEOPLE_SAY

STYLES = {"module": "pt 7 lc '#0072b2'", "octave": "pt 5 lc '#e69f00'",
          "spacepy": "pt 9 lc '#999999'", "pycdfpp": "pt 11 lc '#999999'",
          "cdflib": "pt 13 lc '#999999'"}


def quoted(text):
    return "'" + text.replace("'", "''").replace('"', "") + "'"


def commands(shown, columns, path):
    """A line for each workload from the top, a kind of points for each column."""
    ticks = ", ".join(f"{quoted(title)} {-line}" for line, (title, _) in enumerate(shown))
    lines = [f"set terminal svg size 900,{120 + 24 * len(shown)} font 'sans-serif,12' "
             "background 'white'",
             f"set output {quoted(str(path))}", "set logscale x 10", "set xrange [0.1:300]",
             f"set yrange [{-len(shown) + 0.5}:0.5]", f"set ytics ({ticks})",
             "set xlabel 'time, bare calls taking 1'",
             "set grid x y lt 1 lw 0.5 lc '#dddddd'", "set key outside top right horizontal samplen 1",
             "set arrow from 1, graph 0 to 1, graph 1 nohead lc '#555555' lw 1.5"]
    for number, name in enumerate(columns):
        points = [f"{facts[name]['ratio']} {-line}" for line, (_, facts) in enumerate(shown)
                  if "ratio" in facts.get(name, {})]
        lines.append("\n".join([f"$column{number} << END", *points, "END"]))
    series = [f"$column{number} with points ps 1.1 {STYLES.get(name, '')} "
              f"title {quoted(PEOPLE_SAY.get(name, name))}" for number, name in enumerate(columns)]
    return "\n".join([*lines, "plot " + ", ".join(reversed(series))])  # ours on top


def draw(workloads, results, path):
    """Draws nothing where gnuplot is not installed."""
    shown = [(workload.title, results[workload.name]) for workload in workloads
             if "ratio" in results.get(workload.name, {}).get("module", {})]
    columns = list(dict.fromkeys(name for _, facts in shown for name in facts if name != "library"))
    if not shown or not shutil.which("gnuplot"):
        return
    subprocess.run(["gnuplot"], input=commands(shown, columns, path), text=True, check=True)
