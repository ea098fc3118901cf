#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Uses the hello program on a real X display as a person does: pointer, keys, clipboard and close button.

usage: tests/e2e/hello_on_x.py PROGRAM PICTURES

What the screen has to show comes from the program itself, which carries out hello.robot on the same display first.
PICTURES is a folder for those pictures, and for one of the screen when something is not as it should be. The exit code
is 1 then, and 77 where a tool is missing.
"""

import os
import sys
import time
from pathlib import Path

import picture
from waits import wait_for
from xtest import check, run, step

WHOLE_LIMIT = 110
IDLE_LIMIT = 0.25  # seconds of processor time in one second

MAIN = (120, 120, 361, 281)  # left and top on the screen, width and height, as in the form
NOTE = (520, 120, 261, 131)
PANEL = (216, 216, 216)
# Of the main form's content.
COUNT_TEXT = (128, 144, 348, 166)
GREETING_TEXT = (24, 96, 336, 118)
COUNT_BUTTON = (62, 158)
NOTE_BUTTON = (62, 198)
QUIT_BUTTON = (298, 250)
NAME_FIELD = (230, 50)
SHOUT_BOX = (32, 80)
# Of the note's: all but this depends on which control has the focus.
NOTE_PROMPT = (12, 12, 248, 32)


def run_robot(desktop, program, pictures):
    """The program as its robot uses it; returns the pictures by their names."""
    script = Path(__file__).resolve().parent / "hello.robot"
    robot = desktop.start([program], "robot", environment={"BE_ROBOT_SCRIPT": str(script), "PICTURES": str(pictures)})
    wait_for("the robot's program ends", lambda: robot.poll() is not None)
    output = desktop.output_of("robot").read_text()
    check(robot.returncode == 0, f"the robot's program ended with {robot.returncode}: {output}")
    check("GreetingText: HELLO, WORLD!" in output, f"the robot printed: {output}")
    return {path.stem: picture.load(path) for path in pictures.glob("*.png")}


class Session:
    """One run of the program under real input."""

    def __init__(self, desktop, program, expected):
        self.desktop = desktop
        self.expected = expected
        self.program = desktop.start([program], "hello")

    def wait_for_picture(self, name, rect, place=MAIN):
        """Waits until the screen shows this part of the robot's picture in the window at the place."""
        left, top = place[:2]
        on_screen = (left + rect[0], top + rect[1], left + rect[2], top + rect[3])
        wanted = self.expected[name].part(*rect)
        wait_for(f"the screen shows {rect} of {name}.png",
                 lambda: self.is_running() and self.desktop.picture().part(*on_screen) == wanted)

    def is_running(self):
        check(self.program.poll() is None, f"the program ended with {self.program.poll()}: {self.output()}")
        return True

    def output(self):
        return self.desktop.output_of("hello").read_text()

    def click(self, place):
        self.desktop.click(MAIN[0] + place[0], MAIN[1] + place[1])

    def open(self):
        window = self.desktop.wait_for_window("Hello")
        self.desktop.wait_until_active(window)
        self.wait_for_picture("start", (0, 0, MAIN[2] - 1, MAIN[3] - 1))
        step("the window is there, and shows at its place what the form says")
        check_place(self.desktop, window, MAIN)

    def count(self):
        self.click(COUNT_BUTTON)
        self.wait_for_picture("once", COUNT_TEXT)
        self.click(COUNT_BUTTON)
        self.wait_for_picture("twice", COUNT_TEXT)
        step("two clicks were counted")

    def greet(self):
        self.click(NAME_FIELD)
        self.desktop.type("World")
        self.wait_for_picture("named", GREETING_TEXT)
        self.click(SHOUT_BOX)
        self.wait_for_picture("shouted", GREETING_TEXT)
        step("the name was typed, and is shouted")

    def exchange_texts(self):
        check(self.desktop.clipboard() is None, "there is something on the clipboard of a new display")
        self.click(NAME_FIELD)
        self.desktop.key("ctrl+a")
        self.desktop.key("ctrl+c")
        wait_for("another program gets what was copied", lambda: self.desktop.clipboard() == "World")
        self.desktop.offer_on_clipboard("Moon")
        self.desktop.key("ctrl+a")
        self.desktop.key("ctrl+v")
        self.wait_for_picture("pasted", GREETING_TEXT)
        step("texts went to another program and came from one")

    def open_and_close_note(self):
        self.click(NOTE_BUTTON)
        window = self.desktop.wait_for_window("Note")
        self.desktop.wait_until_active(window)
        self.wait_for_picture("note", NOTE_PROMPT, NOTE)
        check_place(self.desktop, window, NOTE)
        self.desktop.key("alt+F4")
        self.desktop.wait_for_no_window("Note")
        self.is_running()
        # A search fails while windows go, so it may take more than one to find what is still there.
        self.desktop.wait_for_window("Hello")
        step("the note was opened, and closed by the window manager")

    def stay_idle(self):
        before = self.processor_time()
        start = time.monotonic()
        # The one time that is waited for: it is what is measured.
        time.sleep(1)
        used = (self.processor_time() - before) / (time.monotonic() - start)
        check(used < IDLE_LIMIT, f"the idle program used {used:.2f} s of processor time in a second")
        step(f"idle, the program used {used:.2f} s of processor time in a second")

    def processor_time(self):
        stat = Path(f"/proc/{self.program.pid}/stat").read_text()
        # The name of the program, in parentheses, may hold anything.
        fields = stat.rpartition(")")[2].split()
        return (int(fields[11]) + int(fields[12])) / os.sysconf("SC_CLK_TCK")

    def quit(self):
        self.click(QUIT_BUTTON)
        wait_for("the program ends", lambda: self.program.poll() is not None)
        check(self.program.returncode == 0, f"the program ended with {self.program.returncode}: {self.output()}")
        check("libbe:" not in self.output(), f"the kits complained: {self.output()}")
        step("the program quit")


def check_place(desktop, window, wanted):
    """The content of a window is where the form says, for the server and to the eye."""
    found = desktop.geometry(window)
    check(found == wanted, f"the window's content is at {found}, not at {wanted} (left, top, width, height)")

    left, top, right, bottom = wanted[0], wanted[1], wanted[0] + wanted[2] - 1, wanted[1] + wanted[3] - 1

    def outline(screen, by):
        across = range(left - by, right + by + 1)
        down = range(top - by, bottom + by + 1)
        yield {screen.pixel(x, top - by) for x in across}
        yield {screen.pixel(x, bottom + by) for x in across}
        yield {screen.pixel(left - by, y) for y in down}
        yield {screen.pixel(right + by, y) for y in down}

    def stands_out():
        screen = desktop.picture()
        return all(colors == {PANEL} for colors in outline(screen, 0)) \
            and all(PANEL not in colors for colors in outline(screen, 1))

    wait_for(f"the form fills {wanted} of the screen, and nothing around it", stands_out)


def use_hello(desktop, program, pictures):
    expected = run_robot(desktop, program, pictures)
    for rect, names in ((COUNT_TEXT, ("start", "once", "twice")),
                        (GREETING_TEXT, ("start", "named", "shouted", "pasted"))):
        parts = [expected[name].part(*rect) for name in names]
        check(all(one != other for i, one in enumerate(parts) for other in parts[:i]),
              f"of {names} two show the same in {rect}")
    step("the robot used the program, and left different pictures of its states")

    session = Session(desktop, program, expected)
    session.open()
    session.count()
    session.greet()
    session.exchange_texts()
    session.open_and_close_note()
    session.stay_idle()
    session.quit()


if __name__ == "__main__":
    sys.exit(run(use_hello, 2, WHOLE_LIMIT, __doc__))
