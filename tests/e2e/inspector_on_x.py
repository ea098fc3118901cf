#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Edits a form in the property window of the designer on a real X display: a text, a choice, flags, a colour, an event.

usage: tests/e2e/inspector_on_x.py PROGRAM EXAMPLE PICTURES

EXAMPLE is the folder of the hello example; a copy of it is opened. Pictures of the screen go to the folder PICTURES.
The exit code is 1 when something is not as it should be, and 77 where a tool is missing.
"""

import shutil
import sys

from plimworks_on_x import Session
from waits import wait_for
from xtest import check, run, step

WHOLE_LIMIT = 150

# In the property window.
FIRST_ROW = (20, 32)
PROPERTIES_TAB = (20, 8)
EVENTS_TAB = (110, 10)
# The form's rows.
VIEW_COLOR, TITLE, WINDOW_LOOK, WINDOW_FLAGS = 7, 12, 13, 15
# Codes of the messages that the property window prints.
INVOKED, EVENT_INVOKED = "0x9", "0xb"
MENU = "mnuPickEdit"
# In the dialogs: a box, a place on the colours' second ramp, and how far OK is from the right and bottom edges.
NOT_CLOSABLE = (20, 91)
MUCH_RED = (260, 46)
OK_FROM_CORNER = (45, 23)
# From the form's left edge: neither the property window nor the palette lies over it there.
UNCOVERED = 200


class Inspector:
    """The property window of a session."""

    def __init__(self, session):
        self.session = session
        self.desktop = session.desktop

    def activate(self):
        self.session.click_in("Properties", PROPERTIES_TAB)
        self.session.wait_for_active("Properties")

    def count(self, code):
        return self.session.output().count(f"BMessage({code})")

    def press_and_wait(self, code, keys):
        before = self.count(code)
        for key in keys:
            self.desktop.key(key)
        wait_for(f"message {code}", lambda: self.count(code) > before)

    def invoke(self, row):
        """Goes to a row by keys and presses Return there."""
        self.activate()
        self.session.click_in("Properties", FIRST_ROW)
        self.press_and_wait(INVOKED, ["Home", *["Down"] * row, "Return"])

    def wait_for_value(self, name, value):
        wait_for(f"{name} is set", lambda: f"::SetPropertyValue('{name}', '{value}" in self.session.output())

    def confirm(self, title):
        left, top, width, height = self.desktop.geometry(self.session.wait_for_window(title))
        self.desktop.click(left + width - OK_FROM_CORNER[0], top + height - OK_FROM_CORNER[1])
        self.desktop.wait_for_no_window(title)


def edit_form(desktop, program, example, pictures):
    shutil.copytree(example, desktop.folder / "hello")
    session = Session(desktop, program, pictures, "hello/hello.plim")
    inspector = Inspector(session)
    session.click_in("Hello", (5, 5))
    session.wait_for_active("Hello")
    session.save_picture("form")
    step("the form is shown")

    inspector.invoke(TITLE)
    desktop.key("ctrl+a")
    desktop.type("Renamed")
    desktop.key("Return")
    session.wait_for_window("Renamed")
    desktop.wait_for_no_window("Hello")
    session.save_picture("text")
    step("a text was typed")

    inspector.invoke(WINDOW_LOOK)
    desktop.key("space")
    desktop.input.wait_until_shown(MENU)
    session.save_picture("menu")
    for key in ("Home", "Down", "Down", "Return"):
        desktop.key(key)
    inspector.wait_for_value("WindowLook", "B_DOCUMENT_WINDOW_LOOK")
    session.save_picture("choice")
    step("a choice was picked")

    inspector.invoke(WINDOW_FLAGS)
    session.wait_for_active("Window Flags")
    session.click_in("Window Flags", NOT_CLOSABLE)
    session.save_picture("flags")
    inspector.confirm("Window Flags")
    inspector.wait_for_value("WindowFlags", "B_NOT_RESIZABLE|B_NOT_CLOSABLE|B_NOT_ZOOMABLE")
    step("a flag was ticked")

    left, top, _, height = desktop.geometry(session.wait_for_window("Renamed"))
    ground = (left + UNCOVERED, top + height - 5)
    before = desktop.picture().pixel(*ground)
    inspector.invoke(VIEW_COLOR)
    session.wait_for_active("Color")
    session.click_in("Color", MUCH_RED)
    session.save_picture("colour")
    inspector.confirm("Color")
    wait_for("the form has its colour", lambda: desktop.picture().pixel(*ground) != before)
    red, green, blue = desktop.picture().pixel(*ground)
    check(red > green and red > blue, f"the form's ground is {red}, {green}, {blue}, which is not red")
    session.save_picture("coloured")
    step("a colour was chosen")

    inspector.activate()
    session.click_in("Properties", EVENTS_TAB)
    inspector.press_and_wait(EVENT_INVOKED, ["Tab", "Home", "Return"])
    session.save_picture("event")
    session.command("ctrl+s")
    session.command("ctrl+g")
    session.wait_for_active("Generate Source files")
    desktop.key("Return")
    desktop.wait_for_no_window("Generate Source files")
    source = (desktop.folder / "MainForm.fcp").read_text() + (desktop.folder / "MainForm.h").read_text()
    for text in ("Renamed", "B_DOCUMENT_WINDOW_LOOK", "B_NOT_CLOSABLE", "virtual void AllAttached(void)"):
        check(text in source, f"{text} is not in the generated source")
    step("an event was ticked, and all of it is in the generated source")

    session.activate_main()
    desktop.key("alt+F4")
    session.wait_until_ended()


if __name__ == "__main__":
    sys.exit(run(edit_form, 3, WHOLE_LIMIT, __doc__))
