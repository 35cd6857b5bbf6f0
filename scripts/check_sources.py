"""Checks the rules that the sources keep, and prints each place that breaks one.

Usage: check_sources.py [BUILD...]: with build directories, every source must be compiled in one of them.
"""

import collections
import json
import pathlib
import re
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
LONGEST = 400  # lines

# A library of a folder, as CMakeLists.txt makes it: its name, the folder, and what it is linked with.
LIBRARY = re.compile(r"^\s*tolvaris_folder\((\w+)\s+(\w+)[\w/]*([^)]*)\)", re.MULTILINE)
SYSTEM_HEADERS = re.compile(r"(platform|tests|benchmarks)/windows/|tests/contract/\w+_windows\.cpp$")
TWIN_HEADERS = ("platform/simulated/", "tests/", "benchmarks/")
INCLUDE = re.compile(r'^\s*#\s*include\s*[<"]([^>"]+)[>"]')
USING = re.compile(r"^\s*using (?:\w+::)+(\w+);")


def project_files():
    listed = subprocess.run(
        ["git", "ls-files", "-z", "--cached", "--others", "--exclude-standard"],
        cwd=ROOT, check=True, capture_output=True).stdout.decode().split("\0")
    return [name for name in listed if name and (ROOT / name).is_file()]


# What only support/ does: a text that is written where it is shown would escape the translation's checks.
MESSAGE = re.compile(r'MessageBoxA\(|Traduzir\("')
SHOWS_NO_TEXTS = ("app/", "autoconfig/", "catalog/", "collection/", "controller/", "keeper/", "mainwindow/", "package/", "repository/", "savemanager/")


def layers():
    """Of each folder that is a library: the folders that it is linked with, directly or through others."""
    libraries = LIBRARY.findall((ROOT / "CMakeLists.txt").read_text(encoding="utf-8"))
    folders = {name: folder for name, folder, _ in libraries}
    below = {folder: set() for folder in folders.values()}
    for _ in libraries:
        for _, folder, linked in libraries:
            for other in (folders[name] for name in linked.split() if name in folders):
                below[folder] |= {other} | below[other]
    return below


def check_include(name, included, below):
    folder, _, _ = name.partition("/")
    other, separator, _ = included.partition("/")
    if included.lower() == "windows.h" and not SYSTEM_HEADERS.match(name):
        yield "includes <windows.h>"
    if included.startswith("platform/simulated/") and not name.startswith(TWIN_HEADERS):
        yield f"includes {included}, which is for tests"
    if included.startswith("platform/windows/") and not name.startswith(("platform/windows/", "tests/contract/")):
        yield f"includes {included}, which is for its own folder"
    if folder in below and separator and (ROOT / other).is_dir():
        if other not in below[folder] | {folder, "resources"}:
            yield f"includes {included}: {folder} is not linked with {other}"


def check_source(name, below):
    lines = (ROOT / name).read_text(encoding="utf-8").splitlines()
    if len(lines) > LONGEST:
        yield name, len(lines), f"is longer than {LONGEST} lines"
    words = collections.Counter(re.findall(r"\w+", "\n".join(lines)))
    for number, line in enumerate(lines, 1):
        if name.endswith(".cpp") and (match := USING.match(line)) and words[match[1]] < 2:
            yield name, number, f"uses no {match[1]}"
        if match := INCLUDE.match(line):
            for fault in check_include(name, match[1], below):
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
    files, below = project_files(), layers()
    sources = [name for name in files if name.endswith((".cpp", ".h"))]
    faults = [(name, 1, "has a name that is not plain ASCII") for name in files if not name.isascii()]
    for name in sources:
        faults += check_source(name, below)
    if len(sys.argv) > 1:
        faults += check_compiled(sources, sys.argv[1:])
    for name, line, fault in faults:
        print(f"{name}:{line}: {fault}")
    if not sources or not below:
        print("no sources or no layers found")
        return 1
    return 1 if faults else 0


sys.exit(main())
