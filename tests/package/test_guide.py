"""docs/package-format.md has every row of the element table, and the example stands where it says."""

import re
import unittest

from support import PACKAGE, ROOT
from spec_tools import element_table, guide, occurrences

LANGUAGE_SOURCE = ROOT / "zel-lib/zel-svc/spec/zel-svc-language.cpp"


class Guide(unittest.TestCase):
    def test_every_row_has_one_entry_in_the_table_order(self):
        rows = [(row.tag, row.parent) for row in element_table.read()]
        self.assertEqual([entry.key for entry in guide.read()], rows)

    def test_the_example_stands_where_the_guide_says(self):
        rows, entries = element_table.read(), guide.read()
        for path in [PACKAGE / "mps/ZEL/SW_Configuration.xml", *PACKAGE.glob("mps/ZEL/Customer/*/customer.xml")]:
            for element in occurrences.read(path, rows):
                place = element.parent.tag if element.parent else entries[element.row.index].inside
                self.assertEqual(place, entries[element.row.index].inside, f"{path}:{element.line}: {element.tag}")

    def test_the_languages_are_those_that_the_phone_looks_up(self):
        source = dict(re.findall(r'\{\s*"([a-z_]+)",\s*"([a-z]{2}_[A-Z]{2})"\s*\}', LANGUAGE_SOURCE.read_text("utf-8")))
        self.assertEqual(len(source), 13)
        self.assertEqual(guide.languages(), source)

    def test_every_kind_of_text_is_one_that_packages_are_checked_for(self):
        known = re.compile(r'|none|src|unused|language|time|number( \d+ to \d+)?|(text|digits) \d+|"[^"]+"(, "[^"]+")*')
        for entry in guide.read():
            self.assertTrue(known.fullmatch(entry.text) and entry.text, f"{entry.tag}: {entry.text}")

    def test_texts_are_refused_as_the_phone_would(self):
        entries = {entry.key: entry for entry in guide.read()}
        for key, good, bad in (
                (("Bearer", "SMS"), "psfirst", "PS"), (("CLIDigits", ""), "11", "12"), (("PageLimit", ""), "5", "05"),
                (("SPName", ""), "12345678901234", "123456789012345"), (("MCCMNC", ""), "21401", "214-01"),
                (("DefLanguage", ""), "automatic", "german"), (("DefLanguageNoSIM", ""), "en_GB", "automatic"),
                (("TimeoutValue", ""), "2.5", "2,5"), (("GPS", ""), "", "on"),
                (("NetworkName", "Profile"), "é" * 19, "é" * 20)):
            self.assertIsNone(guide.refusal(entries[key], good, guide.languages()), key)
            self.assertIsNotNone(guide.refusal(entries[key], bad, guide.languages()), key)


if __name__ == "__main__":
    unittest.main()
