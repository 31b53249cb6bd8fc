"""Rounds that take turns, and what is made of their times."""

import statistics
import time

SECONDS = 6  # a sitting begins no further round after this long
LONG = 30  # what takes this long is done once


class Times:
    """The seconds of one column's rounds of a workload, and those of the reference's rounds beside
    which they ran."""

    def __init__(self, seconds, reference):
        self.seconds = seconds
        self.reference = reference

    def facts(self):
        facts = {"rounds": len(self.seconds), "median": statistics.median(self.seconds),
                 "quartiles": quartiles(self.seconds)}
        if self.reference:
            beside = self.reference
            if len(beside) != len(self.seconds):
                beside = [statistics.median(beside)] * len(self.seconds)
            ratios = [mine / its for mine, its in zip(self.seconds, beside)]
            facts["ratio"] = statistics.median(ratios)
            facts["ratio_quartiles"] = quartiles(ratios)
        return facts


def quartiles(values):
    if len(values) < 2:
        return [values[0], values[0]]
    low, _, high = statistics.quantiles(values, n=4, method="inclusive")
    return [low, high]


def taking_turns(runs, rounds):
    """Runs each of the named runs once a round, in an order that alternates; returns their seconds
    by name. The first round of all is for warming up and does not count, except of what takes long,
    which is not repeated."""
    seconds = {name: [] for name in runs}
    runs = dict(runs)
    start = time.monotonic()
    for number in range(rounds + 1):
        if number > 1 and time.monotonic() > start + SECONDS:
            break
        for name in list(runs) if number % 2 else reversed(list(runs)):
            taken = runs[name]()
            if number > 0 or taken > LONG:
                seconds[name].append(taken)
            if taken > LONG:
                del runs[name]
    return seconds


def measure(workload, columns, rounds, sittings):
    """Facts by column name. Everything is compared with the first column that does the workload, in
    several sittings, each with programs started anew."""
    asked = [column for column in columns if column.does(workload)]
    together = {column.name: [] for column in asked}
    for _ in range(sittings):
        runs = {column.name: lambda column=column: column.run(workload) for column in asked
                if not any(seconds > LONG for seconds in together[column.name])}
        for name, seconds in taking_turns(runs, rounds).items():
            together[name] += seconds
        for column in asked:
            column.stop()
    reference = together["library"] if "library" in together else None
    return {name: Times(seconds, reference if name != "library" else None).facts()
            for name, seconds in together.items()}


def measure_setting(setting, column, rounds):
    runs = {name: lambda name=name: column.run(name) for name in (setting.before, setting.after)}
    seconds = taking_turns(runs, rounds)
    column.stop()
    return {"before": Times(seconds[setting.before], None).facts(),
            "after": Times(seconds[setting.after], seconds[setting.before]).facts()}
