"""The files for measurements have the size and content that was asked for, and are the same every time."""

import tempfile
import unittest
from collections import Counter
from pathlib import Path

from support import run
from spec_tools import element_table, occurrences


class Generators(unittest.TestCase):
    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.out = Path(self.folder.name) / "customer.xml"

    def tearDown(self):
        self.folder.cleanup()

    def make(self, script: str, *arguments: object) -> bytes:
        result = run(script, *arguments)
        self.assertEqual(result.returncode, 0, result.stderr)
        return self.out.read_bytes()

    def elements(self) -> list:
        found = occurrences.read(self.out, element_table.read())
        self.assertEqual([e.tag for e in found if e.row is None], [])
        return found

    def test_sizes_are_met_within_one_repetition(self):
        for text, size in (("30K", 30_720), ("300K", 307_200), ("10M", 10_485_760)):
            length = len(self.make("make-customer-file", text, self.out))
            self.assertGreaterEqual(length, size)
            self.assertLess(length, size + 8_192)

    def test_a_sized_file_holds_networks_settings_and_profiles_that_are_known(self):
        self.make("make-customer-file", "300K", self.out)
        tags = Counter(e.tag for e in self.elements())
        for tag in ("NetworkInfo", "Profile", "RngVolume", "Bookmark", "EnableVoLTE", "GPSActivation"):
            self.assertGreater(tags[tag], 5, tag)

    def test_the_same_call_gives_the_same_bytes(self):
        self.assertEqual(self.make("make-customer-file", "30K", self.out),
                         self.make("make-customer-file", "30K", self.out))

    def test_networks_and_profiles_are_as_many_as_asked_for(self):
        self.make("make-large-customer", 270, 300, self.out)
        found = self.elements()
        networks = [e.child_text("MCCMNC") for e in found if e.tag == "NetworkInfo"]
        self.assertEqual((len(networks), len(set(networks))), (270, 270))
        of_profiles = [e.child_text("NetworkName") for e in found if e.tag == "Profile"]
        self.assertEqual(len(of_profiles), 300)
        self.assertEqual(of_profiles.count("default"), 10)
        self.assertEqual(max(Counter(n for n in of_profiles if n != "default").values()), 2)
        self.assertEqual(sum(e.tag == "ProfileHandle" for e in found), 50)

    def test_a_large_package_has_no_fault(self):
        package = Path(self.folder.name) / "package"
        self.assertEqual(run("make-large-customer", 30, 40, package, "--package").returncode, 0)
        found = run("check-example", package).stderr.splitlines()
        self.assertIn("row 1: MobileData occurs nowhere", found)
        self.assertEqual([line for line in found if not line.endswith("occurs nowhere")], [])

    def test_senseless_numbers_are_refused(self):
        for arguments in (("make-customer-file", "0", self.out), ("make-large-customer", 0, 1, self.out),
                          ("make-large-customer", 1, 5, self.out, "--defaults", 6)):
            self.assertEqual(run(*arguments).returncode, 2, arguments)
        self.assertFalse(self.out.exists())


if __name__ == "__main__":
    unittest.main()
