"""Files as people see them."""
import html
from typing import TYPE_CHECKING

from ambrix.attributes import shortened

if TYPE_CHECKING:
    from ambrix.file import File
    from ambrix.variable import Variable

HEAD = ("name", "datatype", "shape", "units", "description")
WIDEST = 40
MOST_ROWS = 200


def _text(variable: "Variable", *names: str) -> str:
    """The first of these attributes that is a text."""
    for name in names:
        value = variable.attrs.get(name)
        if isinstance(value, str) and value.strip():
            return shortened(value, WIDEST)
    return ""


def _row(variable: "Variable") -> tuple[str, ...]:
    return (variable.name, variable.datatype, " x ".join(map(str, variable.shape)),
            _text(variable, "UNITS"), _text(variable, "CATDESC", "FIELDNAM"))


def _head(file: "File") -> str:
    return (f"{file.name}: CDF {file.version}, {file.format}, {file.majority}, {file.encoding}"
            f"{', closed' if file.closed else ''}")


def file_as_text(file: "File") -> str:
    """A file as a table in plain text."""
    rows = [HEAD, *(_row(variable) for variable in list(file.values())[:MOST_ROWS])]
    widths = [max(len(row[place]) for row in rows) for place in range(len(HEAD))]
    lines = ["  " + "  ".join(cell.ljust(width) for cell, width in zip(row, widths)).rstrip()
             for row in rows]
    more = [f"  ... {len(file)} variables"] if len(file) > MOST_ROWS else []
    attributes = f"Attributes: {', '.join(file.attrs) or 'none'}"
    return "\n".join([f"<ambrix.File {_head(file)}>", *lines, *more, attributes])


def file_as_html(file: "File") -> str:
    """A file as tables for a notebook."""
    variables = "".join(_html_row("td", _row(variable))
                        for variable in list(file.values())[:MOST_ROWS])
    attributes = "".join(_html_row("td", (name, shortened(file.attrs[name])))
                         for name in file.attrs)
    return (f"<div><b>{html.escape(_head(file))}</b>"
            f"<table>{_html_row('th', HEAD)}{variables}</table>"
            f"<details><summary>{len(file.attrs)} attributes</summary>"
            f"<table>{attributes}</table></details></div>")


def _html_row(tag: str, cells: tuple[str, ...]) -> str:
    style = " style='text-align: left'"
    texts = "".join(f"<{tag}{style}>{html.escape(cell)}</{tag}>" for cell in cells)
    return f"<tr>{texts}</tr>"
