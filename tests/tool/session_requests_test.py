"""Requests of the session protocol, and what is none."""

import unittest

from tool.session_case import BAD_REQUEST, SessionCase, run_session


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


if __name__ == "__main__":
    unittest.main()
