"""What the module writes, as cdflib and pycdfpp read it."""

import os
import unittest

import numpy as np

from readers.case import READERS, ReadersCase, unexplained
from readers.comparison import differences
from readers.content import attempt
from readers.file_writer import FileWriter
from readers.known_faults import rows_for
from readers.written_files import everything


class WrittenTest(ReadersCase):
    def check(self, row_major, compression):
        path = os.path.join(self.folder, "written.cdf")
        expected = everything(self.session, path, row_major, compression)
        self.assertEqual(differences(expected, self.read(path)), [])
        for reader in READERS:
            with self.subTest(reader=reader.NAME):
                content = attempt(reader.read, path)
                rest, used = unexplained(reader, "written.cdf", differences(expected, content))
                self.assertEqual(rest, [])
                self.assertEqual(set(rows_for(reader.NAME, ["written.cdf"])) - used, set())
                self.assert_pads_declared(expected, content)

    def assert_pads_declared(self, expected, content):
        for name, variable in expected.variables.items():
            if variable.pad is not None:
                self.assertIsNotNone(content.variables[name].pad, name)

    def test_row_major(self):
        self.check(True, None)

    def test_column_major(self):
        self.check(False, None)

    def test_row_major_in_a_file_compressed_with_gzip(self):
        self.check(True, "GZIP")

    def test_column_major_in_a_file_compressed_with_gzip(self):
        self.check(False, "GZIP")

    def test_row_major_in_a_file_compressed_with_rle(self):
        self.check(True, "RLE")

    def test_column_major_in_a_file_compressed_with_rle(self):
        self.check(False, "RLE")


class CharactersTest(ReadersCase):
    """The bytes of texts, told by the bytes of the file as well."""

    def write(self, elements, *records):
        path = os.path.join(self.folder, "characters.cdf")
        with FileWriter(self.session, path) as writer:
            writer.create("text", 51, elements=elements)
            for number, record in enumerate(records):
                writer.put_record("text", number, np.frombuffer(record, "u1"))
        with open(path, "rb") as file:
            return path, file.read()

    def test_every_byte_but_0_is_stored_as_it_is(self):
        text = bytes(range(1, 256))
        path, stored = self.write(255, text)
        self.assertIn(text, stored)
        for reader in READERS:
            values = reader.read(path).variables["text"].values
            self.assertEqual(values.tobytes(), text, reader.NAME)

    def test_a_byte_0_ends_the_value(self):
        """The CDF library keeps nothing of what follows; its versions fill up differently."""
        path, _ = self.write(6, b"ab\0cde", b"fghijk")
        version = self.session.values("getLibraryVersion")
        fill = b"\0" if version >= [3, 9] else b" "
        mine = self.read(path).variables["text"].values
        self.assertEqual(mine.tobytes(), b"ab" + 4 * fill + b"fghijk")

    def test_units_beyond_a_byte_keep_their_low_bits(self):
        path = os.path.join(self.folder, "units.cdf")
        with FileWriter(self.session, path) as writer:
            writer.create("text", 52, elements=3)
            self.session.call("putVarRecordData", writer.file, 0, 0, "\u20ac\u0141\uffe9")
        for reader in READERS:
            values = reader.read(path).variables["text"].values
            self.assertEqual(values.tobytes(), b"\xac\x41\xe9", reader.NAME)

    def test_put_var_data_writes_the_first_character_only(self):
        path = os.path.join(self.folder, "first.cdf")
        with FileWriter(self.session, path) as writer:
            writer.create("text", 51, elements=4)
            self.session.call("putVarData", writer.file, 0, 0, [], "wxyz")
        for reader in READERS:
            values = reader.read(path).variables["text"].values
            self.assertEqual(values.tobytes().rstrip(b"\0 "), b"w", reader.NAME)


if __name__ == "__main__":
    unittest.main()
