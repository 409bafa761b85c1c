"""Applications used in a real browser: browser_test.py CHROMEDRIVER FIRST_SCREEN FACTORY_TEST"""

import os
import pathlib
import random
import re
import signal
import socket
import subprocess
import sys
import tempfile
import time
import unittest

from browser import Browser

CHROMEDRIVER, FIRST_SCREEN, FACTORY_TEST = sys.argv[1:4]
BUTTON = "rgb(184, 196, 214)"
BUTTON_AT = (720, 650)  # of 1440 x 2560 pixels; beside the button's caption

# Where a pixel of the screen is on the page, and which colour it shows.
LOOK = """
const canvas = document.querySelector("#screen canvas");
if (!canvas || !canvas.width) return null;
const place = canvas.getBoundingClientRect();
const [r, g, b] = canvas.getContext("2d").getImageData(%d, %d, 1, 1).data;
return {x: place.left + %d * place.width / canvas.width, y: place.top + %d * place.height / canvas.height,
        colour: `rgb(${r}, ${g}, ${b})`, inside: place.left >= 0 && place.top >= 0 &&
        place.right <= innerWidth && place.bottom <= innerHeight};
"""


def free_address():
    """A loopback address whose port and the next are free, and stay so: the system gives them to nobody by itself."""
    while True:
        port = random.randrange(10000, 30000)
        try:
            for wanted in port, port + 1:
                with socket.create_server(("127.0.0.1", wanted)):
                    pass
            return f"127.0.0.1:{port}"
        except OSError:
            continue


class Application:
    """A program that shows its screen in browsers, from its start to its end."""

    def __init__(self, program, listen="127.0.0.1:0", **environment):
        settings = {**os.environ, "BRIMOL_DISPLAY": "browser", "BRIMOL_LISTEN": listen, **environment}
        self.folder = tempfile.TemporaryDirectory()
        self.process = subprocess.Popen([program], stderr=subprocess.PIPE, text=True, env=settings,
                                        cwd=self.folder.name)
        said = self.process.stderr.readline()
        address = re.search(r"http://\S+", said)
        assert address, f"no address, but: {said}"
        self.address = address.group()

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.process.send_signal(signal.SIGKILL)
        self.process.communicate()
        self.folder.cleanup()


class BrowserTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.browser = cls.enterClassContext(Browser(CHROMEDRIVER))

    def eventually(self, look):
        end = time.monotonic() + 60
        while not (found := look()):
            self.assertLess(time.monotonic(), end, self.browser.run("return document.body.innerText"))
        return found

    def look(self, x, y):
        return self.browser.run(LOOK % (x, y, x, y))

    def see(self, x, y, colour):
        """The place of a pixel once it shows the colour."""
        def seen():
            pixel = self.look(x, y)
            return pixel if pixel and pixel["colour"] == colour else None
        return self.eventually(seen)

    def status(self):
        return self.browser.run("return document.getElementById('status').textContent")

    def mouse(self, kind, place, buttons):
        self.browser.devtools("Input.dispatchMouseEvent", type=kind, x=place["x"], y=place["y"],
                              button="left", buttons=buttons, clickCount=1)

    def touch(self, kind, *places):
        points = [{"x": place["x"], "y": place["y"], "id": number} for number, place in enumerate(places)]
        self.browser.devtools("Input.dispatchTouchEvent", type=kind, touchPoints=points)

    def test_a_click_ends_the_application_and_another_one_is_found_again(self):
        for width, height in (1200, 900), (390, 844):
            listen = free_address()
            with Application(FIRST_SCREEN, listen) as first:
                self.browser.resize(width, height)
                self.browser.open(first.address)
                button = self.see(*BUTTON_AT, BUTTON)
                self.assertTrue(button["inside"], "the screen fits into the page")
                self.assertEqual(self.status(), "")
                self.mouse("mousePressed", button, 1)
                self.mouse("mouseReleased", button, 0)
                self.assertEqual(first.process.wait(60), 0)
                self.eventually(lambda: "Trying again" in self.status())
                with Application(FIRST_SCREEN, listen) as second:
                    self.eventually(lambda: "open the address" in self.status())
                    self.browser.open(second.address)
                    self.see(*BUTTON_AT, BUTTON)
        self.assertEqual([entry["message"] for entry in self.browser.log("browser")
                          if "Content Security Policy" in entry["message"]], [])

    def test_fingers_and_keys_are_recorded(self):
        with Application(FACTORY_TEST, BRIMOL_RECORD="session.trace") as test:
            self.browser.devtools("Emulation.setTouchEmulationEnabled", enabled=True, maxTouchPoints=5)
            self.browser.resize(390, 844)
            self.browser.open(test.address)
            self.eventually(lambda: self.look(0, 0) and self.status() == "")
            self.touch("touchStart", self.look(100, 200), self.look(700, 300))
            self.touch("touchEnd")
            self.browser.press("Left")
            recording = pathlib.Path(test.folder.name, "session.trace")
            self.eventually(lambda: "keyup 276" in recording.read_text())
            records = re.findall(r"^\d+ (down|up) (\d) (\d+) (\d+)$", recording.read_text(), re.MULTILINE)
            self.assertEqual([record[:2] for record in records], [("down", "0"), ("down", "1"), ("up", "0"), ("up", "1")])
            for (_, _, x, y), wanted in zip(records, [(100, 200), (700, 300)] * 2):
                self.assertAlmostEqual(int(x), wanted[0], delta=8)  # a pixel of the page is about four
                self.assertAlmostEqual(int(y), wanted[1], delta=8)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], verbosity=2)
