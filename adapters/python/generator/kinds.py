"""How the arguments and results of commands look in Python."""
from typing import NamedTuple


class Kind(NamedTuple):
    """A kind of argument or result: its name in C++, its type in stubs, its words in docstrings."""
    cpp: str
    stub: str
    words: str


NUMBERS = "int | Sequence[int] | numpy.typing.NDArray[Any]"
ARGUMENTS = {
    "file": Kind("kFile", "int", "int"),
    "number": Kind("kNumber", "int | float", "int"),
    "named": Kind("kNamed", "int | float | str", "int, or the name of the constant"),
    "numbers": Kind("kNumbers", NUMBERS, "sequence of int"),
    "variances": Kind("kVariances", "bool | int | Sequence[bool | int] | numpy.typing.NDArray[Any]",
                      "bool, or sequence of bool"),
    "times": Kind("kTimes", "numpy.typing.ArrayLike", "array of float64"),
    "text": Kind("kText", "str | bytes", "str"),
    "file name": Kind("kFileName", "str | os.PathLike[str]", "path"),
    "value": Kind("kValue", "numpy.typing.ArrayLike", "array of exactly the datatype, or text"),
}

ARRAY = "numpy.typing.NDArray[Any]"
RESULTS = {
    ("uint64", "1-by-1"): Kind("kIdentifier", "int", "int"),
    ("double", "1-by-1"): Kind("kNumber", "int", "int"),
    ("char", "1-by-n"): Kind("kText", "str", "str"),
    ("cell", "57-by-1"): Kind("kTexts", "list[str]", "list of str"),
    ("logical", "1-by-1"): Kind("kFlag", "bool", "bool"),
    ("logical", "1-by-n"): Kind("kFlags", "tuple[bool, ...]", "tuple of bool"),
    ("double or char", "0-by-0, 1-by-1 or 1-by-n"):
        Kind("kParameter", "int | str | None", "int, str or None"),
}
SIZES = Kind("kNumbers", "tuple[int, ...]", "tuple of int")
VALUE = Kind("kValue", "Any", "NumPy scalar, 2 numbers for EPOCH16, or str")
RECORD = Kind("kValue", "Any", "array, NumPy scalar or str")
ENTRY = Kind("kRow", "Any", "1-dimensional array, 2-by-n for EPOCH16, or str")
BLOCK = Kind("kBlock", ARRAY, "array: the counts by the number of records")
ROW = Kind("kRow", ARRAY, "1-dimensional array")


def of_argument(argument):
    """The kind of an argument of docs/commands.json."""
    kind = argument["kind"]
    return ARGUMENTS["named" if kind == "number" and "constant" in argument else kind]


def of_result(command, result):
    """The kind of a result of docs/commands.json."""
    class_name, size = result["class"], result["size"]
    if (class_name, size) in RESULTS:
        return RESULTS[class_name, size]
    if command["name"] == "hyperGetVarData":
        return BLOCK
    if class_name == "that of the datatype":
        return ENTRY if size.startswith("1-by-n") else VALUE if "1-by-1" in size else RECORD
    if class_name == "double" and size == "1-by-n":
        return ROW if command["subject"] == "epochs" else SIZES
    if class_name == "double":
        return Kind("kArray", ARRAY, f"array, {size}")
    raise ValueError(f"no kind for the result {result} of {command['name']}")
