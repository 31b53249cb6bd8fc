"""Times as `datetime64`."""
import os
import subprocess
import sys

import numpy as np
import pytest

from ambrix import _core, commands
from ambrix.times import EPOCH, EPOCH16, TT2000, to_datetime64

# Known values: the text, CDF_EPOCH, CDF_EPOCH16 (or None), CDF_TIME_TT2000 (or None).
KNOWN = [
    ("1970-01-01T00:00:00", 62167219200000.0, (62167219200.0, 0.0), None),
    ("2000-01-01T12:00:00", 63113947200000.0, (63113947200.0, 0.0), 64184000000),
    ("2008-02-02T06:08:10.010", 63369151690010.0, (63369151690.0, 1e10), 255204555194000000),
    ("1972-01-01T00:00:00", 62230291200000.0, (62230291200.0, 0.0), -883655957816000000),
    ("2017-01-01T00:00:00", 63650448000000.0, (63650448000.0, 0.0), 536500869184000000),
    ("2016-12-31T23:59:59", 63650447999000.0, (63650447999.0, 0.0), 536500867184000000),
    ("1999-12-31T23:59:59.999999999", None, (63113903999.0, 999999999000.0), -43135816000001),
    ("1959-12-31T23:59:59", 61851599999000.0, (61851599999.0, 0.0), None),
    ("2100-06-15T01:02:03.004", 66283923723004.0, (66283923723.0, 4e9), None),
]


@pytest.mark.parametrize("text, epoch, epoch16, tt2000", KNOWN, ids=[row[0] for row in KNOWN])
def test_known_times(text, epoch, epoch16, tt2000):
    expected = np.datetime64(text, "ns")
    if epoch is not None:
        assert to_datetime64(np.array([epoch]), EPOCH)[0] == expected
    assert to_datetime64(np.array([epoch16]), EPOCH16)[0] == expected
    if tt2000 is not None:
        assert to_datetime64(np.array([tt2000]), TT2000)[0] == expected


@pytest.mark.parametrize("shape", [(), (0,), (3,), (2, 3)])
def test_times_keep_their_shape(shape):
    assert to_datetime64(np.full(shape, 62167219200000.0), EPOCH).shape == shape
    assert to_datetime64(np.full((*shape, 2), 0.0), EPOCH16).shape == shape
    assert to_datetime64(np.full(shape, 0), TT2000).shape == shape


def test_arrays_of_any_order_are_converted():
    values = np.arange(12.0).reshape(3, 4) * 1e11 + 62167219200000.0
    expected = to_datetime64(values, EPOCH)
    assert np.array_equal(to_datetime64(np.asfortranarray(values), EPOCH), expected)
    assert np.array_equal(to_datetime64(values[::2, ::3], EPOCH), expected[::2, ::3])


@pytest.mark.parametrize("value", [-1e31, np.nan, np.inf, -np.inf, 0.0, 315569519999999.0])
def test_what_is_no_time_or_beyond_nanoseconds_is_not_a_time(value):
    assert np.isnat(to_datetime64(np.array([value]), EPOCH))[0]
    assert np.isnat(to_datetime64(np.array([[value, 0.0]]), EPOCH16))[0]


@pytest.mark.parametrize("value", [-2**63, -2**63 + 1, -2**63 + 3, 2**63 - 1])
def test_fill_values_of_tt2000_are_not_a_time(value):
    assert np.isnat(to_datetime64(np.array([value]), TT2000))[0]


def tt2000(*parts):
    """One value of calendar parts; those that are missing are 0."""
    return _core.compute_tt2000(np.array([[*parts, *[0] * (9 - len(parts))]], float).T)[0]


def test_a_leap_second_is_given_as_the_next():
    values = tt2000(2016, 12, 31, 23, 59, 59) + np.arange(0, 3_000_000_000, 500_000_000)
    expected = ["2016-12-31T23:59:59.0", "2016-12-31T23:59:59.5", "2017-01-01T00:00:00.0",
                "2017-01-01T00:00:00.5", "2017-01-01T00:00:00.0", "2017-01-01T00:00:00.5"]
    assert to_datetime64(values, TT2000).tolist() == np.array(expected, "datetime64[ns]").tolist()


def test_times_of_all_years_are_what_the_library_says():
    years = np.arange(1708, 2262)
    parts = np.array([years, *np.ones((2, len(years))), *np.zeros((5, len(years))),
                      np.arange(len(years))])
    expected = years.astype("U4").astype("datetime64[ns]") + np.arange(len(years))
    assert np.array_equal(to_datetime64(_core.compute_tt2000(parts), TT2000), expected)


def test_times_end_where_nanoseconds_do():
    values = tt2000(2262, 4, 11, 23, 47, 16, 854, 775, 807) + np.arange(2)
    times = to_datetime64(values, TT2000)
    assert times.astype(np.int64)[0] == np.iinfo(np.int64).max and np.isnat(times[1])
    epochs = commands.computeEpoch(np.array([[2262, 4, 11, 23, 47, 16, 854]], float).T) + [0, 1]
    assert np.isnat(to_datetime64(epochs, EPOCH)).tolist() == [False, True]


def test_times_when_utc_drifted_are_what_the_library_says():
    rng = np.random.default_rng(1)
    values = np.sort(rng.integers(tt2000(1958, 1, 1), tt2000(1973, 1, 1), 300))
    parts = _core.tt2000_breakdown(values).astype(int)
    expected = [np.datetime64(f"{y:04}-{mo:02}-{d:02}T{h:02}:{m:02}:{s:02}.{ms:03}{us:03}{ns:03}")
                for y, mo, d, h, m, s, ms, us, ns in parts.T]
    assert np.array_equal(to_datetime64(values, TT2000), expected)


def test_epochs_of_the_commands_come_back(folder):
    parts = np.array([[1995, 2030], [2, 11], [28, 30], [23, 0], [59, 1], [58, 2], [999, 3]])
    times = to_datetime64(commands.computeEpoch(parts.astype(float)), EPOCH)
    assert times.tolist() == np.array(["1995-02-28T23:59:58.999", "2030-11-30T00:01:02.003"],
                                      "datetime64[ns]").tolist()


def test_leap_seconds_come_from_the_table_of_the_environment(folder):
    (folder / "table.txt").write_text("; Last updated: 20170101\n 1972  1  1  5.0  0.0  0.0\n")
    program = ("import numpy as np; from ambrix.times import to_datetime64;"
               "print(to_datetime64(np.array([536500869184000000]), 33)[0])")
    done = subprocess.run([sys.executable, "-c", program], capture_output=True, text=True,
                          check=True,
                          env={**os.environ, "CDF_LEAPSECONDSTABLE": str(folder / "table.txt")})
    assert done.stdout.strip() == "2017-01-01T00:00:32.000000000"  # 37 - 5 seconds later
