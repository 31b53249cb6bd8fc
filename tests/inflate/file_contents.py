"""All that can be read of a file through the module, by one inflater or the other."""

import os

from support.ambrix_session import Session, SessionEnded

MOST_VALUES = 1 << 17  # of one read


class Reader:
    """A session that is started anew when a file has brought it down. It works in a folder, where
    the CDF library leaves scratch files when it cannot decompress a file."""

    def __init__(self, inflater, folder):
        self.folder = folder
        self.environment = dict(os.environ, AMBRIX_INFLATER=inflater)
        self.session = None

    def close(self):
        if self.session:
            self.session.close()
            self.session = None

    def contents(self, path):
        """What each request was answered, or how the session has ended."""
        self.session = self.session or Session(env=self.environment, cwd=self.folder)
        told = []
        try:
            self._read(path, told)
        except SessionEnded as end:
            told.append(str(end))
            self.session.process.stdin.close()
            self.session.process.stdout.close()
            self.session = None
        return told

    def _read(self, path, told):
        opened = self.session.request({"command": "open", "arguments": [str(path)]})
        if "error" in opened:
            told.append(opened)
            return

        def ask(command, *arguments):
            answer = self.session.request(
                {"command": command, "arguments": [opened["outputs"][0], *arguments]})
            told.append((command, arguments, answer))
            return [output["data"] for output in answer.get("outputs", [])]

        facts = ask("inquire")
        for number in range(int(facts[3][0]) if facts else 0):
            self._read_variable(ask, number)
        ask("close")

    @staticmethod
    def _read_variable(ask, number):
        facts = ask("inquireVar", number)
        last = ask("getVarMaxWrittenRecNum", number)
        if not facts or not last:
            return
        elements, sizes = facts[2][0], facts[3]
        values = max(elements, 1)
        for size in sizes:
            values *= max(size, 1)
        records = min(last[0][0] + 1, max(MOST_VALUES // values, 1))
        shape = [[0] * len(sizes), sizes, [1] * len(sizes)]
        ask("hyperGetVarData", number, 0, records, 1, *shape)
