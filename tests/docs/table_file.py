"""The table of commands, docs/commands.json, read and written in its own layout."""
import json
import pathlib

ROOT = pathlib.Path(__file__).resolve().parents[2]
PATH = ROOT / "docs" / "commands.json"
WIDTH = 160


def read(path=PATH):
    return json.loads(pathlib.Path(path).read_text())


def write(table, path=PATH):
    pathlib.Path(path).write_text(layout(table) + "\n")


def layout(value, indent=0, prefix=0):
    """JSON in which whatever fits in a line is one, so that changes are easy to read."""
    line = json.dumps(value, ensure_ascii=False)
    if not value or not isinstance(value, (dict, list)):
        return line
    shallow = all(not isinstance(part, (dict, list)) for part in _parts(value))
    if shallow and not _is_script(value) and indent + prefix + len(line) < WIDTH:
        return line
    inner = " " * (indent + 1)
    if isinstance(value, list):
        lines = [layout(part, indent + 1) for part in value]
        return "[\n" + ",\n".join(inner + text for text in lines) + "\n" + " " * indent + "]"
    lines = [f"{json.dumps(key)}: {layout(part, indent + 1, len(key) + 4)}"
             for key, part in value.items()]
    return "{\n" + ",\n".join(inner + text for text in lines) + "\n" + " " * indent + "}"


def _parts(value):
    return value.values() if isinstance(value, dict) else value


def _is_script(value):
    return isinstance(value, list) and any(isinstance(part, str) and part.startswith("> ")
                                           for part in value)
