"""Pictures of the page, for whoever changes how it looks: light, dark, on a phone and on paper."""

import base64
import pathlib
import sys

import page

SCENES = {
    # Name: dark, width, height, whether as on paper.
    "light": (False, 1400, 900, False),
    "dark": (True, 1400, 900, False),
    "phone": (False, 390, 2400, False),
    "paper": (False, 794, 3369, True),
}


class Photographer(page.PageTest):
    def runTest(self):
        """Only there to borrow the page."""

    def take(self, folder, name, width, height, on_paper):
        self.browser.resize(width, height)
        self.open()
        self.drop("av_receiver.txt", (page.SOURCE / "examples/sinks/av_receiver.txt").read_bytes())
        self.drop("tv_4k.txt", (page.SOURCE / "examples/sinks/tv_4k.txt").read_bytes())
        text = page.default_platform().replace("week = 1\n", "week = 99\n")
        self.type_platform(text.replace("4k_x_2k_priority_list = [1, 2, 3, 4]", "4k_x_2k_priority_list = [4]"))
        self.browser.run("document.querySelector('#platform-text').scrollTop = 370")
        self.look_for("4k30")
        if on_paper:
            self.browser.run("dispatchEvent(new Event('beforeprint'))")
            (folder / f"{name}.pdf").write_bytes(self.browser.print_pages())
        (folder / f"{name}.png").write_bytes(self.browser.picture("print" if on_paper else "screen"))


def main():
    folder = pathlib.Path(sys.argv[1])
    folder.mkdir(parents=True, exist_ok=True)
    for name, (dark, width, height, on_paper) in SCENES.items():
        photographer = Photographer()
        Photographer.dark = dark
        try:
            Photographer.setUpClass()
            photographer.take(folder, name, width, height, on_paper)
        finally:
            Photographer.doClassCleanups()
    print(f"{', '.join(SCENES)} are in {folder}")


if __name__ == "__main__":
    main()
