#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Windows of all kinds under a real window manager: order, focus, what blocks what, and what the manager may do.

usage: tests/e2e/windows_on_x.py EXCHANGE_PROGRAM XDND_CLIENT FOLDER
"""

import sys

from exchange import Program, check, main
from waits import wait_for

TITLED, MODAL_LOOK, FLOATING_LOOK = 1, 3, 7
NORMAL, MODAL_APP, FLOATING_APP = 0, 1, 4
NOT_RESIZABLE, NOT_CLOSABLE = 0x2, 0x20
SIZE = 150


class Session:
    def __init__(self, desktop, program):
        self.desktop = desktop
        self.input = desktop.input
        self.one = Program(desktop, [program], "one")
        self.two = Program(desktop, [program], "two")
        for each in (self.one, self.two):
            each.expect("ready")

    def open(self, title, left, top, look=TITLED, feel=NORMAL, flags=0, program=None):
        (program or self.one).ask(f"special {title} {left} {top} {look} {feel} {flags}", f"opened {title}")
        return self.desktop.wait_for_window(title)

    def click(self, x, y, answer, program=None):
        """A click that a window has to get before anything else is pressed. The window manager may still have to bring it
        to the front, or to its place."""
        program = program or self.one
        wait_for(f"{answer} is at {x}, {y}", lambda: any(
            self.input.is_at(window, x, y) for window in self.desktop.windows(answer)))
        since = program.seen
        self.desktop.click(x, y)
        program.expect(f"{answer} released")
        pressed = [line for line in program.lines()[since:program.seen] if line.endswith("pressed")]
        check(pressed == [f"{answer} pressed"], f"of a click on {answer} came {pressed}")

    def close(self, title):
        """By the window manager, as the active one."""
        self.desktop.key("alt+F4")
        self.one.expect_exactly(f"{title} closed")
        self.desktop.wait_for_no_window(title)

    def modal(self):
        self.open("Blocked", 100, 100)
        self.click(120, 120, "Blocked")
        window = self.open("Modal", 300, 100, MODAL_LOOK, MODAL_APP)
        self.desktop.wait_until_active(window)
        # A press on what it blocks brings the modal one back, and is lost.
        self.desktop.click(120, 120)
        self.desktop.wait_until_active(window)
        self.desktop.key("x")
        self.one.expect_exactly(f"Modal key {ord('x')}")
        self.click(320, 120, "Modal")
        self.close("Modal")
        self.click(120, 120, "Blocked")
        self.close("Blocked")

    def modal_above(self):
        """Covering what it blocks, it stays above it."""
        self.open("Blocked", 100, 100)
        self.click(110, 110, "Blocked")
        window = self.open("Modal", 140, 140, MODAL_LOOK, MODAL_APP)
        self.desktop.wait_until_active(window)
        self.desktop.click(110, 110)
        self.desktop.wait_until_active(window)
        self.click(160, 160, "Modal")
        self.close("Modal")
        self.click(200, 200, "Blocked")
        self.close("Blocked")

    def floating(self):
        self.open("Normal", 100, 100)
        self.click(110, 110, "Normal")
        self.open("Floating", 140, 140, FLOATING_LOOK, FLOATING_APP)
        self.click(110, 110, "Normal")
        self.click(200, 200, "Floating")
        # While another program is active it is not there.
        self.open("Elsewhere", 500, 100, program=self.two)
        self.click(520, 120, "Elsewhere", self.two)
        self.desktop.wait_for_no_window("Floating")
        self.click(110, 110, "Normal")
        self.desktop.wait_for_window("Floating")
        self.click(200, 200, "Floating")
        self.close("Floating")
        self.click(200, 200, "Normal")
        self.close("Normal")

    def flags(self):
        fixed = self.open("Fixed", 100, 100, flags=NOT_RESIZABLE | NOT_CLOSABLE)
        self.click(120, 120, "Fixed")
        self.desktop.wait_until_active(fixed)
        self.desktop.key("alt+F4")
        self.desktop.xdotool("windowsize", fixed, 300, 300)
        self.desktop.xdotool("windowmove", fixed, 200, 200)
        self.one.expect("Fixed moved")
        check(self.desktop.geometry(fixed)[2:] == (SIZE, SIZE), "a fixed window has another size")
        self.click(*(place + 20 for place in self.desktop.geometry(fixed)[:2]), "Fixed")
        check("Fixed closed" not in self.one.lines(), "a window was closed that may not be")

        free = self.open("Free", 500, 300)
        self.desktop.xdotool("windowsize", free, 300, 250)
        self.one.expect_exactly("Free resized 299,249")
        # The command is answered by one thread, the window's new size comes in another.
        self.one.tell("limits Free 199 219")
        self.one.expect_all("limited Free", "Free resized 219,219")
        self.desktop.xdotool("windowsize", free, 100, 210)
        self.one.expect_exactly("Free resized 199,209")

        self.desktop.xdotool("windowminimize", free)
        self.one.expect_exactly("Free minimized")
        self.desktop.xdotool("windowactivate", free)
        self.one.expect_exactly("Free restored")
        self.desktop.wait_until_active(free)
        self.close("Free")

    def early(self):
        """What a program asks for at once, before the manager knows the window, is what it gets, and what it is told."""
        with self.desktop.sleeping_manager():
            self.one.ask(f"special Early 300 300 {TITLED} {NORMAL} 0", "opened Early")
            self.one.ask("frame Early 520 340 400 300", "placed Early")
        early = self.desktop.wait_for_window("Early")
        wait_for("the window is where it was placed", lambda: self.desktop.geometry(early) == (520, 340, 400, 300))
        # A click comes after all that the host has said about the frame.
        self.click(540, 360, "Early")
        self.one.tell("where Early")
        self.one.expect_exactly("Early at 520,340 to 919,639")
        self.check_told_of_requests("Early")
        self.close("Early")

    def check_told_of_requests(self, title):
        told = [line for line in self.one.lines() if line.startswith((f"{title} moved", f"{title} resized"))]
        asked = ["moved 520,300", "moved 520,340", "resized 399,149", "resized 399,299"]
        check(told == [f"{title} {one}" for one in asked], f"of frames it was told {told}")

    def crossing(self):
        """What others do with a window meets on its way what its program asks for."""
        title = "Crossing"
        window = self.open(title, 300, 300)
        self.click(320, 320, title)
        with self.desktop.sleeping_manager():
            self.desktop.xdotool("windowmove", window, 100, 100)
            self.one.ask(f"frame {title} 520 340 400 300", f"placed {title}")
        wait_for("the window is where it was placed", lambda: self.desktop.geometry(window) == (520, 340, 400, 300))
        self.click(540, 360, title)
        self.check_told_of_requests(title)

        # It asks for a size only, so that the place is the others'.
        with self.desktop.sleeping_manager():
            self.one.tell(f"limits {title} 249 249")
            self.one.expect_all(f"limited {title}", f"{title} resized 249,249")
            self.desktop.xdotool("windowmove", window, 200, 200)
        self.one.expect_exactly(f"{title} moved 200,200")
        wait_for("the window has the size", lambda: self.desktop.geometry(window) == (200, 200, 250, 250))
        self.click(420, 420, title)
        self.one.tell(f"where {title}")
        self.one.expect_exactly(f"{title} at 200,200 to 449,449")
        self.close(title)

    def behind(self):
        for place, title in enumerate(("Low", "Middle", "High")):
            self.open(title, 500 + 20 * place, 500 + 20 * place)
            self.click(600 + 20 * place, 600 + 20 * place, title)
        self.one.ask("behind High Low", "sent High")
        self.click(600, 600, "Middle")
        self.one.ask("behind Middle High", "sent Middle")
        self.click(600, 600, "Low")
        self.one.quit()
        wait_for("all its windows are gone", lambda: not self.desktop.windows("Low"))
        self.two.quit()


def use_windows(desktop, program, _):
    session = Session(desktop, program)
    for part in (session.modal, session.modal_above, session.floating, session.flags, session.early,
                 session.crossing, session.behind):
        part()
        print(part.__name__, "done", flush=True)


if __name__ == "__main__":
    sys.exit(main(use_windows))
