"""What `ambrix convert` says of its changes."""

import os
import unittest

from readers.sample_files import FOLDER, needs_folder
from support.ambrix_session import array
from tool.convert_test import ConvertCase

MARK = "~"  # the module writes no zero bytes in the midst of texts


class ChangesTest(ConvertCase):
    """What a copy does not keep, on one line."""

    CUT = "1 text of attributes ended at a zero byte, and the rest is now zeros"

    def write_texts(self, *texts, version2=False):
        session = self.session()
        session.call("setFileBackward", int(version2))
        (file,) = session.call("create", "text")
        session.call("createAttr", file, "none", 2)
        session.call("createAttr", file, "global", 1)
        session.call("createAttr", file, "variable", 2)
        session.call("createVar", file, "v", 4, 1, [], True, [])
        for number, text in enumerate(texts):
            session.call("putAttrgEntry", file, 1, 3 * number, 51, text.replace("\0", MARK))
        session.call("putAttrEntry", file, 2, 0, 52, texts[-1].replace("\0", MARK))
        session.call("close", file)
        with open(self.path("text.cdf"), "r+b") as file:
            content = file.read().replace(MARK.encode(), b"\0")
            file.seek(0)
            file.write(content)

    def skip_where_texts_are_blanked(self):
        version = [part.value for part in self.session().call("getLibraryVersion")]
        if version < [3, 9]:
            self.skipTest("the library reads blanks for a zero byte and what follows it")

    def test_texts_that_lose_something(self):
        self.skip_where_texts_are_blanked()
        for version2 in (False, True):
            self.write_texts("ab\0cd", "whole", "zeros\0\0\0", version2=version2)
            self.assertEqual(self.changes("text.cdf", "out.cdf"), [self.CUT])
            self.assertEqual(self.changes("out.cdf", "again.cdf"), [])
            self.clear()
            self.write_texts("ab", "\0\0c", version2=version2)
            self.assertEqual(self.changes("text.cdf", "out.cdf"),
                             [self.CUT.replace("1 text", "2 texts")])
            self.clear()

    def test_texts_that_only_end_in_zeros(self):
        for version2 in (False, True):
            self.write_texts("ab\0", "\0\0", version2=version2)
            self.assertEqual(self.changes("text.cdf", "out.cdf"), [])
            self.clear()

    def test_texts_of_compressed_files_may_have_lost_something(self):
        self.skip_where_texts_are_blanked()
        self.write_texts("ab", "whole")
        self.assertEqual(self.changes("text.cdf", "small.cdf", "--compression", "gzip"), [])
        self.assertEqual(self.changes("small.cdf", "out.cdf"), [])
        self.clear()
        self.write_texts("ab\0", "whole")
        self.assertEqual(self.changes("text.cdf", "small.cdf", "--compression", "gzip"), [])
        self.assertEqual(self.changes("small.cdf", "out.cdf"), [self.CUT])

    def clear(self):
        for name in self.files():
            os.remove(self.path(name))

    def test_growth_that_nobody_asked_for(self):
        session = self.session()
        (file,) = session.call("create", "small")
        (number,) = session.call("createVar", file, "v", 4, 1, [], True, [])
        session.call("setVarAllocBlockRecords", file, number, 0, 0)
        session.call("putVarRecordData", file, number, 0, array("int32", [5]))
        session.call("close", file)
        done = self.run_tool("convert", "small.cdf", "out.cdf")
        self.assertEqual(done.stderr.decode(), self.growth("small.cdf", "out.cdf"))
        for options in (("--compression", "none"), ("--compression", "gzip")):
            self.assertEqual(self.output("convert", "small.cdf", options[1] + ".cdf", *options), "")
        self.assertEqual(self.output("convert", "out.cdf", "same.cdf"), "")

    def growth(self, file, out):
        sizes = [os.path.getsize(self.path(name)) for name in (file, out)]
        self.assertGreater(sizes[1], 1.5 * sizes[0])
        return (f"ambrix: changed in {out}: {sizes[0]} bytes became {sizes[1]}, "
                "including space that the library reserves\n")

    @needs_folder
    def test_variables_of_the_old_kind(self):
        for name, told in (("rvariable.cdf", "1 rVariable became a zVariable"),
                           ("ge_k0_cpi_19921231_v02.cdf", "25 rVariables became zVariables")):
            self.assertEqual(self.changes(str(FOLDER / name), name),
                             [f"{told}, without dimensions that do not vary"])
            self.assertEqual(self.changes(name, "again-" + name), [])


if __name__ == "__main__":
    unittest.main()
