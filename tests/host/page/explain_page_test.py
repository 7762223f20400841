"""The page of "explain" in a real browser: what it shows, that nothing in it runs that shouldn't, and that it fits."""

import base64
import hashlib
import re
import sys
import tempfile
import unittest

import browser
import explaining
import sinks

SKIPPED = 77
PAGE_SOURCE = explaining.SOURCE / "host/cli/explain/page.html"


class PageTest(explaining.ExplainTest):
    dark = False
    scripts = True

    @classmethod
    def setUpClass(cls):
        folder = tempfile.TemporaryDirectory(prefix="edid_composer_browser.", ignore_cleanup_errors=True)
        cls.addClassCleanup(folder.cleanup)
        cls.browser = browser.Browser(folder.name, cls.dark, cls.scripts)
        cls.addClassCleanup(cls.browser.close)

    def setUp(self):
        super().setUp()
        self.browser.resize(1280)

    def open(self, *arguments):
        """Writes a page and opens it; it must be silent and ask nobody for anything."""
        status, printed, complaints = self.run_program("explain", "--html", "page.html", *arguments)
        self.assertEqual((status, printed), (0, ""), complaints)
        page = self.folder / "page.html"
        self.browser.requests()
        self.browser.open(page)
        # Nothing leaves the machine for a data: URL; the browser has some of its own.
        asked_for = [url for url in self.browser.requests() if not url.startswith("data:")]
        self.assertEqual([url for url in asked_for if url != page.as_uri()], [])
        self.assertEqual(self.browser.console(), [])

    def shown(self):
        """The names of the decisions that can be seen."""
        return self.browser.run("return [...document.querySelectorAll('#decided tr[data-v]')]"
                                ".filter(row => row.getClientRects().length).map(row => row.cells[1].textContent)")


class Filters(PageTest):
    def setUp(self):
        super().setUp()
        self.open("--sink", self.sample("tv_720p_50hz"))

    def test_everything_is_shown_at_first(self):
        names = [decision["name"] for decision in
                 self.explain_json("--sink", self.sample("tv_720p_50hz"))["decisions"]]
        self.assertEqual(self.shown(), names)

    def test_a_text_filters_names_reasons_and_sources(self):
        self.browser.press("#text", " VIC 16")
        self.assertEqual(self.shown(), ["1920x1080p60 16:9 (VIC 16)"])
        self.assertRegex(self.browser.run("return document.querySelector('#count').textContent"), r"^1 of \d+$")
        for text in ("neither the sink", "50_hz_priority_list[1]", "not in force"):
            self.browser.run("document.querySelector('#text').value = ''")
            self.browser.press("#text", text)
            self.assertGreater(len(self.shown()), 0, text)
            self.assertLess(len(self.shown()), 15, text)

    def test_sections_without_rows_are_hidden(self):
        self.browser.press("#text", "1920x1080")
        headings = self.browser.run("return [...document.querySelectorAll('#decided th[scope=rowgroup]')]"
                                    ".filter(cell => cell.getClientRects().length).map(cell => cell.textContent)")
        self.assertEqual(headings, ["Video modes"])

    def test_verdict_and_subject_filter_together(self):
        self.browser.press("#verdict", "left")
        self.browser.press("#section", "Video")
        document = self.explain_json("--sink", self.sample("tv_720p_50hz"))["decisions"]
        expected = [decision["name"] for decision in document
                    if decision["verdict"] == "left out" and decision["section"] == "video"]
        self.assertGreater(len(expected), 0)
        self.assertEqual(self.shown(), expected)

    def test_enter_in_the_text_does_not_leave_the_page(self):
        self.browser.press("#text", "vic 16" + browser.ENTER)
        self.assertEqual(len(self.shown()), 1)
        self.assertEqual(self.browser.requests(), [])


class Bytes(PageTest):
    def setUp(self):
        super().setUp()
        self.open("--sink", self.sample("tv_4k"))

    def now(self):
        return self.browser.run("return document.querySelector('#now').textContent")

    def test_all_256_are_there_and_are_those_of_the_edid(self):
        edid = self.composed("--sink", self.sample("tv_4k"))
        shown = self.browser.run("return [...document.querySelectorAll('.bytes a')].map(byte => byte.textContent)")
        self.assertEqual(bytes.fromhex("".join(shown)), edid)

    def test_each_has_a_name_and_leads_to_its_row(self):
        problems = self.browser.run("return [...document.querySelectorAll('.bytes a')].filter(byte => "
                                    "!/^0x[0-9A-F]{2} .+: .+/.test(byte.title) || "
                                    "!document.querySelector(byte.hash + ' .meaning').textContent).length")
        self.assertEqual(problems, 0)

    def test_a_click_tells_offset_value_block_field_and_meaning(self):
        self.browser.click(".bytes a[title^='0x84']")
        self.assertIn("0x84 (132) = 0x83 (131), Speaker allocation data block", self.now())
        self.browser.click(".bytes a[title^='0x89']")
        self.assertIn("0x89 (137) = 0x90 (144), Video data block", self.now())
        self.assertIn("1920x1080p60 16:9 (VIC 16), native", self.now())

    def test_arrow_keys_go_from_byte_to_byte(self):
        self.browser.run("document.querySelector('.bytes a').focus()")
        self.browser.press_here(browser.ARROW_RIGHT)
        self.assertIn("0x01 (1) =", self.now())
        self.browser.press_here(browser.ARROW_DOWN)
        self.assertIn("0x11 (17) =", self.now())

    def test_the_byte_that_has_the_focus_is_never_covered(self):
        for width, height in ((1280, 900), (360, 640)):
            self.browser.resize(width, height)
            covered = self.browser.run("""
                scrollTo(0, 0);
                return [...document.querySelectorAll('.bytes a')].filter(byte => {
                  byte.focus();
                  const box = byte.getBoundingClientRect();
                  return document.elementFromPoint(box.x + box.width / 2, box.y + box.height / 2) !== byte;
                }).map(byte => byte.title)""")
            self.assertEqual(covered, [], f"{width} x {height}")

    def test_one_byte_only_is_reached_by_the_tab_key(self):
        self.assertEqual(self.browser.run("return [...document.querySelectorAll('.bytes a')]"
                                          ".filter(byte => byte.tabIndex === 0).length"), 1)


class Fitting(PageTest):
    def overflow(self):
        return self.browser.run("return document.documentElement.scrollWidth - document.documentElement.clientWidth")

    def test_nothing_is_wider_than_a_phone(self):
        self.open("--sink", self.sample("tv_4k"))
        self.browser.run("document.querySelectorAll('details').forEach(part => part.open = true)")
        for width in (320, 360, 768, 1280):
            self.browser.resize(width)
            self.assertEqual(self.browser.run("return innerWidth"), width)
            self.assertLessEqual(self.overflow(), 0, f"at {width} pixels")

    def test_long_names_do_not_widen_it(self):
        self.open("--platform", self.write("x" * 200 + ".toml", explaining.DEFAULT_PLATFORM))
        self.browser.resize(360)
        self.assertLessEqual(self.overflow(), 0)

    def test_it_can_be_printed(self):
        self.open("--sink", self.sample("tv_4k"))
        pages = self.browser.print_pages()
        self.assertEqual(pages[:5], b"%PDF-")
        self.assertGreater(len(pages), 20000)


class Accessible(PageTest):
    def test_every_text_has_a_contrast_of_4_5(self):
        self.open("--sink", self.sample("tv_4k"))
        self.browser.run("document.querySelectorAll('details').forEach(part => part.open = true)")
        contrast, where = self.browser.run(browser.CONTRAST)
        self.assertGreaterEqual(contrast, 4.5, where)

    def test_it_begins_with_what_matters(self):
        self.open("--sink", self.sample("tv_4k"))
        facts = self.browser.run("return Object.fromEntries([...document.querySelectorAll('header dt')].map(name => "
                                 "[name.textContent, name.nextElementSibling.innerText]))")
        self.assertEqual(set(facts), {"Sink", "Best video", "Preferred video", "Audio", "Lost", "Most common reasons"})
        self.assertEqual(facts["Sink"], "All of the sink's EDID was read.")
        self.assertEqual(facts["Best video"], "3840x2160p30 (4k:1)")
        self.assertLessEqual(len(facts["Most common reasons"].splitlines()), 3)

    def test_it_has_a_language_a_title_and_headings_in_order(self):
        self.open("--sink", self.sample("tv_4k"))
        self.assertEqual(self.browser.run("return document.documentElement.lang"), "en")
        self.assertEqual(self.browser.run("return document.title"), "EDID of default platform for SAMPLE 4K TV")
        levels = self.browser.run("return [...document.querySelectorAll('h1, h2, h3')].map(h => Number(h.tagName[1]))")
        self.assertEqual(levels.count(1), 1)
        self.assertTrue(all(level - before <= 1 for before, level in zip(levels, levels[1:])), levels)

    def test_tables_have_headers_and_fields_have_labels(self):
        self.open()
        self.assertEqual(self.browser.run("return [...document.querySelectorAll('table')].filter(table => "
                                          "!table.querySelector('thead th[scope=col]') || "
                                          "table.querySelector('th:not([scope])')).length"), 0)
        self.assertEqual(self.browser.run("return [...document.querySelectorAll('input, select')]"
                                          ".filter(field => !field.labels.length).length"), 0)


class AccessibleInTheDark(Accessible):
    dark = True

    def test_it_is_dark(self):
        self.open()
        self.assertEqual(self.browser.run("return matchMedia('(prefers-color-scheme: dark)').matches"), True)
        self.assertLess(sum(self.browser.run("return getComputedStyle(document.body).backgroundColor.match(/\\d+/g)"
                                             ".map(Number)")), 150)


class WithoutScripts(PageTest):
    scripts = False

    def test_it_is_a_plain_table_without_filters(self):
        self.open("--sink", self.sample("tv_4k"))
        self.assertEqual(self.browser.run("return document.querySelector('form').hidden"), True)
        self.assertGreater(len(self.shown()), 30)

    def test_a_byte_leads_to_its_row(self):
        self.open("--sink", self.sample("tv_4k"))
        self.browser.click(".bytes a[title^='0x89']")
        self.assertEqual(self.browser.run("return document.querySelector(':target .field').textContent"),
                         "Video descriptor 1")


class Hostile(PageTest):
    """Sinks and files that would like to run something."""

    attacks = (b"<script>", b"<b onclick=1>", b'"><svg/onload', b"</title><i>", b"&lt;&amp;{{}}", b"{{keys}}", b"<!--",
               b"\xff\xfe<p>\x00", b"'onfocus='x")

    def elements(self):
        """How many elements of each kind the page has."""
        return self.browser.run("const counts = {}; for (const element of document.querySelectorAll('*')) "
                                "counts[element.tagName] = (counts[element.tagName] || 0) + 1; return counts")

    def test_names_of_sinks_are_texts_and_nothing_else(self):
        self.open("--sink", self.write("tv.bin", sinks.sink(vics=[16], name=b"plain")))
        plain = self.elements()
        for attack in self.attacks:
            texts = [(0xFF, attack), (0xFE, attack)]
            self.open("--sink", self.write("tv.bin", sinks.sink(vics=[16], name=attack, other_texts=texts)))
            found = self.elements()
            differs = {kind for kind in {*found, *plain} if found.get(kind) != plain.get(kind)}
            # Further texts are further rows of the comparison; an attack has elements of its own.
            self.assertLessEqual(differs, {"TR", "TD", "TH"}, attack)
        self.assertIn("<script>", self.page_of(b"<script>"))

    def page_of(self, name):
        self.open("--sink", self.write("tv.bin", sinks.sink(vics=[16], name=name)))
        return self.browser.run("return document.querySelector('.card').textContent")

    def test_names_of_files_and_texts_of_platforms_are_too(self):
        text = explaining.DEFAULT_PLATFORM.replace('"Media Box"', "'<script>1//'").replace('"YYY"', '"<b>"')
        text += '"<img src=x onerror=alert(1)>" = 1\n'
        platform = self.write("<img src=x onerror=document.body.remove()>.toml", text)
        sink = self.write("<script>document.body.remove();<\u2215script>.bin", sinks.sink(vics=[16], name=b"\n"))
        self.open("--platform", platform, "--sink", sink)
        self.assertEqual(self.browser.run("return document.images.length + document.scripts.length"), 1)
        self.assertEqual(self.browser.run("return document.title"), f"EDID of {platform.name} for {sink.name}")

    def test_scripts_other_than_its_own_do_not_run(self):
        self.open()
        self.browser.run("const script = document.createElement('script'); script.textContent = 'window.ran = 1';"
                         "document.body.append(script);"
                         "document.body.insertAdjacentHTML('beforeend', '<img src=x onerror=\"window.ran = 1\">')")
        self.assertIsNone(self.browser.run("return window.ran || null"))


class Source(unittest.TestCase):
    """What can be seen without a browser."""

    def test_the_policy_names_the_hash_of_the_script(self):
        page = PAGE_SOURCE.read_text()
        script = re.search(r"<script>(.*?)</script>", page, re.DOTALL)[1]
        digest = base64.b64encode(hashlib.sha256(script.encode()).digest()).decode()
        self.assertIn(f"script-src 'sha256-{digest}'", page, "put this hash into the page's policy")

    def test_it_needs_nothing_from_elsewhere(self):
        page = PAGE_SOURCE.read_text()
        self.assertIsNone(re.search(r"https?:|//[\w.]+/|url\(|@import|<link(?! rel=\"icon\" href=\"data:)", page))


if __name__ == "__main__":
    if missing := browser.missing_programs():
        print(f"skipped: {' and '.join(missing)} not installed (Debian: chromium chromium-driver)")
        sys.exit(SKIPPED)
    unittest.main()
