"""The examples of the manual of the commands print in Python what the manual says."""
import warnings

import pytest

from ambrix import commands
from ambrix.tests.support import manual


def values_only(lines, named):
    """The lines without what depends on the library: the values themselves."""
    return [line.partition(" = ")[0] if named and not line.startswith("> ") else line
            for line in lines]


@pytest.mark.parametrize("command", manual.table()["commands"], ids=lambda c: c["name"])
def test_the_example_prints_what_the_manual_says(command, example):
    runner = manual.Example(manual.table())
    runner.variables["id"] = commands.open("example.cdf")
    before = set(vars(runner)["variables"])
    with warnings.catch_warnings(record=True) as warned:
        warnings.simplefilter("always")
        printed = runner.run(command["example"], warned)
    library = command.get("depends_on_library")
    assert values_only(printed, library) == values_only(command["example"], library)
    assert before <= set(runner.variables)
    close_all(runner)


def close_all(runner):
    """Closes the files of an example that it has left open."""
    for name in ("id", "new", "copy", "again"):
        if name in runner.variables:
            try:
                commands.close(runner.variables[name])
            except Exception as error:  # closed or deleted in the example
                assert "invalidFileId" in error.identifier


def test_there_are_91_commands():
    assert len(commands.__all__) == 91
    assert set(commands.__all__) == {c["name"] for c in manual.table()["commands"]}
