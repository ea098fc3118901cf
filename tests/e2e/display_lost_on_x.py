#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""An idle program uses no processor time, and one whose display goes away says so and ends.

usage: tests/e2e/display_lost_on_x.py EXCHANGE_PROGRAM XDND_CLIENT FOLDER
"""

import os
import sys
import time
from pathlib import Path

from exchange import Program, check, main
from waits import wait_for

MEASURED = 2  # seconds
LOST = "libbe: the connection to the display is broken; the program quits"


def ticks(process):
    """Processor time of all threads, in the kernel's ticks."""
    stat = Path(f"/proc/{process.pid}/stat").read_text()
    # The name of the program, in parentheses, may hold anything.
    fields = stat.rpartition(")")[2].split()
    return int(fields[11]) + int(fields[12])


def use_display(desktop, program, _):
    one = Program(desktop, [program], "one")
    one.expect("ready")
    one.ask("window One 100 100 nothing", "opened One")
    desktop.wait_until_active(desktop.wait_for_window("One"))

    def used_while_idle():
        before = ticks(one.process)
        # The one time that is waited for: it is what is measured.
        time.sleep(MEASURED)
        return ticks(one.process) - before

    # A busy machine may still have the window's last changes under way the first times.
    for _ in range(3):
        used = used_while_idle()
        if used <= 1:
            break
    check(used <= 1, f"the idle program used {used} of {os.sysconf('SC_CLK_TCK') * MEASURED} ticks")
    print(f"idle, the program used {used} ticks in {MEASURED} s", flush=True)

    server = next(child for child in desktop.children if child.args[0] == "Xvfb")
    server.kill()
    server.wait()
    wait_for("the program without its display ends", lambda: one.process.poll() is not None)
    check(one.process.returncode == 1, f"without its display the program ended with {one.process.returncode}")
    check(LOST in one.lines(), f"nothing was said about it: {one.lines()}")


if __name__ == "__main__":
    sys.exit(main(use_display))
