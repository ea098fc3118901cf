"""Installs each component of a build by itself, and looks at what belongs to which.

usage: check_components.py BUILD
"""

import re
import subprocess
import sys
import tempfile
from pathlib import Path

PROGRAMS = ("plimworks", "plimgen", "plimcheck")

# Regular expressions, each of which some file of the component must match.
WANTED = {
    "designer": [
        *(f"bin/{program}" for program in PROGRAMS),
        *(rf"share/man/man1/{program}\.1" for program in PROGRAMS),
        r"lib/libplim\.so\.\d+\.\d+",
        r"lib/libplim\.so\.\d+\.\d+\.\d+",
        r"bin/Components/standard\.so",
        r"bin/MoreComponents/gauges\.so",
        r"share/applications/plimworks\.desktop",
        r"share/mime/packages/plimworks\.xml",
        r"share/icons/hicolor/48x48/apps/plimworks\.png",
        r"share/icons/hicolor/48x48/mimetypes/application-x-plim-form\.png",
        r"share/icons/hicolor/scalable/apps/plimworks\.svg",
        r"share/icons/hicolor/scalable/mimetypes/application-x-plim-project\.svg",
    ],
    "runtime": [
        r"lib/libbe\.so\.\d+\.\d+",
        r"lib/libbe\.so\.\d+\.\d+\.\d+",
        r"lib/libbe_display_qt\.so",
        r"lib/libormi\.so\.\d+\.\d+",
        r"lib/libormi\.so\.\d+\.\d+\.\d+",
    ],
    "development": [
        r"include/plimworks/Ormi\.h",
        r"include/plimworks/be/interface/Window\.h",
        r"include/plimworks/designer/model/ComponentKit\.h",
        r"include/plimworks/gauges/.*\.h",
        *(rf"lib/cmake/{package}/{package}{file}\.cmake" for package in ("Ormi", "Plimworks")
          for file in ("Config", "ConfigVersion", "Targets", "Targets-[a-z]+")),
        r"lib/cmake/Plimworks/PlimworksLibrary\.cmake",
        r"lib/libbe\.so",
        r"lib/libormi\.so",
        r"lib/libplim\.so",
        r"lib/pkgconfig/ormi\.pc",
    ],
}

# What no file of another component may match.
ONLY = {
    "designer": r"(bin|share)/.*",
    "runtime": r"(?!)",
    "development": r"(include|.*/cmake|.*/pkgconfig)/.*",
}


def installed(build, prefix, *component):
    prefix.mkdir()
    subprocess.run(["cmake", "--install", build, "--prefix", prefix, *component], check=True,
                   stdout=subprocess.DEVNULL)
    return {str(path.relative_to(prefix)) for path in prefix.rglob("*")
            if path.is_symlink() or not path.is_dir()}


def findings(build, folder):
    everything = installed(build, folder / "everything")
    parts = {name: installed(build, folder / name, "--component", name) for name in WANTED}

    for name, files in parts.items():
        for wanted in WANTED[name]:
            if not any(re.fullmatch(wanted, file) for file in files):
                yield f"{name} lacks {wanted}"
        for other in set(parts) - {name}:
            for file in sorted(files & parts[other]):
                if name < other:
                    yield f"{file} is in {name} and in {other}"
            for file in sorted(files):
                if re.fullmatch(ONLY[other], file):
                    yield f"{file} is in {name}, and belongs to {other}"
    for library in (build / "bin" / "Components").glob("*.so"):
        if f"bin/Components/{library.name}" in everything - parts["designer"]:
            yield f"designer lacks the component library {library.name}"
    for file in sorted(everything - set().union(*parts.values())):
        yield f"{file} is in no component"


def main():
    if len(sys.argv) != 2:
        sys.exit(__doc__)
    with tempfile.TemporaryDirectory() as folder:
        found = list(findings(Path(sys.argv[1]), Path(folder)))
    for finding in found:
        print(finding)
    sys.exit(1 if found else 0)


if __name__ == "__main__":
    main()
