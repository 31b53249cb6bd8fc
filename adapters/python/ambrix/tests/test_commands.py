"""How arguments and results are converted."""
import inspect
import pickle

import numpy as np
import pytest

from ambrix import Error, OutOfMemoryError, commands

TYPES = {"CDF_INT1": "int8", "CDF_INT2": "int16", "CDF_INT4": "int32", "CDF_UINT1": "uint8",
         "CDF_UINT2": "uint16", "CDF_UINT4": "uint32", "CDF_REAL4": "float32",
         "CDF_REAL8": "float64", "CDF_EPOCH": "float64", "CDF_BYTE": "int8",
         "CDF_FLOAT": "float32", "CDF_DOUBLE": "float64"}


@pytest.fixture
def new(folder):
    """A new file with a variable of 3-by-2 values of each datatype."""
    file = commands.create("new")
    for name in TYPES:
        commands.createVar(file, name, name, 1, [3, 2], True, [True, True])
    yield file
    commands.close(file)


def number_of(file, name):
    return commands.getVarNum(file, name)


def write_all(file, name, values):
    commands.hyperPutVarData(file, number_of(file, name), 0, values.shape[-1], 1, [0, 0], [3, 2],
                             [1, 1], values)


def read_all(file, name, records):
    return commands.hyperGetVarData(file, number_of(file, name), 0, records, 1, [0, 0], [3, 2],
                                    [1, 1])


@pytest.mark.parametrize("records", [1, 2, 500])
@pytest.mark.parametrize("name", TYPES)
def test_values_of_each_datatype_come_back_as_they_were(new, name, records):
    values = np.arange(6 * records).astype(TYPES[name]).reshape((3, 2, records), order="F")
    write_all(new, name, values)
    read = read_all(new, name, records)
    assert read.dtype == values.dtype and read.shape == (3, 2, records)
    assert read.flags.f_contiguous and read.flags.writeable
    assert np.array_equal(read, values)


@pytest.mark.parametrize("change", [
    np.ascontiguousarray, lambda a: a.astype(">i4"), lambda a: np.repeat(a, 2, 2)[..., ::2],
    lambda a: a[::-1].copy(order="F")[::-1]])
def test_arrays_of_any_layout_can_be_written(new, change):
    values = np.arange(12, dtype=np.int32).reshape((3, 2, 2), order="F")
    write_all(new, "CDF_INT4", change(values))
    assert np.array_equal(read_all(new, "CDF_INT4", 2), values)


@pytest.mark.parametrize("wrong", ["int64", "float32", "uint32", "bool"])
def test_values_of_another_class_are_refused(new, wrong):
    with pytest.raises(Error) as caught:
        write_all(new, "CDF_INT4", np.zeros((3, 2, 1), wrong))
    assert caught.value.identifier == "TOLVEX:ambrix:cdflib:datatypeMismatch"
    assert caught.value.values[1] == "CDF_INT4"


@pytest.mark.parametrize("wrong", [1j, np.datetime64("2020"), object()])
def test_what_no_cdf_can_hold_is_a_type_error(new, wrong):
    with pytest.raises(TypeError):
        commands.putVarData(new, 0, 0, [0, 0], wrong)


def test_python_numbers_have_their_own_class(new):
    commands.putVarData(new, number_of(new, "CDF_REAL8"), 0, [0, 0], 1.5)
    with pytest.raises(Error, match="int64"):
        commands.putVarData(new, number_of(new, "CDF_REAL8"), 0, [0, 0], 1)


def test_a_single_value_keeps_its_datatype(new):
    commands.putVarData(new, number_of(new, "CDF_REAL4"), 0, (2, 1), np.float32(0.1))
    value = commands.getVarData(new, number_of(new, "CDF_REAL4"), 0, np.array([2, 1]))
    assert type(value) is np.float32 and value == np.float32(0.1)


def test_epoch16_has_two_numbers_a_value(new):
    variable = commands.createVar(new, "e", "CDF_EPOCH16", 1, [], True, [])
    times = commands.computeEpoch16([[2020, 2021], [1, 2], [3, 4]] + 7 * [[0, 1]])
    commands.hyperPutVarData(new, variable, 0, 2, 1, [], [], [], times)
    assert times.shape == (2, 2)
    assert np.array_equal(commands.hyperGetVarData(new, variable, 0, 2, 1, [], [], []), times)
    assert commands.getVarData(new, variable, 1).shape == (2,)


def test_texts_are_arrays_of_bytes(new):
    variable = commands.createVar(new, "t", "CDF_CHAR", 3, [2], True, [True])
    texts = np.array([[b"abc", b"de "], [b"fgh", b"i  "]]).T
    commands.hyperPutVarData(new, variable, 0, 2, 1, [0], [2], [1], texts)
    read = commands.hyperGetVarData(new, variable, 0, 2, 1, [0], [2], [1])
    assert read.dtype == "S3" and np.array_equal(read, texts)
    assert commands.getVarData(new, variable, 1, [0]) == "fgh"


def test_texts_are_utf8(new):
    attribute = commands.createAttr(new, "size", "GLOBAL_SCOPE")
    commands.putAttrgEntry(new, attribute, 0, "CDF_CHAR", "µ")
    commands.putAttrgEntry(new, attribute, 1, "CDF_CHAR", b"\xb5")  # Latin-1, not UTF-8
    assert commands.getAttrgEntry(new, attribute, 0) == "µ"
    odd = commands.getAttrgEntry(new, attribute, 1)
    assert odd.encode(errors="surrogateescape") == b"\xb5"
    commands.putAttrgEntry(new, attribute, 2, "CDF_CHAR", odd)
    assert commands.getAttrgEntry(new, attribute, 2) == odd


def test_entries_are_one_dimensional(new):
    attribute = commands.createAttr(new, "a", "GLOBAL_SCOPE")
    commands.putAttrgEntry(new, attribute, 0, "CDF_INT2", np.array([1, 2], "i2"))
    commands.putAttrgEntry(new, attribute, 1, "CDF_INT2", np.int16(3))
    assert commands.getAttrgEntry(new, attribute, 0).tolist() == [1, 2]
    assert commands.getAttrgEntry(new, attribute, 1).shape == (1,)


def test_constants_are_given_by_number_or_name(new):
    commands.setCompression(new, "GZIP_COMPRESSION", 6)
    assert commands.getCompression(new)[1] == 6
    commands.setMajority(new, commands.getConstantValue("column_major"))
    assert commands.getMajority(new) == "COLUMN_MAJOR"
    with pytest.raises(Error, match="NONE"):
        commands.setMajority(new, "none")


def test_none_stands_for_an_argument_that_is_left_out(new):
    commands.setCompression(new, "NO_COMPRESSION", None)
    assert commands.getCompression(new)[:2] == ("NO_COMPRESSION", None)


@pytest.mark.parametrize("number", [True, "0", np.float32(0), [0, 0], np.zeros(2)])
def test_a_number_is_one_integer_or_double(new, number):
    with pytest.raises(Error) as caught:
        commands.getVarName(new, number)
    assert caught.value.identifier == "TOLVEX:ambrix:validate:argumentNotDoubleScalar"
    assert caught.value.values == ("VARNUM",)


@pytest.mark.parametrize("number", [0, 0.0, np.int8(0), np.float64(0), np.uint64(0)])
def test_integers_and_doubles_of_any_kind_are_numbers(new, number):
    assert commands.getVarName(new, number) == "CDF_INT1"


@pytest.mark.parametrize("identifier", [0, -1, 2**64, 12345])
def test_an_identifier_of_no_file_is_refused(identifier):
    with pytest.raises(Error) as caught:
        commands.getMajority(identifier)
    assert caught.value.identifier == "TOLVEX:ambrix:cdflib:invalidFileId"


def test_arguments_go_by_name_too(new):
    assert commands.getVarName(variable=1, id=new) == "CDF_INT2"


@pytest.mark.parametrize("given, named, text", [
    ((), {}, r"getVarName\(\) misses the argument 'id'"),
    ((1,), {}, r"misses the argument 'variable'"),
    ((1, 2, 3), {}, r"too many arguments"),
    ((1, 2), {"id": 1}, r"multiple values for argument 'id'"),
    ((1,), {"number": 1}, r"unexpected keyword argument 'number'")])
def test_arguments_that_do_not_fit_are_a_type_error(given, named, text):
    with pytest.raises(TypeError, match=text):
        commands.getVarName(*given, **named)


def test_functions_have_signatures_and_descriptions():
    assert str(inspect.signature(commands.getVarData)) == "(id, variable, record, indices=None)"
    assert commands.getVarData.__doc__.startswith("Reads one value.\n")
    assert commands.getVarData.__module__ == "ambrix.commands"
    assert pickle.loads(pickle.dumps(commands.computeEpoch)) is commands.computeEpoch


def test_paths_may_be_path_objects(folder):
    path = folder / "größe.cdf"
    commands.close(commands.create("plain"))
    (folder / "plain.cdf").rename(path)
    file = commands.open(path)
    assert commands.getMajority(file) == "ROW_MAJOR"
    commands.close(file)


def test_memory_that_cannot_be_had_is_a_memory_error(new):
    with pytest.raises(OutOfMemoryError) as caught:
        read_all(new, "CDF_REAL8", 2**40)
    assert isinstance(caught.value, MemoryError) and isinstance(caught.value, Error)
    assert caught.value.identifier == "TOLVEX:host:outOfMemory"
