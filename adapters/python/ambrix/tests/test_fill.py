"""Fill values and ranges."""
import numpy as np
import pytest

import ambrix
from ambrix import commands
from ambrix.tests.support import made

FILL = np.float32(-1e31)


@pytest.fixture
def file(folder):
    """A file with fill values of fitting and of odd kinds."""
    new = commands.create("filled")
    add = made.add
    values = np.array([[1, FILL, 3], [FILL, 50, -6]], "f4")
    number = add(new, "flux", "CDF_REAL4", values)
    made.attribute(new, number, "FILLVAL", "CDF_REAL4", FILL)
    made.attribute(new, number, "VALIDMIN", "CDF_REAL4", np.array([0, 0, -5], "f4"))
    made.attribute(new, number, "VALIDMAX", "CDF_REAL4", np.float32(40))
    number = add(new, "count", "CDF_UINT1", np.array([3, 255, 9], "u1"))
    made.attribute(new, number, "FILLVAL", "CDF_INT2", np.int16(255))
    made.attribute(new, number, "VALIDMAX", "CDF_UINT1", np.uint8(8))
    number = add(new, "odd", "CDF_REAL8", np.array([1.0, 2.0]))
    made.attribute(new, number, "FILLVAL", "CDF_CHAR", "none")
    made.attribute(new, number, "VALIDMIN", "CDF_REAL8", np.array([1.0, 2.0, 3.0, 4.0]))
    number = add(new, "list", "CDF_REAL8", np.array([1.0, 2.0]))
    made.attribute(new, number, "FILLVAL", "CDF_REAL8", np.array([1.0, 2.0]))
    number = add(new, "time", "CDF_EPOCH", np.array([63871286400000.0, 63871286460000.0, -1e31]))
    made.attribute(new, number, "FILLVAL", "CDF_EPOCH", 63871286460000.0)
    made.attribute(new, number, "VALIDMIN", "CDF_EPOCH", 63871286400001.0)
    number = made.add_epoch16(new, "fine", [[2020, 2021], [1, 2], [3, 4]] + 7 * [[0, 1]])
    made.attribute(new, number, "FILLVAL", "CDF_EPOCH16",
                   commands.computeEpoch16([[2021], [2], [4]] + 7 * [[1]]))
    number = add(new, "text", "CDF_CHAR", np.array([b"a", b"b"]), 1)
    made.attribute(new, number, "FILLVAL", "CDF_CHAR", "b")
    commands.close(new)
    with ambrix.open("filled") as opened:
        yield opened


def test_fill_values_stay_unless_they_are_asked_away(file):
    assert (file["flux"][:] == FILL).sum() == 2


def test_fill_values_of_floats_become_nan(file):
    values = file["flux"].read(fill=True)
    assert values.dtype == np.float32
    assert np.array_equal(values, [[1, np.nan, 3], [np.nan, 50, -6]], equal_nan=True)
    assert np.isnan(file["flux"].read((0, 1), fill=True))
    assert file["flux"].read((slice(None), 2), fill=True).tolist() == [3, -6]


def test_integers_and_texts_keep_their_fill_values(file):
    assert file["count"].read(fill=True).tolist() == [3, 255, 9]
    assert file["text"].read(fill=True).tolist() == ["a", "b"]


@pytest.mark.parametrize("name", ["odd", "list"])
def test_a_fill_value_of_another_kind_or_a_list_is_no_fill_value(file, name):
    assert file[name].read(fill=True).tolist() == [1, 2]


def test_times_that_are_none_are_not_a_time(file):
    day = np.datetime64("2024-01-01", "ns")
    minute = day + np.timedelta64(1, "m")
    assert file["time"][:2].tolist() == [day.astype(int), minute.astype(int)]
    assert np.isnat(file["time"][2])
    assert np.isnat(file["time"].read(fill=True)).tolist() == [False, True, True]
    assert np.isnat(file["fine"].read(fill=True)).tolist() == [False, True]


def test_values_out_of_range_are_masked(file):
    values = file["flux"].read(valid=True)
    assert values.mask.tolist() == [[False, True, False], [True, True, True]]
    assert values.data[1, 1] == 50
    assert file["flux"].read((slice(None), 2), valid=True).mask.tolist() == [False, False]
    assert file["count"].read(valid=True).mask.tolist() == [False, True, True]
    assert file["time"].read(valid=True).mask.tolist() == [True, True, True]
    assert file["odd"].read(valid=True).mask.tolist() == [False, False]
    assert file["text"].read(valid=True).mask.tolist() == [False, False]
