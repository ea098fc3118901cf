#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Designs forms on a real X display: places, moves and resizes with the mouse, and works with two designers at once.

usage: tests/e2e/design_on_x.py PROGRAM PICTURES

Pictures of the screen go to the folder PICTURES. The exit code is 1 when something is not as it should be, and 77
where a tool is missing.
"""

import sys

from plimworks_on_x import Session
from waits import wait_for
from xdesktop import AWAY
from xtest import check, run, step

WHOLE_LIMIT = 220

MARKS = (0, 200, 200)  # of what is selected
BUTTON_ON_PALETTE = (50, 12)
CHOSEN = "BMessage('PalE')"
FIRST_PLACE, SECOND_PLACE = (30, 440), (640, 440)
# Items of a component's menu: how far below and right of where it opens.
COPY = (40, 70)
BARE = (200, 250)


class Form:
    """The form of a designer's new project, away from the other windows."""

    def __init__(self, session, place, others=()):
        self.session = session
        self.desktop = session.desktop
        self.window = wait_for("the form", lambda: [
            window for window in self.desktop.windows("Form") if window not in others])[0]
        wanted = (*place, 301, 301)

        def stands_there():
            self.desktop.xdotool("windowmove", self.window, *place)
            return self.desktop.geometry(self.window) == wanted

        wait_for(f"the form is at {wanted}", stands_there)
        self.place = place

    def at(self, point):
        return self.place[0] + point[0], self.place[1] + point[1]

    def click(self, point):
        self.desktop.click(*self.at(point))

    def drag(self, start, end, to=None):
        """From a point of this form to one of this form, or of the form to."""
        start, end = self.at(start), (to or self).at(end)
        self.desktop.input.drag(start, end)
        # The pointer is in the pictures, too.
        self.desktop.input.move(*AWAY)

    def is_marked(self, *points):
        screen = self.desktop.picture()
        return all(screen.pixel(*self.at(point)) == MARKS for point in points)

    def expect_selected(self, left, top, right, bottom):
        """A component with that frame is selected: its border and its handle are there."""
        points = [(left, top), (right, top), (left, bottom), (right, bottom), (right - 5, bottom - 5)]
        wait_for(f"a selected component at {(left, top, right, bottom)}", lambda: self.is_marked(*points))

    def expect_told(self, text, times=1):
        wait_for(f"{times} times \"{text}\"", lambda: self.session.check_running()
                 and self.session.output().count(text) >= times)

    def palettes_if_one(self):
        palettes = self.desktop.windows("Components")
        return palettes if len(palettes) == 1 else None

    def place_button(self, left, top, right, bottom):
        # The palette of another designer goes when this one becomes active.
        self.click(BARE)
        self.desktop.wait_until_active(self.window)
        palette, = wait_for("one palette", lambda: self.palettes_if_one())
        chosen = self.session.output().count(CHOSEN)
        self.session.click_in("Components", BUTTON_ON_PALETTE)
        self.desktop.wait_until_active(palette)
        # What is drawn before the palette has handled the click places nothing.
        self.expect_told(CHOSEN, chosen + 1)
        self.drag((left, top), (right, bottom))
        self.expect_selected(left, top, right, bottom)


def place_and_change(form):
    form.place_button(20, 30, 120, 60)
    form.expect_told("Adding Component 'Button1'(TButton)")
    form.session.save_picture("placed")
    form.drag((60, 45), (110, 145))
    form.expect_selected(70, 130, 170, 160)
    form.drag((167, 157), (220, 200))
    form.expect_selected(70, 130, 220, 200)
    form.session.save_picture("resized")
    step("a button was placed, moved and resized")

    form.session.activate_main()
    wait_for("nothing is selected", lambda: not form.is_marked((70, 130)))
    form.drag((100, 150), (80, 80))
    form.expect_selected(50, 60, 200, 130)
    step("it was dragged out of a window that was not active")


def use_two_designers(first, second):
    desktop = first.desktop
    second.place_button(20, 30, 120, 60)
    second.expect_told("Adding Component 'Button1'(TButton)")

    move = "vwDesign got DTM_COMPONENT_MOVE"
    before = first.session.output().count(move)
    second.drag((60, 45), (100, 200), to=first)
    first.expect_told(move, before + 1)
    first.session.check_running()
    second.click((60, 45))
    second.expect_selected(20, 30, 120, 60)
    desktop.wait_until_active(second.window)
    step("a component that was dropped on another designer stayed where it was")

    inside = second.at((90, 55))
    face = desktop.picture().pixel(*inside)
    desktop.input.click(*second.at((60, 45)), button=3)
    second.expect_told("TDesignFormView Got DTM_COMPONENT_CONTEXTMENU message")
    wait_for("the menu is open", lambda: desktop.picture().pixel(*inside) != face)
    second.session.save_picture("menu")
    desktop.click(*second.at((60 + COPY[0], 45 + COPY[1])))
    wait_for("the record is on the clipboard", lambda: "application/x-plim-component" in desktop.run(
        ["xclip", "-out", "-selection", "clipboard", "-target", "TARGETS"]).stdout)

    # The palette comes back with the designer, and must not take the focus from the form.
    first.click(BARE)
    desktop.wait_until_active(first.window)
    first.expect_told("1 Components")
    desktop.input.move(*first.at((40, 200)))
    desktop.key("ctrl+v")
    first.expect_told("SetPropertyValue('Name', 'Button11')")
    first.click((60, 210))
    first.expect_selected(40, 200, 140, 230)
    first.session.save_picture("pasted")
    step("a copy of it was pasted in the other designer")


def design(desktop, program, pictures):
    first = Form(Session(desktop, program, pictures), FIRST_PLACE)
    place_and_change(first)
    # The second designer's form opens in front.
    second = Form(Session(desktop, program, pictures), SECOND_PLACE, (first.window,))
    use_two_designers(first, second)
    for session in (first.session, second.session):
        for complaint in ("libbe:", "BE_CHECK_LOCKS:"):
            check(complaint not in session.output(), f"the kits complained: {session.output()[-3000:]}")


if __name__ == "__main__":
    sys.exit(run(design, 2, WHOLE_LIMIT, __doc__))
