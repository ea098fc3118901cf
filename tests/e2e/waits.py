# SPDX-License-Identifier: MIT
"""Waiting for what a test expects."""

import os
import time

# More where programs are slow because a sanitizer watches them.
PATIENCE = int(os.environ.get("PLIM_PATIENCE", "1"))
# No wait is meant to come near this, on the slowest of machines.
LIMIT = 40 * PATIENCE
# Between two looks at what is waited for; most things come soon.
SHORTEST_PAUSE, LONGEST_PAUSE = 0.001, 0.02


class Failure(Exception):
    """What was expected and did not happen."""


def wait_for(what, answer):
    """Asks until \\a answer gives something true, and returns that."""
    end = time.monotonic() + LIMIT
    pause = SHORTEST_PAUSE
    while True:
        result = answer()
        if result:
            return result
        if time.monotonic() > end:
            raise Failure(f"this did not come about within {LIMIT} s: {what}")
        time.sleep(pause)
        pause = min(2 * pause, LONGEST_PAUSE)
