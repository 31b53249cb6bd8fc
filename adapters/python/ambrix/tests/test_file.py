"""Files: what they tell of themselves, opening and closing."""
import os
import pickle
import subprocess
import sys

import numpy as np
import pytest

import ambrix
from ambrix import commands
from ambrix.tests.support import made


@pytest.fixture
def path(folder):
    """A file with attributes of several kinds."""
    file = commands.create("told")
    made.add(file, "Epoch", "CDF_EPOCH", commands.computeEpoch([2024, 1, 1, 0, 0, 0, 0]))
    made.add(file, "Flux ", "CDF_REAL4", np.zeros((1, 2), "f4"))
    for name, datatype, value in (("UNITS", "CDF_CHAR", "km/s"), ("CATDESC", "CDF_CHAR", "<Flux>"),
                                  ("FILLVAL", "CDF_REAL4", np.float32(-1e31)),
                                  ("SCALE", "CDF_INT2", np.array([1, 2], "i2"))):
        made.attribute(file, 1, name, datatype, value)
    made.global_attribute(file, "Title", ["Solar wind"])
    made.global_attribute(file, "TEXT", ["one", "two"])
    commands.close(file)
    return str(folder / "told.cdf")


def test_a_file_is_a_mapping_of_its_variables(path):
    with ambrix.open(path) as file:
        assert list(file) == ["Epoch", "Flux "] and len(file) == 2
        assert "Epoch" in file and "epoch" not in file
        assert file["Flux"].name == file["Flux "].name == "Flux "
        with pytest.raises(KeyError, match="did you mean 'Epoch'"):
            file["Epok"]
        assert file.get("Nothing") is None


def test_a_file_tells_its_settings(path):
    with ambrix.open(path) as file:
        assert file.path == path and file.version == "3.9.1" or file.version
        assert (file.format, file.majority) == ("SINGLE_FILE", "ROW_MAJOR")
        assert (file.checksum, file.compression[0]) == ("NO_CHECKSUM", "NO_COMPRESSION")
        flux = file["Flux"]
        assert (flux.number, flux.datatype, flux.shape) == (1, "CDF_REAL4", (1, 2))
        assert flux.sparse_records == "NO_SPARSERECORDS" and flux.blocking_factor >= 0


def test_attributes_keep_their_datatypes(path):
    with ambrix.open(path) as file:
        attrs = file["Flux"].attrs
        assert dict(attrs).keys() == {"UNITS", "CATDESC", "FILLVAL", "SCALE"}
        assert attrs["UNITS"] == "km/s" and type(attrs["FILLVAL"]) is np.float32
        assert attrs["SCALE"].dtype == np.int16 and attrs["SCALE"].tolist() == [1, 2]
        assert attrs.datatype("FILLVAL") == "CDF_REAL4"
        assert attrs.entries("UNITS") == [(1, "CDF_CHAR", "km/s")]
        assert len(file["Epoch"].attrs) == 0


def test_global_attributes_have_a_value_or_a_list(path):
    with ambrix.open(path) as file:
        assert dict(file.attrs) == {"Title": "Solar wind", "TEXT": ["one", "two"]}
        assert [entry.number for entry in file.attrs.entries("TEXT")] == [0, 1]


def test_a_closed_file_still_tells_what_it_is(path):
    file = ambrix.open(path)
    file.close()
    file.close()
    assert file.closed and file["Flux"].attrs["UNITS"] == "km/s"
    with pytest.raises(ValueError, match="is closed"):
        file["Flux"][:]
    with ambrix.open(path) as other:
        assert not other.closed
    assert other.closed


def test_paths_may_lack_the_extension_and_be_relative(path, folder, monkeypatch):
    with ambrix.open("told") as file:
        monkeypatch.chdir("/")
        assert file.path == path and file["Flux"][0, 0] == 0


@pytest.mark.parametrize("name", ["größe.cdf", b"\xff.cdf".decode(errors="surrogateescape")])
def test_paths_may_have_any_characters(path, folder, name):
    os.rename(path, folder / name)
    with ambrix.open(folder / name) as file:
        assert file["Flux"].shape == (1, 2)


@pytest.mark.parametrize("kind", [bytes, bytearray, memoryview])
def test_bytes_are_read_like_files(path, kind):
    with open(path, "rb") as file:
        content = kind(file.read())
    before = len(os.listdir("/proc/self/fd"))
    with ambrix.open(content) as file:
        assert file.path == "<bytes>" and file["Flux"][:].tolist() == [[0, 0]]
        with pytest.raises(TypeError, match="pickled"):
            pickle.dumps(file)
    assert len(os.listdir("/proc/self/fd")) == before


def test_errors_tell_the_file(folder):
    with pytest.raises(FileNotFoundError) as missing:
        ambrix.open("missing")
    assert missing.value.filename == str(folder / "missing")
    (folder / "no.cdf").write_bytes(b"no CDF")
    for source in ("no.cdf", b"no CDF"):
        with pytest.raises(ambrix.Error) as caught:
            ambrix.open(source)
        assert caught.value.identifier == "TOLVEX:ambrix:cdflib:fileOpenError"
        assert caught.value.__notes__
    with pytest.raises(ValueError, match="mode 'w'"):
        ambrix.open("no.cdf", "w")


def test_a_file_is_pickled_by_its_path(path):
    with ambrix.open(path) as file, pickle.loads(pickle.dumps(file)) as again:
        assert again.path == file.path and again is not file
    with pytest.raises(TypeError, match="pickled"):
        pickle.dumps(file)


def test_a_file_that_nobody_has_is_closed(path):
    before = len(os.listdir("/proc/self/fd"))
    file = ambrix.open(path)
    assert len(os.listdir("/proc/self/fd")) > before
    del file
    assert len(os.listdir("/proc/self/fd")) == before


def test_files_left_open_are_closed_silently_at_the_end(path):
    program = f"import ambrix; file = ambrix.open({path!r}); other = [file]; file.me = other"
    done = subprocess.run([sys.executable, "-W", "error", "-c", program], capture_output=True,
                          text=True, check=True)
    assert done.stderr == ""


def test_a_child_does_not_use_the_file_of_its_parent(path):
    with ambrix.open(path) as file:
        child = os.fork()
        if child == 0:
            try:
                file["Flux"][:]
            except RuntimeError:
                file.close()
                os._exit(5)
            os._exit(0)
        assert os.waitstatus_to_exitcode(os.waitpid(child, 0)[1]) == 5
        assert file["Flux"][0, 1] == 0


def test_a_file_is_shown_as_a_table(path):
    with ambrix.open(path) as file:
        text, page = repr(file), file._repr_html_()
        assert repr(file["Flux"]) == "<ambrix.Variable 'Flux ': CDF_REAL4 (1, 2), km/s>"
        assert "UNITS: km/s" in repr(file["Flux"].attrs)
    lines = text.split("\n")
    assert lines[0].startswith(f"<ambrix.File {path}: CDF ")
    assert lines[1].split() == ["name", "datatype", "shape", "units", "description"]
    assert lines[3].split() == ["Flux", "CDF_REAL4", "1", "x", "2", "km/s", "<Flux>"]
    assert lines[4] == "Attributes: Title, TEXT"
    assert "&lt;Flux&gt;" in page and "<Flux>" not in page and page.count("<table>") == 2
    assert "closed" in repr(file)
