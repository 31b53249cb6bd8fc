"""What cdflib and pycdfpp write, as the module reads it."""

import os
import unittest

import numpy as np
import pycdfpp
from cdflib import cdfwrite

from readers.case import ReadersCase
from readers.comparison import differences
from readers.content import CHARACTERS, DATATYPES, EPOCH16, Attribute, Content, Variable
from readers.written_files import some_values

ELEMENTS = 6
SHAPES = {"scalar": (), "flat": (4,), "deep": (2, 3, 4)}
COMPRESSIONS = {"none": pycdfpp.CompressionType.no_compression,
                "gzip": pycdfpp.CompressionType.gzip_compression,
                "rle": pycdfpp.CompressionType.rle_compression}


CDFLIB_WRITES_WRONG = (EPOCH16,)  # twice the records, with zeros between the doubles


def expected_content(row_major, left_out):
    """One variable of every datatype and shape, and an attribute of each scope."""
    content = Content(row_major)
    for code, (name, _, _) in DATATYPES.items():
        elements = ELEMENTS if code in CHARACTERS else 1
        if code in left_out:
            continue
        for shape_name, sizes in SHAPES.items():
            for record_varies in (True, False):
                records = 5 if record_varies else 1
                variable = Variable(code, elements, sizes, (True,) * len(sizes), record_varies)
                values = some_values(code, (records,) + sizes, elements)
                if code in CHARACTERS:
                    values = values % 26 + 65  # letters
                elif code == EPOCH16:
                    values = values // 1000 * 1000  # whole nanoseconds
                variable.values = values
                kind = "" if record_varies else "_once"
                content.variables[f"{name}_{shape_name}{kind}"] = variable
    content.attributes["title"] = Attribute(True, {0: (51, b"A text"), 1: (51, b"Another")})
    numbers = {name: (code, np.array([1, 2, 100], dtype)) for code, (name, dtype, _)
               in DATATYPES.items() if code not in (*CHARACTERS, 31, EPOCH16)}
    for name, entry in numbers.items():
        content.attributes["of " + name] = Attribute(False, {f"{name}_scalar": entry})
    return content


def texts(values):
    return np.ascontiguousarray(values).view(f"S{ELEMENTS}")[..., 0]


def in_file_order(data, row_major):
    """Each record flat, as cdflib wants it."""
    if not row_major:
        data = data.transpose([0, *reversed(range(1, data.ndim))])
    return data.reshape(len(data), -1) if data.ndim > 1 else data


def datetimes(values, code):
    """The times of numpy, which count from 1970 instead of the year 0."""
    if code == 31:
        nanoseconds = (values.astype("i8") - 62167219200000) * 10**6
    else:
        whole = values.astype("i8")
        nanoseconds = (whole[..., 0] - 62167219200) * 10**9 + whole[..., 1] // 1000
    return nanoseconds.view("M8[ns]")


def write_with_cdflib(path, content, compression):
    spec = {"Majority": "row_major" if content.row_major else "column_major", "Encoding": 6,
            "Compressed": 0}
    file = cdfwrite.CDF(path, cdf_spec=spec, delete=True)
    title = content.attributes["title"].entries
    file.write_globalattrs({"title": {n: [value.decode(), "CDF_CHAR"]
                                      for n, (_, value) in title.items()}})
    for name, variable in content.variables.items():
        data = variable.values
        if variable.code in CHARACTERS:
            data = texts(data).astype("U")
        data = in_file_order(data, content.row_major)
        if not variable.record_varies:
            data = data[0]
        entries = {}
        for attribute, described in content.attributes.items():
            if name in described.entries:
                code, value = described.entries[name]
                entries[attribute] = [value, DATATYPES[code][0].upper()]
        file.write_var({
            "Variable": name, "Data_Type": variable.code, "Num_Elements": variable.elements,
            "Rec_Vary": variable.record_varies, "Dim_Sizes": list(variable.sizes),
            "Var_Type": "zVariable", "Compress": compression}, var_attrs=entries, var_data=data)
    file.close()


def write_with_pycdfpp(path, content, compression):
    file = pycdfpp.CDF()
    file.majority = pycdfpp.Majority.row if content.row_major else pycdfpp.Majority.column
    title = content.attributes["title"].entries.values()
    file.add_attribute("title", [value.decode() for _, value in title],
                       [pycdfpp.DataType.CDF_CHAR] * len(title))
    for name, variable in content.variables.items():
        data = np.ascontiguousarray(variable.values)
        if variable.code in CHARACTERS:
            data = texts(data)
        elif variable.code in (31, EPOCH16):
            data = datetimes(data, variable.code)
        added = file.add_variable(name, data, pycdfpp.DataType(variable.code),
                                  is_nrv=not variable.record_varies,
                                  compression=COMPRESSIONS[compression])
        for attribute, described in content.attributes.items():
            if name in described.entries:
                code, value = described.entries[name]
                added.add_attribute(attribute, value, pycdfpp.DataType(code))
    pycdfpp.save(file, path)


class ForeignTest(ReadersCase):
    def check(self, write, compression, left_out=()):
        for row_major in (True, False):
            with self.subTest(row_major=row_major):
                path = os.path.join(self.folder, f"foreign_{row_major}.cdf")
                content = expected_content(row_major, left_out)
                write(path, content, compression)
                self.assertEqual(differences(self.read(path), content), [])

    def test_cdflib(self):
        self.check(write_with_cdflib, 0, CDFLIB_WRITES_WRONG)

    def test_cdflib_with_compression(self):
        self.check(write_with_cdflib, 6, CDFLIB_WRITES_WRONG)

    def test_pycdfpp(self):
        self.check(write_with_pycdfpp, "none")

    def test_pycdfpp_with_gzip(self):
        self.check(write_with_pycdfpp, "gzip")

    def test_pycdfpp_with_rle(self):
        self.check(write_with_pycdfpp, "rle")


if __name__ == "__main__":
    unittest.main()
