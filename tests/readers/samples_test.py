"""Everything in real files, value by value, as cdflib, pycdfpp and SpacePy read it."""

import unittest

from readers import pycdfpp_reader, spacepy_reader
from readers.case import READERS, ReadersCase, read_by, unexplained
from readers.comparison import differences
from readers.content import CHARACTERS, Content, Variable
from readers.known_faults import rows_for
from readers.sample_files import FOLDER, UNREADABLE, distribution_files, folder_files
from readers.sample_files import needs_folder, readable_files
from support.ambrix_session import CallError, Session

ALL_READERS = (*READERS, spacepy_reader)


class SamplesTest(ReadersCase):
    def compare(self, files):
        self.assertTrue(files)
        used = set()
        compared = {reader.NAME: 0 for reader in ALL_READERS}
        in_files = 0
        for name, path in files.items():
            mine = self.read_sample_alone(path)
            in_files += len(mine.variables)
            for reader in ALL_READERS:
                with self.subTest(file=name, reader=reader.NAME):
                    theirs = read_by(reader, path)
                    rest, rows = unexplained(reader, name, differences(mine, theirs))
                    used |= rows
                    self.assertEqual(rest, [])
                    if isinstance(theirs, Content):
                        read = theirs.variables.values()
                        compared[reader.NAME] += sum(isinstance(one, Variable) for one in read)
        print(f"{len(files)} files, {in_files} variables, compared with", compared)
        for reader in ALL_READERS:
            stale = [row for row in rows_for(reader.NAME, files) if row not in used]
            self.assertEqual(stale, [], "known faults that are none any more")

    def test_files_of_the_cdf_distribution(self):
        self.compare(distribution_files())

    @needs_folder
    def test_files_of_the_sample_folder(self):
        self.compare(folder_files())


class DefaultPadValueTest(ReadersCase):
    def test_of_characters_is_blank(self):
        """Where the file declares none the CDF library's versions give one blank or more."""
        for path in readable_files().values():
            mine, right = self.read_sample(path)
            for name, theirs in right.items():
                if theirs.pad is None and theirs.code in CHARACTERS:
                    with self.subTest(file=path.name, variable=name):
                        pad = mine.variables[name].pad.tobytes()
                        self.assertRegex(pad, rb"^ +\x00*$")


@needs_folder
class OrderOfDimensionsTest(ReadersCase):
    """Told without the code that puts the module's arrays into the readers' order."""

    def check(self, name, variable, host_size, order):
        """The module's data are the file's bytes, which lie in numpy's "C" or "F" order."""
        path = folder_files()[name]
        theirs = pycdfpp_reader.read(str(path)).variables[variable]
        (file,) = self.session.call("open", str(path))
        number = self.session.value("getVarNum", file, variable)
        sizes = self.session.call("inquireVar", file, number)[3]
        self.assertEqual(sizes.data, host_size)
        for record in range(len(theirs.values)):
            (one,) = self.session.call("getVarRecordData", file, number, record)
            self.assertEqual(one.size, host_size)
            self.assertEqual(one.data, theirs.values[record].flatten(order).tolist())
            (same,) = self.session.call("hyperGetVarData", file, number, record, 1, 1,
                                        [0] * len(host_size), host_size, [1] * len(host_size))
            self.assertEqual(same, one)
        self.session.call("close", file)

    def test_a_row_major_variable_has_its_dimensions_reversed(self):
        self.check("a_cdf.cdf", "var5d_counter", [2, 3, 4, 5], "C")
        self.check("nasajava_testCdfRowMajor.cdf", "rank3float", [2, 5], "C")

    def test_a_column_major_variable_has_its_dimensions_as_they_are(self):
        self.check("a_col_major_cdf.cdf", "var5d_counter", [5, 4, 3, 2], "F")
        self.check("nasajava_testCdfColMajor.cdf", "rank3float", [5, 2], "F")

    def test_indices_are_in_the_host_s_order(self):
        for name, indices in (("a_cdf.cdf", [1, 2, 3, 4]), ("a_col_major_cdf.cdf", [4, 3, 2, 1])):
            path = folder_files()[name]
            theirs = pycdfpp_reader.read(str(path)).variables["var5d_counter"]
            (file,) = self.session.call("open", str(path))
            number = self.session.value("getVarNum", file, "var5d_counter")
            value = self.session.value("getVarData", file, number, 2, indices)
            self.assertEqual(value, theirs.values[2, 4, 3, 2, 1])
            self.session.call("close", file)


@needs_folder
class RefusedTest(ReadersCase):
    """By a session without the extended datatypes."""

    def setUp(self):
        super().setUp()
        self.session = Session(cwd=self.folder)
        self.addCleanup(self.session.close)

    def assert_raises(self, identifier, values, *call):
        with self.assertRaises(CallError) as raised:
            self.session.call(*call)
        error = raised.exception
        self.assertEqual((error.identifier, error.values), ("TOLVEX:ambrix:cdflib:" + identifier,
                                                            values))

    def test_a_file_that_the_library_refuses(self):
        for name in UNREADABLE:
            self.assert_raises("fileOpenError", [], "open", str(FOLDER / name))

    def test_variables_of_extended_datatypes(self):
        (file,) = self.session.call("open", str(folder_files()["nasajava_test.cdf"]))
        for name, code, zeros in (("newI8", 8, [0]), ("tt2000", 33, [])):
            number = self.session.value("getVarNum", file, name)
            values = [code, "DATATYPE"]
            ones = [1] * len(zeros)
            self.assert_raises("unrecognizedValue", values, "inquireVar", file, number)
            self.assert_raises("unrecognizedValue", values, "getVarPadValue", file, number)
            self.assert_raises("unrecognizedValue", values, "getVarRecordData", file, number, 0)
            self.assert_raises("unrecognizedValue", values, "getVarData", file, number, 0, zeros)
            self.assert_raises("unrecognizedValue", values, "hyperGetVarData", file, number, 0, 1,
                               1, zeros, ones, ones)

    def test_entries_of_extended_datatypes(self):
        (file,) = self.session.call("open", str(folder_files()["testutf8.cdf"]))
        number = self.session.value("getAttrNum", file, "TestDate")
        for command in ("getAttrgEntry", "inquireAttrgEntry"):
            self.assert_raises("unrecognizedValue", [33, "DATATYPE"], command, file, number, 2)
        number = self.session.value("getAttrNum", file, "Test")
        self.assert_raises("unrecognizedValue", [8, "DATATYPE"], "getAttrgEntry", file, number, 17)
        variable = self.session.value("getVarNum", file, "tt2000")
        number = self.session.value("getAttrNum", file, "dummy")
        self.assert_raises("unrecognizedValue", [33, "DATATYPE"], "getAttrEntry", file, number,
                           variable)


if __name__ == "__main__":
    unittest.main()
