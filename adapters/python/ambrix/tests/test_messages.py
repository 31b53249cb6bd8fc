"""Errors and warnings."""
import pickle
import struct
import subprocess
import sys
import warnings

import pytest

from ambrix import CdfWarning, Error, commands


def test_an_error_has_identifier_values_and_text(folder):
    with pytest.raises(Error) as caught:
        commands.getConstantValue("nothing")
    error = caught.value
    assert error.identifier == "TOLVEX:ambrix:cdflib:unrecognizedConstantName"
    assert error.values == ("NOTHING",)
    assert "NOTHING" in str(error)
    again = pickle.loads(pickle.dumps(error))
    assert (str(again), again.identifier, again.values) == (
        str(error), error.identifier, error.values)


@pytest.fixture
def odd_compression(folder):
    """A file with a variable whose RLE compression has a parameter that there is not."""
    file = commands.create("odd")
    commands.createVar(file, "v", "CDF_INT2", 1, [], True, [])
    commands.setVarCompression(file, 0, "RLE_COMPRESSION")
    commands.close(file)
    path = folder / "odd.cdf"
    record = struct.pack(">5i", 11, 1, 0, 1, 0)  # of the parameters of a compression
    assert record in path.read_bytes()
    path.write_bytes(path.read_bytes().replace(record, struct.pack(">5i", 11, 1, 0, 1, 3)))
    return path


def test_warnings_are_issued_through_warnings(odd_compression):
    commands.setValidate("VALIDATEFILEOFF")  # or the file is refused
    file = commands.open(odd_compression)
    commands.setValidate("VALIDATEFILEON")
    with pytest.warns(CdfWarning) as caught:
        assert commands.getVarCompression(file, 0)[:2] == ("RLE_COMPRESSION", 3)
    warning = caught[0].message
    assert warning.identifier == "TOLVEX:ambrix:cdflib:invalidCompressionParameter"
    assert warning.values == (3, "RLE")
    assert caught[0].filename == __file__
    with warnings.catch_warnings():
        warnings.simplefilter("error")
        with pytest.raises(CdfWarning, match="RLE"):
            commands.getVarCompression(file, 0)
    commands.close(file)


def test_files_left_open_are_closed_with_a_warning_at_the_end(folder):
    program = ("from ambrix import commands as c; f = c.create('left');"
               "c.createVar(f, 'v', 'CDF_INT1', 1, [], True, [])")
    done = subprocess.run([sys.executable, "-c", program], capture_output=True, text=True,
                          check=True)
    assert "CdfWarning: Files were still open" in done.stderr
    file = commands.open("left")
    assert commands.getVarName(file, 0) == "v"
    commands.close(file)
