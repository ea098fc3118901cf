# SPDX-License-Identifier: MIT
"""A desktop of its own for a test: an X server without a monitor, a window manager, input and pictures.

Nothing here waits for a time: every wait is for an event, up to a limit.
"""

import contextlib
import ctypes
import mmap
import os
import re
import select
import shutil
import signal
import struct
import subprocess
import time
from pathlib import Path

from picture import Picture
from waits import LIMIT, Failure, wait_for
from xinput import Input

TOOLS = ("Xvfb", "openbox", "xdotool", "xclip", "xsetroot")
PR_SET_PDEATHSIG = 1
AWAY = (1000, 740)
# The default theme and all keys would be the user's; a few keys are enough.
WINDOW_MANAGER_SETTINGS = """<?xml version="1.0" encoding="UTF-8"?>
<openbox_config xmlns="http://openbox.org/3.4/rc">
  <focus><focusNew>yes</focusNew></focus>
  <resistance><strength>0</strength><screen_edge_strength>0</screen_edge_strength></resistance>
  <desktops><number>1</number><popupTime>0</popupTime></desktops>
  <keyboard>
    <keybind key="A-F4"><action name="Close"/></keybind>
    <keybind key="A-F9"><action name="Iconify"/></keybind>
    <keybind key="A-F10"><action name="ToggleMaximize"/></keybind>
  </keyboard>
</openbox_config>
"""

DESKTOP_COLOUR = "#51718f"


def missing_tools(more=()):
    return [tool for tool in (*TOOLS, *more) if shutil.which(tool) is None]


class Desktop:
    """The server, the window manager and the programs on them; all are gone at the end of the with block."""

    def __init__(self, folder):
        self.folder = Path(folder)
        self.environment = dict(os.environ, HOME=str(folder), BE_CHECK_LOCKS="1")
        for name in ("WAYLAND_DISPLAY", "QT_QPA_PLATFORM", "BE_DISPLAY", "BE_ROBOT_SCRIPT", "XAUTHORITY",
                     "XDG_CONFIG_HOME", "XDG_DATA_HOME", "QT_SCALE_FACTOR", "SESSION_MANAGER"):
            self.environment.pop(name, None)
        self.children = []
        self.screen = None
        self.input = None
        self.manager = None
        self.server = None

    def __enter__(self):
        try:
            self.start_server()
            self.start_window_manager()
        except BaseException:
            self.end()
            raise
        return self

    def __exit__(self, *_):
        self.end()

    def end(self):
        """The youngest first, so that nobody loses the server under its feet."""
        for child in reversed(self.children):
            if child.poll() is None:
                child.terminate()
                try:
                    child.wait(5)
                except subprocess.TimeoutExpired:
                    child.kill()
                    child.wait()

    # Programs

    def start(self, command, name, **options):
        """Starts a program that does not outlive this one, not even when this one is killed."""
        library = ctypes.CDLL(None)
        parent = os.getpid()

        def die_with_parent():
            library.prctl(PR_SET_PDEATHSIG, signal.SIGTERM)
            if os.getppid() != parent:
                os._exit(1)

        environment = dict(self.environment, **options.pop("environment", {}))
        with open(self.output_of(name), "wb") as output:
            child = subprocess.Popen(
                [str(word) for word in command], env=environment, cwd=self.folder, stdout=output,
                stderr=subprocess.STDOUT, preexec_fn=die_with_parent, **{"stdin": subprocess.DEVNULL, **options})
        self.children.append(child)
        return child

    def output_of(self, name):
        return self.folder / f"{name}.output"

    def start_server(self):
        """The server finds a free number itself, and says it as soon as it can be used."""
        reader, writer = os.pipe()
        self.server = self.start(
            ["Xvfb", "-displayfd", writer, "-screen", "0", "1024x768x24", "-nolisten", "tcp", "-noreset", "-fbdir",
             self.folder], "Xvfb", pass_fds=[writer])
        os.close(writer)
        number = b""
        end = time.monotonic() + LIMIT
        while not number.endswith(b"\n"):
            ready, _, _ = select.select([reader], [], [], max(end - time.monotonic(), 0))
            read = os.read(reader, 16) if ready else b""
            if not read:
                raise Failure(f"Xvfb did not start (code {self.server.poll()}): " + self.output_of("Xvfb").read_text())
            number += read
        os.close(reader)
        self.environment["DISPLAY"] = f":{int(number)}"
        with open(self.folder / "Xvfb_screen0", "rb") as file:
            self.screen = mmap.mmap(file.fileno(), 0, prot=mmap.PROT_READ)
        self.input = Input(self.environment["DISPLAY"])

    def start_window_manager(self):
        settings = self.folder / "openbox.xml"
        settings.write_text(WINDOW_MANAGER_SETTINGS)
        manager = self.manager = self.start(["openbox", "--sm-disable", "--config-file", settings], "openbox")

        def manages():
            if manager.poll() is not None:
                raise Failure("openbox ended: " + self.output_of("openbox").read_text())
            # The number of the desktop is what a window manager says once it is there.
            return self.try_xdotool("get_desktop") is not None

        wait_for("a window manager that manages", manages)
        # The pictures of tests are also those of the documentation.
        self.run(["xsetroot", "-solid", DESKTOP_COLOUR])

    @contextlib.contextmanager
    def sleeping_manager(self):
        """The window manager does what it is asked after the block only."""
        self.manager.send_signal(signal.SIGSTOP)
        try:
            yield
        finally:
            self.manager.send_signal(signal.SIGCONT)

    # Windows and input

    def run(self, command, environment=None, **options):
        return subprocess.run(
            command, env=environment or self.environment, timeout=LIMIT, text=True, stdout=subprocess.PIPE, stderr=subprocess.PIPE,
            check=False, **options)

    def try_xdotool(self, *words):
        """The output; None where the command fails, as one about a window does while that goes."""
        result = self.run(["xdotool", *(str(word) for word in words)])
        return result.stdout if result.returncode == 0 else None

    def xdotool(self, *words):
        output = self.try_xdotool(*words)
        if output is None:
            raise Failure(f"xdotool {words} failed")
        return output

    def windows(self, title):
        found = self.try_xdotool("search", "--onlyvisible", "--name", f"^{re.escape(title)}$")
        return [int(number) for number in (found or "").split()]

    def wait_for_window(self, title):
        return wait_for(f"a window \"{title}\"", lambda: self.windows(title))[0]

    def wait_for_no_window(self, title):
        wait_for(f"no window \"{title}\"", lambda: not self.windows(title))

    def wait_until_active(self, window):
        wait_for("the window is active", lambda: (self.try_xdotool("getactivewindow") or "").strip() == str(window))

    def geometry(self, window):
        """Where the window's content is on the screen, and its size: left, top, width, height, in pixels."""
        size = values(self.xdotool("getwindowgeometry", "--shell", window))
        # The place in that answer is wrong in a window manager's frame.
        return *self.input.place_of(window), size["WIDTH"], size["HEIGHT"]

    def click(self, x, y):
        """Clicks and goes on at once to where nothing is: the pointer is in the pictures, too."""
        self.input.click(x, y)
        self.input.move(*AWAY)

    def type(self, text):
        self.xdotool("type", "--delay", 1, text)

    def key(self, key):
        self.xdotool("key", "--delay", 1, key)

    # Pictures

    def picture(self):
        """The screen as it is. While the server draws, half of a change may be in it."""
        header = struct.unpack_from(">25I", self.screen)
        start, width, height = header[0] + 12 * header[19], header[4], header[5]
        if (header[7], header[11]) != (0, 32):
            raise Failure("the server's pixels are no blue, green, red, unused")
        line = header[12]
        rows = []
        for y in range(height):
            pixels = self.screen[start + y * line:start + y * line + 4 * width]
            row = bytearray(3 * width)
            row[0::3], row[1::3], row[2::3] = pixels[2::4], pixels[1::4], pixels[0::4]
            rows.append(bytes(row))
        return Picture(width, height, rows)

    # Clipboard

    def clipboard(self):
        result = self.run(["xclip", "-out", "-selection", "clipboard"])
        return result.stdout if result.returncode == 0 else None

    def offer_on_clipboard(self, text):
        """Another program puts the text on the clipboard, and gives it to who asks."""
        file = self.folder / "offered"
        file.write_text(text)
        self.start(["xclip", "-quiet", "-in", "-selection", "clipboard", file], "xclip")
        wait_for(f"\"{text}\" is on the clipboard", lambda: self.clipboard() == text)


def values(output):
    return {name: int(value) for name, value in re.findall(r"^(\w+)=(\d+)$", output, re.MULTILINE)}
