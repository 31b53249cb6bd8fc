"""A client of `ambrix session`: the module's commands as Python calls.

    with Session() as session:
        (file,) = session.call("open", "a.cdf")
        encoding, *rest = session.call("inquire", file)
        session.call("close", file)

Python values stand for arguments as in the protocol's short forms; `array` makes the others.
Results are `Array` objects, which can be arguments again.
"""

import json
import math
import os
import subprocess


class Array:
    """A host array: its class, its sizes and its data, first dimension fastest.

    `data` is a list, of characters a str whose items are UTF-16 units. Non-finite numbers are
    Python floats; cells are arrays.
    """

    def __init__(self, class_name, size, data):
        self.class_name = class_name
        self.size = list(size)
        self.data = data

    @classmethod
    def from_json(cls, value):
        data = value["data"]
        if value["class"] in ("double", "single"):
            data = [_from_number(item) for item in data]
        elif value["class"] == "cell":
            data = [cls.from_json(item) for item in data]
        return cls(value["class"], value["size"], data)

    def to_json(self):
        data = self.data
        if self.class_name in ("double", "single"):
            data = [_to_number(item) for item in data]
        elif self.class_name == "cell":
            data = [to_value(item) for item in data]
        elif self.class_name != "char":
            data = list(data)
        return {"class": self.class_name, "size": self.size, "data": data}

    @property
    def value(self):
        """A text, the only element, or the list of the elements."""
        if self.class_name == "char":
            return self.data
        return self.data[0] if len(self.data) == 1 else self.data

    def __eq__(self, other):
        return isinstance(other, Array) and self.to_json() == other.to_json()

    def __repr__(self):
        return f"Array({self.class_name!r}, {self.size}, {self.data!r})"


def array(class_name, data, size=None):
    """An array from a list (or a str of UTF-16 units); a row unless sizes are given."""
    return Array(class_name, size or [1 if len(data) else 0, len(data)], data)


def _from_number(item):
    names = {"NaN": math.nan, "Inf": math.inf, "-Inf": -math.inf}
    return names[item] if isinstance(item, str) else float(item)


def _to_number(item):
    if isinstance(item, float) and not math.isfinite(item):
        return "NaN" if math.isnan(item) else "Inf" if item > 0 else "-Inf"
    return item


def to_value(argument):
    """The JSON value of an argument."""
    if isinstance(argument, Array):
        return argument.to_json()
    if isinstance(argument, float) and not math.isfinite(argument):
        return array("double", [argument]).to_json()
    if isinstance(argument, (list, tuple)):
        short = all(isinstance(item, bool) for item in argument) or all(
            _is_plain_number(item) for item in argument)
        return list(argument) if short else array("double", list(argument)).to_json()
    return argument


def _is_plain_number(item):
    return isinstance(item, (int, float)) and not isinstance(item, bool) and math.isfinite(item)


class CallError(Exception):
    """What a call raised: `identifier`, `values`, `message` and the `warnings` before it."""

    def __init__(self, error, warnings):
        super().__init__(f"{error['identifier']}: {error['message']} {error['values']}")
        self.identifier = error["identifier"]
        self.values = error["values"]
        self.message = error["message"]
        self.warnings = warnings

    @property
    def name(self):
        """The last part of the identifier."""
        return self.identifier.rpartition(":")[2]


class SessionEnded(Exception):
    """The session has ended where an answer was expected."""


class Session:
    """A running `ambrix session`."""

    def __init__(self, tool=None, options=(), cwd=None, env=None, stderr=None):
        tool = tool or os.environ["AMBRIX_TOOL"]
        self.warnings = []  # of the last call
        self.unload_warnings = None  # known after `close`
        self.process = subprocess.Popen([tool, "session", *options], cwd=cwd, env=env,
                                        stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                                        stderr=stderr)

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.close()

    def send_line(self, line):
        """Sends one line (text or bytes) as it is; returns the parsed answer."""
        data = line if isinstance(line, bytes) else line.encode()
        self.process.stdin.write(data + b"\n")
        self.process.stdin.flush()
        answer = self.process.stdout.readline()
        if not answer.endswith(b"\n"):
            raise SessionEnded(f"no answer; exit status {self.process.wait()}")
        return json.loads(answer)

    def request(self, request):
        """Sends a request object; returns the parsed answer."""
        return self.send_line(json.dumps(request))

    def call(self, command, *arguments, outputs=None):
        """Calls a command; returns its outputs as a list of `Array`, or raises `CallError`."""
        request = {"command": to_value(command), "arguments": [to_value(a) for a in arguments]}
        if outputs is not None:
            request["outputs"] = outputs
        answer = self.request(request)
        self.warnings = answer["warnings"]
        if "error" in answer:
            raise CallError(answer["error"], self.warnings)
        return [Array.from_json(value) for value in answer["outputs"]]

    def values(self, command, *arguments):
        """Like `call`, with plain Python values: texts, scalars and lists."""
        return [output.value for output in self.call(command, *arguments)]

    def value(self, command, *arguments):
        """The only result as a plain Python value."""
        (result,) = self.values(command, *arguments)
        return result

    def constant(self, name):
        """The number of a named constant."""
        return self.value("getConstantValue", name)

    def close(self):
        """Ends the session; returns the exit status."""
        if self.process.stdin.closed:
            return self.process.wait()
        self.process.stdin.close()
        last = self.process.stdout.readline()
        self.process.stdout.close()
        if last:
            self.unload_warnings = json.loads(last)["unload"]["warnings"]
        return self.process.wait()
