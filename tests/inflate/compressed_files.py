"""Compressed files of several makes, and damage to them."""

import random

from support.ambrix_session import Session, array

GZIP_START = b"\x1f\x8b\x08"
NUMBERS = random.Random(7)


def _rising(count):
    value, values = 0, []
    for _ in range(count):
        value += NUMBERS.randrange(8)
        values.append(value % 30000)
    return values


def _fill(session, file, name, datatype, class_name, records, level):
    """A variable of so many records of 10 values."""
    number = session.value("createVar", file, name, session.constant(datatype), 1, [10], True,
                           [True])
    if level:
        session.call("setVarCompression", file, number, session.constant("GZIP_COMPRESSION"), level)
    values = array(class_name, _rising(10 * records), [10, records])
    session.call("hyperPutVarData", file, number, 0, records, 1, [0], [10], [1], values)


def make_files(folder, size):
    """Files of which variables, or the whole, are compressed; the largest have `size` records."""
    makes = {"variables": [0, 1, 6, 9], "whole": [0, 0]}
    with Session() as session:
        for name, levels in makes.items():
            (file,) = session.call("create", str(folder / name))
            if name == "whole":
                session.call("setCompression", file, session.constant("GZIP_COMPRESSION"), 6)
            for index, level in enumerate(levels):
                records = (size // 100, size // 10, size, 20)[index]
                _fill(session, file, f"short{index}", "CDF_INT2", "int16", records, level)
                _fill(session, file, f"double{index}", "CDF_REAL8", "double", records, level)
            session.call("close", file)
    return [folder / f"{name}.cdf" for name in makes]


def streams_in(content):
    """Where gzip streams begin."""
    starts, at = [], content.find(GZIP_START)
    while at >= 0:
        starts.append(at)
        at = content.find(GZIP_START, at + 1)
    return starts


def damaged(content, chance):
    """A copy with a few bytes changed or zeroed, mostly in a stream, or broken off."""
    content = bytearray(content)
    starts = streams_in(content)
    start = chance.choice(starts) if starts and chance.random() < 0.8 else 0
    end = min([after for after in starts if after > start], default=len(content))
    kind = chance.randrange(8)
    if kind == 0:
        return content[:chance.randrange(start, end)]
    for _ in range(1 + chance.randrange(3)):
        reach = min(end, start + 60) if kind == 1 else end  # its header and its codes
        at = chance.randrange(start, reach)
        if kind == 2:
            content[at:at + 16] = bytes(len(content[at:at + 16]))
        else:
            content[at] ^= 1 << chance.randrange(8)
    return content
