"""Values and messages in the session protocol."""

import json
import math
import os
import random
import struct
import unittest

from support.ambrix_session import Array, array
from tool.session_case import SessionCase, run_session


class ValueTest(SessionCase):
    def test_integers_are_exact(self):
        identifier = Array("uint64", [1, 1], [2**64 - 1])
        self.assert_raises("TOLVEX:ambrix:cdflib:invalidFileId", [], "close", identifier)
        file = self.create()
        self.assertEqual((file.class_name, file.size), ("uint64", [1, 1]))
        self.assertGreater(file.data[0], 0)
        for datatype, name, values in (
                ("CDF_INT1", "int8", [-128, 127]), ("CDF_UINT1", "uint8", [0, 255]),
                ("CDF_INT2", "int16", [-2**15, 2**15 - 1]), ("CDF_UINT2", "uint16", [0, 2**16 - 1]),
                ("CDF_INT4", "int32", [-2**31, 2**31 - 1]), ("CDF_UINT4", "uint32", [0, 2**32 - 1])):
            self.session.call("delete", file)
            self.assertEqual(self.echo(array(name, values), datatype), array(name, values))
            file = self.create()

    def test_doubles_and_singles_read_back_exactly(self):
        doubles = [0.1, -0.0, 5e-324, 1.7976931348623157e308, 2**53 + 1.0, 1e22, 123456789.125, 1 / 3]
        result = self.echo(array("double", doubles), "CDF_DOUBLE").data
        self.assertEqual(struct.pack("8d", *result), struct.pack("8d", *doubles))
        singles = [struct.unpack("f", struct.pack("f", x))[0]
                   for x in (0.1, -0.0, 1e-45, 3.4028234e38, 16777217, 1 / 3)]
        result = self.echo(array("single", singles), "CDF_FLOAT").data
        self.assertEqual(struct.pack("6f", *result), struct.pack("6f", *singles))
        self.assertEqual(result, singles)  # as doubles, too

    def assert_exact(self, file, texts, numbers):
        answer = self.session.send_line(
            '{"command":"putAttrgEntry","arguments":[%s,0,0,45,[%s]]}'
            % (json.dumps(file.to_json()), ",".join(texts)))
        self.assertNotIn("error", answer)
        (result,) = self.session.call("getAttrgEntry", file, 0, 0)
        self.assertEqual(struct.pack(f"{len(numbers)}d", *result.data),
                         struct.pack(f"{len(numbers)}d", *numbers))

    def test_half_a_million_doubles_bit_for_bit(self):
        file = self.create()
        self.session.call("createAttr", file, "a", 1)
        self.assert_exact(file, ["0.1100230209618294"] * 2, [0.1100230209618294] * 2)
        source = random.Random(1)
        for _ in range(5):
            numbers = struct.unpack("50000d", source.randbytes(8 * 50_000))
            numbers = [x for x in numbers if math.isfinite(x)]
            self.assert_exact(file, [repr(x) for x in numbers], numbers)
            self.assert_exact(file, [f"{x:.17g}" for x in numbers], numbers)

    def test_numbers_that_are_not_finite(self):
        values = [math.nan, math.inf, -math.inf]
        for name, datatype in (("double", "CDF_DOUBLE"), ("single", "CDF_FLOAT")):
            result = self.echo(array(name, values), datatype).data
            self.assertTrue(math.isnan(result[0]))
            self.assertEqual(result[1:], values[1:])

    def test_shapes(self):
        (names,) = self.session.call("getConstantNames")
        self.assertEqual((names.class_name, names.size), ("cell", [57, 1]))
        self.assertEqual(names.data[0], array("char", "AHUFF_COMPRESSION"))
        self.assertEqual(self.session.call("epochBreakdown", [])[0].size, [7, 0])
        (epochs,) = self.session.call("epoch16Breakdown", Array("double", [2, 3, 2], [0.0] * 12))
        self.assertEqual(epochs.size, [10, 3, 2])

    def test_short_forms(self):
        file = self.create()
        self.session.call("createVar", file, "v", 4, 1, [2, 3], True, [True, False])
        name, datatype, elements, sizes, varies, variances = self.session.call("inquireVar", file, 0)
        self.assertEqual(name, array("char", "v"))
        self.assertEqual(datatype, array("char", "cdf_int4"))
        self.assertEqual(elements, array("double", [1.0]))
        self.assertEqual(sizes, array("double", [2.0, 3.0]))
        self.assertEqual(varies, array("logical", [True]))
        self.assertEqual(variances, array("logical", [True, False]))
        self.session.call("createVar", file, "w", 4, 1, None, True, [])
        self.assertEqual(self.session.call("inquireVar", file, 1)[3].size, [0, 0])
        self.assert_raises("TOLVEX:ambrix:validate:argumentNotDoubleScalar", ["VARNUM"],
                           "inquireVar", file, "0")

    def test_cells_reach_the_module(self):
        cell = Array("cell", [1, 2], [array("double", [1.0]), Array("cell", [0, 0], [])])
        self.assert_raises("TOLVEX:ambrix:validate:argumentNotDoublePrecision", ["EPOCHTIME"],
                           "epochBreakdown", cell)

    def test_units_of_characters(self):
        every = "".join(map(chr, range(1, 256)))
        self.assertEqual(self.echo(array("char", every), "CDF_UCHAR").data, every)
        self.assertEqual(self.echo(array("char", "\u4141\ud842"), "CDF_CHAR").data, "AB")
        answer = self.session.send_line('{"command":"open","arguments":["\\ud800"]}')
        self.assertEqual(answer["error"]["identifier"], "TOLVEX:ambrix:cdflib:invalidCharError")

    def test_answers_are_ascii(self):
        done, answers = run_session(
            '{"command":"getConstantValue","arguments":["é€😀"],"tag":"é😀"}\n'.encode())
        self.assertTrue(done.stdout.isascii())
        self.assertEqual(answers[0]["tag"], "é😀")
        self.assertEqual(answers[0]["error"]["values"], ["\u00e9\u00ac\u003d\u0000"[:3]])

    def test_large_arrays_pass_quickly(self):
        values = [float(i) for i in range(7 * 100_000)]
        self.assertEqual(self.session.call("computeEpoch", array("double", values[:700_000]))[0].size,
                         [1, 100_000])


class MessageTest(SessionCase):
    def test_narrow_values_go_byte_by_byte_and_messages_as_utf8(self):
        name = "\u00c3\u00a9"  # the bytes of an e with an acute accent
        error = self.assert_raises("TOLVEX:ambrix:cdflib:unrecognizedConstantName", [name],
                                   "getConstantValue", name)
        self.assertIn("\u00e9", error.message)
        error = self.assert_raises("TOLVEX:ambrix:cdflib:unrecognizedConstantName", ["\u00e9"],
                                   "getConstantValue", "\u00e9")
        self.assertIn("\u00e9", error.message)

    def test_values_of_every_kind_in_order(self):
        file = self.create()
        self.session.call("createVar", file, "v", 4, 1, [2, 3], True, [True, True])
        self.assert_raises("TOLVEX:ambrix:cdflib:wrongNumberOfHyperPutVarDataElements",
                           ["[ 3 2 ]", 2, "v", 12], "hyperPutVarData", file, 0, 0, 2, 1,
                           [0, 0], [2, 3], [1, 1], array("int32", [0] * 10))

    def test_warnings_of_the_unloading(self):
        self.create("left_open")
        self.session.close()
        (warning,) = self.session.unload_warnings
        self.assertEqual(warning["identifier"], "TOLVEX:ambrix:cdflib:closingFileHandle")
        self.assertEqual(warning["values"], [])
        self.assertGreater(os.path.getsize(os.path.join(self.folder, "left_open.cdf")), 0)


if __name__ == "__main__":
    unittest.main()
