"""What the tests of this folder share."""

import tempfile
import unittest
import warnings
from dataclasses import replace

from readers import cdflib_reader, module_reader, pycdfpp_reader
from readers.comparison import variable_differences
from readers.content import CHARACTERS, Unread, attempt, fill_texts
from readers.known_faults import matching
from support.ambrix_session import Session

SAMPLES = {}  # what was read of sample files, by reader and path
READERS = (cdflib_reader, pycdfpp_reader)


class ReadersCase(unittest.TestCase):
    """A session with the extended datatypes, in a temporary folder."""

    def setUp(self):
        warnings.simplefilter("ignore")  # the readers' own
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = folder.name
        self.session = Session(options=["--extended"], cwd=self.folder)
        self.addCleanup(self.session.close)

    def read(self, path):
        """The content through the module."""
        return module_reader.read(self.session, str(path))

    def read_sample(self, path):
        """Like `read`, of a file that does not change and is read once; with `reference`."""
        return (self.read_sample_alone(path),
                once(reference, path, lambda: reference(self.read_sample_alone(path), path)))

    def read_sample_alone(self, path):
        return once(module_reader, path, lambda: self.read(path))


def once(reader, path, read):
    """What was read of a sample file, which takes long."""
    key = (reader, str(path))
    if key not in SAMPLES:
        SAMPLES[key] = read()
    return SAMPLES[key]


def read_by(reader, path):
    """What an independent reader finds in a sample file."""
    return once(reader, path, lambda: attempt(reader.read, str(path)))


def unexplained(reader, name, found):
    """The differences that are no known fault of the reader, and the rows that explain the rest."""
    rows = {text: matching(reader.NAME, name, text) for text in found}
    used = {row for explaining in rows.values() for row in explaining}
    return [text for text, explaining in rows.items() if not explaining], used


def reference(one, path):
    """The variables of a file by name as an independent reader has them, without known faults.

    Variables that no reader has right are left out.
    """
    contents = [(reader, read_by(reader, path)) for reader in READERS]
    found = {}
    for reader, content in contents:
        if isinstance(content, Unread):
            continue
        for name, variable in content.variables.items():
            if name not in one.variables or isinstance(variable, Unread):
                continue
            texts = [f"variable {name}: {text}"
                     for text in variable_differences(one.variables[name], variable,
                                                      one.nul_reads_as)]
            faulty = any(matching(reader.NAME, path.name, text) for text in texts)
            if name not in found and not faulty:
                if variable.code in CHARACTERS and one.nul_reads_as:
                    variable = replace(variable,
                                       values=fill_texts(variable.values, one.nul_reads_as))
                found[name] = variable
    return found
