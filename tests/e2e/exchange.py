# SPDX-License-Identifier: MIT
"""What the tests of programs that exchange data share: the programs, and the run of a test."""

import subprocess
import sys

from waits import wait_for
from xtest import check, run

WHOLE_LIMIT = 220


class Program:
    """A running exchange_program, or any other that prints lines."""

    def __init__(self, desktop, command, name, **options):
        self.name = name
        self.seen = 0
        self.output_file = desktop.output_of(name)
        self.process = desktop.start(command, name, stdin=subprocess.PIPE, **options)

    def lines(self):
        text = self.output_file.read_text(encoding="utf-8", errors="replace")
        return text.splitlines()[:text.count("\n")]

    def tell(self, command):
        self.process.stdin.write((command + "\n").encode())
        self.process.stdin.flush()

    def expect(self, line):
        """Waits for a line that begins so, after those that were waited for before; returns it."""
        def found():
            lines = self.lines()
            for number in range(self.seen, len(lines)):
                if lines[number].startswith(line):
                    self.seen = number + 1
                    return lines[number]
            check(self.process.poll() is None, f"{self.name} ended with {self.process.poll()}: {lines}")
            return None
        return wait_for(f"{self.name} prints \"{line}\" after {self.lines()[:self.seen][-3:]}", found)

    def ask(self, command, answer):
        self.tell(command)
        return self.expect(answer)

    def expect_exactly(self, line):
        found = self.expect(line)
        check(found == line, f"{self.name} prints \"{found}\", not \"{line}\"")

    def expect_all(self, *wanted):
        """The same of several whole lines, in whatever order they come."""
        def found():
            new = self.lines()[self.seen:]
            if all(line in new for line in wanted):
                self.seen += 1 + max(new.index(line) for line in wanted)
                return True
            check(self.process.poll() is None, f"{self.name} ended with {self.process.poll()}: {new}")
            return False
        wait_for(f"{self.name} prints all of {wanted}", found)

    def forget(self):
        self.seen = len(self.lines())

    def check_silent_about(self, word):
        new = self.lines()[self.seen:]
        check(not any(word in line for line in new), f"{self.name} prints \"{word}\": {new}")

    def quit(self):
        self.tell("quit")
        wait_for(f"{self.name} ends", lambda: self.process.poll() is not None)
        check(self.process.returncode == 0, f"{self.name} ended with {self.process.returncode}: {self.lines()}")


def main(use, tools=()):
    """Calls use(desktop, program, client), which needs these tools, too; returns the exit code."""
    usage = f"usage: {sys.argv[0]} EXCHANGE_PROGRAM XDND_CLIENT FOLDER"
    return run(lambda desktop, program, client, _: use(desktop, program, client), 3, WHOLE_LIMIT, usage,
               owns_folder=False, tools=tools)
