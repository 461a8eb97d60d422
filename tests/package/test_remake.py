"""The committed package is what make-example makes of the operators' data, byte for byte.

With other data than the recorded one the bytes differ; then the package made of it must still pass every check.
"""

import hashlib
import tempfile
import unittest
from pathlib import Path

from support import PACKAGE, ROOT, files_of, run

DATA = Path("/usr/share/mobile-broadband-provider-info/serviceproviders.xml")
RECORDED = (ROOT / "examples/SOURCE").read_text("utf-8").split()[-1]


def data_is_recorded() -> bool:
    return DATA.is_file() and hashlib.sha256(DATA.read_bytes()).hexdigest() == RECORDED


class Remake(unittest.TestCase):
    def test_same_data_gives_the_same_bytes_and_other_data_a_sound_package(self):
        if not DATA.is_file():
            self.check_what_needs_no_data()
            return
        with tempfile.TemporaryDirectory() as folder:
            made = run("make-example", "--out", folder)
            self.assertEqual(made.returncode, 0, made.stderr)
            if data_is_recorded():
                self.assertEqual(sorted(files_of(Path(folder))), sorted(files_of(PACKAGE)))
                self.assertEqual(files_of(Path(folder)), files_of(PACKAGE))
            checked = run("check-example", folder)
            self.assertEqual(checked.returncode, 0, checked.stderr)

    def check_what_needs_no_data(self):
        """Without the data, what comes from the templates alone is compared."""
        import importlib.machinery
        import importlib.util
        loader = importlib.machinery.SourceFileLoader("make_example", str(ROOT / "scripts/make-example"))
        module = importlib.util.module_from_spec(importlib.util.spec_from_loader("make_example", loader))
        loader.exec_module(module)
        committed = files_of(PACKAGE)
        self.assertEqual(module.header_file(), committed["mps/ZEL/SW_Configuration.xml"])
        for name, content in module.SHARED_MEDIA.items():
            self.assertEqual(content, committed[f"mps/ZEL/Media/{name}"], name)

    def test_what_needs_no_data_is_as_committed(self):
        self.check_what_needs_no_data()

    def test_a_folder_with_something_else_in_it_is_not_emptied(self):
        with tempfile.TemporaryDirectory() as folder:
            (Path(folder) / "letter.txt").write_text("keep me")
            self.assertNotEqual(run("make-example", "--out", folder).returncode, 0)
            self.assertEqual((Path(folder) / "letter.txt").read_text(), "keep me")


class Media(unittest.TestCase):
    def test_pictures_unpack_to_their_rows(self):
        import struct
        import zlib
        for name, data in files_of(PACKAGE).items():
            if not name.endswith(".png"):
                continue
            self.assertTrue(data.startswith(b"\x89PNG\r\n\x1a\n"), name)
            position, pixels, size = 8, b"", (0, 0)
            while position < len(data):
                length, kind = struct.unpack(">I4s", data[position:position + 8])
                body = data[position + 8:position + 8 + length]
                (crc,) = struct.unpack(">I", data[position + 8 + length:position + 12 + length])
                self.assertEqual(crc, zlib.crc32(kind + body), name)
                size = struct.unpack(">II", body[:8]) if kind == b"IHDR" else size
                pixels += body if kind == b"IDAT" else b""
                position += 12 + length
            self.assertEqual(len(zlib.decompress(pixels)), size[1] * (1 + 3 * size[0]), name)

    def test_tones_last_a_tenth_of_a_second(self):
        import io
        import wave
        for name, data in files_of(PACKAGE).items():
            if name.endswith(".wav"):
                with wave.open(io.BytesIO(data)) as tone:
                    self.assertEqual((tone.getnframes(), tone.getframerate()), (800, 8000), name)


if __name__ == "__main__":
    unittest.main()
