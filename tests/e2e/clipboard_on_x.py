#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""The clipboard between two programs of the kits, and between one and xclip.

usage: tests/e2e/clipboard_on_x.py EXCHANGE_PROGRAM XDND_CLIENT FOLDER
"""

import os
import signal
import subprocess
import sys

from exchange import Program, check, main
from waits import wait_for

FOO = "application/x-foo"
FOO_BYTES = bytes(range(256)) * 3
LARGE = 10 * 1024 * 1024


def xclip_out(desktop, target):
    result = subprocess.run(["xclip", "-out", "-selection", "clipboard", "-t", target], env=desktop.environment,
                            timeout=60, stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, check=False)
    return result.stdout if result.returncode == 0 else None


def xclip_in(desktop, target, content):
    """Another program offers the content until somebody else takes the clipboard."""
    file = desktop.folder / "offered"
    file.write_bytes(content)
    owner = desktop.start(["xclip", "-quiet", "-in", "-selection", "clipboard", "-t", target, file], "xclip")
    wait_for("xclip has the clipboard", lambda: (xclip_out(desktop, "TARGETS") or b"").split() == [
        b"TARGETS", target.encode()])
    return owner


class Session:
    def __init__(self, desktop, program):
        self.desktop = desktop
        self.one = Program(desktop, [program], "one")
        self.two = Program(desktop, [program], "two")
        for each in (self.one, self.two):
            each.expect("ready")

    def file(self, name, content):
        path = self.desktop.folder / name
        path.write_bytes(content)
        return path

    def fetched(self, program, type_name):
        """What the program reads from the clipboard: the line it prints, and the content of one type."""
        path = self.desktop.folder / "fetched"
        path.unlink(missing_ok=True)
        line = program.ask(f"get {type_name} {path}", "clipboard")
        return line, path.read_bytes() if path.exists() else None

    def expect_fetched(self, program, type_name, content):
        """Soon: a program hears a little later that another one has the clipboard now."""
        wait_for(f"{content[:20]} as {type_name}", lambda: self.fetched(program, type_name)[1] == content)

    def between_programs(self):
        self.one.tell(f"put text/plain {self.file('text', b'Moon')}")
        self.one.tell(f"put {FOO} {self.file('foo', FOO_BYTES)}")
        self.one.tell("put-number count 7")
        self.one.ask("commit", "committed 0")
        self.expect_fetched(self.two, FOO, FOO_BYTES)
        line, _ = self.fetched(self.two, FOO)
        check(line == f"clipboard text/plain=4 {FOO}={len(FOO_BYTES)} count=4", f"the other program has: {line}")
        check(self.fetched(self.two, "text/plain")[1] == b"Moon", "the text is another one")
        check(self.fetched(self.one, "text/plain")[1] == b"Moon", "the program does not see its own text")

    def to_xclip(self):
        check(xclip_out(self.desktop, "UTF8_STRING") == b"Moon", "xclip gets another text")
        check(xclip_out(self.desktop, "text/plain") == b"Moon", "xclip gets another text by its type")
        check(xclip_out(self.desktop, FOO) == FOO_BYTES, "xclip gets other bytes of the program's own type")
        check(not xclip_out(self.desktop, "application/x-bar"), "xclip gets what nobody offers")

    def from_xclip(self):
        xclip_in(self.desktop, "UTF8_STRING", "Grüße".encode())
        self.expect_fetched(self.one, "text/plain", "Grüße".encode())
        line, _ = self.fetched(self.one, "text/plain")
        check(line == "clipboard text/plain=7", f"of a text came {line}")
        xclip_in(self.desktop, FOO, FOO_BYTES)
        self.expect_fetched(self.one, FOO, FOO_BYTES)
        line, _ = self.fetched(self.one, FOO)
        check(line == f"clipboard {FOO}={len(FOO_BYTES)}", f"of another type came {line}")
        xclip_in(self.desktop, "UTF8_STRING", b"a\xff\xfeb")
        self.expect_fetched(self.one, "text/plain", "a\ufffd\ufffdb".encode())

    def broken_text(self):
        self.one.tell(f"put text/plain {self.file('text', b'a' + bytes([0xff]) + b'b')}")
        self.one.ask("commit", "committed 0")
        self.expect_fetched(self.two, "text/plain", b"a\xffb")
        check(xclip_out(self.desktop, "UTF8_STRING") == "a\ufffdb".encode(), "xclip gets what is no UTF-8")

    def much_text(self):
        text = (b"0123456789abcde\n" * (LARGE // 16))
        self.two.tell(f"put text/plain {self.file('large', text)}")
        self.two.ask("commit", "committed 0")
        self.expect_fetched(self.one, "text/plain", text)
        check(xclip_out(self.desktop, "UTF8_STRING") == text, "10 MB came changed to xclip")
        xclip_in(self.desktop, "UTF8_STRING", text)
        self.expect_fetched(self.one, "text/plain", text)

    def emptied(self):
        self.two.ask("commit", "committed 0")
        wait_for("an empty clipboard", lambda: self.fetched(self.one, FOO)[0] == "clipboard")
        check(not xclip_out(self.desktop, "UTF8_STRING"), "there is a text on the emptied clipboard")

    def silent_owner(self):
        owner = xclip_in(self.desktop, "UTF8_STRING", b"never given")
        os.kill(owner.pid, signal.SIGSTOP)
        try:
            line, _ = self.fetched(self.one, "text/plain")
            check(line == "clipboard", f"of a program that does not answer came {line}")
            self.one.forget()
            check("libbe: the program that has the clipboard does not answer" in self.one.lines(),
                  f"nothing was said about it: {self.one.lines()}")
        finally:
            os.kill(owner.pid, signal.SIGCONT)
        # It answers the requests that it slept through first.
        self.expect_fetched(self.one, "text/plain", b"never given")

    def owner_that_ended(self):
        self.one.tell(f"put text/plain {self.file('text', b'mine')}")
        self.one.ask("commit", "committed 0")
        self.expect_fetched(self.two, "text/plain", b"mine")
        self.one.quit()
        # What a program has seen stays with it.
        check(self.fetched(self.two, "text/plain")[1] == b"mine", "the text went with the program that had it")
        self.two.quit()


def use_clipboard(desktop, program, _):
    session = Session(desktop, program)
    for part in (session.between_programs, session.to_xclip, session.from_xclip, session.broken_text,
                 session.much_text, session.emptied, session.silent_owner, session.owner_that_ended):
        part()
        print(part.__name__, "done", flush=True)


if __name__ == "__main__":
    sys.exit(main(use_clipboard))
