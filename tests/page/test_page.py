#!/usr/bin/env python3
"""The page that `zel verify --html` writes, in a real browser: tests/page/test_page.py BUILD-FOLDER"""

import base64
import hashlib
import json
import os
import re
import shutil
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

sys.path.insert(0, str(Path(__file__).resolve().parent))
from browser import Browser  # noqa: E402

TOP = Path(__file__).resolve().parents[2]
BUILD = Path(sys.argv.pop(1) if len(sys.argv) > 1 else TOP / "build/dev").resolve()
SHOTS = BUILD / "page"
NARROW, WIDE = 360, 1280
GPS_KEY = "db/location/setting/GpsEnabled"
HOSTILE = """</script><script>window.hit = 1</script>"><img src=x onerror="window.hit = 1">'&lt;"""
RENDERED = "[...document.querySelectorAll('%s')].filter(e => e.getClientRects().length)"


def zel(root: str, *words: str) -> subprocess.CompletedProcess:
    return subprocess.run([BUILD / "tools/zel/zel", *words], capture_output=True, text=True,
                          env={**os.environ, "ZEL_ROOT": root})


def luminance(colour: str) -> float:
    parts = [int(part) / 255 for part in re.findall(r"\d+", colour)[:3]]
    red, green, blue = [p / 12.92 if p <= 0.03928 else ((p + 0.055) / 1.055) ** 2.4 for p in parts]
    return 0.2126 * red + 0.7152 * green + 0.0722 * blue


def contrast(one: str, other: str) -> float:
    low, high = sorted([luminance(one), luminance(other)])
    return (high + 0.05) / (low + 0.05)


class VerifyPage(unittest.TestCase):
    @classmethod
    def setUpClass(cls) -> None:
        cls.folder = tempfile.mkdtemp(prefix="zel-page-test-")
        cls.root = cls.folder + "/phone"
        for words in (["--root", cls.root, "phone", "create", "--package", str(TOP / "examples/package")],
                      ["install", "UFN"]):
            done = zel(cls.root, *words)
            assert done.returncode == 0, done.stderr
        cls.good = Path(cls.folder, "good.html")
        cls.good_code = zel(cls.root, "verify", "--html", str(cls.good)).returncode
        spec = Path(cls.root, "opt/system/zel/mps/ZEL/Customer/TFG/customer.xml")
        whole = spec.read_bytes()
        spec.write_bytes(whole[:20000])
        cls.cut = Path(cls.folder, "cut.html")
        cls.cut_code = zel(cls.root, "verify", "--html", str(cls.cut)).returncode
        spec.write_bytes(whole)
        # A phone that came off its package, in every kind of thing that the page shows.
        zel(cls.root, "vconf", "set", GPS_KEY, "0" if cls.key(GPS_KEY) == "1" else "1")
        zel(cls.root, "vconf", "set", "db/zel/country_iso", HOSTILE)
        Path(cls.root, "opt/usr/media/Images/new.png").write_text("a picture")
        app = Path(cls.root, "opt/system/zel-default/app")
        (app / "applist.ini").write_text("[zel packages]\nname_001 = <b>bold</b>\ntype_001 = tpk\n")
        (app / "appresult.ini").write_text("[result]\ncount = 1\ndescription_001 = op=install\nresult_001 = fail\n")
        log = Path(cls.root, "opt/system/zel-default/output/zel-time-lap.log")
        log.write_text("Time lap (Spec) : 2.4294467296 sec\nTime lap (Preset) : 0.375000 sec\nnot a lap\n"
                       "Time lap (Set back) : 4294967295.0 sec\nTime lap (<i>All</i>) : 3.0 sec\n")
        cls.page_path = Path(cls.folder, "changed.html")
        cls.changed = zel(cls.root, "verify", "--html", str(cls.page_path))
        cls.browser = Browser()

    @classmethod
    def tearDownClass(cls) -> None:
        cls.browser.__exit__()
        shutil.rmtree(cls.folder, ignore_errors=True)

    @classmethod
    def key(cls, name: str) -> str:
        return zel(cls.root, "vconf", "get", name).stdout.strip()

    def page(self, width: int = WIDE, path: Path | None = None, scheme: str = "light"):
        return self.browser.open(path or self.page_path, width, scheme=scheme)

    def test_exit_codes_tell_the_two_phones_apart(self) -> None:
        self.assertEqual(self.good_code, 0)
        self.assertEqual(self.changed.returncode, 4)

    def test_page_asks_for_nothing_and_the_browser_has_nothing_to_say(self) -> None:
        for path in (self.good, self.page_path):
            page = self.page(path=path)
            self.assertEqual(page.requests, [path.as_uri()])
            self.assertEqual(page.complaints, [])

    def test_security_policy_names_the_sums_of_its_own_script_and_style(self) -> None:
        text = self.page_path.read_text()
        self.assertIn("default-src 'none'", text)
        self.assertNotIn("unsafe", text)
        for tag in ("style", "script"):
            parts = re.findall(f"<{tag}>(.*?)</{tag}>", text, re.S)
            self.assertEqual(len(parts), 1)
            digest = base64.b64encode(hashlib.sha256(parts[0].encode()).digest()).decode()
            self.assertIn(f"{tag}-src 'sha256-{digest}'", text)

    def test_what_comes_from_the_phone_is_text(self) -> None:
        page = self.page()
        self.assertIsNone(page.run("window.hit ?? null"))
        self.assertEqual(page.run("document.querySelectorAll('img, .value b b, .lap i').length"), 0)
        self.assertTrue(page.run(f"[...document.querySelectorAll('.value u')].some(e => e.textContent === {json.dumps(HOSTILE)})"))
        self.assertIn("<b>bold</b>(tpk,install),fail", page.run("document.body.innerText"))
        self.assertIn("<i>All</i>", page.run("document.body.innerText"))

    def test_summary_tells_the_verdict(self) -> None:
        self.assertEqual(self.page(path=self.good).run("document.querySelector('.verdict').textContent"), "OK")
        page = self.page()
        self.assertEqual(page.run("document.querySelector('.verdict').textContent"), "NOT OK")
        self.assertEqual(page.run("document.title"), "Verification of UFN")
        summary = page.run("document.querySelector('dl').innerText")
        self.assertIn("2 of ", summary)
        self.assertIn("Internal name\nTFG", summary)
        self.assertIn("1 of 3 results failed", summary)
        self.assertEqual(page.run("[...document.querySelectorAll('dd.bad')].map(e => e.textContent.split(' ')[0])"),
                         ["2", "2", "1"])
        self.assertEqual(self.page(path=self.good).run("document.querySelectorAll('dd.bad, .problems').length"), 0)

    def test_what_was_not_looked_at_is_said(self) -> None:
        page = self.page(path=self.cut)
        self.assertEqual(self.cut_code, 1)
        self.assertEqual(page.run("document.querySelector('.verdict').textContent"), "INCOMPLETE")
        self.assertEqual(page.run("document.querySelectorAll('.problems li').length"), 1)
        self.assertIn("customer.xml:", page.run("document.querySelector('.problems').innerText"))

    def test_failures_come_first_in_their_groups_and_the_groups_with_them(self) -> None:
        page = self.page()
        order = page.run("[...document.querySelectorAll('.value')].map(e => e.classList.contains('failed'))")
        groups = page.run("[...document.querySelectorAll('.group')].map(g => [...g.querySelectorAll('.value')]"
                          ".map(e => e.classList.contains('failed')))")
        self.assertEqual(sum(order), 3)
        for group in groups:
            self.assertEqual(group, sorted(group, reverse=True))
        with_failures = [any(group) for group in groups]
        self.assertEqual(with_failures, sorted(with_failures, reverse=True))
        names = page.run("[...document.querySelectorAll('.group')].map(g => g.dataset.name)")
        self.assertEqual(len(names), len(set(names)))
        self.assertIn("GPS", names)

    def test_filter_shows_the_values_that_hold_every_word(self) -> None:
        page = self.page()
        shown = lambda: page.run(RENDERED % ".value" + ".map(e => e.children[1].textContent)")  # noqa: E731
        count = lambda: page.run("document.getElementById('count').textContent")  # noqa: E731
        everything = shown()
        self.assertEqual(count(), f"{len(everything)} of {len(everything)} values")
        page.run("document.getElementById('words').focus()")
        page.type("gps ACTIVATION")
        self.assertEqual(shown(), ["GPSActivation"])
        self.assertEqual(count(), f"1 of {len(everything)} values")
        page.type(" nothing has this")
        self.assertEqual(shown(), [])
        self.assertEqual(count(), f"0 of {len(everything)} values")
        page.run("words.value = ''; words.dispatchEvent(new Event('input'))")
        self.assertEqual(shown(), everything)
        page.run("failures.click()")
        self.assertEqual(sorted(shown()), ["CountryISO", "Customer1", "GPSActivation"])
        self.assertEqual(len(page.run(RENDERED % ".group" + ".length") * [0]), 3)

    def test_media_figures_stand_in_a_table(self) -> None:
        page = self.page()
        rows = page.run("[...document.querySelectorAll('#media tr')].slice(1).map(r => [...r.children].map(c => c.textContent))")
        self.assertEqual(len(rows), 10)
        image = next(row for row in rows if row[0] == "image")
        self.assertEqual(int(image[2]) - int(image[1]), 9)
        self.assertEqual(int(image[4]) - int(image[3]), 1)
        self.assertEqual(page.run("document.querySelectorAll('#media .changed').length"), 2)

    def test_laps_are_bars_of_their_true_length(self) -> None:
        page = self.page()
        laps = page.run("[...document.querySelectorAll('.lap')].map(l => [l.children[0].textContent, l.children[2].textContent,"
                        " l.querySelector('rect').getBoundingClientRect().width / l.querySelector('svg').getBoundingClientRect().width])")
        self.assertEqual([lap[:2] for lap in laps], [["Spec", "1.500 s"], ["Preset", "0.375 s"], ["Set back", "-1.000 s"],
                                                     ["<i>All</i>", "3.000 s"]])
        for lap, share in zip(laps, (0.5, 0.125, 0, 1)):
            self.assertAlmostEqual(lap[2], share, 2)

    def test_nothing_is_wider_than_a_narrow_screen(self) -> None:
        for width in (320, NARROW, 800, WIDE):
            page = self.page(width)
            self.assertLessEqual(page.run("document.documentElement.scrollWidth"), width)
            self.assertEqual(page.run("[...document.querySelectorAll('.value *, .lap *, dl *, .filter *')].filter(e => {"
                                      f"const r = e.getBoundingClientRect(); return r.width && r.right > {width} + 0.5; }}).length"), 0)

    def test_narrow_screen_breaks_no_number_and_squeezes_no_text(self) -> None:
        page = self.page(320)
        self.assertEqual(page.run("[...document.querySelectorAll('#media td')].filter(e => { const r = document.createRange();"
                                  "r.selectNodeContents(e); return r.getClientRects().length > 1; }).length"), 0)
        self.assertEqual(page.run("(e => e.scrollWidth - e.clientWidth)(document.querySelector('.wide'))"), 0)
        self.assertEqual(page.run("[...document.querySelectorAll('.value i, .value u')].filter(e =>"
                                  "e.getBoundingClientRect().width < 180).length"), 0)

    def test_text_is_readable_in_both_schemes(self) -> None:
        for scheme in ("light", "dark"):
            page = self.page(scheme=scheme)
            ground = page.run("getComputedStyle(document.body).backgroundColor")
            self.assertEqual(luminance(ground) > 0.5, scheme == "light")
            pairs = page.run("""[...document.querySelectorAll(`body, dt, dd.bad, h3 small, .filter output, .verdict, .value b, .value.failed b, .value i,
                td.changed, th, .lap span`)].map(e => { let g = e; while (getComputedStyle(g).backgroundColor === 'rgba(0, 0, 0, 0)')
                g = g.parentElement; return [e.tagName + '.' + e.className, getComputedStyle(e).color, getComputedStyle(g).backgroundColor]; })""")
            pairs.append(page.run("['placeholder', getComputedStyle(words, '::placeholder').color, getComputedStyle(words).backgroundColor]"))
            for name, text, behind in pairs:
                self.assertGreaterEqual(contrast(text, behind), 4.5, f"{name} in {scheme}")

    def test_page_can_be_heard_and_used_without_a_mouse(self) -> None:
        page = self.page()
        tree = [(node["role"]["value"], node.get("name", {}).get("value", ""))
                for node in page.call("Accessibility.getFullAXTree")["nodes"] if not node["ignored"]]
        for part in (("main", ""), ("heading", "Verification of UFN"), ("searchbox", "Filter values"),
                     ("checkbox", "failures only"), ("region", "Media folders"), ("columnheader", "Bytes now"),
                     ("rowheader", "image")):
            self.assertIn(part, tree)
        self.assertIn("status", [role for role, _ in tree])
        reached = []
        for _ in range(3):
            page.press("Tab")
            reached.append(page.run("document.activeElement.id || document.activeElement.className"))
        self.assertEqual(reached, ["words", "failures", "wide"])

    def test_values_are_there_without_script_as_well(self) -> None:
        text = re.sub(r"<script>.*?</script>", "", self.page_path.read_text(), flags=re.S)
        Path(self.folder, "still.html").write_text(text)
        page = self.page(path=Path(self.folder, "still.html"))
        self.assertTrue(page.run("document.querySelector('.filter').hidden"))
        self.assertGreater(page.run(RENDERED % ".value" + ".length"), 3)

    def test_screens_for_people_to_look_at(self) -> None:
        self.page(NARROW, path=self.cut).screenshot(SHOTS / "verify-incomplete.png")
        for width, name in ((NARROW, "narrow"), (WIDE, "wide")):
            for scheme in ("light", "dark"):
                shot = SHOTS / f"verify-{name}-{scheme}.png"
                self.page(width, scheme=scheme).screenshot(shot)
                self.assertEqual(shot.read_bytes()[:8], b"\x89PNG\r\n\x1a\n")


if __name__ == "__main__":
    unittest.main(verbosity=2)
