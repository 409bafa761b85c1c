"""A browser without a window, driven over the WebDriver protocol."""

import base64
import json
import subprocess
import tempfile
import urllib.request

OPTIONS = ["--headless=new", "--no-sandbox", "--disable-gpu", "--disable-quic", "--no-first-run",
           "--disable-background-networking", "--disable-component-update", "--disable-sync",
           "--disable-dev-shm-usage", "--hide-scrollbars"]
KEYS = {"Escape": "\ue00c", "Right": "\ue014", "Left": "\ue012", "Enter": "\ue007", "End": "\ue010",
        "Tab": "\ue004"}

# Every element's text against what is behind it, as the accessibility guidelines count it.
LOW_CONTRAST = """
const channels = (colour) => colour.match(/[\\d.]+/g).map(Number);
const light = ([r, g, b]) => {
  const [R, G, B] = [r, g, b].map((c) => c / 255).map((c) => c <= 0.04045 ? c / 12.92 : ((c + 0.055) / 1.055) ** 2.4);
  return 0.2126 * R + 0.7152 * G + 0.0722 * B;
};
const ground = (element) => {
  for (; element; element = element.parentElement) {
    const colour = channels(getComputedStyle(element).backgroundColor);
    if (colour.length < 4 || colour[3] === 1) return colour;
  }
  return [255, 255, 255];
};
const low = [];
for (const element of document.querySelectorAll("body *")) {
  const hasText = [...element.childNodes].some((node) => node.nodeType === 3 && node.data.trim());
  if (!hasText || !element.checkVisibility() || element.disabled || element.tagName === "SCRIPT") continue;
  const [a, b] = [light(channels(getComputedStyle(element).color)), light(ground(element))];
  if ((Math.max(a, b) + 0.05) / (Math.min(a, b) + 0.05) < 4.5) low.push(element.outerHTML.slice(0, 80));
}
return low;
"""
NAMELESS = """
return [...document.querySelectorAll("button, a[href], input, dialog, [role=img], section, img")]
    .filter((one) => !(one.textContent.trim() || one.getAttribute("aria-label") || one.alt ||
                       one.labels?.length || one.getAttribute("aria-labelledby")))
    .filter((one) => one.id !== "viewer-picture").map((one) => one.outerHTML.slice(0, 80));
"""


class Browser:
    """Use it in a with statement: it ends what it starts."""

    def __init__(self, chromedriver):
        self.profile = tempfile.TemporaryDirectory(ignore_cleanup_errors=True)
        self.driver = subprocess.Popen([chromedriver, "--port=0"], stdout=subprocess.PIPE, text=True)
        port = None
        for line in self.driver.stdout:
            if "started successfully on port" in line:
                port = line.rstrip(".\n").split()[-1]
                break
        self.url = f"http://127.0.0.1:{port}"
        self.session = ""

    def __enter__(self):
        wanted = {"goog:chromeOptions": {"args": OPTIONS + [f"--user-data-dir={self.profile.name}"]},
                  "goog:loggingPrefs": {"browser": "ALL", "performance": "ALL"}}
        answer = self.call("POST", "/session", {"capabilities": {"alwaysMatch": wanted}})
        self.session = "/session/" + answer["sessionId"]
        return self

    def __exit__(self, *_):
        if self.session:
            self.call("DELETE", self.session)
        self.driver.terminate()
        self.driver.wait()
        self.driver.stdout.close()
        self.profile.cleanup()

    def call(self, method, path, body=None):
        data = None if body is None else json.dumps(body).encode()
        request = urllib.request.Request(self.url + path, data, {"Content-Type": "application/json"},
                                         method=method)
        with urllib.request.urlopen(request, timeout=60) as answer:
            return json.load(answer)["value"]

    def open(self, url):
        self.call("POST", self.session + "/url", {"url": url})

    def run(self, script):
        """What the script, the body of a function, returns."""
        return self.call("POST", self.session + "/execute/sync", {"script": script, "args": []})

    def click(self, selector):
        found = self.call("POST", self.session + "/element", {"using": "css selector", "value": selector})
        self.call("POST", f"{self.session}/element/{next(iter(found.values()))}/click", {})

    def press(self, key):
        actions = [{"type": kind, "value": KEYS[key]} for kind in ("keyDown", "keyUp")]
        self.call("POST", self.session + "/actions",
                  {"actions": [{"type": "key", "id": "keyboard", "actions": actions}]})

    def devtools(self, command, **parameters):
        return self.call("POST", self.session + "/goog/cdp/execute", {"cmd": command, "params": parameters})

    def resize(self, width, height):
        self.devtools("Emulation.setDeviceMetricsOverride", width=width, height=height,
                      deviceScaleFactor=1, mobile=False)

    def prefer(self, scheme):
        self.devtools("Emulation.setEmulatedMedia",
                      features=[{"name": "prefers-color-scheme", "value": scheme}])

    def log(self, kind):
        """What was logged since the last look: kind is browser or performance."""
        return self.call("POST", self.session + "/se/log", {"type": kind})

    def fetched(self):
        """The addresses that were asked for since the last look."""
        messages = [json.loads(entry["message"])["message"] for entry in self.log("performance")]
        return [message["params"]["request"]["url"] for message in messages
                if message["method"] == "Network.requestWillBeSent"]

    def picture(self, file, whole=False):
        shot = self.devtools("Page.captureScreenshot", captureBeyondViewport=whole)
        with open(file, "wb") as out:
            out.write(base64.b64decode(shot["data"]))
