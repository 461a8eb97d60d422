#!/usr/bin/env python3
"""Exported documents in another XML reader than the phone's: tests/package/test_export.py ZEL"""

import os
import shutil
import subprocess
import sys
import tempfile
import unittest
from xml.parsers import expat

from support import PACKAGE

ZEL = sys.argv.pop(1)


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

    def test_values_come_through_unless_they_hold_a_tags_first_character(self) -> None:
        for value in ("A & B", "&lt;", "]]&gt;", "\"quoted\" 'too' >", "\u00e9\u4e2d", "a\tb"):
            self.zel("vconf", "set", "db/zel/country_iso", value)
            self.assertEqual(texts_of(self.zel("export"))["CustomerData/GeneralInfo/CountryISO"], value)
        self.zel("vconf", "set", "db/zel/country_iso", "a<b")
        with self.assertRaises(expat.ExpatError):
            texts_of(self.zel("export"))


if __name__ == "__main__":
    unittest.main()
