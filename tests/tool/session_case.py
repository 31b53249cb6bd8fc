"""What the tests of `ambrix session` share."""

import json
import os
import subprocess
import tempfile
import unittest

from support.ambrix_session import CallError, Session
from tool.support import TOOL

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
