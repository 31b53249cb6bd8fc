"""Reading variables: any index gives what NumPy gives of the whole."""
import itertools

import numpy as np
import pytest

import ambrix
from ambrix.indexing import parse
from ambrix.tests.support import made

RECORD_KEYS = [slice(None), 3, -1, slice(5, 30), slice(2, 38, 3), slice(None, None, -1),
               slice(35, 3, -20), slice(1, 39, 17), slice(7, 7), slice(0, 1, 5)]
INNER_KEYS = [(), (1,), (slice(None), -1), (slice(3, None, -2), slice(1, 3), slice(None, None, 2)),
              (..., 2), (slice(None), slice(2, 0, -1), 0), (0, 1, 2)]
LISTS = [([3, 1, 1],), (slice(2, 9, 2), [2, 0]), (5, [0, 3], 1), (np.array([], int),),
         (np.arange(made.RECORDS) % 7 == 2, slice(None), [True, False, True]), (..., [4, -5])]


@pytest.fixture(params=made.MAJORITIES)
def file(request, folder):
    with ambrix.open(made.grid_file("grid", request.param)) as opened:
        yield opened


@pytest.mark.parametrize("key", [(r, *i) for r, i in itertools.product(RECORD_KEYS, INNER_KEYS)],
                         ids=repr)
def test_a_basic_index_gives_what_numpy_gives(file, key):
    expected = made.grid()[key]
    read = file["grid"][key]
    assert type(read) is type(expected) and np.shape(read) == np.shape(expected)
    assert np.array_equal(read, expected)
    assert np.array_equal(file["still"][key[1:]], made.grid("f4")[0][key[1:]])


@pytest.mark.parametrize("key", LISTS, ids=repr)
def test_lists_select_along_their_own_dimension(file, key):
    expected = made.grid()
    keys = [item for item in key if item is not Ellipsis]
    first = expected.ndim - len(keys) if key[0] is Ellipsis else 0
    for place, item in enumerate(keys, first):
        if not isinstance(item, int):
            expected = expected[(slice(None),) * place + (item,)]
    expected = expected[tuple(item if isinstance(item, int) else slice(None) for item in keys)]
    assert np.array_equal(file["grid"][key], expected)


@pytest.mark.parametrize("key, text", [
    ((0,) * 5, "5 indices for 4"), (40, "out of range"), (-41, "out of range"),
    ((..., 0, ...), "one ellipsis"), (None, "new dimensions"), (([[1]],), "one dimension"),
    ([0.5], "integers"), ([True] * 3, "mask of shape")])
def test_an_index_that_does_not_fit_is_an_index_error(file, key, text):
    with pytest.raises(IndexError, match=text):
        file["grid"][key]


def test_a_variable_is_an_array(file):
    grid = file["grid"]
    assert (grid.shape, grid.ndim, grid.size, grid.dtype) == ((40, 4, 3, 5), 4, 2400, np.float64)
    assert grid.nbytes == 8 * 2400 and len(grid) == 40
    assert np.array_equal(np.asarray(grid), made.grid())
    assert np.array_equal(np.asarray(grid, "f4"), made.grid("f4"))
    assert np.array_equal(np.add(grid, 1), made.grid() + 1)
    with pytest.raises(ValueError, match="copy"):
        np.array(grid, copy=False)
    with pytest.raises(TypeError, match="no dimensions"):
        len(file["one"])


def test_values_of_variables_without_records_or_dimensions_are_scalars(file):
    assert file["one"][()] == 7 and type(file["one"][...]) is np.int16
    assert file["one"].shape == () and not file["one"].record_varies
    assert file["line"].shape == (40,) and file["line"][39] == 39


def test_large_values_are_not_copied(file):
    values = file["grid"][:]
    assert not values.flags.owndata
    if file.majority == "ROW_MAJOR":
        assert values.flags.c_contiguous


def test_texts_are_str(file):
    assert file["texts"].dtype == np.dtype("U3")
    assert file["texts"][:].tolist() == [["ab ", "µ "], ["x  ", "   "]]
    assert file["texts"][0, 1] == "µ " and isinstance(file["texts"][0, 1], str)
    assert file["word"][...] == "alone"
    assert file["texts"].raw.dtype == "S3"
    assert file["texts"].raw[:].tolist() == [[b"ab ", "µ ".encode()], [b"x  ", b"   "]]


def test_raw_values_of_epoch16_are_pairs(file):
    assert file["fine"].shape == (2,) and file["fine"].raw.shape == (2, 2)
    assert file["fine"].raw[0].shape == (2,)
    assert file["fine"][1] == np.datetime64("2021-02-04T01:01:01.001001001")


@pytest.mark.parametrize("key", [(), slice(3, 9), (4, 1), (slice(None), 2, 1), slice(None, None, 2),
                                 (slice(None, None, -1),), ([3, 2],), slice(5, 5)], ids=repr)
@pytest.mark.parametrize("order", "CF")
def test_values_are_read_into_an_array_that_is_given(file, key, order):
    expected = made.grid()[key]
    for variable in (file["grid"], file["grid"].raw):
        out = np.zeros(expected.shape, expected.dtype, order)
        assert variable.read(key, out=out) is out
        assert np.array_equal(out, expected)


def test_memory_in_the_order_of_the_file_is_read_into_directly(file):
    raw, key = file["grid"].raw, (slice(3, 9), 1)
    direct = raw._read_into(parse(key, raw.shape), np.zeros((6, 3, 5)))
    assert direct == (file.majority == "ROW_MAJOR")
    line = np.zeros(20, "i4")
    assert file["line"].raw._read_into(parse(slice(0, 40, 2), (40,)), line)
    assert line.tolist() == list(range(0, 40, 2))


def test_an_array_of_another_shape_or_type_is_refused(file):
    with pytest.raises(ValueError, match="shape"):
        file["grid"].read(out=np.zeros((40, 4, 3, 4)))
    with pytest.raises(ValueError, match="shape"):
        file["grid"].raw.read(out=np.zeros((40, 4, 3 * 5)))
    with pytest.raises(TypeError, match="same_kind"):
        file["grid"].read(out=np.zeros((40, 4, 3, 5), int))
    small = np.zeros((40, 4, 3, 5), "f4")
    assert np.array_equal(file["grid"].read(out=small), made.grid("f4"))


def test_an_array_may_be_a_part_of_another(file):
    whole = np.full((40, 8, 3, 5), -1.0)
    file["grid"].raw.read(out=whole[:, ::2])
    assert np.array_equal(whole[:, ::2], made.grid()) and (whole[:, 1::2] == -1).all()


def test_fixed_values_and_pairs_are_read_into_arrays(file):
    still = np.zeros((4, 3, 5), "f4")
    assert np.array_equal(file["still"].raw.read(out=still), made.grid("f4")[0])
    pairs = np.zeros((2, 2))
    assert np.array_equal(file["fine"].raw.read(out=pairs), file["fine"].raw[:])
    times = np.zeros(2, "datetime64[ns]")
    assert np.array_equal(file["fine"].read(out=times), file["fine"][:])
