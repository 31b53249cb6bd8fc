"""Relative links and anchors in the documents lead somewhere."""
import pathlib
import re
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
LINK = re.compile(r"\]\(([^)\s]+)\)")
FENCE = re.compile(r"^```.*?^```", re.S | re.M)


def documents():
    return [*sorted(ROOT.glob("*.md")), *sorted((ROOT / "docs").glob("*.md"))]


def prose(document):
    return FENCE.sub("", document.read_text())


def anchors(document):
    """The anchors that Markdown gives the headings."""
    heads = re.findall(r"^#+ (.*)$", prose(document), re.M)
    return {re.sub(r"[^\w -]", "", head.lower()).replace(" ", "-") for head in heads}


def links(document):
    return [link for link in LINK.findall(prose(document)) if not re.match(r"\w+:", link)]


class LinksTest(unittest.TestCase):
    def test_links_lead_to_files_and_headings(self):
        for document in documents():
            for link in links(document):
                with self.subTest(document=document.name, link=link):
                    path, _, anchor = link.partition("#")
                    target = (document.parent / path) if path else document
                    self.assertTrue(target.exists(), "no such file")
                    if anchor:
                        self.assertIn(anchor, anchors(target))

    def test_there_are_links_to_check(self):
        self.assertIn("commands.json", links(ROOT / "docs" / "commands.md"))


if __name__ == "__main__":
    unittest.main()
