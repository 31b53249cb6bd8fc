"""The help of the functions for Octave, in Texinfo."""
import re
import textwrap

from lines import PROMPT

WIDTH = 97
CDFLIB = "TOLVEX:ambrix:cdflib"


def listed(names):
    """a, b or c"""
    return ", ".join(names[:-1]) + " or " + names[-1] if names[1:] else names[0]


def wrapped(lines):
    """Lines of prose, none too long; those of an example stay."""
    kept = lines.index("@example")
    for line in lines[:kept]:
        whole = not line or line.startswith("@deftypefn")
        yield from [line] if whole else textwrap.wrap(line, WIDTH, break_on_hyphens=False)
    yield from lines[kept:]


def escaped(text):
    return re.sub(r"([@{}])", r"@\1", text)


class HelpText:
    def __init__(self, table, calls):
        self.commands = table["commands"]
        self.kinds = {kind["kind"]: kind for kind in table["argument_kinds"]}
        self.constants = {row["kind"]: list(row["values"]) for row in table["constants"]}
        self.components = {row["identifier"]: row["component"] for row in table["identifiers"]}
        self.calls = calls
        self.quoted = re.compile(rf'"({"|".join(c["name"] for c in self.commands)})"')

    def texinfo(self, text):
        parts = re.split(r"`([^`]*)`", text)
        for position, part in enumerate(parts):
            if position % 2:
                parts[position] = f"@code{{{escaped(part)}}}"
            else:
                parts[position] = self.quoted.sub(r"@code{ambrix_\1}", escaped(part))
        return "".join(parts)

    def lines(self, command):
        """The help of a command, without comment signs."""
        return wrapped(self.whole(command))

    def whole(self, command):
        lines = ["-*- texinfo -*-", *self.signatures(command), self.texinfo(command["does"])]
        lines += self.described("Arguments:", "@var", map(self.argument, command["arguments"]))
        lines += self.described("Results:", "@var", map(self.result, command["results"]))
        if command.get("notes"):
            lines += ["", self.texinfo(" ".join(command["notes"]))]
        lines += self.described("Errors:", "@code", self.errors(command))
        lines += self.described("Warnings:", "@code",
                                map(self.error, command.get("warnings", [])))
        lines += self.shown_example(command)
        others = [f"ambrix_{c['name']}" for c in self.commands
                  if c["subject"] == command["subject"] and c is not command]
        return lines + [f"@seealso{{{', '.join(others)}}}", "@end deftypefn"]

    @staticmethod
    def signatures(command):
        results = [f"@var{{{r['name']}}}" for r in command["results"]]
        left = f"[{', '.join(results)}]" if results[1:] else "".join(results)
        arguments = [f"@var{{{a['name']}}}" for a in command["arguments"]]
        counts = {sum(not a.get("optional") for a in command["arguments"]), len(arguments)}
        return [f"@deftypefn{'x' if position else ''} {{}} {{{left + ' =' if left else ''}}} "
                f"ambrix_{command['name']} ({', '.join(arguments[:count])})"
                for position, count in enumerate(sorted(counts))]

    @staticmethod
    def described(head, style, rows):
        rows = [line for item, text in rows for line in (f"@item {item}", text)]
        return ["", head, "", f"@table {style}", *rows, "@end table"] if rows else []

    def argument(self, argument):
        kind = self.kinds[argument["kind"]]
        class_name, size = argument.get("class", kind["class"]), argument.get("size", kind["size"])
        text = f"({class_name}, {size}) {argument['meaning']}"
        if "constant" in argument:
            text += f". Or the name of the constant: {self.names(argument['constant'])}"
        return argument["name"], self.texinfo(text) + "."

    def names(self, kind):
        return listed([f"`{name}`" for name in self.constants[kind]]) + ", in any case"

    def result(self, result):
        return result["name"], self.texinfo(
            f"({result['class']}, {result['size']}) {result['meaning']}.")

    def errors(self, command):
        rows = [self.error({"identifier": "wrongNumberOfInputs", "when": "the command takes another"
                            " number of arguments"})]
        for kind in dict.fromkeys(argument["kind"] for argument in command["arguments"]):
            taking = [f"@var{{{a['name']}}}" for a in command["arguments"] if a["kind"] == kind]
            for identifier, text in map(self.error, self.kinds[kind]["errors"]):
                rows.append((identifier, f"{', '.join(taking)}: {text}"))
        if any("constant" in argument for argument in command["arguments"]):
            rows.append((f"{CDFLIB}:unrecognizedConstantName", "no constant has this name."))
        if command["routines"]:
            routines = listed([f"`{routine}`" for routine in command["routines"]])
            rows.append((f"{CDFLIB}:libraryFailure", self.texinfo(
                f"the CDF library reports a failure; the text names the routine, {routines}.")))
        rows += map(self.error, command["errors"])
        merged = {}
        for identifier, text in rows:
            merged.setdefault(identifier, []).append(text)
        return [(identifier, " ".join(text[0].upper() + text[1:] for text in dict.fromkeys(texts)))
                for identifier, texts in merged.items()]

    def error(self, row):
        when = self.texinfo(row["when"])
        return f"{self.components[row['identifier']]}:{row['identifier']}", when + "."

    def shown_example(self, command):
        lines = ["", "@example", "@group", "id = ambrix_open ('example.cdf');"]
        for line in command["example"]:
            if line.startswith(PROMPT):
                lines.append(escaped(self.calls.in_octave(line[len(PROMPT):])))
            elif line.startswith("error: "):
                lines.append("     @error{} " + escaped(line[len("error: "):]))
            else:
                lines.append("     @result{} " + escaped(line))
        return lines + ["@end group", "@end example"]
