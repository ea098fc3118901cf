#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""What a window manager does with a generated program's form reaches the handlers of its events.

usage: tests/e2e/events_on_x.py EVENTS_PROGRAM EXCHANGE_PROGRAM FOLDER
"""

import sys

from exchange import Program
from waits import wait_for
from xtest import check, run, step

WHOLE_LIMIT = 110
# In the form when it is 545 pixels high, and what that is in the button.
PLACE, PLACE_IN_BUTTON = (70, 120), "60,51"


class Session:
    def __init__(self, desktop, program, exchange):
        self.desktop = desktop
        self.exchange = exchange
        self.events = Program(desktop, [program, "word"], "events")
        self.window = desktop.wait_for_window("Main")

    def told(self, *calls):
        self.events.expect_all(*(f"! {call}" for call in calls))

    def place(self):
        """Left and top, and the size as the API has it."""
        left, top, width, height = self.desktop.geometry(self.window)
        return f"{left},{top}", f"{width - 1} {height - 1}"

    def activate(self):
        self.told("Main.OnWindowActivated 1", "Events.OnAppActivated 1")
        other = Program(self.desktop, [self.exchange], "other")
        other.expect("ready")
        self.events.forget()
        other.ask("special Other 820 600 1 0 0", "opened Other")
        self.told("Main.OnWindowActivated 0", "Events.OnAppActivated 0")
        self.desktop.wait_until_active(self.desktop.wait_for_window("Other"))
        self.desktop.key("alt+F4")
        self.told("Main.OnWindowActivated 1", "Events.OnAppActivated 1")
        other.quit()
        step("the form and the application hear which window is active")

    def move_and_size(self):
        self.events.forget()
        self.desktop.xdotool("windowmove", "--sync", self.window, 140, 150)
        self.told(f"Main.OnFrameMoved {self.place()[0]}")
        self.desktop.xdotool("windowsize", "--sync", self.window, 710, 555)
        self.told("Main.OnFrameResized 709 554")
        self.events.forget()
        self.desktop.xdotool("windowsize", "--sync", self.window, 700, 545)
        # It follows both sides and the bottom.
        self.told("Main.OnFrameResized 699 544", "Main.StringView1.OnFrameResized 129 79")
        step("moves and sizes are told to the form and what follows it")

    def zoom(self):
        before = self.place()
        for _ in range(2):
            self.events.forget()
            self.desktop.key("alt+F10")
            self.events.expect("! Main.OnZoom ")
            zoomed = self.events.lines()[self.events.seen - 1]
            wanted = self.place()
            check(zoomed == f"! Main.OnZoom {wanted[0]} {wanted[1]}", f"\"{zoomed}\" was told, but it is {wanted}")
        check(self.place() == before, f"the frame is {self.place()}, not {before} again")
        step("the zoom button is told with the frame")

    def click(self):
        self.events.forget()
        left, top = self.desktop.geometry(self.window)[:2]
        self.desktop.click(left + PLACE[0], top + PLACE[1])
        self.told(f"Main.Button1.OnMouseDown {PLACE_IN_BUTTON}", "Main.Button1.OnClick",
                  f"Main.Button1.OnMouseUp {PLACE_IN_BUTTON}")
        step("a click is told with its place")

    def minimize(self):
        self.events.forget()
        self.desktop.key("alt+F9")
        self.told("Main.OnMinimize 1")
        self.desktop.xdotool("windowactivate", self.window)
        self.told("Main.OnMinimize 0")
        self.desktop.wait_until_active(self.window)
        step("minimizing is told, and the way back")

    def close(self):
        self.events.forget()
        self.desktop.key("alt+F4")
        self.told("Main.OnQuitRequested", "Main.OnQuit", "Main.FormDestroy")
        process = self.events.process
        wait_for("the program ends", lambda: process.poll() is not None)
        check(process.returncode == 0, f"the program ended with {process.returncode}")
        check(not any("libbe:" in line for line in self.events.lines()), "the kits complained")
        step("the close button ends the program")


def use_events(desktop, program, exchange, _):
    session = Session(desktop, program, exchange)
    session.activate()
    session.move_and_size()
    session.zoom()
    session.click()
    session.minimize()
    session.close()


if __name__ == "__main__":
    sys.exit(run(use_events, 3, WHOLE_LIMIT, __doc__, owns_folder=False))
