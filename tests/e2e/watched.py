# SPDX-License-Identifier: MIT
"""A program whose robot only looks: it tells where things are on the screen and what they show."""

import os

from exchange import Program


class Watched(Program):
    """The running program with a robot that carries out each line when it is told."""

    def __init__(self, desktop, command, name):
        self.desktop = desktop
        self.pipe_path = desktop.folder / f"{name}.robot"
        os.mkfifo(self.pipe_path)
        # Both ends, so that neither waits for the other.
        self.pipe = os.open(self.pipe_path, os.O_RDWR)
        self.output = None
        self.known = []
        self.rest = ""
        super().__init__(desktop, command, name, environment={"BE_ROBOT_SCRIPT": str(self.pipe_path)})
        self.tell("limit 20")

    def lines(self):
        """All so far. Only what is new is read: a program may print much."""
        if self.output is None:
            self.output = open(self.output_file, encoding="utf-8", errors="replace")
        *new, self.rest = (self.rest + self.output.read()).split("\n")
        self.known += new
        return self.known

    def tell(self, command):
        os.write(self.pipe, (command + "\n").encode())

    def look_at(self, title):
        """What is asked from now on is about this window."""
        self.tell(f'wait-window "{title}"')
        self.ask("print-windows", f"window: {title}")
        self.desktop.wait_for_window(title)

    def expect_no_window(self, title):
        self.tell(f'wait-no-window "{title}"')
        self.desktop.wait_for_no_window(title)

    def expect_text(self, view, text):
        self.tell(f'expect-view "{view}" "{text}"')
        self.ask(f'print-view "{view}"', f"{view}: {text}")

    def frame(self, name, kind="print-frame"):
        answer = self.ask(f'{kind} "{name}"', f"{name}: ")
        return [float(word) for word in answer[len(name) + 2:].split()]

    def stop_watching(self):
        """The robot leaves."""
        os.close(self.pipe)
