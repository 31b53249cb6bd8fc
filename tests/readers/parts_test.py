"""Single records, single values and hyperslabs of real files, as independent readers have them."""

import random
import unittest

import numpy as np

from readers.case import ReadersCase
from readers.comparison import first_difference, same_numbers
from readers.content import leading_of
from readers.module_reader import ModuleReader, host_size, to_numpy
from readers.sample_files import readable_files

RECORDS = 3  # of each variable
SLABS = 2  # of each variable


def spread(variable, theirs):
    """Their values, with the dimensions that do not vary where they leave these out."""
    if theirs.sizes == variable.sizes:
        return theirs.values
    leading = leading_of(variable.code, variable.elements)
    kept = [size if vary else 1 for size, vary in zip(variable.sizes, variable.varies)]
    records = [len(theirs.values)]
    values = theirs.values.reshape(records + kept + list(leading))
    return np.broadcast_to(values, records + list(variable.sizes) + list(leading))


def record_sizes(reader, variable):
    """The dimensions that "getVarRecordData" gives."""
    leading = leading_of(variable.code, variable.elements)
    if variable.sizes and leading == (1,):
        leading = ()
    if not variable.sizes and not leading:
        leading = (1,)
    return list(leading) + reader.host_order(variable.sizes)


def stored(reader, variable, record):
    """A record's values in the order of the file, then zeros."""
    taken = tuple(slice(None) if vary else slice(0, 1) for vary in variable.varies)
    values = variable.values[record][taken]
    if not reader.row_major:
        count = len(variable.sizes)
        values = values.transpose([*reversed(range(count)), *range(count, values.ndim)])
    flat = np.zeros(variable.values[record].size, values.dtype)
    flat[:values.size] = values.reshape(-1)
    return flat


def some(count):
    """Some numbers below count, the first and the last among them."""
    return sorted({0, count - 1} | set(random.sample(range(count), min(RECORDS - 2, count))))


def slab(size):
    """A start, a count and a step that fit into a size; at most a few hundred values."""
    start = random.randrange(size)
    step = random.randint(1, max(1, min(4, size - start)))
    return start, random.randint(1, min(300, (size - start + step - 1) // step)), step


class PartsTest(ReadersCase):
    def setUp(self):
        super().setUp()
        random.seed(20)  # the same places each time

    def assert_same(self, mine, theirs):
        if not same_numbers(mine, theirs):
            self.fail(first_difference(mine, theirs))

    def check_all(self, check):
        """Calls check(reader, number, variable) for every variable with records, its values those
        of an independent reader."""
        for path in readable_files().values():
            _, right = self.read_sample(path)
            with ModuleReader(self.session, str(path)) as reader:
                for number, name in enumerate(reader.names()):
                    variable = reader.definition(number)
                    theirs = right.get(name)
                    if variable is None or theirs is None or not len(theirs.values):
                        continue
                    variable.values = spread(variable, theirs)
                    with self.subTest(file=path.name, variable=name):
                        check(reader, number, variable)

    def test_records(self):
        """As the host stores them, dimensions that do not vary left as zeros."""
        self.check_all(self.check_records)

    def check_records(self, reader, number, variable):
        for record in some(len(variable.values)):
            (result,) = self.session.call("getVarRecordData", reader.file, number, record)
            self.assertEqual(result.size, host_size(record_sizes(reader, variable)))
            self.assert_same(to_numpy(result, variable.code), stored(reader, variable, record))

    def test_single_values(self):
        self.check_all(self.check_single_values)

    def check_single_values(self, reader, number, variable):
        rows = leading_of(variable.code, variable.elements) or (1,)
        for record in some(len(variable.values)):
            place = [random.randrange(size) for size in variable.sizes]
            indices = reader.host_order(place)
            (result,) = self.session.call("getVarData", reader.file, number, record, indices)
            self.assertEqual(result.size, [rows[0], 1])
            expected = variable.values[tuple([record] + place)]
            self.assert_same(to_numpy(result, variable.code), np.ravel(expected))

    def test_hyperslabs(self):
        self.check_all(self.check_hyperslabs)

    def check_hyperslabs(self, reader, number, variable):
        for _ in range(SLABS):
            slabs = [slab(size) for size in (len(variable.values),) + variable.sizes]
            first, dimensions = slabs[0], slabs[1:]
            vectors = [reader.host_order(part) for part in zip(*dimensions)] or [[], [], []]
            (result,) = self.session.call("hyperGetVarData", reader.file, number, *first, *vectors)
            mine = reader.from_host(result, variable.code, variable.elements,
                                    [count for _, count, _ in dimensions], first[1])
            taken = tuple(slice(start, start + count * step, step) for start, count, step in slabs)
            self.assert_same(mine, variable.values[taken])


if __name__ == "__main__":
    unittest.main()
