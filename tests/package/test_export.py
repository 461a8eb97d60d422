#!/usr/bin/env python3
"""Exported documents in another XML reader than the phone's: tests/package/test_export.py ZEL"""

import os
import re
import shutil
import subprocess
import sys
import tempfile
import unittest
from xml.parsers import expat

from support import PACKAGE, ROOT

from spec_tools import guide  # noqa: E402

ZEL = sys.argv.pop(1)
LOSSES = (ROOT / "docs/export.md").read_text("utf-8").split("## What it cannot carry")[1].split("\nOf elements that it has")[0]


def texts_of(document: bytes) -> dict[str, str]:
    """Each leaf's text by its path; an exception when the document is not well-formed."""
    found: dict[str, str] = {}
    path: list[str] = []
    reader = expat.ParserCreate()
    reader.StartElementHandler = lambda name, _: path.append(name)
    reader.EndElementHandler = lambda _: path.pop()

    def text(piece: str) -> None:
        found["/".join(path)] = found.get("/".join(path), "") + piece

    reader.CharacterDataHandler = text
    reader.Parse(document, True)
    return found


def places_of(document: bytes) -> set[tuple[str, str]]:
    """Each element with its parent."""
    found: set[tuple[str, str]] = set()
    path = [""]
    reader = expat.ParserCreate()

    def start(name: str, _: dict) -> None:
        found.add((name, path[-1]))
        path.append(name)

    reader.StartElementHandler = start
    reader.EndElementHandler = lambda _: path.pop()
    reader.Parse(document, True)
    return found


def is_listed(entry: guide.Entry, parents: dict[str, str]) -> bool:
    """Whether a row of the losses names the element, its parent too where other parents have one, or all of a parent's."""
    rows = [line.split("|")[1] for line in LOSSES.splitlines() if line.startswith("| `")]
    above = entry.inside
    while above:
        if re.search(rf"`{above}` and its (\w+ )?children", " ".join(rows)):
            return True
        above = parents.get(above, "")
    named = re.compile(rf"(?<!of )`{entry.tag}`")
    return any(named.search(row) and (not entry.inside_needed or f"`{entry.inside}`" in row) for row in rows)


class Export(unittest.TestCase):
    def setUp(self) -> None:
        self.folder = tempfile.mkdtemp(prefix="zel-export-")
        self.root = self.folder + "/phone"
        self.zel("--root", self.root, "phone", "create", "--package", str(PACKAGE))

    def tearDown(self) -> None:
        shutil.rmtree(self.folder)

    def zel(self, *words: str) -> bytes:
        done = subprocess.run([ZEL, *words], capture_output=True, env={**os.environ, "ZEL_ROOT": self.root})
        self.assertEqual(done.returncode, 0, done.stderr)
        return done.stdout

    def test_documents_of_the_example_are_well_formed(self) -> None:
        for customer in ("XFV", "UFN", "INS", "IMN", "MCI"):
            self.zel("install", customer)
            for words in (["export"], ["export", "--installable"]):
                document = self.zel(*words)
                self.assertTrue(document.startswith(b"\xef\xbb\xbf<?xml "))
                self.assertIn(texts_of(document)["CustomerData/GeneralInfo/SalesCode"], (customer, "TFG"))

    # The example's first customer uses every element, so what its document does not have no document has.
    def test_documentation_lists_each_element_that_is_lost_and_no_other(self) -> None:
        self.zel("install", "XFV")
        written = places_of(self.zel("export"))
        entries = guide.read()
        parents = {entry.tag: entry.inside for entry in entries}
        self.assertEqual(len(entries), 304)
        for entry in entries:
            if (entry.tag, entry.inside) in written or (entry.tag, "") in written and not entry.inside_needed:
                self.assertFalse(is_listed(entry, parents), f"{entry.tag} in {entry.inside} is not lost")
            else:
                self.assertTrue(is_listed(entry, parents), f"{entry.tag} in {entry.inside} is lost")

    def test_values_come_through_unless_they_hold_a_tags_first_character(self) -> None:
        for value in ("A & B", "&lt;", "]]&gt;", "\"quoted\" 'too' >", "\u00e9\u4e2d", "a\tb"):
            self.zel("vconf", "set", "db/zel/country_iso", value)
            self.assertEqual(texts_of(self.zel("export"))["CustomerData/GeneralInfo/CountryISO"], value)
        self.zel("vconf", "set", "db/zel/country_iso", "a<b")
        with self.assertRaises(expat.ExpatError):
            texts_of(self.zel("export"))


if __name__ == "__main__":
    unittest.main()
