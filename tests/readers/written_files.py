"""Files that hold everything the module can write."""

import numpy as np

from readers.content import CHARACTERS, DATATYPES, EPOCH16, dtype_of, leading_of
from readers.file_writer import FileWriter

TEXT_ELEMENTS = 7


def some_values(code, shape, elements=1, seed=0):
    """Values of any bits, the extremes among them; times that a calendar knows."""
    rng = np.random.default_rng(seed + code)
    shape = tuple(shape) + leading_of(code, elements)
    dtype = dtype_of(code)
    if code in CHARACTERS:
        return rng.integers(1, 256, shape, "u1")
    if code == 31:
        return rng.integers(6e13, 6.5e13, shape).astype(dtype)
    if code == EPOCH16:
        return rng.integers(6e10, 6.5e10, shape).astype(dtype)
    if dtype.kind == "f":
        values = rng.standard_normal(shape) * 10.0 ** rng.integers(-30, 30, shape)
        extremes = [np.inf, -np.inf, np.nan, -0.0, np.finfo(dtype).max, np.finfo(dtype).tiny / 4]
    else:
        values = rng.integers(np.iinfo(dtype).min, np.iinfo(dtype).max, shape, dtype, True)
        extremes = [np.iinfo(dtype).min, np.iinfo(dtype).max, 0]
    values = values.astype(dtype)
    extremes = np.array(extremes, dtype)[:values.size]
    values.reshape(-1)[:len(extremes)] = extremes
    return values


def some_pad(code, elements):
    """A pad value; a text in ASCII, for not every reader knows another."""
    if code in CHARACTERS:
        return np.frombuffer(b"pad value"[:elements], "u1")
    return some_values(code, (9,), seed=7)[-1]


def _create_and_put(writer, name, code, records, sizes=(), **settings):
    elements = settings.pop("elements", TEXT_ELEMENTS if code in CHARACTERS else 1)
    writer.create(name, code, sizes, elements=elements, **settings)
    writer.put(name, some_values(code, (records,) + tuple(sizes), elements, len(name)))


def all_datatypes(writer):
    """Each datatype, scalar and with dimensions, record-varying and not, with a pad value."""
    for code, (name, _, _) in DATATYPES.items():
        elements = TEXT_ELEMENTS if code in CHARACTERS else 1
        pad = some_pad(code, elements)
        _create_and_put(writer, name, code, 12, pad=pad)
        _create_and_put(writer, name + "_3d", code, 5, (2, 3, 4))
        _create_and_put(writer, name + "_once", code, 1, record_varies=False)
        _create_and_put(writer, name + "_once_2d", code, 1, (4, 3), record_varies=False)
        writer.create(name + "_empty", code, (2, 3), elements=elements)


def compressed_variables(writer, compressions):
    """Large enough and plain enough to become smaller."""
    for compression in compressions:
        for code, elements in ((2, 1), (14, 1), (21, 1), (45, 1), (32, 1), (51, 8)):
            name = f"{compression}_{code}"
            writer.create(name, code, (5, 4), elements=elements, compression=compression)
            shape = (50,) + writer.content.variables[name].shape
            values = np.full(shape, 32 if code == 51 else 0, dtype_of(code))
            values[::7, 1:3] = some_values(code, (1,), elements)[0]
            writer.put(name, values)


def all_dimensions(writer):
    """0 to 10 dimensions."""
    sizes = (3, 2, 4, 1, 2, 3, 1, 2, 2, 1)
    for count in range(11):
        _create_and_put(writer, f"int4_{count}d", 4, 3, sizes[:count])
        _create_and_put(writer, f"char_{count}d", 51, 2, sizes[:count], elements=3)
        _create_and_put(writer, f"epoch16_{count}d", 32, 2, sizes[:count])


def dimensions_that_do_not_vary(writer):
    """Only the first of the values along such a dimension is stored."""
    for name, varies in (("first", (False, True)), ("last", (True, False)),
                         ("both", (False, False))):
        for code, elements in ((45, 1), (51, 4), (32, 1)):
            variable = writer.create(f"{name}_{code}", code, (3, 4), varies, elements=elements)
            single = tuple(size if vary else 1 for size, vary in zip((3, 4), varies))
            values = some_values(code, (2,) + single, elements)
            writer.put(f"{name}_{code}", np.broadcast_to(values, (2,) + variable.shape))


def records_that_are_missing(writer):
    """Sparse records: filled with the pad value, or with the one before."""
    for code, elements in ((4, 1), (44, 1), (45, 1), (51, 5)):
        for sparse in ("pad", "previous"):
            name = f"{sparse}_{code}"
            pad = some_pad(code, elements)
            variable = writer.create(name, code, (2,), elements=elements, sparse=sparse, pad=pad)
            values = some_values(code, (10, 2), elements)
            for record in (1, 2, 5, 9):
                writer.put_record(name, record, values[record])
            variable.values = _filled(values, (1, 2, 5, 9), pad, sparse == "previous")


def _filled(values, written, pad, previous):
    values = values.copy()
    for record in sorted(set(range(len(values))) - set(written)):
        values[record] = values[record - 1] if previous and record else pad
    return values


def records_and_single_values(writer):
    """Written record by record, and value by value."""
    for code in DATATYPES:
        elements = TEXT_ELEMENTS if code in CHARACTERS else 1
        variable = writer.create(f"records_{code}", code, (3, 2), elements=elements)
        variable.values = some_values(code, (4, 3, 2), elements)
        for record, value in enumerate(variable.values):
            writer.put_record(f"records_{code}", record, value)
        variable = writer.create(f"values_{code}", code, (2, 3))
        variable.values = some_values(code, (2, 2, 3))
        for place in np.ndindex(2, 2, 3):
            value = variable.values[place]
            writer.put_value(f"values_{code}", place[0], place[1:], value)


def all_attributes(writer):
    """Entries of every datatype, of one value and of several, with gaps; many attributes."""
    writer.create("x", 4)
    writer.create("y", 45)
    writer.attribute("global", True)
    writer.attribute("variable", False)
    for position, code in enumerate(DATATYPES):
        if code in CHARACTERS:
            one, several = b"a", b"several characters"
        else:
            one, several = some_values(code, (1,)), some_values(code, (6,))
        writer.entry("global", 3 * position, code, one)
        writer.entry("global", 3 * position + 1, code, several)
        writer.attribute(f"variable {code}", False)
        writer.entry(f"variable {code}", "y", code, several)
    writer.entry("variable", "x", 51, b"of x")
    for number in range(200):
        writer.attribute(f"many {number}", number % 2 == 0)
        writer.entry(f"many {number}", 0 if number % 2 == 0 else "x", 4, [number])
    writer.attribute("no entries", True)
    writer.attribute("bytes", True)
    writer.entry("bytes", 0, 51, bytes(range(1, 256)))
    writer.entry("bytes", 1, 52, bytes(range(255, 0, -1)))


# Readers other than the CDF library know these; some of them know the others, too.
WIDELY_READ = ("GZIP", "RLE")
ALL_COMPRESSIONS = ("GZIP", "RLE", "HUFF", "AHUFF")


def everything(session, path, row_major, compression=None, compressions=WIDELY_READ):
    """Writes it all into one file, whose file compression and those of variables are given;
    returns its content."""
    with FileWriter(session, path, row_major, compression) as writer:
        all_attributes(writer)
        all_datatypes(writer)
        compressed_variables(writer, compressions)
        all_dimensions(writer)
        dimensions_that_do_not_vary(writer)
        records_that_are_missing(writer)
        records_and_single_values(writer)
    return writer.content
