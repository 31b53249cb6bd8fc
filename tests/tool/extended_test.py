"""--extended of `ambrix call` and `ambrix session`."""

import json
import unittest

from support.ambrix_session import CallError, Session, array
from tool.support import ToolCase

LEAST, MOST = -2 ** 63, 2 ** 63 - 1
LEAP_SECOND = 536500868184000000


class ExtendedTest(ToolCase):
    def extended_session(self):
        session = Session(options=["--extended"], cwd=self.folder)
        self.addCleanup(session.close)
        return session

    def write_file(self, session):
        (file,) = session.call("create", "example")
        session.call("createVar", file, "v", 8, 1, [], True, [])
        values = array("int64", [LEAST, -9007199254740993, 0, 9007199254740993, MOST])
        session.call("hyperPutVarData", file, 0, 0, 5, 1, [], [], [], values)
        session.call("close", file)
        return values.data

    def test_integers_are_exact_both_ways(self):
        session = self.extended_session()
        values = self.write_file(session)
        (file,) = session.call("open", "example")
        (found,) = session.call("hyperGetVarData", file, 0, 0, 5, 1, [], [], [])
        self.assertEqual((found.class_name, found.data), ("int64", values))
        session.call("close", file)

    def test_times(self):
        session = self.extended_session()
        components = array("double", [2016, 12, 31, 23, 59, 60, 0, 0, 0], [9, 1])
        (time,) = session.call("computeTT2000", components)
        self.assertEqual((time.class_name, time.data), ("int64", [LEAP_SECOND]))
        (again,) = session.call("tt2000Breakdown", time)
        self.assertEqual(again.data, components.data)

    def test_without_it_a_session_is_strict(self):
        session = self.session()
        for command in ("computeTT2000", "tt2000Breakdown"):
            with self.assertRaises(CallError) as raised:
                session.call(command, 5)
            self.assertEqual(raised.exception.name, "invalidOperation")
        self.write_file(self.extended_session())
        (file,) = session.call("open", "example")
        with self.assertRaises(CallError) as raised:
            session.call("getVarData", file, 0, 0)
        self.assertEqual(raised.exception.name, "unrecognizedValue")
        session.call("close", file)

    def test_call(self):
        done = self.output("call", "--extended", "computeTT2000", "[2016,12,31,23,59,60,0,0,0]")
        self.assertEqual(json.loads(done), {"class": "int64", "size": [1, 1],
                                            "data": [LEAP_SECOND]})
        self.assert_fails("TOLVEX:ambrix:cdflib:invalidOperation", "call", "computeTT2000",
                          "[2016,12,31,23,59,60,0,0,0]")
        self.write_file(self.extended_session())
        value = self.output("call", "--file", self.path("example.cdf"), "--extended", "getVarData",
                            "0", "4")
        self.assertEqual(json.loads(value)["data"], [MOST])


if __name__ == "__main__":
    unittest.main()
