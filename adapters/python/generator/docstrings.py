"""The docstrings of the commands, with their signatures in front."""
import re
import textwrap

import kinds

WIDTH = 88
CDFLIB = "TOLVEX:ambrix:cdflib"


def plain(text):
    """A sentence without the marks of Markdown."""
    return text.replace("`", "")


def wrapped(text, indent=""):
    return textwrap.wrap(text, WIDTH, initial_indent=indent, subsequent_indent=indent + "    ",
                         break_on_hyphens=False, break_long_words=False)


class Docstrings:
    """Docstrings of the commands of a table."""

    def __init__(self, table):
        self.constants = {row["kind"]: list(row["values"]) for row in table["constants"]}
        self.components = {row["identifier"]: row["component"] for row in table["identifiers"]}

    def with_signature(self, command):
        """What CPython takes a function's signature and docstring from."""
        names = [a["name"] + ("=None" if a.get("optional") else "") for a in command["arguments"]]
        return f"{command['name']}({', '.join(names)})\n--\n\n{self.docstring(command)}"

    def docstring(self, command):
        lines = textwrap.wrap(plain(command["does"]), WIDTH)
        lines += self.arguments(command) + self.results(command)
        if command.get("notes"):
            lines += ["", *textwrap.wrap(plain(" ".join(command["notes"])), WIDTH)]
        lines += self.messages("Errors:", command["errors"], command["routines"])
        lines += self.messages("Warnings:", command.get("warnings", []), [])
        return "\n".join(lines)

    def arguments(self, command):
        lines = []
        for argument in command["arguments"]:
            text = f"{argument['name']} ({kinds.of_argument(argument).words}): "
            text += plain(argument["meaning"])
            if "constant" in argument:
                text += f"; one of {', '.join(self.constants[argument['constant']])}"
            lines += wrapped(text, "    ")
        return ["", "Arguments:", *lines] if lines else []

    @staticmethod
    def results(command):
        lines = []
        for result in command["results"]:
            words = kinds.of_result(command, result).words
            lines += wrapped(f"{result['name']} ({words}): {plain(result['meaning'])}", "    ")
        return ["", "Returns:", *lines] if lines else []

    def messages(self, head, rows, routines):
        lines = []
        if routines:
            named = re.sub(", ([^,]*)$", r" or \1", ", ".join(routines))
            lines += wrapped(f"{CDFLIB}:libraryFailure: the CDF library reports a failure of {named}",
                             "    ")
        for row in rows:
            name = f"{self.components[row['identifier']]}:{row['identifier']}"
            lines += wrapped(f"{name}: {plain(row['when'])}", "    ")
        return ["", head, *lines] if lines else []
