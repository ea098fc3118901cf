#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Designs the hello example with the mouse, from an empty desktop to the generated sources, on a real X display.

usage: tests/e2e/hello_from_nothing_on_x.py PLIMWORKS PLIMGEN EXAMPLE PICTURES

The keyboard is used for texts and for names of files alone. The sources must be those that EXAMPLE, the folder of the
hello example, generates, byte for byte. Pictures of the road go to the folder PICTURES; scripts/designer-pictures makes
them for the documentation. The exit code is 1 when something is not as it should be, and 77 where a tool is missing.
"""

import difflib
import sys

from design_on_x import Form
from plimworks_on_x import FILE_MENU, GENERATED, QUESTION, Session
from waits import wait_for
from xdesktop import AWAY
from xtest import check, run, step

WHOLE_LIMIT = 220

# In any window: where its title bar is taken hold of, and its corner, from the content's left top and right bottom.
TITLE_BAR = (60, -10)
CORNER = (0, 3)
# Left and top of the windows' content, as they are arranged for the work.
PALETTE, PROJECT, INSPECTOR = (900, 40), (20, 460), (560, 310)
INSPECTOR_SIZE = (241, 401)
MAIN_FORM, NOTE_FORM = (120, 120, 480, 400), (520, 120, 780, 250)
# In a menu: the middle of its first item, and how far apart items are, and what a separator takes.
FIRST_ITEM, ITEM, SEPARATOR = 12, 19, 6
# On the palette: the middle of its first button, and how far apart they are.
FIRST_BUTTON, BUTTON = (50, 12), 27
ENTRIES = ("Button", "CheckBox", "TextControl", "StringView", "Box")
# In the property window: the tabs, the middle of each page's first row, how far apart rows are, and the menu of choices.
PROPERTIES_TAB, EVENTS_TAB = (20, 8), (110, 10)
FIRST_ROW, FIRST_EVENT, ROW = (40, 32), (40, 49), 15
CHOICES = (150, INSPECTOR_SIZE[1] - 18)
FONT_SIZES = tuple(str(size) for size in range(6, 25))
VISUAL = ("Name", "Visible", "Left", "Top", "Right", "Bottom", "Flags", "ViewColor", "HighColor", "LowColor", "Font",
          "FontSize")
ROWS = {
    "Application": ("Name", "ClassName", "Signature", "LaunchFlags", "GenerationPath"),
    "Form": VISUAL + ("Title", "WindowLook", "WindowFeel", "WindowFlags"),
    "Button": VISUAL + ("Enabled", "Label"),
    "CheckBox": VISUAL + ("Enabled", "Label"),
    "TextControl": VISUAL + ("Enabled", "Label", "ResizingMode", "Text", "Divider"),
    "StringView": VISUAL + ("Text",),
    "Box": VISUAL + ("Label",),
}
# Codes of the messages that the property window prints.
PROPERTY_SELECTED, PROPERTY_INVOKED, EVENT_INVOKED = "0x8", "0x9", "0xb"
# Every component's events begin with those that all have.
OWN_EVENT = 13
FIRST_PROJECT_ROW = (40, 10)
# In the flags' dialog.
NOT_RESIZABLE, NOT_ZOOMABLE, OK_FROM_CORNER = (20, 72), (20, 108), (45, 23)
SAVE_FROM_CORNER = (55, 30)
GENERATE = (40, 275)
FORMS = ("NoteForm.frm", "MainForm.frm")
FORM_PANEL, PROJECT_PANEL, DIALOG = "plimworks: Save", "Save Project", "Generate Source files"


class Designer(Session):
    """One run of the designer, used with the mouse."""

    def __init__(self, *arguments):
        super().__init__(*arguments)
        self.input = self.desktop.input
        self.pictures_so_far = 0
        self.places = {}
        self.seen = 0

    def shoot(self, name):
        self.pictures_so_far += 1
        self.save_picture(f"{self.pictures_so_far:02}-{name}")

    # What the designer tells on standard output

    def listen(self):
        """What is told from now on is waited for by expect_told()."""
        self.seen = self.desktop.output_of(self.name).stat().st_size

    def expect_told(self, *texts):
        def told():
            self.check_running()
            with open(self.desktop.output_of(self.name), "rb") as file:
                file.seek(self.seen)
                output = file.read().decode(errors="replace")
            return all(text in output for text in texts)

        wait_for(f"{texts} on standard output", told)

    # Windows

    def drag_frame(self, window, grip, distance):
        """Holds the pointer until the window manager has followed it, and keeps it there until that lets go of it."""
        before = self.desktop.geometry(window)
        end = (grip[0] + distance[0], grip[1] + distance[1])
        self.input.move(*grip)
        self.input.press()

        def follows():
            # It may have begun to hold the pointer after the first move.
            self.input.move(end[0] - 1, end[1])
            self.input.move(*end)
            return self.desktop.geometry(window) != before
        wait_for("the window follows the pointer", follows)
        self.input.release()
        self.input.wait_until_let_go()
        self.input.move(*AWAY)

    def move_window(self, window, place):
        """By its title bar."""
        left, top, _, _ = self.desktop.geometry(window)
        distance = (place[0] - left, place[1] - top)
        self.drag_frame(window, (left + TITLE_BAR[0], top + TITLE_BAR[1]), distance)
        wait_for(f"it is at {place}", lambda: self.desktop.geometry(window)[:2] == place)

    def resize_window(self, window, size):
        """By its right bottom corner."""
        left, top, width, height = self.desktop.geometry(window)
        distance = (size[0] - width, size[1] - height)
        self.drag_frame(window, (left + width + CORNER[0], top + height + CORNER[1]), distance)
        wait_for(f"it has the size {size}", lambda: self.desktop.geometry(window)[2:] == size)

    def arrange(self, title, place, size=None):
        window = self.wait_for_window(title)
        self.move_window(window, place)
        if size is not None:
            self.resize_window(window, size)

    def click_from_corner(self, title, distance):
        left, top, width, height = self.desktop.geometry(self.wait_for_active(title))
        self.desktop.click(left + width - distance[0], top + height - distance[1])
        self.desktop.wait_for_no_window(title)

    # Menus

    def choose_from(self, menu, index, separators=0, picture=None):
        """In an open menu."""
        left, top, _, _ = self.desktop.geometry(self.wait_for_window(menu))
        if picture is not None:
            self.shoot(picture)
        self.desktop.click(left + 30, top + FIRST_ITEM + index * ITEM + separators * SEPARATOR)
        self.desktop.wait_for_no_window(menu)

    def choose_file(self, index, separators, picture=None):
        self.activate_main()
        self.click_in("Plimworks", FILE_MENU)
        self.choose_from("File", index, separators, picture)

    def open_menu(self, x, y):
        self.input.click(x, y, button=3)

    def save_as(self, title, name, picture=None):
        """In a panel that has opened; what it proposes is selected."""
        self.wait_for_active(title)
        self.desktop.type(name)
        if picture is not None:
            self.shoot(picture)
        self.click_from_corner(title, SAVE_FROM_CORNER)
        wait_for(f"{name} is saved", (self.desktop.folder / name).exists)

    # Properties and events of what is selected

    def inspect(self, tab):
        self.desktop.click(INSPECTOR[0] + tab[0], INSPECTOR[1] + tab[1])
        self.wait_for_active("Properties")

    def invoke(self, first, row, code):
        """A double click on the row, which the window tells by a message of the code."""
        self.listen()
        place = (INSPECTOR[0] + first[0], INSPECTOR[1] + first[1] + row * ROW)
        self.input.double_click(*place)
        self.input.move(*AWAY)
        self.expect_told(f"BMessage({code})")

    def edit(self, kind, picture=None, **values):
        """Texts are typed in place of the ones that are there, which a double click selects."""
        self.inspect(PROPERTIES_TAB)
        for name, value in values.items():
            self.invoke(FIRST_ROW, ROWS[kind].index(name), PROPERTY_INVOKED)
            if name == "FontSize":
                self.desktop.click(INSPECTOR[0] + CHOICES[0], INSPECTOR[1] + CHOICES[1])
                self.choose_from("mnuPickEdit", FONT_SIZES.index(value), picture=picture)
            else:
                self.desktop.type(f"{value}\n")
            self.expect_told(f"::SetPropertyValue('{name}', '{value}')")

    def tick_event(self, row):
        self.inspect(EVENTS_TAB)
        self.invoke(FIRST_EVENT, row, EVENT_INVOKED)


class BareForm(Form):
    """A form of a designer, wherever it is."""

    def __init__(self, session, window, frame):
        self.session = session
        self.desktop = session.desktop
        self.window = window
        self.place = frame[:2]
        session.move_window(window, frame[:2])
        session.resize_window(window, (frame[2] - frame[0] + 1, frame[3] - frame[1] + 1))

    def set_up(self, name, title, picture=False):
        session = self.session
        session.click_in("Form", (3, 3))
        # The designer makes it active, maybe after the next click.
        session.wait_for_active("Form")
        session.edit("Form", "sizes" if picture else None, Name=name, Title=title, FontSize="12")
        session.invoke(FIRST_ROW, ROWS["Form"].index("WindowFlags"), PROPERTY_INVOKED)
        session.wait_for_active("Window Flags")
        for box in (NOT_RESIZABLE, NOT_ZOOMABLE):
            session.click_in("Window Flags", box)
        if picture:
            session.shoot("flags")
        session.click_from_corner("Window Flags", OK_FROM_CORNER)
        session.expect_told("SetPropertyValue('WindowFlags', 'B_NOT_RESIZABLE|B_NOT_ZOOMABLE')")

    def band(self, start, end, picture):
        """Draws a frame; while it is drawn there is a picture of it."""
        if picture is None:
            self.drag(start, end)
            return
        before = self.desktop.picture()
        self.desktop.input.move(*self.at(start))
        self.desktop.input.press()
        self.desktop.input.move(*self.at(end))
        edge = self.at(((start[0] + end[0]) // 2, start[1]))
        wait_for("the frame is shown", lambda: self.desktop.picture().pixel(*edge) != before.pixel(*edge))
        self.session.shoot(picture)
        self.desktop.input.release()
        self.desktop.input.move(*AWAY)

    def draw(self, entry, frame, inside=(0, 0), event=False, picture=None, **values):
        """Chooses on the palette, draws the frame, which lies that far inside of the form, and sets the properties."""
        session = self.session
        session.listen()
        button = (PALETTE[0] + FIRST_BUTTON[0], PALETTE[1] + FIRST_BUTTON[1] + ENTRIES.index(entry) * BUTTON)
        session.desktop.click(*button)
        session.expect_told("PalE")
        left, top, right, bottom = (frame[i] + inside[i % 2] for i in range(4))
        self.band((left, top), (right, bottom), picture)
        self.expect_selected(left, top, right, bottom)
        session.edit(entry, **values, FontSize="12")
        if event:
            session.tick_event(OWN_EVENT)

    def save(self, file, *pictures):
        session = self.session
        session.open_menu(*self.at((3, 3)))
        session.choose_from("pmFormDesign", 1, 0, *pictures[:1])
        session.save_as(FORM_PANEL, file, *pictures[1:])


def begin(designer):
    designer.choose_file(0, 0)
    designer.answer_no(QUESTION)
    designer.arrange("Components", PALETTE)
    designer.arrange("Project", PROJECT)
    designer.arrange("Properties", INSPECTOR, INSPECTOR_SIZE)
    form = BareForm(designer, designer.wait_for_window("Form"), NOTE_FORM)
    designer.shoot("arranged")
    step("a new project is begun, and the windows are arranged")

    designer.listen()
    designer.click_in("Project", FIRST_PROJECT_ROW)
    # The property window shows the application, and its first row.
    designer.expect_told(f"BMessage({PROPERTY_SELECTED})")
    designer.edit("Application", Name="Hello", ClassName="THello", Signature="application/x-vnd.Plimworks-Hello",
                  GenerationPath=".")
    designer.shoot("application")
    step("the application has its name")
    return form


def design_note(form):
    form.set_up("NoteForm", "Note", True)
    form.draw("StringView", (12, 12, 248, 32), Name="Prompt", picture="frame", Text="Write something down:")
    form.draw("TextControl", (12, 44, 248, 68), Name="NoteField")
    form.draw("Button", (148, 88, 248, 116), Name="CloseButton", Label="Close", event=True)
    form.session.shoot("first-form")
    form.save(FORMS[0], "form-menu", "save-form")
    step("the first form is designed")


def design_main(designer):
    designer.open_menu(PROJECT[0] + 60, PROJECT[1] + 100)
    designer.choose_from("pmProject", 2, 1)
    form = BareForm(designer, designer.wait_for_window("Form"), MAIN_FORM)
    form.set_up("MainForm", "Hello")
    step("the second form is there")
    box = (12, 12)
    form.draw("Box", (12, 12, 348, 128), Name="GreetingBox", Label="Greeting")
    form.draw("TextControl", (12, 26, 324, 50), box, Name="NameField", Label="Your name:", Divider="90", event=True)
    designer.shoot("event")
    form.draw("CheckBox", (12, 58, 150, 78), box, Name="ShoutBox", Label="Shout", event=True)
    form.draw("StringView", (12, 84, 324, 106), box, Name="GreetingText", Text="Hello!")
    designer.shoot("box")
    step("what is in the box is designed")
    form.draw("Button", (12, 144, 112, 172), Name="CountButton", Label="Count", event=True)
    form.draw("StringView", (128, 144, 348, 166), Name="CountText", Text="No clicks yet")
    form.draw("Button", (12, 184, 112, 212), Name="NoteButton", Label="Note...", event=True)
    form.draw("StringView", (128, 184, 348, 206), Name="NoteText", Text="Opens another form")
    form.draw("Button", (248, 236, 348, 264), Name="QuitButton", picture="last-frame", Label="Quit", event=True)
    designer.shoot("second-form")
    form.save(FORMS[1])
    step("the second form is designed")


def finish(designer):
    # The second form's row, and what its menu offers last.
    designer.open_menu(PROJECT[0] + FIRST_PROJECT_ROW[0], PROJECT[1] + FIRST_PROJECT_ROW[1] + 2 * ITEM)
    designer.choose_from("pmProject", 5, 2, "project-menu")
    designer.choose_file(2, 1)
    designer.save_as(PROJECT_PANEL, "hello.plim", "save-project")
    designer.choose_file(4, 2)
    designer.wait_for_active(DIALOG)
    designer.shoot("generate")
    designer.click_in(DIALOG, GENERATE)
    designer.desktop.wait_for_no_window(DIALOG)
    step("all is saved, and the sources are generated")

    # Nothing has changed since, so that there is no question.
    designer.choose_file(5, 3)
    designer.wait_until_ended()
    step("it quit")


def generate(desktop, generator, project, folder):
    folder.mkdir()
    result = desktop.run([generator, "-o", folder, project])
    check(result.returncode == 0, f"plimgen {project}: {result.stdout}{result.stderr}")
    return folder


def check_same(found, wanted):
    """Both hold the same sources."""
    for name in GENERATED:
        text, expected = ((folder / name).read_text(encoding="utf-8") for folder in (found, wanted))
        lines = difflib.unified_diff(expected.splitlines(), text.splitlines(), "the example's", name, lineterm="")
        check(text == expected, "\n".join(lines))


def design(desktop, program, generator, example, pictures):
    designer = Designer(desktop, program, pictures)
    designer.shoot("start")
    design_note(begin(designer))
    design_main(designer)
    finish(designer)

    wanted = generate(desktop, generator, example / "hello.plim", desktop.folder / "wanted")
    check_same(desktop.folder, wanted)
    for name in FORMS:
        check((desktop.folder / name).read_bytes() == (example / name).read_bytes(), f"{name} is not the example's")
    check_same(generate(desktop, generator, desktop.folder / "hello.plim", desktop.folder / "again"), wanted)
    step("they are the example's, and so are the forms' files; the saved project generates them, too")


if __name__ == "__main__":
    sys.exit(run(design, 4, WHOLE_LIMIT, __doc__))
