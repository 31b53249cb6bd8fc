"""The examples of the manual of the commands, run through `ambrix.commands`."""
import functools
import json
import os
import pathlib
import sys

import numpy as np

from ambrix import Error, commands

HERE = pathlib.Path(__file__).parent
sys.path.insert(0, str(HERE))  # the notation's modules name each other without a package

import notation  # noqa: E402
from ambrix_session import Array  # noqa: E402
from shown import shown  # noqa: E402

PROMPT = "> "
TYPES = {"single": np.float32, "double": np.float64, "logical": np.bool_}
CLASSES = {"float32": "single", "float64": "double", "bool": "logical"}


@functools.cache
def table():
    """docs/commands.json."""
    return json.loads((HERE / "commands.json").read_text(encoding="utf-8"))


def files_of(variable):
    """The CDF files in the folder that a variable of the environment names, sorted."""
    folder = os.environ.get(variable, "")
    return sorted(str(path) for path in pathlib.Path(folder).rglob("*.cdf")) if folder else []


def to_python(array, kind):
    """An array of the notation as somebody would give it in Python for a kind of argument."""
    if array.class_name == "char":
        return array.data
    if array.class_name == "double" and kind != "value" and array.size[0] < 2:
        plain = [int(number) if number == int(number) else number for number in array.data]
        return plain[0] if array.size == [1, 1] else plain
    if array.class_name == "logical":
        return array.data[0] if array.size == [1, 1] else array.data
    values = np.array(array.data, TYPES.get(array.class_name, array.class_name))
    return values.reshape(array.size, order="F")


def to_array(result, size):
    """A result of Python's as an array of the notation; `size` is what the manual says of it."""
    if result is None:
        return Array("double", [0, 0], [])
    if isinstance(result, str):
        column = "column of its characters" in size or size.startswith("the sizes")
        counts = [len(result), 1] if column else [1, len(result)] if result else [0, 0]
        return Array("char", counts, result)
    if isinstance(result, list):
        return Array("cell", [len(result), 1], [to_array(item, "1-by-n") for item in result])
    values = np.asarray(result)
    if values.dtype.kind == "S":
        items = b"".join(item.ljust(values.itemsize, b"\0") for item in values.flat).decode()
        return Array("char", [values.itemsize, values.size], items)
    name = "double" if isinstance(result, (int, tuple)) and values.dtype.kind == "i" else \
        CLASSES.get(values.dtype.name, values.dtype.name)
    sizes = list(values.shape)
    if len(sizes) < 2:
        row = size.startswith("1-by-n")
        sizes = [1, values.size] if row or not sizes else [values.size, 1]
    return Array(name, sizes if values.size else [0, 0], values.flatten("F").tolist())


class Example:
    """Runs the lines of an example with the file of the examples open."""

    def __init__(self, table_of_commands):
        self.commands = {c["name"]: c for c in table_of_commands["commands"]}
        self.variables = {}

    def run(self, lines, warned=()):
        """The lines, what they print among them. `warned` collects warnings as they are issued."""
        printed = []
        for line in (line for line in lines if line.startswith(PROMPT)):
            statement = notation.Statement(line[len(PROMPT):])
            printed += [line, *self.step(statement, warned)]
        return printed

    def step(self, statement, warned):
        before = len(warned)
        try:
            results = self.evaluate(statement.call)
        except Error as error:
            return [message("error", error)]
        lines = [message("warning", warning.message) for warning in warned[before:]]
        declared = self.commands[statement.call.name]["results"]
        results = results if isinstance(results, tuple) and len(declared) > 1 else (results,)
        for target, result, facts in zip(statement.targets, results, declared):
            self.variables[target] = result
            if not statement.silent:
                lines.append(f"{target} = {shown(to_array(result, facts['size']))}")
        return lines

    def evaluate(self, expression, kind="value"):
        if isinstance(expression, notation.Name):
            return self.variables[expression.name]
        if not isinstance(expression, notation.Call):
            return to_python(expression, kind)
        command = self.commands[expression.name]
        kinds = [argument["kind"] for argument in command["arguments"]] + ["value"] * 9
        arguments = [self.evaluate(argument, kind)
                     for argument, kind in zip(expression.arguments, kinds)]
        return getattr(commands, expression.name)(*arguments)


def message(kind, told):
    """An error or warning as the manual writes it."""
    texts = ", ".join(f"'{value}'" if isinstance(value, str) else str(value)
                      for value in told.values)
    return f"{kind}: {told.identifier}" + (f" ({texts})" if texts else "")
