"""What the independent readers are known to get wrong, so that a difference there is theirs.

Rows: reader, file, what differs (regular expressions for the whole name and for the beginning of
the difference), the reason. A row that no difference matches any more makes the tests fail: it
would hide something else.
"""

import re

VAX_LIKE = r"alltypes_(vax|alphavmsd|alphavmsg)\.cdf"
WRITTEN = r"written\.cdf"  # by the module, see written_files.py
CONVERTED = r"(converted_)?"  # a conversion keeps the fault
SPARSE_FILES = (r"(nasajava_(cdfml_)?test|testutf8|alltypes_(?!vax|alphavms[dg]).*"
                r"|converted_(nasajava_(cdfml_)?test|testutf8|alltypes_.*))\.cdf")

KNOWN_FAULTS = (
    ("cdflib", CONVERTED + r"a_cdf_huff\.cdf",
     r"file: unread \(OSError.*Only GZIP",
     "cdflib reads no file compressed with HUFF"),
    ("pycdfpp", CONVERTED + r"a_cdf_huff\.cdf",
     r"file: unread \(RuntimeError.*Unknown compression",
     "pycdfpp reads no file compressed with HUFF"),
    ("cdflib", CONVERTED + r"geocpi[012]\.cdf",
     r"variable \S+: unread \(BadGzipFile",
     "cdflib takes AHUFF for GZIP"),
    ("pycdfpp", CONVERTED + r"geocpi[012]\.cdf",
     r"variable \S+: unread \(RuntimeError.*Unknown compression",
     "pycdfpp reads no variable compressed with AHUFF"),
    ("pycdfpp", CONVERTED + r"geocpi0\.cdf",
     r"variable label_time: unread \(BufferError",
     "pycdfpp reads no variable compressed with AHUFF"),
    ("cdflib", VAX_LIKE, r"file: unread \(OSError.*does not support CDFs with this",
     "cdflib refuses floating point numbers that are not IEEE 754's"),
    ("pycdfpp", VAX_LIKE, r"variable (Temp\w*|ep|ep16|dp): (values|pad): ",
     "pycdfpp takes VAX floating point numbers for IEEE 754's"),
    ("pycdfpp", VAX_LIKE, r"attribute (dummy|TestDate|Test|epTestDate) entry "
     r"(\d+|ep|ep16): \((45|44|31|32), ",
     "pycdfpp takes VAX floating point numbers for IEEE 754's"),
    ("cdflib", SPARSE_FILES, r"variable Temp: values: (8|24) differ",
     "cdflib fills only part of a missing record with the pad value, or forgets its byte order"),
    ("pycdfpp", CONVERTED + r"thg_l2_mag_mek_00000000_v01\.cdf",
     r"attribute Rules_of_use entry 0: unread \(UnicodeDecodeError",
     "pycdfpp gives no text that is not UTF-8"),
    ("pycdfpp", CONVERTED + r"wi_l2-30min_sms-stics-afm-magnetosphere_00000000_v01\.cdf",
     r"attribute TEXT entry 0: unread \(UnicodeDecodeError",
     "pycdfpp gives no text that is not UTF-8"),
    ("pycdfpp", WRITTEN, r"attribute bytes entry [01]: unread \(UnicodeDecodeError",
     "pycdfpp gives no text that is not UTF-8"),
    ("cdflib", WRITTEN, r"variable (pad|previous)_(4|44|45): values: \d differ, first \(0, 1\)",
     "cdflib fills only part of a missing record with the pad value"),
    ("cdflib", WRITTEN, r"variable RLE_\d+: unread \(BadGzipFile",
     "cdflib reads no variable compressed with RLE"),
    ("jcdf", WRITTEN, r"variable previous_\d+: unread \(.*ArrayIndexOutOfBounds",
     "jcdf loses its way in records that repeat the one before"),
    ("jcdf", WRITTEN, r"variable epoch16_1d: unread \(ValueError",
     "jcdf gives half of the doubles of a row of epoch16 values"),
    ("jcdf", VAX_LIKE, r"file: unread \(.*Unsupported encoding",
     "jcdf refuses floating point numbers that are not IEEE 754's"),
    ("jcdf", r"(ge_k0_cpi_19921231_v02|ia_k0_epi_19970102_v01)\.cdf",
     r"(variables: .* and \[''\]|order of variables|attribute \w+: entries .* and \[(''|)\])$",
     "jcdf loses the names of the variables in files of CDF 2.4"),
)


def matching(reader, file, difference):
    """The rows that explain a difference."""
    return [row for row in KNOWN_FAULTS
            if row[0] == reader and re.fullmatch(row[1], file) and re.match(row[2], difference)]


def rows_for(reader, files):
    """The rows that apply to at least one of the files."""
    return [row for row in KNOWN_FAULTS
            if row[0] == reader and any(re.fullmatch(row[1], file) for file in files)]
