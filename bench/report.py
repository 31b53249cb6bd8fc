"""Results as tables, for people: in the terminal, and between two markers of a document."""

import re

BEGIN, END = "<!-- begin: {} (script/bench --document) -->", "<!-- end: {} -->"
PEOPLE_SAY = {"library": "bare calls", "module": "ambrix", "octave": "in Octave",
              "spacepy": "SpacePy"}


def time_text(seconds):
    for factor, unit in ((1, "s"), (1e3, "ms"), (1e6, "us")):
        if seconds * factor >= 0.9995:
            return f"{seconds * factor:#.3g} {unit}".replace(". ", " ")
    return f"{seconds * 1e9:.0f} ns"


def ratio_text(facts):
    if facts["rounds"] == 1:
        return short(facts["ratio"])
    low, high = facts["ratio_quartiles"]
    return f"{short(facts['ratio'])} ({short(low)}-{short(high)})"


def short(number):
    return f"{number:.2f}" if number < 9.995 else f"{number:.0f}"


def cell(workload, facts):
    if facts is None:
        return "-"
    if "ratio" in facts:
        return ratio_text(facts)
    if workload.calls:
        return time_text(facts["median"] / facts["calls"])
    return time_text(facts["median"])


def main_rows(workloads, results):
    names = list(dict.fromkeys(name for facts in results.values() for name in facts))
    rows = [["workload", *(PEOPLE_SAY.get(name, name) for name in names)]]
    for workload in workloads:
        facts = results.get(workload.name)
        if facts:
            rows.append([workload.title, *(cell(workload, facts.get(name)) for name in names)])
    return rows


def setting_rows(settings, results):
    rows = [["setting", "without", "with", "ratio"]]
    for setting in settings:
        facts = results.get(setting.title)
        if facts:
            rows.append([setting.title, time_text(facts["before"]["median"]),
                         time_text(facts["after"]["median"]), ratio_text(facts["after"])])
    return rows


def machine_text(machine):
    return (f"Measured on {machine['date']}: {machine['processor']}, {machine['processors']} "
            f"processors, {machine['system']}, load at the start {machine['load']:.1f}.")


def terminal(rows):
    widths = [max(len(row[i]) for row in rows) for i in range(len(rows[0]))]
    lines = ["  ".join(text.ljust(width) for text, width in zip(row, widths)).rstrip()
             for row in rows]
    return "\n".join(lines)


def markdown(rows):
    lines = ["| " + " | ".join(row) + " |" for row in rows]
    lines.insert(1, "|---" * len(rows[0]) + "|")
    return "\n".join(lines)


def put_into(document, parts):
    """Replaces what stands between the markers of each part."""
    text = document.read_text()
    for name, content in parts.items():
        begin, end = BEGIN.format(name), END.format(name)
        pattern = re.escape(begin) + ".*?" + re.escape(end)
        if not re.search(pattern, text, re.DOTALL):
            raise SystemExit(f"{document} has no place for: {name}")
        replacement = f"{begin}\n\n{content}\n\n{end}"
        text = re.sub(pattern, lambda _, new=replacement: new, text, flags=re.DOTALL)
    document.write_text(text)
