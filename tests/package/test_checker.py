"""check-example finds what is wrong: each test breaks a copy of the package in one way."""

import shutil
import tempfile
import unittest
from pathlib import Path

from support import PACKAGE, run

INS = "mps/ZEL/Customer/INS/customer.xml"


class Checker(unittest.TestCase):
    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.package = Path(self.folder.name) / "package"
        shutil.copytree(PACKAGE, self.package)

    def tearDown(self):
        self.folder.cleanup()

    def replace(self, old: str, new: str, name: str = INS):
        path = self.package / name
        data = path.read_bytes()
        self.assertIn(old.encode(), data)
        path.write_bytes(data.replace(old.encode(), new.encode(), 1))

    def assert_found(self, message: str):
        result = run("check-example", self.package)
        self.assertEqual(result.returncode, 1, result.stdout)
        self.assertIn(message, result.stderr)

    def test_the_unbroken_package_passes(self):
        result = run("check-example", self.package)
        self.assertEqual(result.returncode, 0, result.stderr)

    def test_a_file_without_the_mark(self):
        path = self.package / INS
        path.write_bytes(path.read_bytes()[3:])
        self.assert_found("not with the mark ef bb bf")

    def test_a_file_that_is_not_well_formed(self):
        self.replace("</GPSActivation>", "</GPSActivatio>")
        self.assert_found("mismatched tag")

    def test_a_capital_letter_in_a_tag(self):
        self.replace("<SalesCode>INS</SalesCode>", "<Salescode>INS</Salescode>")
        self.assert_found("Salescode inside GeneralInfo has no row")

    def test_an_element_in_the_wrong_place(self):
        self.replace("<Bearer>cs</Bearer>", "")
        self.replace("<RecOption>", "<Bearer>cs</Bearer><RecOption>")
        self.assert_found("Bearer inside PushMsg has no row")

    def test_an_element_that_no_customer_uses(self):
        for code in ("XFV", "TFG"):
            name = f"mps/ZEL/Customer/{code}/customer.xml"
            data = (self.package / name).read_bytes()
            (self.package / name).write_bytes(data.replace(b"<SubsetCode>A3</SubsetCode>", b""))
        self.assert_found("SubsetCode occurs nowhere")

    def test_a_name_of_32_characters(self):
        name = "A" * 32
        self.replace("<GPS>", f"<GPS><{name}></{name}>")
        self.assert_found("has 32 characters, 31 are allowed")

    def test_an_entity_that_the_phone_does_not_know(self):
        self.replace("Messagerie", "Messagerie&#39;")
        self.assert_found("&#39; is not decoded by the phone")

    def test_an_attribute_in_single_quotes(self):
        self.replace('src="/Media/Ringtones/ring-2.wav"', "src='/Media/Ringtones/ring-2.wav'")
        self.assert_found("single quotes")

    def test_text_in_a_cdata_section(self):
        self.replace("Messagerie", "<![CDATA[Messagerie]]>")
        self.assert_found("CDATA")

    def test_a_trailing_blank(self):
        self.replace("<Bearer>cs<", "<Bearer>cs <")
        self.assert_found("blanks around 'cs '")

    def test_a_text_that_is_ignored(self):
        self.replace("<TimeFormat>24h<", "<TimeFormat>24H<")
        self.assert_found("TimeFormat '24H': not one of 12h, 24h")

    def test_a_text_that_is_cut(self):
        self.replace("<VoicemailName>Messagerie<", f"<VoicemailName>{'M' * 200}<")
        self.assert_found("200 bytes, 199 are kept")

    def test_a_count_that_does_not_count(self):
        self.replace("<NbSubsetLock>2", "<NbSubsetLock>3")
        self.assert_found("NbSubsetLock says 3, there are 2 SubsetLock")

    def test_a_network_that_the_customer_does_not_have(self):
        self.replace("<NetworkName>default</NetworkName>", "<NetworkName>Default</NetworkName>")
        self.assert_found("'Default' is no network of this customer")

    def test_a_default_connection_without_profile(self):
        self.replace("<ProfMMS>MMSGPRS<", "<ProfMMS>MMS<")
        self.assert_found("ProfMMS 'MMS' is no profile of 'SFR Réunion'")

    def test_media_that_are_not_there(self):
        (self.package / "mps/ZEL/Media/Alarms/alarm.wav").unlink()
        self.assert_found("'/Media/Alarms/alarm.wav' is no file of the package")

    def test_a_customer_without_file(self):
        shutil.rmtree(self.package / "mps/ZEL/Customer/MCI")
        self.assert_found("'/Customer/MCI/customer.xml' names no customer file")

    def test_a_sales_code_of_another_customer(self):
        self.replace("<SalesCode>INS<", "<SalesCode>XFV<")
        self.assert_found("SalesCode is not INS")


if __name__ == "__main__":
    unittest.main()
