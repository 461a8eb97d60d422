"""Presets: the guide and the example package know exactly the keys of the library's table."""

import configparser
import re
import unittest

from support import PACKAGE, ROOT

TABLE = ROOT / "zel-lib/zel-svc/preset/zel-svc-preset-table.cpp"
GUIDE = ROOT / "docs/package-format.md"


def table_keys() -> list[str]:
    return re.findall(r'\.key = "([a-z0-9_]+)"', TABLE.read_text("utf-8"))


def preset_files() -> list[configparser.ConfigParser]:
    files = []
    for path in sorted(PACKAGE.glob("preconfig/*/preset/zel-preset.ini")):
        parser = configparser.ConfigParser(default_section="", interpolation=None)
        parser.read(path, "utf-8")
        files.append(parser)
    return files


class Presets(unittest.TestCase):
    def test_the_guide_tells_every_key_in_the_tables_order(self):
        section = GUIDE.read_text("utf-8").split("\n## Presets\n")[1].split("\n## ")[0]
        cells = re.findall(r"^\| (`[^|]*`) \|", section, re.MULTILINE)
        self.assertEqual([key for cell in cells for key in re.findall(r"`([a-z0-9_]+)`", cell)], table_keys())

    def test_the_example_uses_every_key_and_no_other(self):
        used = {key for file in preset_files() for key in file["default"]}
        self.assertEqual(used, set(table_keys()))

    def test_the_example_marks_only_known_keys(self):
        marked = {key for file in preset_files() if file.has_section("upgrade_update") for key in file["upgrade_update"]}
        self.assertLess(marked, set(table_keys()))
        self.assertGreater(len(marked), 3)


if __name__ == "__main__":
    unittest.main()
