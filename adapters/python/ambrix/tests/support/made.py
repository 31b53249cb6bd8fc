"""Files that the tests make with the commands."""
import numpy as np

from ambrix import Error, commands

RECORDS = 40
SIZES = (4, 3, 5)
MAJORITIES = ("ROW_MAJOR", "COLUMN_MAJOR")


def add(file, name, datatype, values, elements=1, varies=True):
    """Adds a variable with values: records first, unless they do not vary, then the dimensions."""
    values = np.asarray(values)
    sizes = values.shape[1:] if varies else values.shape
    row_major = commands.getMajority(file) == "ROW_MAJOR"
    shape = list(sizes[::-1] if row_major else sizes)
    number = commands.createVar(file, name, datatype, elements, shape, varies, [True] * len(sizes))
    ordered = values.T if row_major else np.moveaxis(values, 0, -1) if varies else values
    commands.hyperPutVarData(file, number, 0, len(values) if varies else 1, 1, [0] * len(sizes),
                             shape, [1] * len(sizes), ordered)
    return number


def add_epoch16(file, name, times):
    """Adds a variable of the times that components make."""
    epochs = commands.computeEpoch16(times)
    number = commands.createVar(file, name, "CDF_EPOCH16", 1, [], True, [])
    commands.hyperPutVarData(file, number, 0, epochs.shape[1], 1, [], [], [], epochs)
    return number


def attribute(file, number, name, datatype, value):
    """Sets an attribute of a variable."""
    try:
        place = commands.getAttrNum(file, name)
    except Error:
        place = commands.createAttr(file, name, "VARIABLE_SCOPE")
    commands.putAttrEntry(file, place, number, datatype, value)


def grid(dtype="f8"):
    """Values that tell where they are."""
    return np.arange(RECORDS * np.prod(SIZES)).astype(dtype).reshape(RECORDS, *SIZES)


def grid_file(name, majority):
    """A file with a variable of three dimensions, one of none, some without records, and texts."""
    file = commands.create(name)
    commands.setMajority(file, majority)
    add(file, "grid", "CDF_REAL8", grid())
    add(file, "line", "CDF_INT4", np.arange(RECORDS, dtype="i4"))
    add(file, "still", "CDF_REAL4", grid("f4")[0], varies=False)
    add(file, "one", "CDF_INT2", np.int16(7), varies=False)
    add(file, "texts", "CDF_CHAR", np.char.encode([["ab ", "µ "], ["x  ", "   "]], "utf-8"), 3)
    add(file, "word", "CDF_CHAR", b"alone", 5, varies=False)
    add_epoch16(file, "fine", [[2020, 2021], [1, 2], [3, 4]] + 7 * [[0, 1]])
    commands.close(file)
    return name + ".cdf"


def global_attribute(file, name, texts):
    """Adds a global attribute with a text in each entry."""
    place = commands.createAttr(file, name, "GLOBAL_SCOPE")
    for number, text in enumerate(texts):
        commands.putAttrgEntry(file, place, number, "CDF_CHAR", text)
