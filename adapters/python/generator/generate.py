"""Makes the Python side of the 91 commands from docs/commands.json.

usage: generate.py TABLE FOLDER

FOLDER gets rows.inc, the table that the extension is compiled with: names, signatures, docstrings,
and how arguments and results are converted; and commands.pyi, the stubs for type checkers.
"""
import json
import pathlib
import sys

sys.dont_write_bytecode = True
sys.path.insert(0, str(pathlib.Path(__file__).parent))

from docstrings import Docstrings  # noqa: E402
import kinds  # noqa: E402
from stubs import stub_file  # noqa: E402


def row(command, docstring):
    """The row of a command as C++."""
    required = sum(not a.get("optional") for a in command["arguments"])
    arguments = ", ".join(f'{{"{a["name"]}", ArgumentKind::{kinds.of_argument(a).cpp}}}'
                          for a in command["arguments"])
    results = ", ".join(f"ResultKind::{kinds.of_result(command, r).cpp}"
                        for r in command["results"])
    head = f'"{command["name"]}", {required}, {len(command["arguments"])}'
    return (f'{{{head}, {{{{{arguments}}}}},\n'
            f' {len(command["results"])}, {{{{{results}}}}},\n R"doc({docstring})doc"}},\n')


def main(arguments):
    if len(arguments) != 2:
        print(__doc__.strip())
        return 2
    table = json.loads(pathlib.Path(arguments[0]).read_text(encoding="utf-8"))
    folder = pathlib.Path(arguments[1])
    folder.mkdir(parents=True, exist_ok=True)
    docstrings = Docstrings(table)
    rows = "".join(row(command, docstrings.with_signature(command))
                   for command in table["commands"])
    (folder / "rows.inc").write_text(f"// Made from docs/commands.json.\n{rows}", encoding="utf-8")
    (folder / "commands.pyi").write_text(stub_file(table["commands"], docstrings),
                                         encoding="utf-8")
    return 0


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))
