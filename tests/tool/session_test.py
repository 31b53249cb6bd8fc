"""The protocol of `ambrix session`."""

import json
import math
import os
import pathlib
import random
import re
import struct
import subprocess
import tempfile
import unittest

from support.ambrix_session import Array, CallError, Session, array
from tool.support import has_sanitizer

TOOL = os.environ["AMBRIX_TOOL"]
DOCUMENT = pathlib.Path(__file__).resolve().parents[2] / "docs" / "session-protocol.md"
BAD_REQUEST = "ambrix:session:badRequest"


def run_session(data, *options):
    """Feeds bytes to a session; returns the process and the answers."""
    done = subprocess.run([TOOL, "session", *options], input=data, capture_output=True)
    return done, [json.loads(line) for line in done.stdout.splitlines()]


class SessionCase(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = folder.name
        self.session = Session(cwd=self.folder)
        self.addCleanup(self.session.close)

    def assert_bad(self, line, tag=None):
        answer = self.session.send_line(line)
        self.assertEqual(answer["error"]["identifier"], BAD_REQUEST, line)
        self.assertEqual(answer["error"]["values"], [])
        self.assertTrue(answer["error"]["message"])
        self.assertEqual(answer["warnings"], [])
        self.assertEqual(answer.get("tag"), tag, line)

    def assert_raises(self, identifier, values, command, *arguments):
        with self.assertRaises(CallError) as raised:
            self.session.call(command, *arguments)
        self.assertEqual((raised.exception.identifier, raised.exception.values),
                         (identifier, values))
        return raised.exception

    def create(self, name="a"):
        return self.session.call("create", os.path.join(self.folder, name))[0]

    def echo(self, value, datatype):
        """The value after it was written to a file as an attribute entry and read back."""
        file = self.create()
        self.session.call("createAttr", file, "a", 1)
        self.session.call("putAttrgEntry", file, 0, 0, self.session.constant(datatype), value)
        (result,) = self.session.call("getAttrgEntry", file, 0, 0)
        self.session.call("delete", file)
        return result


class RequestTest(SessionCase):
    def test_arguments_and_outputs_may_be_left_out(self):
        answer = self.session.send_line('{"command":"getLibraryVersion"}')
        self.assertEqual([o["size"] for o in answer["outputs"]], [[1, 1]] * 3)
        self.assertEqual([o["class"] for o in answer["outputs"]], ["double"] * 3)
        self.assertEqual(sorted(answer), ["outputs", "warnings"])

    def test_outputs_limits_the_results(self):
        for count, expected in ((0, 0), (1, 1), (2, 2), (3, 3), (4, 3), (2**64 - 1, 3)):
            outputs = self.session.call("getLibraryVersion", outputs=count)
            self.assertEqual(len(outputs), expected, count)

    def test_tag_is_echoed_whatever_it_is(self):
        for tag in (1, None, "x", "\ud800\u00e9\u20ac\x7f", {"a": [1, {"b": 2.5}]}, True, [], 2**70):
            for command in ("getLibraryVersion", "nonsense"):
                answer = self.session.request({"command": command, "tag": tag})
                self.assertIn("tag", answer)
                self.assertEqual(answer["tag"], tag)

    def test_tag_comes_back_as_it_was_sent(self):
        for tag in ("12345678901234567890123456789012345678901234567890", "0.10", "1E+2", "-0",
                    '{"z":1,"a":[0.1100230209618294,{}],"m":18446744073709551617,"a":2}',
                    '"]}\\" ,:{["', "123456789.12345678901234567890"):
            for line in ('{"command":"getLibraryVersion","outputs":0,"tag":%s}',
                         ' { "tag" : %s , "command":"nonsense","x":{"tag":1}} ',
                         '{"tag":0,"command":[1,"],"],"t\\u0061g":%s}',
                         '{"command":"x","other":1e99999,"tag":%s}'):
                done, _ = run_session((line % tag).encode())
                answer = done.stdout.split(b"\n")[0].decode()
                self.assertTrue(answer.endswith('"tag":' + tag + "}"), (line, tag, answer))

    def test_no_other_member_is_taken_for_the_tag(self):
        for line in ('[{"tag":1},1e400]', '{"x":{"tag":1}}', '{"x":"\\"tag\\":1,"}',
                     '{"other":1e400,"tag":01}', '{"other":1e400,"tag":'):
            _, answers = run_session(line.encode())
            self.assertEqual(answers[0]["error"]["identifier"], BAD_REQUEST)
            self.assertNotIn("tag", answers[0], line)

    def test_blanks_around_and_inside_a_request_are_fine(self):
        answer = self.session.send_line('\t { "command" : "getLibraryVersion" , "outputs" : 0 } \r')
        self.assertEqual(answer, {"outputs": [], "warnings": []})

    def test_any_value_may_stand_for_the_command(self):
        for command in (5, True, None, [1, 2], {"class": "int8", "size": [0, 0], "data": []}):
            answer = self.session.request({"command": command})
            self.assertEqual(answer["error"], {
                "identifier": "", "values": [],
                "message": "basic_string::_M_construct null not valid"})

    def test_last_line_without_line_end_counts(self):
        done, answers = run_session(b'{"command":"getLibraryVersion"}')
        self.assertEqual(done.returncode, 0)
        self.assertEqual([sorted(a) for a in answers], [["outputs", "warnings"], ["unload"]])

    def test_empty_input_gives_the_last_line_only(self):
        done, answers = run_session(b"")
        self.assertEqual((done.returncode, done.stderr), (0, b""))
        self.assertEqual(answers, [{"unload": {"warnings": []}}])


class MalformedTest(SessionCase):
    def test_what_is_no_json_object(self):
        for line in ("", "   ", "x", "[]", "1", '"open"', "null", "{", '{"command":"x"', "{}}",
                     '{"command":"x"} 1', "{'command':'x'}", '{"command":"x",}', '{"command" "x"}',
                     '{"command":"a\tb"}', '{"command":"\\x"}', '{"command":"\\u12g4"}',
                     '{"command":01}', '{"command":1.}', '{"command":.5}', '{"command":+1}',
                     '{"command":1e}', '{"command":nul}', '{"command":"x"', '{"command":-}'):
            self.assert_bad(line)

    def test_invalid_utf8(self):
        for octets in (b"\xff", b"\xc3", b"\xed\xa0\x80", b"\xc0\x80", b"\xf5\x80\x80\x80"):
            self.assert_bad(b'{"command":"' + octets + b'"}')

    def test_numbers_beyond_double_and_literals_that_json_lacks(self):
        for number in ("1e400", "-1e400", "1" + "0" * 400):
            self.assert_bad('{"command":"epochBreakdown","arguments":[%s]}' % number)
            self.assert_bad('{"command":"getLibraryVersion","tag":1,"other":%s}' % number, tag=1)
        for literal in ("NaN", "Infinity", "-Infinity", "nan"):
            self.assert_bad('{"command":"epochBreakdown","arguments":[%s]}' % literal)

    def test_numbers_that_round_to_zero_are_numbers(self):
        answer = self.session.send_line('{"command":"epochBreakdown","arguments":[1e-400]}')
        self.assertEqual(len(answer["outputs"]), 1)

    def test_members(self):
        self.assert_bad('{"arguments":[],"tag":4}', tag=4)
        self.assert_bad('{"command":"getLibraryVersion","arguments":{},"tag":"t"}', tag="t")
        self.assert_bad('{"command":"getLibraryVersion","arguments":null}')
        for outputs in ("true", "-1", "1.5", "1.0", "1e0", '"1"', "null", "[]"):
            self.assert_bad('{"command":"getLibraryVersion","outputs":%s,"tag":1}' % outputs, tag=1)

    def test_of_two_members_with_one_name_the_last_counts(self):
        answer = self.session.send_line('{"command":"open","\\u0063ommand":"getLibraryVersion"}')
        self.assertEqual(len(answer["outputs"]), 3)

    def test_values(self):
        for value in ('{}', '{"class":"double"}', '{"class":"double","size":[1,1]}',
                      '{"size":[1,1],"data":[1]}', '{"class":"float","size":[1,1],"data":[1]}',
                      '{"class":1,"size":[1,1],"data":[1]}', '{"class":"double","size":[1],"data":[1]}',
                      '{"class":"double","size":[],"data":[]}', '{"class":"double","size":1,"data":[1]}',
                      '{"class":"double","size":[-1,1],"data":[]}',
                      '{"class":"double","size":[1.0,1],"data":[1]}',
                      '{"class":"double","size":[1,true],"data":[1]}',
                      '{"class":"double","size":[1,2],"data":[1]}',
                      '{"class":"double","size":[0,2],"data":[1]}',
                      '{"class":"double","size":[4294967296,4294967296],"data":[]}',
                      '{"class":"double","size":[1,1],"data":"a"}',
                      '{"class":"double","size":[1,1],"data":["nan"]}',
                      '{"class":"double","size":[1,1],"data":[true]}',
                      '{"class":"double","size":[1,1],"data":[null]}',
                      '{"class":"single","size":[1,1],"data":[1e39]}',
                      '{"class":"logical","size":[1,1],"data":[1]}',
                      '{"class":"char","size":[1,1],"data":"ab"}',
                      '{"class":"char","size":[1,1],"data":["a"]}',
                      '{"class":"cell","size":[1,1],"data":[]}',
                      '{"class":"cell","size":[1,1],"data":[["x"]]}',
                      '[1,true]', '[true,1]', '["a"]', '[[1]]', '[null]'):
            self.assert_bad('{"command":"getLibraryVersion","arguments":[%s],"tag":0}' % value, tag=0)

    def test_integers_must_fit_their_class(self):
        ranges = {"int8": (-128, 127), "uint8": (0, 255), "int16": (-2**15, 2**15 - 1),
                  "uint16": (0, 2**16 - 1), "int32": (-2**31, 2**31 - 1), "uint32": (0, 2**32 - 1),
                  "int64": (-2**63, 2**63 - 1), "uint64": (0, 2**64 - 1)}
        line = '{"command":"getLibraryVersion","arguments":[{"class":"%s","size":[1,1],"data":[%s]}]}'
        for name, (low, high) in ranges.items():
            for value in (low - 1, high + 1, "1.0", "1e0", '"1"', "true"):
                self.assert_bad(line % (name, value))
            for value in (low, high, "-0"):
                answer = self.session.send_line(line % (name, value))
                self.assertEqual(answer["error"]["identifier"],
                                 "TOLVEX:ambrix:validate:wrongNumberOfInputs", (name, value))

    def test_deep_nesting_is_refused_and_survived(self):
        depth = 1_000_000
        self.assert_bad('{"command":"x","arguments":' + "[" * depth + "]" * depth + "}")
        self.assert_bad('{"command":"x","arguments":' + "[" * depth)
        self.assert_bad('{"tag":' + '{"a":' * depth + "1" + "}" * depth + "}")

    def test_the_session_goes_on_and_nothing_is_registered(self):
        done, answers = run_session(b"nonsense\n\n{\"command\":\"getLibraryVersion\"}\n")
        self.assertEqual(done.returncode, 0)
        self.assertEqual(len(answers), 4)
        self.assertIn("outputs", answers[2])


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

    def test_a_million_doubles_bit_for_bit(self):
        file = self.create()
        self.session.call("createAttr", file, "a", 1)
        self.assert_exact(file, ["0.1100230209618294"] * 2, [0.1100230209618294] * 2)
        source = random.Random(1)
        for _ in range(20):
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


class LimitTest(SessionCase):
    def test_host_errors(self):
        file = self.create()
        self.session.call("createVar", file, "v", 45, 1, [1000, 1000], True, [True, True])
        hyper = ("hyperGetVarData", file, 0, 0)
        rest = (1, [0, 0], [1000, 1000], [1, 1])
        self.assert_raises("TOLVEX:host:badDimension", [], *hyper, -1, *rest)
        self.assert_raises("TOLVEX:host:outOfMemory", [], *hyper, 2**31, *rest)
        self.assert_raises("TOLVEX:host:outOfMemory", [], *hyper, 600, *rest)

    def test_limit_can_be_changed(self):
        line = b'{"command":"epochBreakdown","arguments":[{"class":"double","size":[1,100],"data":[' \
            + b",".join([b"0"] * 100) + b"]}]}\n"
        for limit, ok in (("5600", True), ("5599", False), ("799", False)):
            done, answers = run_session(line, "--max-array-bytes", limit)
            self.assertEqual("outputs" in answers[0], ok, limit)
            if not ok:
                self.assertEqual(answers[0]["error"]["identifier"], "TOLVEX:host:outOfMemory")
                self.assertEqual(answers[0]["error"]["values"], [])


    def test_limits_that_are_none(self):
        for option in ("--max-array-bytes", "--max-line-bytes"):
            for value in ("-1", "-0", "x", "", "1 tree"):
                done, answers = run_session(b"", option, value)
                self.assertEqual((done.returncode, answers), (2, []), (option, value))
                self.assertIn(option.encode(), done.stderr)

    def test_lines_that_are_too_long(self):
        request = b'{"command":"getLibraryVersion","tag":1}'
        size = len(request)
        for length, limit, good in ((size, str(size), True), (size, str(size - 1), False),
                                    (1 << 20, "1MB", True), (1 << 20, "1048575", False),
                                    (65535, "65535", True), (65536, "65535", False)):
            for end in (b"", b"\n"):
                line = request.ljust(length)
                done, answers = run_session(request + b"\n" + line + end,
                                            "--max-line-bytes", limit)
                self.assertEqual(len(answers), 3, (length, limit))
                self.assertEqual("outputs" in answers[1], good, (length, limit))
        done, answers = run_session(b" " * 100 + b"\n" + request, "--max-line-bytes", "99")
        error = answers[0]["error"]
        self.assertEqual((error["identifier"], error["values"]), (BAD_REQUEST, []))
        self.assertIn("--max-line-bytes", error["message"])
        self.assertEqual(sorted(answers[0]), ["error", "warnings"])
        self.assertIn("outputs", answers[1])

    @unittest.skipIf(has_sanitizer(), "the sanitizer keeps memory that was freed")
    def test_lines_that_are_too_long_are_not_held_in_memory(self):
        with subprocess.Popen([TOOL, "session"], stdin=subprocess.PIPE,
                              stdout=subprocess.PIPE) as process:
            for _ in range(300):
                process.stdin.write(b" " * (1 << 20))  # and 256 are the most at first
            process.stdin.write(b"\n")
            process.stdin.flush()
            self.assertEqual(json.loads(process.stdout.readline())["error"]["identifier"],
                             BAD_REQUEST)
            with open(f"/proc/{process.pid}/status", encoding="ascii") as status:
                peak = next(int(line.split()[1]) for line in status if line.startswith("VmHWM"))
            self.assertLess(peak, 400 << 10)


class StreamTest(unittest.TestCase):
    def test_a_reader_that_goes_away_ends_the_session_quietly(self):
        process = subprocess.Popen([TOOL, "session"], stdin=subprocess.PIPE, stdout=subprocess.PIPE,
                                   stderr=subprocess.PIPE)
        process.stdout.close()
        with self.assertRaises(BrokenPipeError):
            for _ in range(100_000):
                process.stdin.write(b'{"command":"getConstantNames"}\n')
                process.stdin.flush()
        self.assertEqual(process.wait(), 0)
        self.assertEqual(process.stderr.read(), b"")
        process.stderr.close()
        try:
            process.stdin.close()
        except BrokenPipeError:
            pass

    def test_answers_come_line_by_line(self):
        with Session() as session:
            for number in range(1000):
                answer = session.request({"command": "getLibraryVersion", "tag": number})
                self.assertEqual(answer["tag"], number)

    def test_library_settings_of_the_environment_do_not_count(self):
        environment = dict(os.environ, CDF_VALIDATE="no", CDF_CHECKSUM="MD5")
        with tempfile.TemporaryDirectory() as folder, Session(env=environment) as session:
            self.assertEqual(session.value("getValidate"), "VALIDATEFILEon")
            (file,) = session.call("create", os.path.join(folder, "a"))
            self.assertEqual(session.value("getChecksum", file), "NO_CHECKSUM")
            session.call("close", file)


class DocumentTest(SessionCase):
    """The example in docs/session-protocol.md, with the identifier that this session gives."""

    def test_the_example_is_answered_as_shown(self):
        example, last = re.findall(r"^```\n(.*?)^```", DOCUMENT.read_text(), re.S | re.M)
        lines = example.splitlines()
        shown_id = re.search(r'"uint64".*?\[(\d+)\]', lines[1]).group(1)
        given_id = None
        for request, answer in zip(lines[::2], lines[1::2]):
            self.assertEqual(request[:2], "> ")
            given = self.session.send_line(request[2:].replace(shown_id, str(given_id)))
            given_id = given_id or given["outputs"][0]["data"][0]
            printed = json.dumps(given, separators=(",", ":"))
            self.assertEqual(printed.replace(str(given_id), shown_id), answer, request)
        self.session.close()
        self.assertEqual({"unload": {"warnings": self.session.unload_warnings}}, json.loads(last))


if __name__ == "__main__":
    unittest.main()
