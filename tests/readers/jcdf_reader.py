"""Files' content as jcdf reads it, a library in Java."""

import json
import os
import shutil
import subprocess
from pathlib import Path

import numpy as np

from readers.content import CHARACTERS, CODES, Attribute, Content, Unread, Variable
from readers.content import attempt, dtype_of, seen_as_zvariable, text_bytes

NAME = "jcdf"
JAVA = shutil.which("java")
JAR = Path(os.environ.get("AMBRIX_JCDF", "/usr/share/java/jcdf.jar"))
PROGRAM = Path(__file__).parent / "java" / "DumpCdf.java"
SPECIAL = {"NaN": np.nan, "Infinity": np.inf, "-Infinity": -np.inf}


def why_not():
    """The reason why jcdf can't be used; empty when it can."""
    if not JAVA:
        return "no Java here"
    return "" if JAR.is_file() else f"no {JAR} (Debian's libjcdf-java; or set AMBRIX_JCDF)"


def _code(name):
    return CODES["cdf_" + name.lower()]


def _flat(values):
    if isinstance(values, list):
        return [item for value in values for item in _flat(value)]
    return [values]


def _numbers(values, code):
    return np.array([SPECIAL.get(item, item) for item in _flat(values)], dtype_of(code))


def _variable(shown):
    if shown["error"]:
        return Unread(shown["error"])
    code = _code(shown["datatype"])
    variable = Variable(code, shown["elements"], tuple(shown["sizes"]), tuple(shown["varies"]),
                        shown["recordVaries"], sparse=None)
    records = shown["records"]
    if code in CHARACTERS:
        values = text_bytes(_flat(records), variable.elements)
    else:
        values = _numbers(records, code)
    variable.values = values.reshape((len(records),) + variable.shape)
    return variable if shown["zVariable"] else seen_as_zvariable(variable)


def _entry(shown):
    code = _code(shown[0])
    if code in CHARACTERS:
        return code, shown[1].encode("latin-1")
    return code, _numbers(shown[1], code)


def _content(shown):
    if "error" in shown:
        return Unread(shown["error"])
    content = Content(shown["rowMajor"])
    names = [variable["name"] for variable in shown["variables"]]
    content.variables = {variable["name"]: attempt(_variable, variable)
                         for variable in shown["variables"]}
    for attribute in shown["attributes"]:
        keys = range(len(attribute["entries"])) if attribute["global"] else names
        content.attributes[attribute["name"]] = Attribute(attribute["global"], {
            key: _entry(entry) for key, entry in zip(keys, attribute["entries"])
            if entry is not None})
    return content


def read_all(paths):
    """The contents of files, read by one run of Java."""
    done = subprocess.run(
        [JAVA, "-Dfile.encoding=ISO-8859-1", "-cp", str(JAR), str(PROGRAM), *map(str, paths)],
        capture_output=True, text=True, check=True)
    return [_content(json.loads(line)) for line in done.stdout.splitlines()]
