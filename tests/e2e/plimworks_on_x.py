#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Uses the designer on a real X display as a person does: menus, shortcuts, boxes, panels and close buttons.

usage: tests/e2e/plimworks_on_x.py PROGRAM EXAMPLE PICTURES

EXAMPLE is the folder of the hello example; a copy of it is opened. Pictures of the screen go to the folder PICTURES.
The exit code is 1 when something is not as it should be, and 77 where a tool is missing.
"""

import shutil
import sys

from waits import wait_for
from xtest import check, run, step

WHOLE_LIMIT = 220

MAIN = (20, 40, 301, 41)  # left and top on the screen, width and height
# In the main window: the title of the menu, then, with that open, its items.
FILE_MENU = (18, 10)
NEW_PROJECT = (50, 32)
QUIT = (32, 145)
HELP_MENU = (83, 10)
ABOUT = (110, 57)
BACKGROUND = (250, 30)
PANEL = (216, 216, 216)
QUESTION = "The 'Application' project has changed. Save before closing?"
DIALOG = "Generate Source files"
# In the dialog.
GENERATE = (40, 275)
CANCEL = (120, 275)
# Of an alert with three buttons: how far their middles are from its right and bottom edge.
NO_FROM_RIGHT = 143
BUTTONS_FROM_BOTTOM = 30
GENERATED = ("Hello.h", "Hello.cpp", "MainForm.h", "MainForm.cpp", "MainForm.fcp", "NoteForm.h", "NoteForm.cpp",
             "NoteForm.fcp")


class Session:
    """One run of the designer."""

    runs = 0

    def __init__(self, desktop, program, pictures, *arguments):
        Session.runs += 1
        self.desktop = desktop
        self.pictures = pictures
        self.name = f"plimworks-{Session.runs}"
        self.program = desktop.start([program, *arguments], self.name)
        for title in ("Plimworks", "Properties", "Project", "Components"):
            self.wait_for_window(title)

    def output(self):
        return self.desktop.output_of(self.name).read_text(errors="replace")

    def check_running(self):
        code = self.program.poll()
        check(code is None, f"the designer ended with {code}: {self.output()[-3000:]}")
        return True

    def wait_for_window(self, title):
        return wait_for(f"a window \"{title}\"", lambda: self.check_running() and self.desktop.windows(title))[0]

    def wait_for_active(self, title):
        window = self.wait_for_window(title)
        self.desktop.wait_until_active(window)
        return window

    def save_picture(self, name):
        self.desktop.picture().save(self.pictures / f"{name}.png")

    def click_in(self, title, place):
        left, top, _, _ = self.desktop.geometry(self.wait_for_window(title))
        self.desktop.click(left + place[0], top + place[1])

    def activate_main(self):
        """A window that is not active takes the first press for that."""
        self.click_in("Plimworks", BACKGROUND)
        self.wait_for_active("Plimworks")

    def command(self, key):
        self.activate_main()
        self.desktop.key(key)

    def choose(self, menu, item, picture=None):
        """Opens a menu by a press and a release, and clicks the item."""
        self.activate_main()
        before = self.desktop.picture()
        self.click_in("Plimworks", menu)
        place = (MAIN[0] + item[0], MAIN[1] + item[1])
        around = (place[0] - 10, place[1] - 5, place[0] + 10, place[1] + 5)
        wait_for("the menu is open", lambda: self.desktop.picture().part(*around) != before.part(*around))
        if picture is not None:
            self.save_picture(picture)
        self.desktop.click(*place)

    def answer_no(self, title):
        window = self.wait_for_active(title)
        left, top, width, height = self.desktop.geometry(window)
        self.desktop.click(left + width - NO_FROM_RIGHT, top + height - BUTTONS_FROM_BOTTOM)
        self.desktop.wait_for_no_window(title)

    def cancel(self, title):
        """Return presses the last button."""
        self.wait_for_active(title)
        self.desktop.key("Return")
        self.desktop.wait_for_no_window(title)

    def wait_until_ended(self):
        wait_for("the designer ends", lambda: self.program.poll() is not None)
        check(self.program.returncode == 0, f"it ended with {self.program.returncode}: {self.output()[-3000:]}")
        for complaint in ("libbe:", "BE_CHECK_LOCKS:"):
            check(complaint not in self.output(), f"the kits complained: {self.output()[-3000:]}")


def shown_in_row(desktop, y, left, right):
    screen = desktop.picture()
    return {screen.pixel(x, y) for x in range(left, right)}


def begin_a_project(desktop, program, pictures):
    session = Session(desktop, program, pictures)
    main = session.wait_for_active("Plimworks")
    found = desktop.geometry(main)
    check(found == MAIN, f"the main window is at {found}, not at {MAIN} (left, top, width, height)")
    session.wait_for_window("Form")
    session.save_picture("start")
    step("the windows are there")

    session.choose(HELP_MENU, ABOUT)
    session.wait_for_active("Plim App")
    session.save_picture("about")
    desktop.key("Return")
    desktop.wait_for_no_window("Plim App")
    step("it told about itself")

    session.choose(FILE_MENU, NEW_PROJECT, "menu")
    session.wait_for_active(QUESTION)
    session.save_picture("question")
    session.cancel(QUESTION)
    session.choose(FILE_MENU, NEW_PROJECT)
    session.answer_no(QUESTION)
    session.wait_for_window("Form")
    step("a new project was begun, after a question that was cancelled first")

    session.command("ctrl+o")
    session.wait_for_active("Open Project")
    session.save_picture("open-panel")
    desktop.key("Escape")
    desktop.wait_for_no_window("Open Project")
    step("opening was thought better of")

    session.command("ctrl+shift+s")
    session.wait_for_active("Save Project")
    session.save_picture("save-panel")
    desktop.key("Return")
    desktop.wait_for_no_window("Save Project")
    # The form has no file yet, and the user is told.
    session.wait_for_active("Information")
    session.save_picture("form-without-file")
    desktop.key("Return")
    desktop.wait_for_no_window("Information")
    wait_for("the project is saved", (desktop.folder / "Project1.plim").exists)
    step("the project was saved where the panel said")

    session.choose(FILE_MENU, QUIT)
    session.cancel(QUESTION)
    session.check_running()
    session.wait_for_window("Project")
    session.choose(FILE_MENU, QUIT)
    session.answer_no(QUESTION)
    session.wait_until_ended()
    check((desktop.folder / ".config" / "Plim_Settings").exists(), "the frames of the windows were not stored")
    step("it quit, after a question that was cancelled first")


def open_and_generate(desktop, program, pictures, example):
    work = desktop.folder / "hello"
    shutil.copytree(example, work)
    for name in GENERATED:
        (work / name).unlink()
    session = Session(desktop, program, pictures, "hello/hello.plim", "hello/missing.plim")
    session.wait_for_window("Hello")
    session.wait_for_window("Note")
    session.save_picture("project")
    step("the project on the command line is open")

    session.command("ctrl+g")
    session.wait_for_active(DIALOG)
    session.save_picture("generate")
    session.click_in(DIALOG, CANCEL)
    desktop.wait_for_no_window(DIALOG)
    check(not list(desktop.folder.glob("*.fcp")), "cancelling generated something")
    session.command("ctrl+g")
    session.wait_for_active(DIALOG)
    session.click_in(DIALOG, GENERATE)
    desktop.wait_for_no_window(DIALOG)
    # The project's folder for sources is the one that the designer was started in.
    for name in GENERATED:
        check((desktop.folder / name).exists(), f"{name} was not generated")
    step("the sources were generated, after a dialog that was cancelled first")

    session.command("ctrl+s")
    desktop.wait_until_active(session.wait_for_window("Plimworks"))
    session.activate_main()
    desktop.key("alt+F4")
    session.wait_until_ended()
    step("its close button quit it, without a question")


def tell_of_a_bad_project(desktop, program, pictures):
    bad = desktop.folder / "bad.plim"
    bad.write_text("no project")
    # What a program that was killed may leave.
    settings = desktop.folder / ".config" / "Plim_Settings"
    settings.write_bytes(b"\xff" * 1000)
    session = Session(desktop, program, pictures, bad)
    warning = session.wait_for_active("Warning")
    left, top, width, _ = desktop.geometry(warning)
    # Below the title nothing is drawn: whatever lies above the box would show, as the floating palette must not.
    strip = (left + 60, left + width - 5)
    wait_for("nothing covers the box", lambda: shown_in_row(desktop, top + 3, *strip) == {PANEL})
    session.save_picture("bad-project")
    desktop.key("Return")
    desktop.wait_for_no_window("Warning")
    found = desktop.geometry(session.wait_for_window("Plimworks"))
    check(found == MAIN, f"with settings of rubbish the main window is at {found}, not at {MAIN}")
    session.activate_main()
    desktop.key("alt+F4")
    session.wait_until_ended()
    step("a file that is no project was told, and settings of rubbish did no harm")


def use_designer(desktop, program, example, pictures):
    begin_a_project(desktop, program, pictures)
    open_and_generate(desktop, program, pictures, example)
    tell_of_a_bad_project(desktop, program, pictures)


if __name__ == "__main__":
    sys.exit(run(use_designer, 3, WHOLE_LIMIT, __doc__))
