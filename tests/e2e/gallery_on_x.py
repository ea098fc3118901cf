#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Uses the gallery on a real X display as a person does: menus, alerts, file panels, lists and controls.

usage: tests/e2e/gallery_on_x.py GALLERY XDND_CLIENT FOLDER

All input is the X server's. The gallery's robot only looks: it tells where things are on the screen, and what the line at
the window's foot says came of their use.
"""

import sys
import time
from pathlib import Path

import picture
from exchange import Program, check, main
from watched import Watched
from waits import wait_for

STATUS = "svStatus"
# Beside the gallery's window.
SOURCE = (900, 100)


class Gallery(Watched):
    def __init__(self, desktop, program):
        super().__init__(desktop, [program], "gallery")

    def expect_status(self, text):
        self.expect_text(STATUS, text)

    def click(self, view, right=None, down=None):
        """In the view's middle, or so far from its left and upper side."""
        left, top, end, bottom = self.frame(view)
        self.desktop.click(int(left + right if right is not None else (left + end) / 2),
                           int(top + down if down is not None else (top + bottom) / 2))

    def click_item(self, label):
        left, top, right, bottom = self.frame(label, "print-item-frame")
        self.desktop.click(int((left + right) / 2), int((top + bottom) / 2))

    def keys(self, *keys):
        for key in keys:
            self.desktop.key(key)

    def close(self):
        """By its shortcut, after the robot has left."""
        self.stop_watching()
        self.keys("ctrl+q")
        wait_for("the gallery ends", lambda: self.process.poll() is not None)
        check(self.process.returncode == 0, f"the gallery ended with {self.process.returncode}")
        check(not any("libbe:" in line for line in self.lines()), f"the kits complained: {self.lines()}")


class Session:
    def __init__(self, desktop, program, client):
        self.desktop = desktop
        self.client = client
        self.folder = desktop.folder / "files"
        (self.folder / "inner").mkdir(parents=True)
        for name in ("apple.txt", "banana.txt", "inner/cherry.txt"):
            (self.folder / name).write_text(name)
        self.gallery = Gallery(desktop, program)
        self.gallery.look_at("Gallery")
        desktop.wait_until_active(desktop.wait_for_window("Gallery"))

    def buttons(self):
        g = self.gallery
        g.click("btnPlain")
        g.expect_status("Used: btnPlain, value 1")
        g.click("cbOff")
        g.expect_status("Used: cbOff, value 1")
        g.keys("Tab", "Tab", "space")
        g.expect_status("Used: btnPlain, value 1")

    def menus_by_click(self):
        g = self.gallery
        g.click_item("Page")
        g.click_item("Menus")
        g.expect_no_window("Page")
        g.look_at("Gallery")
        g.frame("mfFitted")
        # A submenu, two levels deep.
        g.click_item("Sample")
        g.click_item("One of several")
        g.click_item("Third")
        g.expect_no_window("One of several")
        g.expect_no_window("Sample")
        g.expect_status("Used: a menu, item 2")
        # A press elsewhere closes a menu and chooses nothing.
        g.click_item("Sample")
        g.look_at("Sample")
        self.desktop.click(640, 480)
        g.expect_no_window("Sample")
        g.look_at("Gallery")
        g.expect_status("Used: a menu, item 2")

    def menus_by_keys(self):
        g = self.gallery
        g.keys("ctrl+Escape")
        g.keys("Right", "Right", "Right", "Right", "Down")
        g.look_at("Sample")
        g.keys("Return")
        g.expect_no_window("Sample")
        g.look_at("Gallery")
        g.expect_status("Used: a menu, item 0")
        # Into a submenu and out of it again.
        g.keys("ctrl+Escape")
        g.keys("Right", "Right", "Right", "Right", "Down")
        g.look_at("Sample")
        g.keys("End", "Right")
        g.look_at("One of several")
        g.keys("Left")
        g.expect_no_window("One of several")
        g.keys("Right")
        g.look_at("One of several")
        # The keys begin at the present choice.
        g.keys("Home", "Down", "Return")
        g.expect_no_window("Sample")
        g.look_at("Gallery")
        g.expect_status("Used: a menu, item 1")

    def pop_up_menu(self):
        g = self.gallery
        g.click("mfFitted", 150)
        g.click_item("Large")
        g.expect_no_window("size")
        g.look_at("Gallery")
        g.expect_status("Used: a menu, item 2")
        g.click("mfFitted", 150)
        g.look_at("size")
        g.keys("End", "Return")
        g.expect_no_window("size")
        g.look_at("Gallery")
        g.expect_status("Used: a menu, item 3")

    def alerts(self):
        g = self.gallery
        g.keys("ctrl+9")
        g.click("btnWarning")
        g.look_at("Alert")
        self.desktop.wait_until_active(self.desktop.wait_for_window("Alert"))
        # Meanwhile the window behind it takes neither presses nor keys.
        g.look_at("Gallery")
        g.click("btnInfo")
        g.look_at("Alert")
        g.keys("Return")
        g.expect_no_window("Alert")
        g.look_at("Gallery")
        g.expect_status("The alert was answered with button 3")
        self.desktop.wait_until_active(self.desktop.wait_for_window("Gallery"))
        g.click("btnWarning")
        g.look_at("Alert")
        g.click("Second")
        g.expect_no_window("Alert")
        g.look_at("Gallery")
        g.expect_status("The alert was answered with button 2")

    def open_panel(self):
        g = self.gallery
        g.keys("ctrl+o")
        g.look_at("gallery: Open")
        self.desktop.wait_until_active(self.desktop.wait_for_window("gallery: Open"))
        # A path that is typed, then a folder below it, and up again.
        g.click("PoseView", down=200)
        self.desktop.type(f"{self.folder}/")
        g.keys("Return")
        g.expect_text("status", "3 items")
        self.desktop.type("inn")
        g.keys("Return")
        g.expect_text("status", "1 item")
        g.expect_text("path", f"{self.folder}/inner")
        g.keys("BackSpace")
        g.expect_text("path", str(self.folder))
        self.desktop.type("ban")
        g.click("default button")
        g.expect_no_window("gallery: Open")
        g.look_at("Gallery")
        g.expect_status("Chosen: banana.txt")

    def save_panel(self):
        g = self.gallery
        g.keys("ctrl+s")
        g.look_at("gallery: Save")
        self.desktop.wait_until_active(self.desktop.wait_for_window("gallery: Save"))
        # A program that was started at home begins where a file was chosen last.
        g.expect_text("path", str(self.folder))
        g.keys("ctrl+a")
        self.desktop.type("apple.txt")
        g.expect_text("text view", "apple.txt")
        g.keys("Return")
        # The file is there: kept at first, replaced the second time.
        g.look_at("File panel")
        g.click("Cancel")
        g.expect_no_window("File panel")
        g.look_at("gallery: Save")
        g.click("default button")
        g.look_at("File panel")
        g.click("Replace")
        g.expect_no_window("gallery: Save")
        g.look_at("Gallery")
        g.expect_status("To be saved as: apple.txt")

    def lists(self):
        g = self.gallery
        g.keys("ctrl+7")
        g.click("lvPlain", 30, 8)
        g.expect_status("Used: lvPlain, item 0")
        self.desktop.type("ju")
        g.expect_status("Used: lvPlain, item 4")
        g.keys("Down")
        g.expect_status("Used: lvPlain, item 5")

    def sliders_and_colours(self):
        g = self.gallery
        g.keys("ctrl+3")
        g.click("slBlock")
        g.expect_status("Used: slBlock, value 50")
        g.keys("Tab", "Tab", "End")
        g.expect_status("Used: slBlock, value 100")
        g.keys("ctrl+5")
        g.click("ccWide", 4, 4)
        self.wait_until_told("ccWide")
        g.click("_blue", 60)
        g.keys("ctrl+a")
        self.desktop.type("77")
        g.keys("Return")
        g.expect_text("_blue", "77")

    def wait_until_told(self, name):
        """Whatever value it has."""
        def found():
            return self.gallery.ask(f"print-view {STATUS}", f"{STATUS}: ").startswith(f"{STATUS}: Used: {name}, value")
        wait_for(f"{name} was used", found)

    def tabs(self):
        g = self.gallery
        g.keys("ctrl+1")
        g.frame("btnPlain")
        # The second tab, then the first one again.
        g.click("pages", 100, 10)
        g.frame("efName")
        g.click("pages", 30, 10)
        g.frame("btnPlain")

    def texts(self):
        g = self.gallery
        g.keys("ctrl+2")
        g.click("efName", 150)
        g.keys("ctrl+a")
        self.desktop.type("Hello, ")
        self.desktop.offer_on_clipboard("Moon")
        g.keys("ctrl+v")
        g.expect_text("efName", "Hello, Moon")
        g.keys("ctrl+a", "ctrl+c")
        wait_for("another program gets what was copied", lambda: self.desktop.clipboard() == "Hello, Moon")
        g.keys("BackSpace", "ctrl+z", "Return")
        g.expect_text("efName", "Hello, Moon")
        g.expect_status("Used: efName, value 0")

    def selecting_beyond_the_edge(self):
        """The text comes into sight while the pointer rests below it, and the selection with it."""
        g = self.gallery
        g.keys("ctrl+7")
        left, top, _, bottom = (int(place) for place in g.frame("tvScrolled"))
        # From behind the first letter.
        pointer = self.desktop.input
        pointer.move(left + 9, top + 8)
        pointer.press()
        pointer.move(left + 9, bottom - 5)
        pointer.move(left + 9, bottom + 40)

        def copied_to_the_end():
            g.keys("ctrl+c")
            text = self.desktop.clipboard() or ""
            return text.startswith("ine 1 ") and "Line 20 of" in text
        wait_for("the text is selected to its last line", copied_to_the_end)
        pointer.release()

    def dropped_file(self):
        g = self.gallery
        g.keys("ctrl+9")
        left, top, right, bottom = g.frame("drop")
        offered = self.desktop.folder / "offered"
        offered.write_text(f"file://{self.folder}/apple.txt\r\nfile://{self.folder}/banana.txt\r\n")
        source = Program(self.desktop, [self.client, "source", *SOURCE, "text/uri-list", offered], "source")
        source.expect("ready")
        start, end = (SOURCE[0] + 30, SOURCE[1] + 30), (int(left + right) // 2, int(top + bottom) // 2)
        self.desktop.input.drag(start, end)
        source.expect("finished")
        g.expect_status("Dropped: apple.txt banana.txt")
        source.process.terminate()

    def server_reads_the_picture(self):
        """From the gallery's own memory, and so what is on the screen is what the gallery has drawn."""
        g = self.gallery
        maps = Path(f"/proc/{self.desktop.server.pid}/maps")
        wait_for("the server has the memory of the window", lambda: "memfd:window" in maps.read_text())
        drawn = self.desktop.folder / "gallery.png"
        left, top = self.desktop.input.place_of(int(self.desktop.wait_for_window("Gallery")))

        def is_shown():
            g.tell(f"save-png {drawn}")
            g.ask("print-windows", "window: Gallery")
            own = picture.load(drawn)
            return self.desktop.picture().part(left, top, left + own.width - 1, top + own.height - 1) == own
        g.keys("ctrl+1")
        g.click("cbOff")
        # Its shape is part of the screen.
        self.desktop.input.move(*SOURCE)
        wait_for("the screen shows what was drawn", is_shown)


def use_gallery(desktop, program, client):
    started = time.monotonic()
    session = Session(desktop, program, client)
    for part in (session.buttons, session.menus_by_click, session.menus_by_keys, session.pop_up_menu, session.alerts,
                 session.open_panel, session.save_panel, session.lists, session.sliders_and_colours, session.tabs,
                 session.texts, session.selecting_beyond_the_edge, session.dropped_file, session.server_reads_the_picture):
        part()
        print(f"{time.monotonic() - started:6.2f} s  {part.__name__} done", flush=True)
    session.gallery.close()


if __name__ == "__main__":
    sys.exit(main(use_gallery))
