"""Runs the examples of docs/commands.json through `ambrix session`, and compares or records them.

usage: examples.py record    writes what the examples print into docs/commands.json

The environment variable AMBRIX_TOOL is the path of the tool.
"""
import pathlib
import shutil
import sys
import tempfile

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))

from ambrix_session import CallError, Session  # noqa: E402
import notation  # noqa: E402
from shown import shown  # noqa: E402
import table_file  # noqa: E402

PROMPT = "> "
FILE = "example.cdf"


def inputs(example):
    """The lines of an example that are typed."""
    return [line[len(PROMPT):] for line in example if line.startswith(PROMPT)]


class Runner:
    """Runs examples, each in a folder and a process of its own, with their file open.

    `options` are those of the session. `calls` are the calls that succeeded: the command, its
    arguments and its results.
    """

    def __init__(self, table, options=()):
        self._options = options
        self._folder = tempfile.TemporaryDirectory()
        self.home = pathlib.Path(self._folder.name)
        self.calls = []
        failed = [line for line in self._run(table["example_file"], self.home, opened=False)
                  if line.startswith("error")]
        if failed:
            raise RuntimeError(f"the file of the examples can't be made: {failed}")

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self._folder.cleanup()

    def run(self, example):
        """The lines of the example, what it prints among them."""
        with tempfile.TemporaryDirectory() as folder:
            shutil.copy(self.home / FILE, folder)
            return self._run(example, folder, opened=True)

    def raise_from(self, line, folder):
        """Runs one call and lets its error through."""
        shutil.copy(self.home / FILE, folder)
        with Session(cwd=folder) as session:
            variables = {"id": session.call("open", FILE)[0]}
            self._evaluate(session, variables, notation.Statement(line).call)

    def _run(self, example, folder, opened):
        with Session(options=self._options, cwd=folder) as session:
            variables = {"id": session.call("open", FILE)[0]} if opened else {}
            lines = []
            for line in inputs(example):
                lines += [PROMPT + line, *self._step(session, variables, notation.Statement(line))]
            return lines

    def _step(self, session, variables, statement):
        """What one statement prints; its results become variables."""
        try:
            results = self._evaluate(session, variables, statement.call)
        except CallError as error:
            return [_message("error", error.identifier, error.values)]
        lines = [_message("warning", warning["identifier"], warning["values"])
                 for warning in session.warnings]
        for target, result in zip(statement.targets, results):
            variables[target] = result
            if not statement.silent:
                lines.append(f"{target} = {shown(result)}")
        return lines

    def _evaluate(self, session, variables, expression):
        if isinstance(expression, notation.Name):
            return [variables[expression.name]]
        if not isinstance(expression, notation.Call):
            return [expression]
        arguments = [self._evaluate(session, variables, argument)[0]
                     for argument in expression.arguments]
        results = session.call(expression.name, *arguments)
        self.calls.append((expression.name, arguments, results))
        return results


def _message(kind, identifier, values):
    texts = ", ".join(f"'{value}'" if isinstance(value, str) else str(value) for value in values)
    return f"{kind}: {identifier}" + (f" ({texts})" if texts else "")


def record():
    table = table_file.read()
    with Runner(table) as runner:
        for command in table["commands"]:
            command["example"] = runner.run(command["example"])
    table_file.write(table)


if __name__ == "__main__":
    if sys.argv[1:] != ["record"]:
        sys.exit(__doc__)
    record()
