"""Limits and streams of a session, and the example in its description."""

import json
import os
import pathlib
import re
import subprocess
import tempfile
import unittest

from support.ambrix_session import Session, array
from tool.session_case import BAD_REQUEST, SessionCase, run_session
from tool.support import TOOL, has_sanitizer

DOCUMENT = pathlib.Path(__file__).resolve().parents[2] / "docs" / "session-protocol.md"


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
