"""The table of commands, docs/commands.json, read and written in its own layout."""
import json
import pathlib

ROOT = pathlib.Path(__file__).resolve().parents[2]
PATH = ROOT / "docs" / "commands.json"
INDENT = 2
WIDTH = 100
FLAT_WIDTH = 160  # of what holds no further lists or objects


def read(path=PATH):
    return json.loads(pathlib.Path(path).read_text())


def write(table, path=PATH):
    pathlib.Path(path).write_text(layout(table) + "\n")


def layout(value, indent=0, prefix=0):
    """JSON in which whatever fits in a line is one, so that changes are easy to read."""
    line = json.dumps(value, ensure_ascii=False)
    if not value or not isinstance(value, (dict, list)):
        return line
    width = FLAT_WIDTH if _is_flat(value) else WIDTH
    if not _is_example(value) and indent + prefix + len(line) < width:
        return line
    inner = indent + INDENT
    if isinstance(value, list):
        lines = [layout(part, inner) for part in value]
    else:
        lines = [f"{json.dumps(key)}: {layout(part, inner, len(key) + 4)}"
                 for key, part in value.items()]
    opening, closing = "[]" if isinstance(value, list) else "{}"
    body = ",\n".join(" " * inner + text for text in lines)
    return f"{opening}\n{body}\n{' ' * indent}{closing}"


def _is_flat(value):
    parts = value.values() if isinstance(value, dict) else value
    return not any(isinstance(part, (dict, list)) for part in parts)


def _is_example(value):
    return isinstance(value, list) and any(str(part).startswith("> ") for part in value)
