"""`ambrix call`."""

import json
import unittest

from support.ambrix_session import array
from tool.support import ToolCase


class CallTest(ToolCase):
    def setUp(self):
        super().setUp()
        session = self.session()
        (file,) = session.call("create", "example")
        session.call("createVar", file, "v", 4, 1, [2, 3], True, [True, False])
        session.call("hyperPutVarData", file, 0, 0, 1, 1, [0, 0], [2, 1], [1, 1],
                     array("int32", [1, 2]))
        session.call("close", file)

    def values(self, *arguments):
        return [json.loads(line) for line in self.output("call", *arguments).splitlines()]

    def test_each_result_is_a_line(self):
        values = self.values("getLibraryVersion")
        self.assertEqual([v["class"] for v in values], ["double"] * 3)
        self.assertEqual(self.values("getConstantValue", "GZIP_COMPRESSION"),
                         [{"class": "double", "size": [1, 1], "data": [5]}])

    def test_arguments_are_json_and_else_texts(self):
        self.assertEqual(self.values("computeEpoch", "[1996,1,1,0,0,0,0]")[0]["data"],
                         [62987673600000])
        epoch = '{"class":"double","size":[1,1],"data":[62987673600000]}'
        self.assertEqual(self.values("epochBreakdown", epoch)[0]["data"], [1996, 1, 1, 0, 0, 0, 0])
        self.values("setValidate", "-1")
        self.assert_fails("TOLVEX:ambrix:validate:argumentNotDoubleScalar", "call", "setValidate",
                          "no")
        self.assert_fails("TOLVEX:ambrix:cdflib:unrecognizedConstantName", "call",
                          "getConstantValue", "[a]")
        self.assertEqual(self.values("getConstantValue", '"CDF_INT4"')[0]["data"], [4])

    def test_a_file_is_opened_passed_and_closed(self):
        self.assertEqual(self.values("--file", "example.cdf", "getVarName", "0")[0]["data"], "v")
        (record,) = self.values("--file", "example.cdf", "getVarRecordData", "0", "0")
        self.assertEqual((record["class"], record["size"]), ("int32", [2, 3]))
        self.assertEqual(self.values("--file", "example.cdf", "renameVar", "0", "w"), [])
        self.assertEqual(self.values("--file", "example.cdf", "getVarName", "0")[0]["data"], "w")

    def test_commands_that_close_the_file_themselves(self):
        self.assertEqual(self.values("--file", "example.cdf", "close"), [])
        self.assertEqual(self.values("--file", "example.cdf", "delete"), [])
        self.assert_fails("TOLVEX:ambrix:cdflib:fileOpenError", "call", "--file", "example.cdf",
                          "inquire")

    def test_warnings_go_to_standard_error(self):
        done = self.run_tool("call", "create", "left_open")
        self.assertEqual(json.loads(done.stdout)["class"], "uint64")
        self.assertTrue(done.stderr.decode().startswith(
            "ambrix: warning: TOLVEX:ambrix:cdflib:closingFileHandle: "))

    def test_failures(self):
        message = self.assert_fails("TOLVEX:ambrix:cdflib:invalidOperation", "call", "nonsense")
        self.assertIn("nonsense", message)
        self.assert_fails("TOLVEX:ambrix:validate:wrongNumberOfInputs", "call", "open")
        self.assert_fails("TOLVEX:ambrix:cdflib:libraryFailure", "call", "--file", "example.cdf",
                          "getVarName", "7")
        self.assert_misused("call")
        self.assert_misused("call", "getConstantValue", '{"class":"double"}')


if __name__ == "__main__":
    unittest.main()
