"""The stubs of the commands, for type checkers and editors."""
import kinds

HEAD = '''"""The 91 commands of ambrix as functions."""
# Made from docs/commands.json.
import os
from collections.abc import Sequence
from typing import Any

import numpy.typing

__all__: list[str]
'''


def stub_file(commands, docstrings):
    return HEAD + "".join(stub(command, docstrings) for command in commands)


def stub(command, docstrings):
    arguments = []
    for argument in command["arguments"]:
        text = f"{argument['name']}: {kinds.of_argument(argument).stub}"
        arguments.append(text + (" | None = None" if argument.get("optional") else ""))
    text = indented(docstrings.docstring(command))
    return (f"\ndef {command['name']}({', '.join(arguments)}) -> {result_type(command)}:\n"
            f'    """{text}\n    """\n')


def result_type(command):
    types = [kinds.of_result(command, result).stub for result in command["results"]]
    if not types:
        return "None"
    return types[0] if len(types) == 1 else f"tuple[{', '.join(types)}]"


def indented(text):
    lines = text.replace("\\", "\\\\").replace('"""', "'''").split("\n")
    return "\n".join([lines[0], *(("    " + line).rstrip() for line in lines[1:])])
