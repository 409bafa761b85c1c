"""The report in a real browser: report_browser_test.py CHROMEDRIVER BRIMOL_REPLAY APPLICATION"""

import pathlib
import subprocess
import sys
import tempfile
import unittest

from browser import LOW_CONTRAST, NAMELESS, Browser

CHROMEDRIVER, REPLAY, APPLICATION = sys.argv[1:4]


class ReportTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.folder = tempfile.TemporaryDirectory()
        cls.addClassCleanup(cls.folder.cleanup)
        cls.browser = cls.enterClassContext(Browser(CHROMEDRIVER))
        cls.browser.open("about:blank")
        cls.browser.fetched()

    def show(self, does, *options, width=1280, scheme="light"):
        """Opens the report of a new run."""
        folder = pathlib.Path(tempfile.mkdtemp(dir=self.folder.name))
        (folder / "menu.trace").write_text("brimol-trace 1\n")
        subprocess.run([REPLAY, "--dir", folder / "run", *options, folder / "menu.trace", "--", APPLICATION,
                        *does.split()], stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, check=False)
        self.browser.resize(width, 900)
        self.browser.prefer(scheme)
        page = (folder / "run" / "report.html").as_uri()
        self.browser.open(page)
        self.assertEqual([page], [url for url in self.browser.fetched() if not url.startswith("data:")])
        self.assertEqual([], self.browser.log("browser"))
        return folder / "run"

    def text(self, selector):
        return self.browser.run(f"return document.querySelector('{selector}').innerText")

    def viewer(self):
        """What is enlarged; nothing: the viewer is closed."""
        return self.browser.run("return document.getElementById('viewer').open"
                                " ? document.getElementById('viewer-title').textContent : ''")

    def test_opens_with_its_verdict(self):
        for does, verdict, says in [("pass", "Passed", "played to its end"),
                                    ("fail", "Failed", 'expect text "Passed"'),
                                    ("crash", "Crashed", "crashed"),
                                    ("silent", "Failed", "before it opened a screen")]:
            with self.subTest(does):
                self.show(does)
                self.assertEqual(verdict, self.text("#badge"))
                self.assertIn(says, self.text("#headline"))
                title = self.browser.run("return document.title")
                self.assertTrue(title.startswith(verdict), title)

    def test_marks_a_failed_step(self):
        self.show("fail")
        self.assertIn("menu.trace:4", self.text("#failures li"))
        self.assertIn("no item shows it", self.text(".card.marked .failure"))
        self.assertIn("failed", self.text(".card.marked .failure .kind"))
        self.browser.click("#failures a")
        self.assertEqual("#frame-2", self.browser.run("return location.hash"))

    def test_enlarges_a_thumbnail_by_mouse_and_keys(self):
        self.show("pass")
        self.browser.click(".thumb")
        self.assertEqual("Frame 1", self.viewer())
        self.assertTrue(self.browser.run("const p = document.getElementById('viewer-picture');"
                                         "return p.complete && p.naturalWidth === 480"))
        for key, shown in [("Right", "Frame 2"), ("Left", "Frame 1"), ("Left", "Frame 1"), ("End", "Frame 3"),
                           ("Right", "Frame 3"), ("Escape", "")]:
            self.browser.press(key)
            self.assertEqual(shown, self.viewer(), key)
        # The browser tells the page of the end of a viewer a moment later.
        focused = self.browser.run("""return new Promise((told) => {
            const look = () => document.activeElement.ariaLabel === 'Enlarge Frame 3' ? told(true)
                : requestAnimationFrame(look);
            setTimeout(() => told(false), 60000);
            look();
        })""")
        self.assertTrue(focused, "the viewer gives the focus to the picture that it showed last")
        self.browser.press("Enter")
        self.assertEqual("Frame 3", self.viewer())
        self.browser.click("#viewer-close")
        self.assertEqual("", self.viewer())

    def test_hides_what_is_not_wanted(self):
        self.show("fail")
        self.browser.click("#filters label:nth-of-type(4)")
        self.assertIsNone(self.browser.run("return document.querySelector('.log')"))
        self.browser.click("#filters label:nth-of-type(3)")
        self.assertIsNone(self.browser.run("return document.querySelector('.check:not(.failure)')"))
        self.assertIsNotNone(self.browser.run("return document.querySelector('.check.failure')"))

    def test_shows_both_sides_of_a_comparison(self):
        first = self.show("pass")
        self.show("pass-otherwise", "--against", first)
        self.assertIn("1 of 3 frames differs", self.text("#comparison-summary"))
        self.assertEqual(3, self.browser.run("return document.querySelectorAll('.pair img').length"))

    def test_can_be_read_everywhere(self):
        for scheme in ("light", "dark"):
            for width in (1280, 390):
                with self.subTest(scheme=scheme, width=width):
                    self.show("fail", width=width, scheme=scheme)
                    self.assertEqual([], self.browser.run(LOW_CONTRAST))
                    self.assertEqual([], self.browser.run(NAMELESS))
                    self.assertEqual(width, self.browser.run("return document.documentElement.scrollWidth"))
        dark = self.browser.run("return getComputedStyle(document.body).backgroundColor")
        self.browser.prefer("light")
        self.assertNotEqual(dark, self.browser.run("return getComputedStyle(document.body).backgroundColor"))

    def test_shows_thousands_of_frames(self):
        folder = self.show("animate 5000")
        self.assertLess((folder / "report.html").stat().st_size, 20_000_000)
        self.assertEqual(4000, self.browser.run("return document.querySelectorAll('.strip figure').length"))
        self.assertIn("1000 frames left out", self.text("#frame-list"))


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
