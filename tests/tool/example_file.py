"""A file with something of everything, made through a session."""

from support.ambrix_session import array

TEXT = "caf\u00c3\u00a9"  # UTF-8 bytes, one per unit
DATATYPES = {
    "CDF_INT1": ("int8", [-128, 127]), "CDF_BYTE": ("int8", [1, -1]),
    "CDF_INT2": ("int16", [-32768, 5]), "CDF_INT4": ("int32", [-2**31, 7]),
    "CDF_UINT1": ("uint8", [0, 255]), "CDF_UINT2": ("uint16", [0, 65535]),
    "CDF_UINT4": ("uint32", [0, 2**32 - 1]), "CDF_REAL4": ("single", [0.5, -1.25]),
    "CDF_FLOAT": ("single", [2.0, 0.0]), "CDF_REAL8": ("double", [0.1, 1e300]),
    "CDF_DOUBLE": ("double", [1 / 3, -2.5]), "CDF_EPOCH": ("double", [62987673600000.0, -1e31]),
    "CDF_UCHAR": ("char", "xy"),
}


def write_example(session, name, majority):
    """Creates NAME with that majority. Sizes are the host's: fastest first."""
    call, constant = session.call, session.constant
    (file,) = call("create", name)
    call("setMajority", file, constant(majority))
    for datatype, (class_name, values) in DATATYPES.items():
        (number,) = call("createVar", file, datatype, constant(datatype), 1, [], True, [])
        call("hyperPutVarData", file, number, 0, 2, 1, [], [], [],
             array(class_name, values, [1, 2]))
    _write_cube(session, file)
    _write_others(session, file)
    _write_attributes(session, file)
    call("close", file)


def _write_cube(session, file):
    sizes = [2, 3, 4]
    (number,) = session.call("createVar", file, "cube", session.constant("CDF_INT4"), 1, sizes,
                             True, [True] * 3)
    session.call("setVarCompression", file, number, session.constant("GZIP_COMPRESSION"), 7)
    session.call("setVarPadValue", file, number, array("int32", [-7]))
    session.call("hyperPutVarData", file, number, 0, 3, 1, [0, 0, 0], sizes, [1, 1, 1],
                 array("int32", list(range(72)), [72, 1]))


def _write_others(session, file):
    call, constant = session.call, session.constant
    (texts,) = call("createVar", file, "texts", constant("CDF_CHAR"), 5, [2, 2], False, [True] * 2)
    call("hyperPutVarData", file, texts, 0, 1, 1, [0, 0], [2, 2], [1, 1],
         array("char", TEXT + "b    c    d    "))
    (fine,) = call("createVar", file, "fine", constant("CDF_EPOCH16"), 1, [], True, [])
    (time,) = call("computeEpoch16", [2004, 5, 13, 15, 8, 11, 22, 33, 44, 55])
    call("hyperPutVarData", file, fine, 0, 1, 1, [], [], [], time)
    for mode in ("PAD", "PREV"):
        (sparse,) = call("createVar", file, f"sparse {mode}", constant("CDF_INT2"), 1, [3], True,
                         [True])
        call("setVarSparseRecords", file, sparse, constant(f"{mode}_SPARSERECORDS"))
        call("setVarPadValue", file, sparse, array("int16", [-9]))
        for record in (2, 5):
            call("putVarRecordData", file, sparse, record, array("int16", [record, 1, 2]))
    call("createVar", file, "empty", constant("CDF_DOUBLE"), 1, [4], True, [True])


def _write_attributes(session, file):
    call, constant = session.call, session.constant
    call("createAttr", file, "Global", constant("GLOBAL_SCOPE"))
    for entry, (datatype, (class_name, values)) in enumerate(DATATYPES.items()):
        call("putAttrgEntry", file, 0, 2 * entry, constant(datatype), array(class_name, values))
    call("createAttr", file, "UNITS", constant("VARIABLE_SCOPE"))
    for variable in (0, 13):
        call("putAttrEntry", file, 1, variable, constant("CDF_CHAR"), TEXT)
    call("createAttr", file, "no entries", constant("VARIABLE_SCOPE"))
