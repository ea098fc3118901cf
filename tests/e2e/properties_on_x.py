#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Edits every property of a component of each class, of a form and of the application on a real X display: by mouse, and
in a second run of the designer by keys. Both save, and what was typed and chosen has to be in the files.

usage: tests/e2e/properties_on_x.py PROGRAM PROPERTY_PROGRAM LIBRARIES PICTURES

LIBRARIES is the folder of the component libraries that the designer loads. Pictures of the screen go to the folder
PICTURES. The exit code is 1 when something is not as it should be, and 77 where a tool is missing.
"""

import re
import sys
import time

from watched import Watched
from waits import wait_for
from xtest import check, run, step

WHOLE_LIMIT = 280

STRING, MODAL, _, PICK = range(4)  # types of editors, as numbers in what property_program prints
MENU = "mnuPickEdit"
ROW = 15  # the height of a row in the property window
# Code of a message that the property window prints.
SELECTED = "0x8"
# On the form, and in the property window: places without a component, and the first tab.
GROUND = (127, 5)
PROPERTIES_TAB = (20, 8)
TALL = (200, 590)
PROJECT_PLACE = (250, 560)
PATIENCE = 5  # seconds, before a text is typed again
DIALOGS = {"WindowFlags": "Window Flags", "Flags": "View Flags"}
# In the dialog of colours: from the middle of the control, into the second ramp.
RAMP_RIGHT, RAMP_DOWN = 60, -10


class Property:
    def __init__(self, words):
        self.name, kind, number, self.value = words[:4]
        self.type = int(kind)
        self.is_number = number == "number"
        self.choices = words[4:]
        self.dialog = DIALOGS.get(self.name, "Color") if self.type == MODAL else None

    def new_text(self, turn):
        """Another value, which leaves a component about where it is."""
        if self.name in ("Left", "Top"):
            return str(int(self.value) + turn)
        if self.name in ("Right", "Bottom"):
            return str(int(self.value) + 2 * turn)
        if self.name == "Name":
            return f"{self.value}_{turn}"
        return f"1{turn}" if self.is_number else f"Text {turn}|{self.name}"

    def next_choice(self):
        at = self.choices.index(self.value) + 1 if self.value in self.choices else 0
        return at % len(self.choices)


class Component:
    def __init__(self, name, class_name):
        self.name = name
        self.class_name = class_name
        self.properties = []

    def value(self, name):
        return next(one.value for one in self.properties if one.name == name)


class Designer(Watched):
    """One run of the designer with the project all.plim."""

    def __init__(self, desktop, program, components, turn):
        super().__init__(desktop, [program, "all.plim"], f"designer-{turn}")
        self.turn = turn
        self.application, self.form, *self.components = components
        self.input = desktop.input
        for title in ("Plimworks", "Components", "Project", self.form.value("Title")):
            desktop.wait_for_window(title)
        desktop.xdotool("windowmove", desktop.wait_for_window("Project"), *PROJECT_PLACE)
        self.window = desktop.wait_for_window("Properties")
        self.dialog_frames = {}
        self.form_title = self.form.value("Title")

    def activate(self, title):
        self.desktop.xdotool("windowactivate", self.desktop.wait_for_window(title))
        self.input.wait_for_active(title)

    def middle(self, view, kind="print-frame"):
        left, top, right, bottom = self.frame(view, kind)
        return (left + right) / 2, (top + bottom) / 2

    # What is shown

    def show(self, component):
        """Selects the component, and makes the property window the active one."""
        if component is self.application:
            self.look_at("Project")
            left, top, _, _ = self.frame("lvProject")
            self.activate("Project")
            self.input.click(left + 20, top + 5)
        else:
            left, top, _, _ = (int(self.form.value(edge)) for edge in ("Left", "Top", "Right", "Bottom"))
            self.activate(self.form_title)
            x, y = GROUND
            if component is not self.form:
                x = (int(component.value("Left")) + int(component.value("Right"))) / 2
                y = (int(component.value("Top")) + int(component.value("Bottom"))) / 2
            self.input.click(left + x, top + y)
        self.look_at("Properties")
        # A robot that expects something in vain ends the program, and nothing is left to look at.
        shown = f"efStringEdit: {component.value('Name')}"
        wait_for(f"{component.name} is shown",
                 lambda: self.ask("print-view efStringEdit", "efStringEdit: ") == shown)
        self.activate("Properties")

    def wait_for_menu(self, item):
        """Where the item of the open menu is."""
        place = self.middle(item, "print-item-frame")
        self.input.wait_until_shown(MENU)
        # The robot answers when the menu has handled what it was sent: an item may still have to be selected.
        self.ask("print-windows", "window: Properties")
        return place

    def wait_until_menu_closed(self):
        self.tell(f"wait-no-window {MENU}")
        self.ask("print-windows", "window: Properties")

    def wait_until_dialog_closed(self):
        self.input.wait_for_active("Properties")

    def place_in_dialog(self, title, view):
        """Dialogs open in the middle of the screen: always at the same place."""
        if (title, view) not in self.dialog_frames:
            self.look_at(title)
            self.dialog_frames[title, view] = self.middle(view)
            self.tell('wait-window "Properties"')
        return self.dialog_frames[title, view]

    def wait_for_messages(self, code, before, count=1):
        """Until the property window got so many of them, after so many lines of output."""
        wait_for(f"{count} messages {code}", lambda: sum(
            line.startswith(f"BMessage({code})") for line in self.lines()[before:]) >= count)

    def enter(self, type_it, name, text):
        """Types a text and Return, until the property has it.

        The window of a form that was moved tells of its new frame a little later. Then the values are shown anew, and
        what is being typed is lost, or the value of before is taken: it is typed again, as often as it takes."""
        before = len(self.lines())

        def is_set():
            type_it()
            return self.is_told(f"::SetPropertyValue('{name}', '{text}')", before)
        wait_for(f"{name} is {text}", is_set)

    def is_told(self, text, before):
        end = time.monotonic() + PATIENCE
        while not any(line.endswith(text) for line in self.lines()[before:]):
            if time.monotonic() > end:
                return False
            time.sleep(0.002)
        return True

    def told_value(self, name, before):
        """What the model was told that the property is now, after so many lines of output."""
        pattern = re.compile(rf".*::SetPropertyValue\('{name}', '(.*)'\)$")

        def found():
            matches = [pattern.match(line) for line in self.lines()[before:]]
            return next((match for match in matches if match), None)
        return wait_for(f"{name} is set", found).group(1)

    # Saving

    def times_of_files(self):
        return [(self.desktop.folder / name).stat().st_mtime_ns for name in ("all.plim", "all.frm")]

    def save_and_quit(self):
        self.stop_watching()
        before = self.times_of_files()
        self.activate("Plimworks")
        self.input.key("ctrl+s")
        wait_for("both files are written anew", lambda: not any(
            time in before for time in self.times_of_files()))
        self.activate("Plimworks")
        self.input.key("ctrl+q")
        wait_for("the designer ends", lambda: self.process.poll() is not None)
        check(self.process.returncode == 0, f"it ended with {self.process.returncode}: {self.lines()[-30:]}")
        for complaint in ("libbe:", "BE_CHECK_LOCKS:"):
            check(not any(complaint in line for line in self.lines()), f"the kits complained: {complaint}")


class Mouse:
    """Edits with the pointer, in a property window that shows all rows. Only texts are typed."""

    def __init__(self, designer):
        self.designer = designer
        self.input = designer.input

    def begin(self):
        d = self.designer
        d.desktop.xdotool("windowsize", "--sync", d.window, *TALL)
        d.activate("Properties")
        d.look_at("Properties")
        left, top, _, bottom = d.frame("lvProperties")
        self.row = left + 20, top + ROW / 2
        left, top, right, bottom = d.frame("tabView")
        # The panes of the editors, which are not shown at once, are at the window's foot.
        self.field = right - 20, bottom - 12

    def focus(self):
        """The first row is selected when a component is shown."""
        self.selected = 0

    def select(self, row):
        """What follows the pointer while it is pressed must be done with it before it is pressed again."""
        if row == self.selected:
            return
        before = len(self.designer.lines())
        self.input.click(self.row[0], self.row[1] + row * ROW)
        self.designer.wait_for_messages(SELECTED, before)
        self.selected = row

    def type(self, row, name, text):
        self.select(row)

        def type_it():
            self.input.click(*self.field)
            # A shortcut would be carried out after what is typed so soon.
            self.input.key("End", "shift+Home")
            self.input.type(text)
            self.input.key("Return")
        self.designer.enter(type_it, name, text)

    def pick(self, row, one, choice):
        self.select(row)
        self.input.click(*self.field)
        self.input.click(*self.designer.wait_for_menu(one.choices[choice]))
        self.designer.wait_until_menu_closed()

    def confirm(self, row, one):
        self.select(row)
        self.input.click(*self.field)
        self.input.wait_for_active(one.dialog)
        place = self.designer.place_in_dialog
        if one.dialog == "Color":
            x, y = place(one.dialog, "ccColors")
            is_middling = one.value.startswith("{1")
            self.input.click(x + (RAMP_RIGHT if is_middling else -RAMP_RIGHT), y + RAMP_DOWN)
        else:
            self.input.click(*place(one.dialog, "Frame events" if one.name == "Flags" else "Not closable"))
        self.input.click(*place(one.dialog, "btnOK"))


class Keys:
    """Edits with the keyboard alone, in a property window of the usual size."""

    def __init__(self, designer):
        self.designer = designer
        self.input = designer.input
        self.selected = 0

    def begin(self):
        """Goes from no view to the tabs, and on to the list."""
        self.designer.activate("Properties")
        self.input.key("Tab", "Tab")

    def focus(self):
        """The list keeps the keyboard focus when another component is shown."""
        self.input.key("Home")
        self.selected = 0

    def select(self, row):
        """Goes to the row and from there to its editor, which is another one as soon as the window knows of the row."""
        before = len(self.designer.lines())
        self.input.key(*["Down"] * (row - self.selected))
        self.designer.wait_for_messages(SELECTED, before, row - self.selected)
        self.input.key("Tab")
        self.selected = row

    def type(self, row, name, text):
        self.select(row)

        def type_it():
            self.input.type("unwanted")
            self.input.key("Escape")
            self.input.type(text)
            self.input.key("Return")
        self.designer.enter(type_it, name, text)
        self.input.key("shift+Tab")

    def pick(self, row, one, choice):
        self.select(row)
        self.input.key("space")
        self.designer.wait_for_menu(one.choices[choice])
        # It begins at the present choice.
        self.input.key("Home", *["Down"] * choice, "Return")
        self.designer.wait_until_menu_closed()
        self.input.key("shift+Tab")

    def confirm(self, row, one):
        self.select(row)
        self.input.key("space")
        self.input.wait_for_active(one.dialog)
        # The first press shows that Escape changes nothing.
        self.input.key("Tab", *(["Right"] * 3 if one.dialog == "Color" else ["space"]), "Escape")
        self.designer.wait_until_dialog_closed()
        self.input.key("space")
        self.input.wait_for_active(one.dialog)
        direction = "Left" if re.match(r"\{(1|2\d\d)", one.value) else "Right"
        self.input.key("Tab", *([direction] * 5 if one.dialog == "Color" else ["space"]), "Return")
        self.designer.wait_until_dialog_closed()
        self.input.key("shift+Tab")


def edit_all(designer, hand, component):
    designer.show(component)
    hand.focus()
    for row, one in enumerate(component.properties):
        if one.type == STRING:
            text = one.new_text(designer.turn)
            hand.type(row, one.name, text)
            one.value = text
        elif one.type == PICK:
            choice = one.next_choice()
            hand.pick(row, one, choice)
            one.value = one.choices[choice]
        else:
            before = len(designer.lines())
            hand.confirm(row, one)
            designer.wait_until_dialog_closed()
            value = designer.told_value(one.name, before)
            check(value != one.value, f"{component.name}'s {one.name} is {value} as before")
            one.value = value
        if one.name == "Title":
            designer.form_title = one.value


def inventory(output):
    components = []
    for line in output.splitlines():
        word, *words = line.split("\t")
        if word == "component":
            components.append(Component(*words))
        elif word == "property":
            components[-1].properties.append(Property(words))
    return components


class Files:
    """The project with a component of each class, and what property_program knows of it."""

    def __init__(self, desktop, program):
        self.desktop = desktop
        self.program = program

    def ask(self, *words):
        environment = dict(self.desktop.environment, BE_DISPLAY="none", BE_CHECK_LOCKS="0")
        result = self.desktop.run([self.program, *words], environment=environment)
        check(result.returncode == 0, f"property_program {words} failed: {result.stderr}")
        return result.stdout

    def values(self, document):
        return {tuple(line.split("\t")[:2]): line.split("\t")[2]
                for line in self.ask("print", self.desktop.folder / document).splitlines() if line.count("\t") == 2}

    def check_against(self, components):
        """The documents have what the components were given, and nothing else has changed."""
        found = {**self.values("all.plim"), **self.values("all.frm")}
        application, form, *others = components
        wrong = []
        for name, component in [("application", application), ("form", form), *((one.value("Name"), one) for one in others)]:
            for one in component.properties:
                value = found.get((name, one.name))
                if value != one.value:
                    wrong.append(f"{component.class_name}: {one.name} is {value}, not {one.value}")
        check(not wrong, "in the files:\n" + "\n".join(wrong))


def walk(desktop, program, components, turn, kind, pictures):
    designer = Designer(desktop, program, components, turn)
    hand = kind(designer)
    hand.begin()
    # The form moves, so it comes after its components.
    for component in [*designer.components, designer.application, designer.form]:
        edit_all(designer, hand, component)
        step(f"{component.class_name} by {kind.__name__.lower()}")
    desktop.picture().save(pictures / f"{kind.__name__.lower()}.png")
    designer.save_and_quit()


def edit(desktop, program, property_program, libraries, pictures):
    files = Files(desktop, property_program)
    components = inventory(files.ask("make", desktop.folder, libraries))
    check(len(components) > 2, "no library offers a class")
    for turn, kind in ((1, Mouse), (2, Keys)):
        walk(desktop, program, components, turn, kind, pictures)
        files.check_against(components)
        step(f"all that was edited by {kind.__name__.lower()} is in the files")


if __name__ == "__main__":
    sys.exit(run(edit, 4, WHOLE_LIMIT, __doc__))
