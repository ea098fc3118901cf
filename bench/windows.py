# SPDX-License-Identifier: MIT
"""What windows full of buttons take, with the kits and with other tools: the part of bench/compare about windows.

An X server without a monitor keeps the screen in a file. A window counts as painted when the mark that it paints last
is there, so all tools are seen with the same eyes, and the server's part of the work counts.
"""

import mmap
import os
import select
import shutil
import statistics
import struct
import subprocess
import tempfile
import time
from pathlib import Path

LIMIT = 30  # seconds, for any single step
COUNT = 1000
IDLE = 2  # seconds
# Seconds after which programs that give memory back once nothing changes any more have done so.
REST = 2
SCREEN = (2400, 1400)
# As in ButtonWindow.h: the middles of the marks, and their colours.
SMALL_MARK = (2240 + 140 - 8, 40 + 80 - 8)
LARGE_MARK = (8 + 2216 - 8, 40 + 1320 - 8)
RED, BLUE = 0xC80000, 0x0000C8
PROGRAMS = {"kits": "kit_window", "FLTK": "fltk_window", "Qt Widgets": "qt_window", "Qt Gui, bare": "qt_gui_window"}


class Screen:
    """The server, and what it shows."""

    def __init__(self, folder):
        self.environment = dict(os.environ, HOME=str(folder), QT_QPA_PLATFORM="xcb", QT_LOGGING_RULES="*=false")
        for name in ("WAYLAND_DISPLAY", "BE_DISPLAY", "BE_ROBOT_SCRIPT", "BE_CHECK_LOCKS", "QT_SCALE_FACTOR",
                     "QT_QPA_PLATFORMTHEME", "QT_STYLE_OVERRIDE", "XAUTHORITY"):
            self.environment.pop(name, None)
        reader, writer = os.pipe()
        self.server = subprocess.Popen(
            ["Xvfb", "-displayfd", str(writer), "-screen", "0", "%dx%dx24" % SCREEN, "-nolisten", "tcp", "-noreset",
             "-fbdir", str(folder)], pass_fds=[writer], stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        os.close(writer)
        number = b""
        while not number.endswith(b"\n"):
            ready, _, _ = select.select([reader], [], [], LIMIT)
            read = os.read(reader, 16) if ready else b""
            if not read:
                self.end()
                raise RuntimeError("Xvfb did not start")
            number += read
        os.close(reader)
        self.environment["DISPLAY"] = f":{int(number)}"
        with open(Path(folder) / "Xvfb_screen0", "rb") as file:
            self.pixels = mmap.mmap(file.fileno(), 0, prot=mmap.PROT_READ)
        header = struct.unpack_from(">25I", self.pixels)
        self.start, self.line = header[0] + 12 * header[19], header[12]

    def end(self):
        self.server.terminate()
        self.server.wait()

    def wait_for(self, place, color):
        """Returns the time at which the pixel has the colour, in ns."""
        at = self.start + place[1] * self.line + 4 * place[0]
        wanted = bytes((color & 0xFF, color >> 8 & 0xFF, color >> 16))
        end = time.monotonic() + LIMIT
        while self.pixels[at:at + 3] != wanted:
            if time.monotonic() > end:
                raise RuntimeError(f"the mark at {place} did not come")
            time.sleep(0.0001)
        return time.monotonic_ns()


class Program:
    """One of the programs, told what to do."""

    def __init__(self, screen, path, count):
        self.screen = screen
        started, served = time.monotonic_ns(), used(screen.server.pid)
        self.process = subprocess.Popen([str(path), str(count)], env=screen.environment, stdin=subprocess.PIPE,
                                        stdout=subprocess.PIPE)
        wall = screen.wait_for(SMALL_MARK, RED) - started
        settle(self.process.pid)
        # As do() has it.
        self.start = [spent / 1e6 for spent in (wall, used(self.process.pid), used(screen.server.pid) - served)]

    def do(self, order, color):
        """Milliseconds on the clock, and of processor time of the program and of the server."""
        before = used(self.process.pid), used(self.screen.server.pid)
        self.process.stdin.write(order.encode() + b"\n")
        self.process.stdin.flush()
        word, begun = self.process.stdout.readline().decode().split()
        if word != order:
            raise RuntimeError(f"the program says {word}, not {order}")
        wall = self.screen.wait_for(LARGE_MARK, color) - int(begun)
        settle(self.process.pid)
        after = used(self.process.pid), used(self.screen.server.pid)
        return [wall / 1e6] + [(now - then) / 1e6 for now, then in zip(after, before)]

    def memory(self):
        """KiB: resident, its proportional share of what is shared, and what nobody else has."""
        text = Path(f"/proc/{self.process.pid}/smaps_rollup").read_text()
        sizes = {line.split(":")[0]: int(line.split()[1]) for line in text.splitlines()[1:]}
        return sizes["Rss"], sizes["Pss"], sizes["Private_Clean"] + sizes["Private_Dirty"]

    def idle(self):
        """Milliseconds of processor time in a second of nothing to do."""
        settle(self.process.pid)
        before = used(self.process.pid)
        time.sleep(IDLE)
        return (used(self.process.pid) - before) / 1e6 / IDLE

    def end(self):
        self.process.stdin.close()
        try:
            self.process.wait(LIMIT)
        except subprocess.TimeoutExpired:
            self.process.kill()
            self.process.wait()
            raise RuntimeError("a program did not end") from None
        if self.process.returncode != 0:
            raise RuntimeError(f"a program ended with {self.process.returncode}")


def used(pid):
    """Nanoseconds of processor time of all threads, those that have ended included."""
    # The clock of another process, as clock_getcpuclockid() makes its number.
    return time.clock_gettime_ns(~pid << 3 | 2)


def settle(pid):
    """Waits until the program has nothing more to do."""
    end = time.monotonic() + LIMIT
    before = used(pid)
    while True:
        time.sleep(0.05)
        now = used(pid)
        if now == before:
            return
        if time.monotonic() > end:
            raise RuntimeError("the program is never idle")
        before = now


def measure(screen, path, runs, repaints, is_bare):
    """Starts the program several times, and has the last one open and repaint the large window."""
    starts = []
    for last in (False,) * (runs - 1) + (True,):
        program = Program(screen, path, COUNT)
        starts.append(program.start)
        if not last:
            clear(screen, program)
    result = {"start": starts, "small": program.memory()}
    time.sleep(REST)
    result["idle"] = program.idle()
    result["open"] = program.do("open", RED)
    result["large"] = program.memory()
    if not is_bare:
        result["repaint"] = [program.do("repaint", RED if i % 2 else BLUE) for i in range(repaints)]
        result["large"] = program.memory()
    time.sleep(REST)
    result["rest"] = program.memory()
    result["idle"] = max(result["idle"], program.idle())
    clear(screen, program)
    return result


def clear(screen, program):
    """Ends the program. The next one must not take this one's mark for its own."""
    program.end()
    for mark in (SMALL_MARK, LARGE_MARK):
        screen.wait_for(mark, 0)


def tools_of(folder):
    missing = [name for name, program in PROGRAMS.items() if not (folder / program).exists()]
    for name in missing:
        print(f"left out: {name} is not installed here, or not all of it")
    return {name: folder / program for name, program in PROGRAMS.items() if name not in missing}


def compare(folder, runs):
    """Runs the programs of the folder by turns and prints what they took."""
    if shutil.which("Xvfb") is None:
        print("left out: windows, as Xvfb is not installed here")
        return
    tools = tools_of(folder)
    rounds = {name: [] for name in tools}
    with tempfile.TemporaryDirectory(prefix="plimworks-bench-") as place:
        screen = Screen(place)
        try:
            for _ in range(3):
                for name, path in tools.items():
                    rounds[name].append(measure(screen, path, runs, 2 * runs, "bare" in name))
        finally:
            screen.end()
    results = {name: joined(rounds[name]) for name in tools}
    print_times(results)
    print_memory(results)


def joined(rounds):
    """Of each time the best and the median, of memory the least."""
    def times(values):
        return min(values), statistics.median(values)

    result = {"start": [times(column) for column in zip(*(start for each in rounds for start in each["start"]))],
              "idle": min(each["idle"] for each in rounds)}
    result["open"] = [times(column) for column in zip(*(each["open"] for each in rounds))]
    result["repaint"] = [times(column) for column in zip(*(row for each in rounds for row in each.get("repaint", [])))]
    for window in ("small", "large", "rest"):
        result[window] = [min(column) for column in zip(*(each[window] for each in rounds))]
    return result


def print_times(results):
    print(f"\nwindows, milliseconds, best / median; {COUNT} buttons; \"cpu\" is the program's and the server's\n")
    print(f"{'':>13} {'start':>15} {'its cpu':>13} {'open':>15} {'its cpu':>13} {'repaint':>15} {'its cpu':>13} {'idle, ms/s':>11}")

    def pair(values, width):
        return f"{values[0]:.1f} / {values[1]:.1f}".rjust(width)

    def both(column):
        return f"{column[1][0]:.1f} + {column[2][0]:.1f}"

    for name, result in results.items():
        repaint = result["repaint"]
        print(f"{name:>13} {pair(result['start'][0], 15)} {both(result['start']):>13}"
              f" {pair(result['open'][0], 15)} {both(result['open']):>13}"
              f" {pair(repaint[0], 15) if repaint else '':>15} {both(repaint) if repaint else '':>13}"
              f" {result['idle']:>11.2f}")
    if "FLTK" in results and "kits" in results:
        own, other = results["kits"], results["FLTK"]
        print("\nkits to FLTK, medians: start %.2f, open %.2f, repaint %.2f" % (
            own["start"][0][1] / other["start"][0][1], own["open"][0][1] / other["open"][0][1],
            own["repaint"][0][1] / other["repaint"][0][1]))


def print_memory(results):
    print(f"\nmemory in MiB: resident, proportional, private; then with the window of {COUNT} buttons, painted just now and"
          f" after {REST} s without a change\n")
    for name, result in results.items():
        print(f"{name:>13}" + "".join(f" {size / 1024:>8.1f}" for size in result["small"] + result["large"] + result["rest"]))
    if {"kits", "FLTK", "Qt Gui, bare"} <= set(results):
        for title, which in (("one button", "small"), (f"{COUNT} buttons", "large"), ("at rest", "rest")):
            own, fltk, bare = (results[name][which] for name in ("kits", "FLTK", "Qt Gui, bare"))
            goal = [1.5 * one + other for one, other in zip(fltk, bare)]
            print(f"{title}: the goal is 1.5 times FLTK's and Qt Gui's share: "
                  + ", ".join(f"{mine / 1024:.1f} of {limit / 1024:.1f}" for mine, limit in zip(own, goal)))
