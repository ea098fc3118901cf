# SPDX-License-Identifier: MIT
"""What starting the designer takes beside fluid and Qt Designer: the part of bench/compare about starts.

The programs run on an X server of their own. "first" is the time from the start of the process to its first window on
the server, "painted" the time to the last change of the screen, which is when all its windows show what they have to
show. Memory is the resident set then. No window manager runs: it would only add its own time.
"""

import ctypes
import ctypes.util
import mmap
import os
import select
import shutil
import subprocess
import sys
import tempfile
import time
import zlib
from pathlib import Path

FORMS = 20
COMPONENTS = 100
LIMIT = 120  # seconds
# The screen has come to rest when it was still for so long.
REST = 1.5
SUBSTRUCTURE_NOTIFY = 1 << 19
MAP_NOTIFY = 19
QT_DESIGNERS = ("/usr/lib/qt6/bin/designer", "/usr/bin/designer6")


class Server:
    """Xvfb, with its screen as a file and an ear for the windows that it maps."""

    def __init__(self, folder):
        reader, writer = os.pipe()
        self.process = subprocess.Popen(
            ["Xvfb", "-displayfd", str(writer), "-screen", "0", "1280x1024x24", "-nolisten", "tcp", "-noreset",
             "-fbdir", folder], pass_fds=[writer], stderr=subprocess.DEVNULL)
        os.close(writer)
        with os.fdopen(reader) as pipe:
            self.name = f":{int(pipe.readline())}"
        with open(Path(folder) / "Xvfb_screen0", "rb") as file:
            self.screen = mmap.mmap(file.fileno(), 0, prot=mmap.PROT_READ)
        self.xlib = ctypes.CDLL(ctypes.util.find_library("X11") or "libX11.so.6")
        self.xlib.XOpenDisplay.restype = ctypes.c_void_p
        self.xlib.XDefaultRootWindow.restype = ctypes.c_ulong
        self.display = ctypes.c_void_p(self.xlib.XOpenDisplay(self.name.encode()))
        root = self.xlib.XDefaultRootWindow(self.display)
        self.xlib.XSelectInput(self.display, ctypes.c_ulong(root), ctypes.c_long(SUBSTRUCTURE_NOTIFY))
        self.xlib.XSync(self.display, 0)

    def mapped(self):
        """How many windows were mapped since the last question."""
        count = 0
        event = ctypes.create_string_buffer(256)
        while self.xlib.XPending(self.display) > 0:
            self.xlib.XNextEvent(self.display, event)
            count += int.from_bytes(event.raw[:4], sys.byteorder) == MAP_NOTIFY
        return count

    def end(self):
        self.process.terminate()
        self.process.wait()


def resident(pid):
    """MiB."""
    for line in Path(f"/proc/{pid}/status").read_text().splitlines():
        if line.startswith("VmRSS:"):
            return int(line.split()[1]) / 1024
    sys.exit("the resident set is not known")


def measure_once(server, command, folder, windows):
    """(seconds to the first window, seconds until painted, MiB) of a start."""
    home = Path(tempfile.mkdtemp(dir=folder))
    environment = dict(os.environ, DISPLAY=server.name, HOME=str(home), QT_QPA_PLATFORM="xcb")
    for name in ("WAYLAND_DISPLAY", "BE_DISPLAY", "BE_ROBOT_SCRIPT", "XDG_CONFIG_HOME", "XDG_DATA_HOME"):
        environment.pop(name, None)
    server.mapped()
    picture = zlib.adler32(server.screen)
    started = time.perf_counter()
    process = subprocess.Popen(command, cwd=home, env=environment, stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL,
                               stderr=subprocess.DEVNULL)
    first = changed = None
    count = 0
    try:
        while True:
            now = time.perf_counter() - started
            if process.poll() is not None:
                sys.exit(f"{command[0]} ended by itself with {process.returncode}")
            if now > LIMIT:
                sys.exit(f"{command[0]} has mapped {count} of {windows} windows after {LIMIT} s")
            count += server.mapped()
            if first is None and count > 0:
                first = now
            shown = zlib.adler32(server.screen)
            if shown != picture:
                picture = shown
                changed = time.perf_counter() - started
            if count >= windows and changed is not None and now - changed > REST:
                return first, changed, resident(process.pid)
            select.select([], [], [], 0.001)
    finally:
        process.terminate()
        process.wait()


def best(runs, server, command, folder, windows):
    results = [measure_once(server, command, folder, windows) for _ in range(runs)]
    return [min(column) for column in zip(*results)]


def qt_designer():
    return next((path for path in QT_DESIGNERS if Path(path).exists()), None)


def starts_of(build, folder):
    """Of each row of the table the command, and how many windows it opens."""
    designer = build / "bin" / "plimworks"
    subprocess.run([build / "bin" / "bench_documents", str(COMPONENTS), folder, str(FORMS)], check=True,
                   stdout=subprocess.DEVNULL)
    # The designer's windows: the main one, the three tools and the forms.
    starts = {"plimworks": ([designer], 5), "fluid": ([shutil.which("fluid")], 1),
              "Qt Designer": ([qt_designer()], 1),
              f"plimworks, {FORMS} x {COMPONENTS}": ([designer, folder / "bench.plim"], 4 + FORMS)}
    for name, (command, _) in starts.items():
        if command[0] is None:
            print(f"left out: {name} is not installed here")
    return {name: start for name, start in starts.items() if start[0][0] is not None}


def compare(build, runs):
    """Starts the programs of the build and the other tools, and prints what it took."""
    if shutil.which("Xvfb") is None:
        print("left out: starts, as Xvfb is not installed here")
        return
    with tempfile.TemporaryDirectory(prefix="plimworks-start-") as base:
        folder = Path(base)
        starts = starts_of(build, folder)
        server = Server(base)
        try:
            results = {name: best(runs, server, command, folder, windows) for name, (command, windows) in starts.items()}
        finally:
            server.end()
    print_starts(results)


def print_starts(results):
    print(f"\nstarts, on the clock, best of the runs; {FORMS} x {COMPONENTS} is a project of {FORMS} forms with {COMPONENTS}"
          " components each\n")
    print(f"{'':>20} {'first':>10} {'painted':>10} {'memory':>10}")
    for name, (first, painted, memory) in results.items():
        print(f"{name:>20} {first * 1000:>7.0f} ms {painted * 1000:>7.0f} ms {memory:>6.1f} MiB")
    print()
    own, fluid, qt = (results.get(name) for name in ("plimworks", "fluid", "Qt Designer"))
    if fluid is not None:
        print(f"first window to fluid's: {own[0] / fluid[0]:.2f}x")
    if qt is not None:
        print(f"all painted to Qt Designer's first window: {own[1] / qt[0]:.2f}x"
              f"\nmemory to Qt Designer's: {own[2] / qt[2]:.2f}x")
