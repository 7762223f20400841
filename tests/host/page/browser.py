"""A browser without a window, driven by plain WebDriver (W3C) requests."""

import base64
import json
import os
import pathlib
import shutil
import subprocess
import time
import urllib.error
import urllib.request

PROGRAMS = ("chromedriver", "chromium")
ENTER = "\ue007"
ARROW_RIGHT, ARROW_DOWN = "\ue014", "\ue015"

# The relative luminance and the contrast of WCAG 2.1, of each text on the nearest background behind it.
CONTRAST = """
const parts = color => color.match(/[\\d.]+/g).map(Number);
const luminance = color => {
  const linear = value => value <= 0.03928 ? value / 12.92 : ((value + 0.055) / 1.055) ** 2.4;
  const [r, g, b] = parts(color).map(value => linear(value / 255));
  return 0.2126 * r + 0.7152 * g + 0.0722 * b;
};
const background = element => {
  for (; element; element = element.parentElement) {
    const color = getComputedStyle(element).backgroundColor;
    if (parts(color).length === 3) return color;
  }
  return "rgb(255, 255, 255)";
};
let least = [99, ""];
for (const element of document.querySelectorAll("body *")) {
  const own = [...element.childNodes].some(node => node.nodeType === 3 && node.data.trim());
  if (!own || !element.getClientRects().length) continue;
  const [a, b] = [getComputedStyle(element).color, background(element)].map(luminance).sort((x, y) => y - x);
  const contrast = (a + 0.05) / (b + 0.05);
  if (contrast < least[0]) least = [contrast, element.outerHTML.slice(0, 200)];
}
return least;
"""


def missing_programs():
    return [program for program in PROGRAMS if shutil.which(program) is None]


class Browser:
    """One page at a time. What it logs and what it asks the network for is kept."""

    def __init__(self, folder, dark=False, scripts=True):
        self._folder = folder
        self._driver = subprocess.Popen([shutil.which("chromedriver"), "--port=0"], cwd=folder, stdout=subprocess.PIPE,
                                        stderr=subprocess.STDOUT, text=True)
        try:
            self._url = f"http://127.0.0.1:{self._port()}"
            colors = f"--blink-settings=preferredColorScheme={0 if dark else 1}"
            arguments = ["--headless=new", "--no-sandbox", "--disable-gpu", "--disable-dev-shm-usage",
                         f"--user-data-dir={folder}/profile", colors, "about:blank"]
            options = {"args": arguments, "binary": shutil.which("chromium")}
            if not scripts:
                options["prefs"] = {"profile.managed_default_content_settings.javascript": 2}
            always = {"browserName": "chrome", "goog:chromeOptions": options,
                      "goog:loggingPrefs": {"browser": "ALL", "performance": "ALL"}}
            session = self._send("POST", "/session", {"capabilities": {"alwaysMatch": always}})
            self._url += f"/session/{session['sessionId']}"
        except BaseException:
            self._driver.kill()
            self._driver.wait()
            raise

    def close(self):
        try:
            self._send("DELETE", "")
        finally:
            self._driver.terminate()
            self._driver.wait(timeout=20)
            self._driver.stdout.close()

    def _port(self):
        for line in self._driver.stdout:
            if "started successfully on port" in line:
                return int(line.rstrip(".\n").rpartition(" ")[2])
        raise RuntimeError("chromedriver does not start")

    def _send(self, method, path, body=None):
        data = json.dumps(body).encode() if body is not None else None
        request = urllib.request.Request(self._url + path, data, {"Content-Type": "application/json"}, method=method)
        try:
            with urllib.request.urlopen(request, timeout=60) as answer:
                return json.load(answer)["value"]
        except urllib.error.HTTPError as error:
            raise RuntimeError(error.read().decode()) from error

    def open(self, page):
        self.open_address(page.as_uri())

    def open_address(self, address):
        self._send("POST", "/url", {"url": address})

    def resize(self, width, height=900):
        """The inside of the window, as a phone has it."""
        self._send("POST", "/goog/cdp/execute", {"cmd": "Emulation.setDeviceMetricsOverride", "params": {
            "width": width, "height": height, "deviceScaleFactor": 1, "mobile": False}})

    def processor_seconds(self):
        """What the processes that draw pages and run their scripts have used of the processor until now."""
        ticks = 0
        for status in pathlib.Path("/proc").glob("[0-9]*/stat"):
            try:
                if f"--user-data-dir={self._folder}/".encode() in (status.parent / "cmdline").read_bytes() and \
                        b"--type=renderer" in (status.parent / "cmdline").read_bytes():
                    fields = status.read_text().rpartition(")")[2].split()
                    ticks += int(fields[11]) + int(fields[12])
            except FileNotFoundError:  # It has ended meanwhile.
                continue
        return ticks / os.sysconf("SC_CLK_TCK")

    def picture(self, medium="screen"):
        """What the window shows, as a PNG file's bytes; "print": as it would be on paper."""
        self._send("POST", "/goog/cdp/execute", {"cmd": "Emulation.setEmulatedMedia", "params": {"media": medium}})
        picture = self._send("POST", "/goog/cdp/execute", {"cmd": "Page.captureScreenshot", "params": {"format": "png"}})
        return base64.b64decode(picture["data"])

    def run(self, script, *arguments):
        """The value that a script returns, or that its promise comes to."""
        return self._send("POST", "/execute/sync", {"script": script, "args": arguments})

    def press(self, selector, keys):
        """Keys that a person would press in an element."""
        element = self._send("POST", "/element", {"using": "css selector", "value": selector})
        self._send("POST", f"/element/{next(iter(element.values()))}/value", {"text": keys})

    def press_here(self, *keys):
        """Keys where the focus is."""
        actions = [{"type": kind, "value": key} for key in keys for kind in ("keyDown", "keyUp")]
        self._send("POST", "/actions", {"actions": [{"type": "key", "id": "keyboard", "actions": actions}]})

    def click(self, selector):
        self.run("document.querySelector(arguments[0]).scrollIntoView({block: 'center'})", selector)
        element = self._send("POST", "/element", {"using": "css selector", "value": selector})
        self._send("POST", f"/element/{next(iter(element.values()))}/click", {})

    def print_pages(self):
        """A PDF file's bytes."""
        paper = {"width": 21, "height": 29.7}
        return base64.b64decode(self._send("POST", "/print", {"background": True, "page": paper}))

    def console(self):
        return [entry["message"] for entry in self._send("POST", "/se/log", {"type": "browser"})]

    def requests(self):
        """The addresses that were asked for since the last call."""
        time.sleep(0.2)
        entries = self._send("POST", "/se/log", {"type": "performance"})
        events = [json.loads(entry["message"])["message"] for entry in entries]
        urls = [event["params"]["request"]["url"] for event in events if event["method"] == "Network.requestWillBeSent"]
        return [url for url in urls if not url.startswith("chrome:")]  # Those of its own first page.
