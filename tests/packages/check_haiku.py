"""Configures the tree as the recipe for Haiku's packages does, and looks at what would be built and installed: nothing of
the kits, with the system's libraries, and all that the recipe names.

usage: check_haiku.py SOURCE COMPILER
"""

import fnmatch
import re
import shlex
import subprocess
import sys
import tempfile
from pathlib import Path


# What the tool for recipes sets.
FOLDERS = {"prefix": "/packages/plimworks", "relativeBinDir": "bin", "relativeLibDir": "lib",
           "relativeIncludeDir": "develop/headers", "relativeManDir": "documentation/man", "relativeDataDir": "data",
           "binDir": "$prefix/bin", "libDir": "$prefix/lib", "dataDir": "$prefix/data", "developDir": "$prefix/develop",
           "developLibDir": "$prefix/develop/lib", "jobArgs": "",
           "secondaryArchSuffix": "", "targetArchitecture": "x86_64"}
INSTALLED = re.compile(r'file\(INSTALL DESTINATION "\$\{CMAKE_INSTALL_PREFIX\}/([^"]*)" TYPE (\w+) FILES((?:\s+"[^"]*")+)')


def expand(text):
    """The text with the values of its variables."""
    known = dict(FOLDERS, commandBinDir="$relativeBinDir", commandSuffix="")
    while re.search(r"\$\{?\w", text):
        text = re.sub(r"\$\{?(\w+)\}?", lambda match: known[match.group(1)], text)
    return text


def function(recipe, name):
    """The commands of a function of the recipe, each as its words."""
    body = re.search(rf"^{name}\(\)\n\{{\n(.*?)^\}}", recipe, re.MULTILINE | re.DOTALL).group(1)
    lines = expand(body.replace("\\\n", " ")).splitlines()
    return [words for words in (shlex.split(line, comments=True) for line in lines) if words]


def configure(recipe, source, compiler, build):
    command = next(words for words in function(recipe, "BUILD") if words[:2] == ["cmake", "-S"])
    options = command[command.index("build") + 1:]
    return subprocess.run(
        ["cmake", "-S", source, "-B", build, "-DCMAKE_SYSTEM_NAME=Haiku", "-DCMAKE_CXX_COMPILER_WORKS=ON",
         f"-DCMAKE_CXX_COMPILER={compiler}", *options],
        stdout=subprocess.PIPE, stderr=subprocess.STDOUT, text=True)


def installed(scripts):
    """Every file and folder that is installed."""
    for folder, kind, files in INSTALLED.findall(scripts):
        yield f"{FOLDERS['prefix']}/{folder}"
        if kind != "DIRECTORY":
            for file in re.findall(r'"([^"]*)"', files):
                yield f"{FOLDERS['prefix']}/{folder}/{Path(file).name}"


def unknown_paths(recipe, paths):
    """What the recipe names of the installation and the installation lacks."""
    def is_there(pattern):
        return any(fnmatch.fnmatch(path, pattern) or path.startswith(f"{pattern}/") for path in paths)

    for words in function(recipe, "INSTALL"):
        if words[0] == "prepareInstalledDevelLibs":
            named = [expand(f"$libDir/{library}.so") for library in words[1:]]
        elif words[0] == "sed":
            # The tool has moved what is in lib/pkgconfig.
            named = [word.replace("/develop/lib/", "/lib/") for word in words if word.startswith("/")]
        else:
            named = [word for word in words if word.startswith("/")]
        for path in named:
            if not is_there(path):
                yield f"{words[0]}: {path} is not installed"
    provided = re.findall(r"^\t(cmd|lib):(\w+)\S* = ", recipe, re.MULTILINE)
    for kind, name in provided:
        path = expand(f"$binDir/{name}" if kind == "cmd" else f"$libDir/{name}.so")
        if not is_there(path):
            yield f"{kind}:{name} is provided, but {path} is not installed"
    commands = {name for kind, name in provided if kind == "cmd"}
    for path in paths:
        if Path(path).parent == Path(expand("$binDir")) and Path(path).name not in commands:
            yield f"{path} is installed, but no command is provided for it"


def findings(source, compiler, build):
    file = next((Path(source) / "packaging" / "haiku").glob("plimworks-*.recipe"))
    recipe = file.read_text()
    configured = configure(recipe, source, compiler, build)
    if configured.returncode != 0:
        yield f"it cannot be configured:\n{configured.stdout}"
        return

    version = re.search(r"^CMAKE_PROJECT_VERSION:\w+=(.*)", (build / "CMakeCache.txt").read_text(), re.MULTILINE).group(1)
    if file.name != f"plimworks-{version}.recipe":
        yield f"{file.name} is not named after version {version}"

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
    paths = set(installed(installs))
    for wanted in ("Components/standard.so", "MoreComponents/gauges.so"):
        if expand(f"$libDir/plimworks/{wanted}") not in paths:
            yield f"{wanted} is not installed beside the programs"
    yield from unknown_paths(recipe, paths)
    for words in function(recipe, "TEST"):
        built = f"build {words[0].removeprefix('build/')}:"
        if not re.search(rf"^{re.escape(built)} (?!phony)", rules, re.MULTILINE):
            yield f"TEST: {words[0]} is not built"
        yield from (f"TEST: there is no {word}" for word in words[1:]
                    if "/" in word and not (Path(source) / word).exists())


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
