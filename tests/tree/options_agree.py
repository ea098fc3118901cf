#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""A program's help, its manual page and its document name the same options.

usage: tests/tree/options_agree.py PROGRAM MANUAL_PAGE DOCUMENT
"""

import re
import subprocess
import sys
from pathlib import Path

OPTION = re.compile(r"(?<![\w-])--?[a-z][a-z-]*")
# Options of other programs that documents speak of.
FOREIGN = {"-fpermissive", "-pedantic"}


def options(text):
    return set(OPTION.findall(text)) - FOREIGN


def in_manual(path):
    """Those that begin an item, and none that the text only mentions."""
    items = re.findall(r"^\.TP\n(.*)$", path.read_text(), re.MULTILINE)
    return options("\n".join(items).replace("\\-", "-"))


def in_document(path):
    """Those in the first column of tables, and in lines of commands."""
    rows = re.findall(r"^\|([^|]*)", path.read_text(), re.MULTILINE)
    commands = re.findall(rf"^{path.stem} .*$", path.read_text(), re.MULTILINE)
    return options("\n".join(rows + commands))


def main(program, manual, document):
    run = subprocess.run([program, "--help"], capture_output=True, text=True)
    told = options(run.stdout)
    if run.returncode != 0 or not told:
        print(f"{program} --help ended with {run.returncode} and told of {told or 'no options'}")
        return 1
    wrong = 0
    for name, known in ((manual, in_manual(Path(manual))), (document, in_document(Path(document)))):
        for option in sorted(told ^ known):
            print(f"{option}: " + (f"not in {name}" if option in told else f"in {name}, but unknown to {program}"))
            wrong += 1
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
