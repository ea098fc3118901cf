# SPDX-License-Identifier: MIT
"""What every test on a real X display shares: its arguments, its limit, and what it leaves behind when it fails."""

import signal
import sys
import tempfile
import time
import traceback
from pathlib import Path

from waits import PATIENCE, Failure
from xdesktop import Desktop, missing_tools

SKIPPED = 77
START = time.monotonic()
REPORTS = ("SUMMARY: ", ": runtime error: ")


def check(condition, message):
    if not condition:
        raise Failure(message)


def step(text):
    print(f"{time.monotonic() - START:6.2f} s  {text}", flush=True)


def check_unreported(folder):
    """What a sanitizer says of a program, at its end or before, is a failure whatever else was seen."""
    for file in sorted(folder.glob("*.output")):
        text = file.read_text(encoding="utf-8", errors="replace")
        check(not any(words in text for words in REPORTS), f"a sanitizer reports in {file.name}")


def interrupted(number, _):
    # Once is enough: what is left is to end the programs that were started.
    signal.signal(number, signal.SIG_IGN)
    raise Failure("the whole took too long" if number == signal.SIGALRM else f"signal {number} came")


def run(use, paths, limit, usage, owns_folder=True, tools=()):
    """Calls use(desktop, PATH...) with the `paths` paths of the command line, of which the last is the folder for
    pictures; returns the exit code. `limit`: in seconds, below that of CTest, which would leave nobody to say what was
    waited for. `owns_folder`: the folder is the test's alone, and old pictures in it are removed. `tools`: what has to be
    installed besides what all tests use."""
    if len(sys.argv) != 1 + paths:
        print(usage, file=sys.stderr)
        return 2
    missing = missing_tools(tools)
    if missing:
        print(f"skipped: not installed here: {', '.join(missing)} (scripts/setup test installs it)")
        return SKIPPED

    for number in (signal.SIGALRM, signal.SIGTERM, signal.SIGINT, signal.SIGHUP):
        signal.signal(number, interrupted)
    signal.alarm(limit * PATIENCE)
    words = [Path(word).resolve() for word in sys.argv[1:]]
    name = Path(sys.argv[0]).stem
    screen = words[-1] / f"{name}.png"
    if owns_folder:
        words[-1].mkdir(parents=True, exist_ok=True)
        for old in words[-1].glob("*.png"):
            old.unlink()
    with tempfile.TemporaryDirectory(prefix=f"{name}.") as folder, Desktop(folder) as desktop:
        try:
            use(desktop, *words)
            check_unreported(Path(folder))
        except Exception:
            traceback.print_exc()
            desktop.picture().save(screen)
            print(f"the screen then: {screen}", file=sys.stderr)
            for file in sorted(Path(folder).glob("*.output")):
                text = file.read_text(encoding="utf-8", errors="replace")
                print(f"{file.name}: {text[-3000:]}", file=sys.stderr)
            return 1
    return 0
