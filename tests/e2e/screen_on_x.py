#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""A screen that gets another size while programs run: every window is told, shown or not.

usage: tests/e2e/screen_on_x.py EXCHANGE_PROGRAM XDND_CLIENT FOLDER
"""

import sys

from exchange import Program, check, main

B_RGB32 = 8
# Of a usual monitor; the virtual one goes by the numbers of the size alone.
SMALL = ("small", 40, 800, 840, 968, 1056, 600, 601, 605, 628)


def set_screen(desktop, *words):
    result = desktop.run(["xrandr", *(str(word) for word in words)])
    check(result.returncode == 0, f"xrandr {words}: {result.stderr}")


def change_screen(desktop, program, _):
    one = Program(desktop, [program], "one")
    one.expect("ready")
    for title, place in (("First", 100), ("Second", 300)):
        one.ask(f"window {title} {place} {place} nothing -", f"opened {title}")
        desktop.wait_for_window(title)
    one.forget()

    set_screen(desktop, "--newmode", *SMALL)
    set_screen(desktop, "--addmode", "screen", "small")
    for mode, edge in (("small", "799,599"), ("1024x768", "1023,767")):
        set_screen(desktop, "--output", "screen", "--mode", mode)
        one.expect_all(*(f"{title} screen 0,0 {edge} mode {B_RGB32} found {edge}" for title in ("First", "Second")))
        print(mode, "done", flush=True)
    one.quit()


if __name__ == "__main__":
    sys.exit(main(change_screen, tools=("xrandr",)))
