"""Files and links that would like to freeze the page, break it, or run something in it."""

import base64
import json
import random
import re
import zlib

import page
import sinks  # Those that the page of "explain" is tested with.

ATTACKS = (b"<script>", b"<b onclick=1>", b'"><svg/onload', b"</title><i>", b"&lt;&amp;{{}}", b"{{style}}", b"<!--",
           b"\xff\xfe<p>\x00", b"'onfocus='x")
MARKUP = "<img src=x onerror=\"window.ran=1\"><script>window.ran=1</script>"
# Seconds that the page may stand still, on a machine that does a lot besides. What the worker takes does not count.
LONGEST_STALL = 4

# Begins to measure how long the page does not come to anything else.
WATCH = """
    window.longest = 0;
    let last = performance.now();
    clearInterval(window.watch);
    window.watch = setInterval(() => {
      const now = performance.now();
      window.longest = Math.max(window.longest, now - last);
      last = now;
    }, 10);"""


# Of the WebAssembly format: a section of memories, and their limits in pages.
MEMORY_SECTION, HAS_MAXIMUM, WEBASSEMBLY_PAGE = 5, 1, 65536


def number_at(content, place):
    """A number in LEB128, and the place after it."""
    value = shift = 0
    while True:
        byte = content[place]
        value |= (byte & 0x7F) << shift
        place, shift = place + 1, shift + 7
        if byte < 0x80:
            return value, place


class Hostile(page.PageTest):
    def setUp(self):
        super().setUp()
        self.browser.run(WATCH)

    def lives(self, what):
        """The page has not stalled, runs nothing strange, and still composes."""
        self.assertLess(self.browser.run("return window.longest") / 1000, LONGEST_STALL, what)
        self.assertIsNone(self.browser.run("return window.ran || null"))
        self.browser.run("window.longest = 0")

    def test_seeds_of_the_fuzzers_as_displays(self):
        number = 0
        for seed in sorted((page.SOURCE / "fuzz/seeds").rglob("*")):
            if seed.is_file():
                sink = self.read(seed.name, seed.read_bytes())
                answer = self.ask("compose", sink=sink) if "refused" not in sink else sink
                self.assertTrue("refused" in answer or answer["explanation"] or answer["problems"], seed)
                self.assertNotIn("could not be computed", str(answer.get("refused")), seed)
                number += 1
        self.assertGreater(number, 50)
        self.lives("seeds")

    def test_displays_of_any_size_and_content(self):
        chance = random.Random(16)
        head = bytes.fromhex("00ffffffffffff00")
        contents = {
            "random": head + chance.randbytes(256 * 128 - 8),
            "zeros": bytes(256 * 128),
            "ones": b"\xff" * 256 * 128,
            "one mode, again and again": sinks.sink(vics=[16] * 31, name=b"x" * 13) + b"\x02\x03\x7f\x40" * 32 * 254,
            "text": b"00 " * 300_000,
            "a megabyte": chance.randbytes(1024 * 1024),
        }
        for name, content in contents.items():
            self.drop(name, content)
            for tab in ("decisions", "bytes", "differences", "displays", "report", "messages"):
                self.browser.run(f"document.querySelector('#tab-{tab}').click()")
            self.changed("edidComposer.state.traces = true; document.querySelector('#sinks input').dispatchEvent(new Event('change'))")
            self.lives(name)

    def test_platforms_of_any_size_and_content(self):
        table = "[platform.software.drivers.vorex.edid]\n"
        megabyte = 1024 * 1024
        texts = {
            "brackets": "[" * megabyte,
            "nested": "a = " + "[" * 5000 + "]" * 5000,
            "dotted": "a" + ".a" * 5000 + " = 1",
            "keys that nobody reads": table + "".join(f"k{number} = 1\n" for number in range(80_000)),
            "a list": table + "60_hz_priority_list = [" + "'99', " * 1000 + "]",
            "lists of a thousand": table + "".join(f"l{number} = [{'1,' * 1000}]\n" for number in range(400)),
            "one line": table + "monitor_name = '" + "x" * (megabyte - 100) + "'",
            "only line breaks": "\n" * (megabyte - 1),
            "too much": "#" * (megabyte + 1),
            "control characters": table + "monitor_name = \"\\u0007\\u001b[2J\\u202e\"",
        }
        for name, text in texts.items():
            answer = self.ask("compose", platform={"name": "hostile.toml", "text": text})
            said = answer.get("refused") or answer["problems"] or answer["findings"]
            self.assertTrue(said, name)
            self.assertNotIn("could not be computed", str(said), name)
            if len(text) > 256 * 1024 or text.count("\n") >= 5000:
                self.browser.run("const data = new DataTransfer(); data.items.add(new File([arguments[0]], 'big.toml'));"
                                 "document.querySelector('#told').textContent = '';"
                                 "dispatchEvent(new DragEvent('drop', { dataTransfer: data }))", text)
                self.wait("document.querySelector('#told').textContent.startsWith('big.toml')")
            else:
                self.type_platform(text)
                self.browser.run("document.querySelector('#platform-text').scrollTop = 1e6")
                self.look_for("1080p60")
            print(f"{name}: the page stood for {self.browser.run('return window.longest') / 1000:.2f} s")
            self.lives(name)
        self.type_platform(page.default_platform())
        self.assertEqual(self.text("#title"), "EDID of platform.toml for no sink")

    def test_a_worker_that_does_not_return_is_stopped_and_the_page_goes_on(self):
        said = self.browser.run("""
            const { postMessage, terminate } = Worker.prototype;
            window.stopped = 0;
            Worker.prototype.terminate = function () { ++window.stopped; terminate.call(this); };
            Worker.prototype.postMessage = () => {};
            const answer = edidComposer.ask("about").catch(failure => failure.message);
            return answer.finally(() => { Worker.prototype.postMessage = postMessage; })""")
        self.assertEqual(said, "This took longer than 5 s and was stopped.")
        self.assertEqual(self.browser.run("return window.stopped"), 1)
        self.drop("tv.bin", sinks.sink(vics=[16], name=b"after it"))
        self.assertEqual(self.text("#title"), "EDID of default platform for after it")
        self.lives("a silent worker")

    def test_a_request_that_makes_no_sense_ends_in_an_error(self):
        for operation, members in (("compose", {"sink": 1}), ("compose", {"sink": {"name": 1}}), ("nonsense", {}),
                                   ("want", {}), ("apply", {"want": "1080p60", "answer": 99, "way": 99}),
                                   ("compare", {"left": None, "right": {}}), ("compose", {"settings": {"port": [1]}})):
            self.assertIn("refused", self.ask(operation, **members), (operation, members))
        half_a_character = "{ platform: { name: 'x', text: 'a = 1 # ' + String.fromCharCode(0xD800) } }"
        self.assertEqual(self.browser.run(f"return edidComposer.ask('compose', {half_a_character}).catch(() => 'refused')"),
                         "refused")
        self.lives("nonsense")

    def elements(self):
        return self.browser.run("const counts = {}; for (const found of document.querySelectorAll('*')) "
                                "counts[found.tagName] = (counts[found.tagName] || 0) + 1; return counts")

    def all_tabs(self):
        for tab in ("bytes", "differences", "displays", "report", "keys", "messages", "decisions"):
            self.browser.run(f"document.querySelector('#tab-{tab}').click()")
            # That of all displays composes for each.
            self.wait(f"document.querySelector('#{tab}').childElementCount > 0")

    def test_names_of_displays_are_texts_and_nothing_else(self):
        for attack in ATTACKS:
            plain, found = [], []
            for name, counts in ((b"plain", plain), (attack, found)):
                self.open()
                self.drop("tv.bin", sinks.sink(vics=[16], name=name, other_texts=[(0xFF, name), (0xFE, name)]))
                self.all_tabs()
                counts.append(self.elements())
            differs = {kind for kind in {*plain[0], *found[0]} if plain[0].get(kind) != found[0].get(kind)}
            self.assertLessEqual(differs, {"TR", "TD", "TH"}, attack)
            self.browser.run("window.longest = 0")

    def test_names_of_files_and_texts_of_platforms_are_too(self):
        scripts = self.browser.run("return document.scripts.length")
        self.drop(MARKUP.replace("/", "\u2215") + ".bin", sinks.sink(vics=[16], name=b"\n"))
        text = page.default_platform().replace('"Media Box"', "'<script>1//'") + '"<img src=x onerror=alert(1)>" = 1\n'
        self.drop("<img src=x onerror=alert(1)>.toml", text.encode())
        self.wait("document.querySelector('#findings').childElementCount > 0")
        self.look_for(MARKUP)
        self.all_tabs()
        self.assertEqual(self.browser.run("return document.images.length + document.scripts.length"), scripts)
        self.assertIn("<img src=x onerror=alert(1)>.toml", self.text("#title"))
        self.lives("names")

    def test_links_are_texts_too(self):
        state = {"sinks": [{"name": MARKUP, "text": MARKUP}, {"name": 1}, None, "x"], "active": 0, "want": MARKUP,
                 "platform": {"name": MARKUP, "text": MARKUP}, "settings": {"port": MARKUP, "__proto__": {"x": 1}, "y": {}}}
        packed = zlib.compressobj(wbits=-15)
        content = packed.compress(json.dumps(state).encode()) + packed.flush()
        self.browser.open_address("about:blank")
        self.browser.open_address(page.PAGE.as_uri() + "#z" + base64.urlsafe_b64encode(content).decode())
        self.wait("document.querySelector('#problems').childElementCount > 2")
        self.assertIsNone(self.browser.run("return window.ran || null"))
        self.assertEqual(self.browser.run("return document.images.length"), 0)
        self.assertEqual(self.browser.run("return edidComposer.state.sinks.length"), 1)

    def test_a_link_that_unpacks_without_end_is_refused(self):
        packed = zlib.compressobj(9, wbits=-15)
        content = packed.compress(bytes(200 * 1024 * 1024)) + packed.flush()
        self.open("#z" + base64.urlsafe_b64encode(content).decode())
        self.assertEqual(self.text("#told"), "The link cannot be read: it is too large.")

    def test_nothing_but_its_own_script_runs_and_nothing_can_be_asked_for(self):
        self.browser.run("""
            const script = document.createElement("script");
            try { script.textContent = "window.ran = 1"; } catch {}
            document.body.append(script);
            try { document.body.insertAdjacentHTML("beforeend", "<img src=x onerror='window.ran = 1'>"); } catch {}
            setTimeout(() => (0, eval)("window.ran = 1"));""")
        for request in ("fetch('https://localhost:1/')", "new Promise((done, fail) => { const image = new Image(); "
                        "image.onload = done; image.onerror = fail; image.src = 'https://localhost:1/x.png'; })",
                        "new Promise((done, fail) => { const socket = new WebSocket('wss://localhost:1/'); "
                        "socket.onopen = done; socket.onerror = fail; })"):
            self.assertEqual(self.browser.run(f"return Promise.resolve().then(() => {request}).then(() => 'done', () => 'refused')"),
                             "refused")
        self.assertIsNone(self.browser.run("return window.ran || null"))
        self.browser.requests()  # The driver lists also those that were refused.
        self.assertTrue(all("Content Security Policy" in line or "TrustedHTML" in line or "TrustedScript" in line
                            or "violates" in line for line in self.browser.console()))


class Source(page.unittest.TestCase):
    """What can be seen without a browser."""

    def test_no_part_of_the_page_takes_markup(self):
        for file in (page.SOURCE / "web/page").rglob("*.js"):
            for way in ("innerHTML", "outerHTML", "insertAdjacentHTML", "document.write", "DOMParser", "eval(", "Function("):
                self.assertNotIn(way, file.read_text(), file)

    def test_the_core_has_256_mib_at_most(self):
        core = base64.b64decode(re.search(r'id="core">([^<]+)<', page.PAGE.read_text())[1])
        place = 8  # After the magic number and the version.
        while core[place] != MEMORY_SECTION:
            size, begin = number_at(core, place + 1)
            place = begin + size
        _, content = number_at(core, place + 1)
        count, flags_place = number_at(core, content)
        flags, limits = number_at(core, flags_place)
        _, most_place = number_at(core, limits)
        most, _ = number_at(core, most_place)
        self.assertEqual((count, flags, most * WEBASSEMBLY_PAGE), (1, HAS_MAXIMUM, 256 * 1024 * 1024))

    def test_it_is_one_file_of_about_a_megabyte_that_names_no_other(self):
        content = page.PAGE.read_text()
        self.assertLess(len(content), 1_250_000)
        head = content[:content.index("<style>")]
        self.assertNotIn("http://", head)
        self.assertNotRegex(content, r"<link(?! rel=\"icon\" href=\"data:,\")|<script[^>]* src|@import|url\(")


if __name__ == "__main__":
    page.main()
