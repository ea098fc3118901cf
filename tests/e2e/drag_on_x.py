#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Drags with a real pointer: within a program, to another of the kits, from and to an X client that knows neither.

usage: tests/e2e/drag_on_x.py EXCHANGE_PROGRAM XDND_CLIENT FOLDER
"""

import sys
from urllib.parse import quote

from exchange import Program, check, main
from waits import wait_for

PLACES = {"One": (100, 100), "Two": (300, 100), "Other": (500, 100), "Files": (100, 320), "Picture": (300, 320)}
SOURCE = (700, 100)
TARGET = (700, 300)
NOWHERE = (600, 500)
DRAGGED = "drag text=dragged number=42"


class Session:
    def __init__(self, desktop, program, client):
        self.desktop = desktop
        self.client = client
        self.file = desktop.folder / "a file, 100% ü.txt"
        self.file.write_text("content")
        self.pointer = desktop.input
        self.one = Program(desktop, [program], "one")
        self.other = Program(desktop, [program], "other")
        for each, title, drags in ((self.one, "One", "rect"), (self.one, "Two", "nothing"),
                                   (self.other, "Other", "rect"), (self.one, "Picture", "bitmap")):
            self.open(each, title, drags)
        # One whose name can be a word of a command.
        self.plain = desktop.folder / "plain"
        self.plain.write_text("")
        self.open(self.one, "Files", "refs", self.plain)

    def open(self, program, title, drags, file=""):
        left, top = PLACES[title]
        program.ask(f"window {title} {left} {top} {drags} {file}", f"opened {title}")
        window = self.desktop.wait_for_window(title)
        # Of a program in the background the window manager leaves a new window inactive.
        self.desktop.click(left + 60, top + 60)
        program.expect(f"{title} released")
        self.desktop.wait_until_active(window)

    def drag(self, start, end, button_up=True):
        """Presses, goes there in steps and releases."""
        self.pointer.move(*start)
        self.pointer.press()
        self.pointer.go(start, end)
        if button_up:
            self.pointer.release()

    def drag_to(self, program, title, start, end):
        """Releases over another program when that has answered that it takes what is dragged: before, it is not given."""
        self.drag(start, end, button_up=False)
        program.expect_exactly(f"{title} entered {DRAGGED}")
        # A hand that rests moves a little all the same.
        self.pointer.go((end[0] - 4, end[1]), end, steps=4)
        # The answer is on its way when the one has drawn what came before it, and has come when the other has.
        self.let_draw(self.other, "Other")
        self.let_draw(self.one, "Two")
        self.let_draw(self.other, "Other")
        self.pointer.release()

    @staticmethod
    def let_draw(program, title):
        """What has come to the program by now is handled at the latest in the second round."""
        for _ in range(2):
            program.ask(f"sync {title}", f"synced {title}")

    def place(self, title, x, y):
        return PLACES[title][0] + x, PLACES[title][1] + y

    def within_a_window(self):
        self.drag(self.place("One", 40, 40), self.place("One", 100, 110))
        self.one.expect_exactly("One pressed")
        self.one.expect_exactly("One released")
        self.one.expect_exactly(f"One dropped {DRAGGED} at 100,110 offset 5,6")
        self.one.expect_exactly("One answered")

    def between_windows(self):
        self.drag(self.place("One", 40, 40), self.place("Two", 70, 80))
        self.one.expect_exactly("One pressed")
        self.one.expect_exactly(f"Two entered {DRAGGED}")
        self.one.expect_exactly(f"Two dropped {DRAGGED} at 70,80 offset 5,6")
        self.one.expect_exactly("One answered")
        self.drag(self.place("Picture", 40, 40), self.place("Two", 20, 30))
        self.one.expect_exactly(f"Two dropped {DRAGGED} at 20,30 offset 2,3")
        self.one.expect_exactly("Picture answered")

    def to_another_program(self):
        self.one.forget()
        self.drag_to(self.other, "Other", self.place("One", 40, 40), self.place("Other", 70, 80))
        self.other.expect_exactly(f"Other dropped {DRAGGED} at 70,80 offset 5,6")
        self.check_nothing_else()
        # And back.
        self.drag_to(self.one, "Two", self.place("Other", 40, 40), self.place("Two", 30, 20))
        self.one.expect_exactly(f"Two dropped {DRAGGED} at 30,20 offset 5,6")

    def over_another_program(self):
        self.drag(self.place("One", 40, 40), self.place("Other", 70, 80), button_up=False)
        self.other.expect_exactly(f"Other entered {DRAGGED}")
        self.pointer.go(self.place("Other", 70, 80), NOWHERE)
        self.other.expect_exactly("Other exited")
        self.pointer.release()
        self.check_nothing_else()

    def check_nothing_else(self):
        """Nothing more was dropped by the time that a click arrives, and that is a click as any other."""
        self.let_draw(self.one, "Two")
        since = self.one.seen
        self.desktop.click(*self.place("Two", 120, 120))
        self.one.expect_exactly("Two pressed")
        self.one.expect_exactly("Two released")
        check(not any("dropped" in line for line in self.one.lines()[since:]), "something was dropped")
        self.other.check_silent_about("dropped")

    def cancelled(self):
        for end, name in ((self.place("Two", 50, 50), "Two"), (self.place("Other", 50, 50), "Other")):
            self.drag(self.place("One", 40, 40), end, button_up=False)
            hovered = self.one if name == "Two" else self.other
            hovered.expect_exactly(f"{name} entered {DRAGGED}")
            self.desktop.key("Escape")
            hovered.expect_exactly(f"{name} exited")
            self.pointer.go(end, self.place("Two", 20, 20))
            self.pointer.release()
            self.check_nothing_else()

    def files_from_outside(self):
        encoded = "file://" + quote(str(self.file))
        offered = self.desktop.folder / "offered"
        offered.write_text(f"{encoded}\r\nhttp://example.org/elsewhere\r\nfile://{self.plain}\r\n")
        source = Program(self.desktop, [self.client, "source", *SOURCE, "text/uri-list", offered], "files source")
        source.expect("ready")
        self.drag((SOURCE[0] + 30, SOURCE[1] + 30), self.place("Two", 33, 44))
        source.expect("dragging")
        files = f"data ref={self.file} ref={self.plain}"
        self.one.expect_exactly(f"Two entered {files}")
        self.one.expect_exactly(f"Two dropped {files} at 33,44 offset 0,0")
        source.expect("finished")
        source.process.terminate()

    def text_from_outside(self):
        offered = self.desktop.folder / "offered"
        offered.write_text("Grüße", encoding="utf-8")
        source = Program(self.desktop, [self.client, "source", *SOURCE, "UTF8_STRING", offered], "text source")
        source.expect("ready")
        self.drag((SOURCE[0] + 30, SOURCE[1] + 30), self.place("Two", 33, 44))
        self.one.expect_exactly("Two dropped data text=Grüße at 33,44 offset 0,0")
        source.expect("finished")
        # Over no window nothing happens.
        self.drag((SOURCE[0] + 30, SOURCE[1] + 30), NOWHERE)
        source.expect("refused")
        self.one.check_silent_about("dropped")
        source.process.terminate()

    def nothing_known_from_outside(self):
        offered = self.desktop.folder / "offered"
        offered.write_text("?")
        source = Program(self.desktop, [self.client, "source", *SOURCE, "application/x-unknown", offered], "odd source")
        source.expect("ready")
        self.drag((SOURCE[0] + 30, SOURCE[1] + 30), self.place("Two", 33, 44))
        source.expect("refused")
        self.one.check_silent_about("dropped")
        source.process.terminate()

    def to_outside(self):
        for title, kind, content in (("One", "text/plain", b"dragged"),
                                     ("Files", "text/uri-list", f"file://{self.plain}\r\n".encode())):
            received = self.desktop.folder / "received"
            received.unlink(missing_ok=True)
            target = Program(self.desktop, [self.client, "target", *TARGET, kind, received], f"{title} target")
            target.expect("ready")
            self.drag(self.place(title, 40, 40), (TARGET[0] + 20, TARGET[1] + 20), button_up=False)
            target.expect("entered")
            target.expect("answered")
            self.pointer.release()
            target.expect("dropped")
            check(received.read_bytes() == content, f"as {kind} came {received.read_bytes()}")
            target.process.terminate()
            wait_for("the target is gone", lambda: target.process.poll() is not None)

    def source_that_ends(self):
        """A program that ends in the middle of its drag leaves no trace of it in another."""
        self.drag(self.place("One", 40, 40), self.place("Other", 70, 80), button_up=False)
        self.other.expect_exactly(f"Other entered {DRAGGED}")
        self.one.quit()
        self.pointer.release()
        self.desktop.click(*self.place("Other", 60, 60))
        self.other.expect("Other pressed")
        self.other.expect("Other released")
        self.other.quit()


def use_drags(desktop, program, client):
    session = Session(desktop, program, client)
    for part in (session.within_a_window, session.between_windows, session.to_another_program,
                 session.over_another_program, session.cancelled, session.files_from_outside,
                 session.text_from_outside, session.nothing_known_from_outside, session.to_outside,
                 session.source_that_ends):
        for each in (session.one, session.other):
            each.forget()
        part()
        print(part.__name__, "done", flush=True)


if __name__ == "__main__":
    sys.exit(main(use_drags))
