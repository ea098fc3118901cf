"""Configures the tree as on Haiku, and looks at what would be built: nothing of the kits, with the system's libraries.

usage: check_haiku.py SOURCE COMPILER
"""

import re
import subprocess
import sys
import tempfile
from pathlib import Path


def findings(source, compiler, build):
    configured = subprocess.run(
        ["cmake", "-S", source, "-B", build, "-G", "Ninja", "-DCMAKE_SYSTEM_NAME=Haiku",
         "-DCMAKE_CXX_COMPILER_WORKS=ON", f"-DCMAKE_CXX_COMPILER={compiler}", "-DPLIM_TESTS=OFF",
         "-DPLIM_BENCH=OFF", "-DPLIM_SEPARATE_PROGRAMS=ON"],
        stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True)
    if configured.returncode != 0:
        yield f"it cannot be configured:\n{configured.stdout}"
        return

    rules = (build / "build.ninja").read_text()
    for unwanted in (f"{source}/kits", "Qt6", "libbe.so", "be_display_qt"):
        if unwanted in rules:
            yield f"{unwanted} is in what is built"
    for wanted in ("plimworks", "plimgen", "plimcheck", "Components/standard.so", "MoreComponents/gauges.so"):
        link = re.search(rf"^build bin/{re.escape(wanted)}: .*\n((?:  .*\n)*)", rules, re.MULTILINE)
        if link is None:
            yield f"bin/{wanted} is not built"
        elif not re.search(r"LINK_LIBRARIES = .*-lbe\b.*-ltracker\b", link.group(1)):
            yield f"bin/{wanted} is linked without the system's libraries"

    installs = "".join(script.read_text() for script in build.rglob("cmake_install.cmake"))
    if f"{source}/kits" in installs:
        yield "headers of the kits are installed"
    if "Components" not in installs:
        yield "no component libraries are installed"


def main():
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    with tempfile.TemporaryDirectory() as folder:
        found = list(findings(sys.argv[1], sys.argv[2], Path(folder)))
    for finding in found:
        print(finding)
    sys.exit(1 if found else 0)


if __name__ == "__main__":
    main()
