# SPDX-License-Identifier: MIT
"""The pointer and the keys of an X server, many a millisecond: all events go through one connection, and no move overtakes a
release, as those of separate programs do while the window manager holds the pointer.

The server sends them to the windows in their order, so what follows waits only where another window has to be there first.
"""

import ctypes
import time

from waits import wait_for

FIRST_BUTTON_MASK = 0x100
# XWindowAttributes as ints, with room to spare: five of them, three pointers and a number come before the place of the
# state of mapping.
ATTRIBUTES, MAP_STATE, VIEWABLE = ctypes.c_int * 64, 23, 2
ASYNCHRONOUS, GRAB_SUCCESS = 1, 0
STEP = 0.03  # seconds
POINTER_ROOT = 1  # in place of a window: none has the focus by itself
NAMED_KEYS = {"ctrl": "Control_L", "shift": "Shift_L", "alt": "Alt_L"}


class Input:
    """One connection to a server."""

    def __init__(self, server):
        self.x = ctypes.CDLL("libX11.so.6")
        self.test = ctypes.CDLL("libXtst.so.6")
        self.x.XOpenDisplay.restype = ctypes.c_void_p
        self.x.XDefaultRootWindow.restype = ctypes.c_ulong
        self.x.XStringToKeysym.restype = ctypes.c_ulong
        self.x.XkbKeycodeToKeysym.restype = ctypes.c_ulong
        # A window may go while it is asked about; that is no reason to end.
        self.ignore = ctypes.CFUNCTYPE(ctypes.c_int, ctypes.c_void_p, ctypes.c_void_p)(lambda *_: 0)
        self.x.XSetErrorHandler(self.ignore)
        self.display = ctypes.c_void_p(self.x.XOpenDisplay(server.encode()))
        self.root = ctypes.c_ulong(self.x.XDefaultRootWindow(self.display))
        self.codes = {}

    def flush(self):
        self.x.XSync(self.display, 0)

    # The pointer

    def move(self, x, y):
        self.test.XTestFakeMotionEvent(self.display, -1, int(x), int(y), ctypes.c_ulong(0))
        self.flush()

    def press(self, button=1):
        self.test.XTestFakeButtonEvent(self.display, button, 1, ctypes.c_ulong(0))
        self.flush()

    def release(self, button=1):
        """Until it is on its way to its window: the window manager holds the pointer while it looks at a press, and keys
        would get past it."""
        self.test.XTestFakeButtonEvent(self.display, button, 0, ctypes.c_ulong(0))
        wait_for("the button is released", lambda: not self.is_pressed(button))

    def is_pressed(self, button=1):
        numbers = [ctypes.c_int() for _ in range(4)]
        windows = [ctypes.c_ulong() for _ in range(2)]
        mask = ctypes.c_uint()
        self.x.XQueryPointer(self.display, self.root, *map(ctypes.byref, [*windows, *numbers, mask]))
        return mask.value & FIRST_BUTTON_MASK << (button - 1) != 0

    def click(self, x, y, button=1):
        self.move(x, y)
        self.press(button)
        self.release(button)

    def double_click(self, x, y):
        """Its presses are no longer apart than the server needs, however busy the machine is."""
        self.move(x, y)
        for down in (1, 0, 1):
            self.test.XTestFakeButtonEvent(self.display, 1, down, ctypes.c_ulong(0))
        self.release()

    def go(self, start, end, steps=8):
        """Each step is a move of its own for the programs, too."""
        for i in range(1, steps + 1):
            self.move(*(start[j] + (end[j] - start[j]) * i // steps for j in (0, 1)))
            time.sleep(STEP)

    def drag(self, start, end):
        self.move(*start)
        self.press()
        self.go(start, end)
        self.release()

    def wait_until_let_go(self):
        """Until no other program holds the pointer: a window manager that moves a window follows it up to then, even when
        the button is up already."""
        def can_be_held():
            held = self.x.XGrabPointer(
                self.display, self.root, 0, 0, ASYNCHRONOUS, ASYNCHRONOUS, ctypes.c_ulong(0), ctypes.c_ulong(0),
                ctypes.c_ulong(0))
            if held == GRAB_SUCCESS:
                self.x.XUngrabPointer(self.display, ctypes.c_ulong(0))
                self.flush()
            return held == GRAB_SUCCESS
        wait_for("the pointer is let go", can_be_held)

    # Keys

    def code(self, symbol):
        """The key's code, and whether it needs Shift."""
        if symbol not in self.codes:
            code = self.x.XKeysymToKeycode(self.display, ctypes.c_ulong(symbol)) & 0xff
            plain = self.x.XkbKeycodeToKeysym(self.display, ctypes.c_ubyte(code), 0, 0)
            self.codes[symbol] = code, plain != symbol
        return self.codes[symbol]

    def key_event(self, code, down):
        self.test.XTestFakeKeyEvent(self.display, code, int(down), ctypes.c_ulong(0))

    def tap(self, code, held=()):
        for modifier in held:
            self.key_event(modifier, True)
        self.key_event(code, True)
        self.key_event(code, False)
        for modifier in reversed(held):
            self.key_event(modifier, False)

    def named(self, name):
        return self.x.XStringToKeysym(name.encode())

    def key(self, *keys):
        """Each by its X name, with "ctrl+", "shift+" or "alt+" before it."""
        for key in keys:
            *modifiers, name = key.split("+")
            held = [self.code(self.named(NAMED_KEYS[modifier]))[0] for modifier in modifiers]
            self.tap(self.code(self.named(name))[0], held)
        self.flush()

    def type(self, text):
        shift = self.code(self.named("Shift_L"))[0]
        for character in text:
            code, shifted = self.code(ord(character))
            self.tap(code, [shift] if shifted else [])
        self.flush()

    # Windows

    def active_window(self):
        """The window that has the server's keyboard focus: what is pressed now follows that news to its program."""
        window, revert = ctypes.c_ulong(), ctypes.c_int()
        self.x.XGetInputFocus(self.display, ctypes.byref(window), ctypes.byref(revert))
        return window.value

    def title(self, window):
        name = ctypes.c_char_p()
        if window <= POINTER_ROOT or not self.x.XFetchName(self.display, ctypes.c_ulong(window), ctypes.byref(name)):
            return ""
        title = (name.value or b"").decode(errors="replace")
        self.x.XFree(name)
        return title

    def wait_for_active(self, title):
        wait_for(f"the window \"{title}\" is active", lambda: self.title(self.active_window()) == title)

    def is_shown(self, title):
        """Whether a window of this title is on the screen by itself, as menus are, without a frame around it."""
        root, parent, count = ctypes.c_ulong(), ctypes.c_ulong(), ctypes.c_uint()
        windows = ctypes.POINTER(ctypes.c_ulong)()
        if not self.x.XQueryTree(
                self.display, self.root, ctypes.byref(root), ctypes.byref(parent), ctypes.byref(windows),
                ctypes.byref(count)):
            return False
        titled = [window for window in windows[:count.value] if self.title(window) == title]
        self.x.XFree(windows)
        return any(self.is_viewable(window) for window in titled)

    def is_viewable(self, window):
        attributes = ATTRIBUTES()
        found = self.x.XGetWindowAttributes(self.display, ctypes.c_ulong(window), ctypes.byref(attributes))
        return found and attributes[MAP_STATE] == VIEWABLE

    def is_at(self, window, x, y):
        """Whether a click there reaches the window."""
        numbers = [ctypes.c_int() for _ in range(2)]
        inside, found = self.root, ctypes.c_ulong()
        while self.x.XTranslateCoordinates(
                self.display, self.root, inside, int(x), int(y), *map(ctypes.byref, [*numbers, found])) and found.value != 0:
            if found.value == window:
                return True
            inside = ctypes.c_ulong(found.value)
        return False

    def place_of(self, window):
        """Where the window's content is on the screen: left and top, in pixels."""
        left, top, child = ctypes.c_int(), ctypes.c_int(), ctypes.c_ulong()
        self.x.XTranslateCoordinates(
            self.display, ctypes.c_ulong(window), self.root, 0, 0, *map(ctypes.byref, [left, top, child]))
        return left.value, top.value

    def wait_until_shown(self, title):
        wait_for(f"a window \"{title}\" is shown", lambda: self.is_shown(title))
