"""Checks the rules that the sources keep, and prints each place that breaks one.

Usage: check_sources.py [BUILD...]: with build directories, every source must be compiled in one of them.
"""

import json
import pathlib
import re
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
LONGEST = 400  # lines

# Who may include whose headers, besides its own: app -> windows -> collection -> package, catalog -> support -> platform.
SUPPORT = {"platform", "support"}
WINDOW = SUPPORT | {"catalog", "package", "collection", "resources"}
MAY_INCLUDE = {
    "platform": {"resources"},
    "support": {"platform"},
    "catalog": SUPPORT,
    "package": SUPPORT,
    "collection": SUPPORT | {"catalog", "package"},
    "controller": WINDOW,
    "savemanager": WINDOW,
    "mainwindow": WINDOW | {"controller", "savemanager"},
    "autoconfig": SUPPORT,
    "app": WINDOW | {"controller", "savemanager", "mainwindow"},
}
SYSTEM_HEADERS = re.compile(r"(platform|tests|benchmarks)/windows/|tests/contract/\w+_windows\.cpp$")
TWIN_HEADERS = ("platform/simulated/", "tests/", "benchmarks/")
INCLUDE = re.compile(r'^\s*#\s*include\s*[<"]([^>"]+)[>"]')


def project_files():
    listed = subprocess.run(
        ["git", "ls-files", "-z", "--cached", "--others", "--exclude-standard"],
        cwd=ROOT, check=True, capture_output=True).stdout.decode().split("\0")
    return [name for name in listed if name and (ROOT / name).is_file()]


# What only support/ does: a text that is written where it is shown would escape the translation's checks.
MESSAGE = re.compile(r'MessageBoxA\(|Traduzir\("')
SHOWS_NO_TEXTS = ("app/", "autoconfig/", "catalog/", "collection/", "controller/", "mainwindow/", "package/", "savemanager/")


def check_include(name, included):
    folder, _, _ = name.partition("/")
    other, separator, _ = included.partition("/")
    if included.lower() == "windows.h" and not SYSTEM_HEADERS.match(name):
        yield "includes <windows.h>"
    if included.startswith("platform/simulated/") and not name.startswith(TWIN_HEADERS):
        yield f"includes {included}, which is for tests"
    if included.startswith("platform/windows/") and not name.startswith(("platform/windows/", "tests/contract/")):
        yield f"includes {included}, which is for its own folder"
    if folder in MAY_INCLUDE and separator and (ROOT / other).is_dir():
        if other != folder and other not in MAY_INCLUDE[folder]:
            yield f"includes {included}: {folder} must not know {other}"


def check_source(name):
    lines = (ROOT / name).read_text(encoding="utf-8").splitlines()
    if len(lines) > LONGEST:
        yield name, len(lines), f"is longer than {LONGEST} lines"
    for number, line in enumerate(lines, 1):
        if match := INCLUDE.match(line):
            for fault in check_include(name, match[1]):
                yield name, number, fault
        if name.startswith(SHOWS_NO_TEXTS) and MESSAGE.search(line):
            yield name, number, "shows a text that has no name in support/mensagens.h or textos.h"


def check_compiled(sources, builds):
    compiled = set()
    for build in builds:
        for command in json.loads((pathlib.Path(build) / "compile_commands.json").read_text()):
            compiled.add((pathlib.Path(command["directory"]) / command["file"]).resolve())
    for name in sources:
        if name.endswith(".cpp") and (ROOT / name) not in compiled:
            yield name, 1, "is part of no build"


def main():
    files = project_files()
    sources = [name for name in files if name.endswith((".cpp", ".h"))]
    faults = [(name, 1, "has a name that is not plain ASCII") for name in files if not name.isascii()]
    for name in sources:
        faults += check_source(name)
    if len(sys.argv) > 1:
        faults += check_compiled(sources, sys.argv[1:])
    for name, line, fault in faults:
        print(f"{name}:{line}: {fault}")
    if not sources:
        print("no sources found")
    return 1 if faults or not sources else 0


sys.exit(main())
