"""The engine for xarray."""
import io
import os
import pickle
import time
from importlib.metadata import entry_points

import numpy as np
import pytest

import ambrix
from ambrix import commands, file_cache
from ambrix.tests.support import made

xr = pytest.importorskip("xarray", minversion="2024.1")
CdfBackend = pytest.importorskip("ambrix.xarray_backend").CdfBackend

RECORDS = 6
ENERGIES = np.array([1, 10, 100, 1000], "f4")


def make(name, records=RECORDS, first=0):
    """A file in the style of ISTP. Values count up from the first."""
    file = commands.create(name)
    times = 63871286400000.0 + 1000 * np.arange(first, first + records)
    values = np.arange(first * 12, (first + records) * 12, dtype="f4").reshape(records, 4, 3)
    add = made.add
    numbers = {
        "Epoch": add(file, "Epoch", "CDF_EPOCH", times),
        "flux": add(file, "flux", "CDF_REAL4", values),
        "energy": add(file, "energy", "CDF_REAL4", ENERGIES, varies=False),
        "labels": add(file, "labels", "CDF_CHAR", np.array([b"a", b"b", b"c", b"d"]), varies=False),
        "look": add(file, "look", "CDF_CHAR", np.array([b"x", b"y", b"z"]), varies=False),
        "moving": add(file, "moving", "CDF_REAL4", values[:, :, 0].copy()),
        "bins": add(file, "bins", "CDF_REAL4", values[:, :2, 0].copy()),
        "spectrum": add(file, "spectrum", "CDF_REAL4", values[:, 2:, 0].copy()),
        "count": add(file, "count", "CDF_INT4", np.arange(records + 1, dtype="i4")),
    }
    for name_of, attribute, text in (
            ("flux", "DEPEND_0", "Epoch"), ("flux", "DEPEND_1", "energy"),
            ("flux", "LABL_PTR_1", "labels"), ("flux", "LABL_PTR_2", "look "),
            ("flux", "UNITS", "1/s "), ("flux", "CATDESC", "Flux"), ("moving", "DEPEND_0", "Epoch"),
            ("moving", "DEPEND_1", "look"), ("bins", "DEPEND_0", "Epoch"),
            ("spectrum", "DEPEND_0", "Epoch"), ("spectrum", "DEPEND_1", "bins"),
            ("count", "DEPEND_0", "Epoch"),
            ("Epoch", "UNITS", "ms")):
        made.attribute(file, numbers[name_of], attribute, "CDF_CHAR", text)
    made.attribute(file, numbers["flux"], "FILLVAL", "CDF_REAL4", np.float32(5))
    made.global_attribute(file, "Project", ["Test"])
    commands.close(file)
    return name + ".cdf"


@pytest.fixture
def path(folder):
    return str(folder / make("data"))


@pytest.fixture(autouse=True)
def empty_cache():
    yield
    file_cache.set_cache_size(0)
    file_cache.set_cache_size(64)


def opened(path, **options):
    return xr.open_dataset(path, engine=CdfBackend, **options)


def test_dimensions_are_named_by_what_variables_depend_on(path):
    with opened(path) as data:
        assert data.flux.dims == ("Epoch", "energy", "look")
        assert data.energy.dims == ("energy",) and data["labels"].dims == ("energy",)
        assert data.look.dims == ("look",)
        assert data.moving.dims == ("Epoch", "moving_dim_1")
        assert data["count"].dims == ("count_record",)  # one record more than Epoch
        assert data.spectrum.dims == data.bins.dims == ("Epoch", "bins_dim_1")
        assert set(data.coords) == {"Epoch", "energy", "labels", "look", "bins"}
        assert "bins" in data.spectrum.coords
        assert set(data.indexes) == {"Epoch", "energy", "look"}


def test_values_are_those_of_the_file(path):
    with opened(path) as data, ambrix.open(path) as file:
        assert data.Epoch.dtype == np.dtype("datetime64[ns]")
        assert np.array_equal(data.Epoch, file["Epoch"])
        assert np.array_equal(data["labels"], ["a", "b", "c", "d"])
        flux = data.flux.load()
        assert np.isnan(flux[0, 1, 2]) and int(flux.isnull().sum()) == 1
        assert np.array_equal(flux.fillna(5), file["flux"])
        assert data.flux.sel(energy=100, look="y")[3] == 3 * 12 + 2 * 3 + 1


def test_facts_are_kept(path):
    with opened(path) as data:
        assert data.attrs == {"Project": "Test"}
        assert data.flux.attrs["UNITS"] == "1/s " and data.flux.attrs["units"] == "1/s"
        assert data.flux.attrs["long_name"] == "Flux"
        assert "units" not in data.Epoch.attrs  # which xarray would take for its own
        assert data.flux.encoding["datatype"] == "CDF_REAL4"
        assert data.encoding["source"] == path


def test_options(path):
    with opened(path, drop_variables=["moving", "energy"]) as data:
        assert "moving" not in data and "energy" not in data
        assert data.flux.dims == ("Epoch", "energy", "look")
    with opened(path, drop_variables="count", mask_and_scale=False, decode_times=False) as data:
        assert data.flux[0, 1, 2] == 5
        assert data.Epoch[0] == 63871286400000.0


@pytest.mark.parametrize("key", [
    {"Epoch": 2}, {"Epoch": slice(1, 5, 2), "energy": [3, 0]}, {"look": slice(None, None, -1)},
    {"Epoch": [0, 5], "energy": [1, 1], "look": [2, 0]},
    {"Epoch": xr.DataArray([0, 3], dims="p"), "look": xr.DataArray([2, 1], dims="p")}], ids=repr)
def test_parts_are_those_of_the_whole(path, key):
    with opened(path) as data:
        part = data.flux.isel(key)
        whole = data.flux.load()
        xr.testing.assert_identical(part.load(), whole.isel(key))


def test_a_lazy_array_reads_nothing_before_it_must(path, monkeypatch):
    with opened(path) as data:
        monkeypatch.setattr(ambrix.Variable, "read", None)
        part = data.flux[2:4].isel(energy=1)
        monkeypatch.undo()
        assert part.shape == (2, 3) and part.values[0, 0] == 2 * 12 + 3


def test_a_dataset_is_pickled_by_its_path(path):
    with opened(path) as data:
        flux = pickle.dumps(data.flux.variable)
        assert len(flux) < 3000
        again = pickle.loads(flux)
    file_cache.set_cache_size(0)
    assert again[1, 2, 0] == 12 + 6


def test_a_file_that_has_changed_is_an_error(path):
    with opened(path) as data:
        time.sleep(0.01)
        os.utime(path)
        with pytest.raises(OSError, match="has changed"):
            data.flux.load()
    os.remove(path)
    with pytest.raises(FileNotFoundError):
        data.moving.load()


@pytest.mark.parametrize("kind", [bytes, io.BytesIO, lambda content: memoryview(content)])
def test_bytes_are_opened(path, kind):
    with open(path, "rb") as source:
        content = source.read()
    assert CdfBackend().guess_can_open(kind(content))
    with opened(kind(content)) as data:
        assert data.flux[1, 2, 0] == 12 + 6
        with pytest.raises(TypeError, match="pickled"):
            pickle.dumps(data.flux.variable)


def test_files_are_told_by_how_they_begin(path, folder):
    assert CdfBackend().guess_can_open(path)
    (folder / "other.cdf").write_bytes(b"CDF\x01 of another kind")
    for given in ("other.cdf", "missing.cdf", b"", io.BytesIO(b"none"), 5):
        assert not CdfBackend().guess_can_open(given)


def test_xarray_finds_the_engine_of_the_installed_package(path):
    if not entry_points(group="xarray.backends", name="ambrix"):
        pytest.skip("the package is not installed")
    with xr.open_dataset(path) as data:
        assert data.flux[1, 2, 0] == 12 + 6
    with xr.open_dataset(path, engine="ambrix", chunks={}) as data:
        assert data.flux.chunks is not None


def test_no_more_files_stay_open_than_allowed(folder):
    paths = [str(folder / make(f"many{number}", first=number)) for number in range(5)]
    file_cache.set_cache_size(2)
    before = len(os.listdir("/proc/self/fd"))
    datasets = [opened(path) for path in paths]
    assert [float(data.flux[0, 0, 0]) for data in datasets] == [0, 12, 24, 36, 48]
    assert len(os.listdir("/proc/self/fd")) - before <= 2
    for data in datasets:
        data.close()
    assert len(os.listdir("/proc/self/fd")) == before


def test_a_file_without_variables_stays_open_as_well(folder):
    commands.close(commands.create("none"))
    source = file_cache.Source("none.cdf")
    assert source.file() is source.file()
    source.close()


def test_real_files_are_datasets(sample):
    if not CdfBackend().guess_can_open(sample):
        pytest.skip("no CDF file")
    try:
        file = ambrix.open(sample)
    except ambrix.Error:
        pytest.skip("the CDF library refuses this file")
    with file, opened(sample) as data:
        assert set(data.variables) == set(file)
        data.load()
        for name, variable in file.items():
            assert data[name].shape == variable.shape
        with opened(sample, mask_and_scale=False, decode_times=False) as raw:
            for name, variable in file.items():
                if variable.dtype.kind == "M":
                    assert np.array_equal(raw[name], variable.raw, equal_nan=True)


def test_dask_reads_blocks_in_threads_and_processes(folder):
    dask = pytest.importorskip("dask")
    paths = [str(folder / make(f"part{number}", first=RECORDS * number)) for number in range(4)]
    series = xr.open_mfdataset(paths, engine=CdfBackend, drop_variables="count",
                               data_vars="minimal", coords="minimal", compat="override",
                               join="override", combine="nested", concat_dim="Epoch")
    expected = np.arange(4 * RECORDS * 12, dtype="f8")
    expected[5] = 0  # the fill value
    for scheduler in ("synchronous", "threads", "processes"):
        with dask.config.set(scheduler=scheduler):
            assert float(series.flux.sum(dtype="f8")) == expected.sum()
    assert series.sizes["Epoch"] == 4 * RECORDS
    series.close()
