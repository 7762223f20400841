"""The page in a browser, and the program beside it."""

import base64
import functools
import os
import pathlib
import subprocess
import sys
import tempfile
import time
import unittest

SOURCE = pathlib.Path(os.environ["SOURCE_DIR"])
sys.path.insert(0, str(SOURCE / "tests/host/page"))
import browser  # noqa: E402  (the driver that the page of "explain" is tested with)

PAGE = pathlib.Path(os.environ["PAGE"])
PROGRAM = os.environ["EDID_COMPOSER"]
SINKS = sorted((SOURCE / "examples/sinks").iterdir())
PLATFORMS = sorted((SOURCE / "examples/platforms").iterdir())


def run_program(*arguments, status=0):
    """What the program prints."""
    done = subprocess.run([PROGRAM, *map(str, arguments)], capture_output=True, check=False, timeout=60)
    if done.returncode != status:
        raise AssertionError(f"{arguments}: {done.returncode}: {done.stderr.decode()}")
    return done.stdout.decode()


class PageTest(unittest.TestCase):
    """One browser for all tests of a class; each test begins with the page as it is opened."""

    dark = False

    @classmethod
    def setUpClass(cls):
        folder = tempfile.TemporaryDirectory(prefix="edid_composer_page.", ignore_cleanup_errors=True)
        cls.addClassCleanup(folder.cleanup)
        cls.browser = browser.Browser(folder.name, cls.dark)
        cls.addClassCleanup(cls.browser.close)

    def setUp(self):
        self.browser.resize(1400)
        self.open()

    def open(self, fragment=""):
        """Opens the page anew. It must be silent, and ask nobody for anything."""
        self.browser.open_address("about:blank")
        self.browser.requests()
        self.browser.open_address(PAGE.as_uri() + fragment)
        self.wait("document.querySelector('#summary').childElementCount > 0")

    def tearDown(self):
        own = (PAGE.as_uri(), "blob:", "data:", "about:blank")
        self.assertEqual([url for url in self.browser.requests() if not url.startswith(own)], [])
        self.assertEqual(self.browser.console(), [])

    def wait(self, condition, seconds=10):
        end = time.monotonic() + seconds
        while not self.browser.run(f"return Boolean({condition})"):
            self.assertLess(time.monotonic(), end, f"still not: {condition}\n{self.text('body')[:2000]}")
            time.sleep(0.02)

    def text(self, selector):
        return self.browser.run("return document.querySelector(arguments[0]).innerText", selector)

    def texts(self, selector):
        return self.browser.run("return [...document.querySelectorAll(arguments[0])].map(found => found.textContent)",
                                selector)

    def ask(self, operation, **members):
        """What the core returns, or the text of its refusal under "refused"."""
        return self.browser.run("return edidComposer.ask(...arguments).catch(failure => ({ refused: failure.message }))",
                                operation, members)

    def read(self, name, content):
        """An EDID as the page reads it from a file."""
        answer = self.browser.run(
            "const bytes = Uint8Array.from(atob(arguments[1]), letter => letter.charCodeAt(0));"
            "return edidComposer.ask('read', { name: arguments[0] }, bytes).catch(failure => ({ refused: failure.message }))",
            name, base64.b64encode(content).decode())
        return answer if "refused" in answer else {"name": name, "text": answer["text"]}

    def drop(self, name, content):
        """Drops a file on the page, and waits for what is composed then."""
        self.changed("""
            const bytes = Uint8Array.from(atob(arguments[1]), letter => letter.charCodeAt(0));
            const data = new DataTransfer();
            data.items.add(new File([bytes], arguments[0]));
            dispatchEvent(new DragEvent("drop", { dataTransfer: data, bubbles: true }))""",
                     name, base64.b64encode(content).decode())

    def changed(self, script, *arguments):
        """Runs a script and returns the milliseconds until the page shows what comes of it."""
        return self.browser.run("const shown = new Promise(resolve => document.addEventListener('composed', resolve, "
                                "{ once: true })); const begin = performance.now();" + script +
                                "; return shown.then(() => performance.now() - begin)", *arguments)

    def type_platform(self, text):
        return self.changed("const field = document.querySelector('#platform-text'); field.value = arguments[0];"
                            "field.dispatchEvent(new Event('input', { bubbles: true }))", text)

    def platform(self):
        return self.browser.run("return document.querySelector('#platform-text').value")

    def look_for(self, wanted):
        self.browser.run("const field = document.querySelector('#want'); field.value = arguments[0];"
                         "document.querySelector('#answers').replaceChildren();"
                         "field.dispatchEvent(new Event('input', { bubbles: true }))", wanted)
        self.wait("document.querySelector('#answers').childElementCount > 0")


@functools.cache
def default_platform():
    return run_program("platform")


def main():
    if missing := browser.missing_programs():
        sys.exit(f"{' and '.join(missing)} not installed (Debian: chromium chromium-driver)")
    unittest.main(verbosity=2)

