"""The tests in the functions for Octave: the examples, and wrong arguments."""
import re

from lines import PROMPT, prefixed

CDFLIB = "TOLVEX:ambrix:cdflib"
WRONG_COUNT = "TOLVEX:ambrix:validate:wrongNumberOfInputs"


class FunctionTests:
    def __init__(self, calls):
        self.calls = calls

    def text(self, command):
        tests = [self.example_test(command, by_name=True)]
        if tests[0] != self.example_test(command, by_name=False):
            tests.append(self.example_test(command, by_name=False))
        least = sum(not a.get("optional") for a in command["arguments"])
        most = len(command["arguments"])
        for count in sorted({least - 1, most + 1, most + 5} - {-1}):
            given = ", ".join(["{}"] * count)
            tests.append(f"%!error id={WRONG_COUNT} ambrix_{command['name']} ({given})\n")
        for position, argument in enumerate(command["arguments"]):
            if "constant" in argument:
                given = ["0"] * most
                given[position] = "'NO_SUCH_CONSTANT'"
                tests.append(f"%!error id={CDFLIB}:unrecognizedConstantName"
                             f" ambrix_{command['name']} ({', '.join(given)})\n")
        return "\n".join(tests)

    def example_test(self, command, by_name):
        lines = ["test", "[id, restore] = __ambrix_example__ ();"]
        files = ["id"]
        for line in command["example"]:
            if line.startswith(PROMPT):
                call = self.calls.in_octave(line[len(PROMPT):], by_name)
                opened = re.match(r"(\w+) = ambrix_(?:create|open) \(", call)
                files += [opened[1]] if opened else []
                closed = re.match(r"ambrix_(?:close|delete) \((\w+)\)", call)
                files = [file for file in files if not closed or file != closed[1]]
                lines.append(call.rstrip(";") + ";")
            elif line.startswith("error: "):
                lines += self.expected_error(lines.pop(), line[len("error: "):])
            else:
                lines.append(self.expected(line, command.get("depends_on_library")))
        lines += [f"ambrix_close ({file});" for file in files]
        return "%!" + prefixed(lines, "%! ")[3:]

    @staticmethod
    def expected_error(call, shown):
        identifier, _, values = shown.partition(" ")
        lines = [f"err = __ambrix_raised__ (@() {call.rstrip(';')});",
                 f"assert (err.identifier, '{identifier}');"]
        values = re.findall(r"'((?:[^']|'(?=[a-z]))*)'|(-?\d+)", values)
        if identifier.endswith("libraryFailure"):
            values = values[:1]  # the rest is the library's text, of its version
        return lines + [f"assert (any (strfind (err.message, '{text or number}')));"
                        for text, number in values]

    @staticmethod
    def expected(line, depends_on_library):
        name, _, value = line.partition(" = ")
        if depends_on_library:
            kind = "ischar" if value.startswith("'") else "isreal"
            return f"assert ({kind} ({name}) && ! isempty ({name}));"
        cells = re.fullmatch(r"\{(.*); \.\.\. \}, (\d+) cells", value)
        if cells:
            count = cells[1].count(";") + 1
            return (f"assert (size ({name}), [{cells[2]}, 1]);\n%! "
                    f"assert ({name}(1:{count}), {{{cells[1]}}});")
        return f"assert ({name}, {value});"
