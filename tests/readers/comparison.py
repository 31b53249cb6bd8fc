"""Differences between a file's content as the module and as another reader sees it."""

from dataclasses import replace

import numpy as np

from readers.content import CHARACTERS, Attribute, Unread, fill_texts, leading_of


def same_numbers(one, other):
    """Equal bit for bit; of NaN, only that both are."""
    if one.shape != other.shape or one.dtype != other.dtype:
        return False
    if one.dtype.kind != "f":
        return bool(np.array_equal(one, other))
    bits = f"<u{one.dtype.itemsize}"
    equal = np.ascontiguousarray(one).view(bits) == np.ascontiguousarray(other).view(bits)
    return bool(np.all(equal | (np.isnan(one) & np.isnan(other))))


def first_difference(one, other):
    """The first place where two arrays differ, as text."""
    if one.shape != other.shape or one.dtype != other.dtype:
        return f"{one.dtype}{one.shape} and {other.dtype}{other.shape}"
    places = np.argwhere(one != other)
    place = tuple(int(index) for index in places[0]) if len(places) else ()
    return f"{len(places)} differ, first {place}: {one[place]!r} and {other[place]!r}"


def _pads_differ(one, other, code):
    if one is None or other is None:  # the file declares none
        return False
    if code not in CHARACTERS:
        return not same_numbers(one, other)
    return one.tobytes().rstrip(b"\0 ") != other.tobytes().rstrip(b"\0 ")


def kept_sizes(variable):
    """The sizes of the dimensions that matter: some readers drop the ones that do not vary,
    others take them for dimensions of size 1."""
    pairs = zip(variable.sizes, variable.varies)
    return tuple(size for size, vary in pairs if vary and size != 1)


def without_repetition(variable):
    """The values without the repetition along dimensions that do not vary, which must be one."""
    values = variable.values
    for axis, vary in enumerate(variable.varies, 1):
        if not vary:
            single = values.take([0], axis)
            if not same_numbers(np.broadcast_to(single, values.shape).copy(), values):
                raise AssertionError(f"dimension {axis} varies")
            values = single
    return values.reshape((values.shape[0],) + kept_sizes(variable)
                          + leading_of(variable.code, variable.elements))


def variable_differences(one, other, nul_reads_as=0):
    """`one` from the module, whose library reads a text's bytes from the first 0 on as these."""
    if isinstance(other, Unread):
        return [f"unread ({other.error!r})"]
    if one is None:
        return [f"datatype {other.code} refused"]
    found = []
    for name in ("code", "elements", "record_varies"):
        mine, theirs = getattr(one, name), getattr(other, name)
        if mine != theirs:
            found.append(f"{name}: {mine} and {theirs}")
    if other.sparse not in (None, one.sparse):  # None: the reader does not tell
        found.append(f"sparse: {one.sparse} and {other.sparse}")
    if one.sizes != other.sizes and kept_sizes(one) != kept_sizes(other):
        return found + [f"sizes: {one.sizes} and {other.sizes}"]
    mine, theirs = one.values, other.values
    if one.sizes != other.sizes:
        mine = without_repetition(one)
        theirs = without_repetition(other).reshape(mine.shape)
    if one.code in CHARACTERS and nul_reads_as:
        theirs = fill_texts(theirs, nul_reads_as)
    if not same_numbers(mine, theirs):
        found.append("values: " + first_difference(mine, theirs))
    if _pads_differ(one.pad, other.pad, one.code):
        found.append(f"pad: {one.pad} and {other.pad}")
    return found


def entry_difference(one, other, nul_reads_as=0):
    """`one` from the module. Empty when there is none."""
    if isinstance(other, Unread):
        return f"unread ({other.error!r})"
    code, value = one
    if code is None:
        same = False
    elif code in CHARACTERS:
        filler = bytes([nul_reads_as])
        same = code == other[0] and value.rstrip(filler) == other[1].split(b"\0")[0].rstrip(filler)
    else:
        same = code == other[0] and same_numbers(value, other[1])
    return "" if same else f"{one} and {other}"


def renumbered(attribute):
    """The attribute with its gEntries counted without gaps."""
    values = [attribute.entries[key] for key in sorted(attribute.entries)]
    return Attribute(True, dict(enumerate(values)))


def without_blanks_of_names(content):
    """The content with the names of variables and attributes without blanks at their end."""
    variables = {name.rstrip(): variable for name, variable in content.variables.items()}
    attributes = {}
    for name, attribute in content.attributes.items():
        entries = attribute.entries
        if not attribute.is_global:
            entries = {key.rstrip(): entry for key, entry in entries.items()}
        attributes[name.rstrip()] = replace(attribute, entries=entries)
    return replace(content, variables=variables, attributes=attributes)


def attribute_differences(name, one, other, keeps_entry_numbers, nul_reads_as):
    if one.is_global and not keeps_entry_numbers:
        one = renumbered(one)
    if one.is_global != other.is_global:
        yield f"attribute {name}: scope"
    if set(one.entries) != set(other.entries):
        yield f"attribute {name}: entries {sorted(one.entries)} and {sorted(other.entries)}"
    for key in one.entries.keys() & other.entries.keys():
        difference = entry_difference(one.entries[key], other.entries[key], nul_reads_as)
        if difference:
            yield f"attribute {name} entry {key}: {difference}"


def differences(one, other):
    """Texts that tell what differs; `one` from the module, `other` from an independent reader."""
    if isinstance(other, Unread):
        return [f"file: unread ({other.error!r})"]
    if not other.keeps_blanks_of_names:
        one = without_blanks_of_names(one)
    found = []
    if one.row_major != other.row_major:
        found.append("majority")
    for kind in ("variables", "attributes"):
        mine, theirs = list(getattr(one, kind)), list(getattr(other, kind))
        if sorted(mine) != sorted(theirs):
            found.append(f"{kind}: {mine} and {theirs}")
    if [n for n in one.variables] != [n for n in other.variables]:
        found.append("order of variables")
    for name in one.variables.keys() & other.variables.keys():
        for text in variable_differences(one.variables[name], other.variables[name],
                                         one.nul_reads_as):
            found.append(f"variable {name}: {text}")
    for name in one.attributes.keys() & other.attributes.keys():
        found += attribute_differences(name, one.attributes[name], other.attributes[name],
                                       other.keeps_entry_numbers, one.nul_reads_as)
    return found
