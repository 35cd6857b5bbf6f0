"""Runs clang-tidy over the program's own sources of a built directory: tidy.py BUILD

A source is examined again only when it, a header of ours that it includes, .clang-tidy or the tool has changed since
it was last found to be clean.
"""

import concurrent.futures
import hashlib
import json
import os
import pathlib
import shlex
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
FOLDERS = ("app", "autoconfig", "catalog", "controller", "mainwindow", "package", "platform", "savemanager", "support")


def own(path):
    return path.is_relative_to(ROOT) and path.relative_to(ROOT).parts[0] in FOLDERS


def sources(build):
    """Each source with the object file that the build makes of it."""
    for command in json.loads((build / "compile_commands.json").read_text()):
        path = pathlib.Path(command["file"])
        if own(path):
            words = shlex.split(command["command"])
            yield path, words[words.index("-o") + 1]


def included(build):
    """By object file: our files that went into it, as the last build saw them."""
    listing = subprocess.run(["ninja", "-C", build, "-t", "deps"], check=True, capture_output=True, text=True).stdout
    files = {}
    for line in listing.splitlines():
        if line.startswith(" "):
            path = (build / line.strip()).resolve()
            if own(path):
                current.append(path)
        elif ": #deps" in line:
            current = files.setdefault(line.partition(": #deps")[0], [])
    return files


def digest(files, tool):
    total = hashlib.sha256(tool)
    for path in [ROOT / ".clang-tidy", *sorted(set(files))]:
        total.update(str(path).encode() + b"\0" + path.read_bytes())
    return total.hexdigest()


def examine(build, source):
    return subprocess.run(
        ["clang-tidy", "--quiet", "-p", build, source], capture_output=True, text=True, check=False)


def main():
    build = pathlib.Path(sys.argv[1]).resolve()
    tool = subprocess.run(["clang-tidy", "--version"], check=True, capture_output=True).stdout
    clean = build / "tidy"
    clean.mkdir(exist_ok=True)
    dependencies = included(build)
    waiting = {}
    for source, output in sources(build):
        if output not in dependencies:
            print(f"{source.relative_to(ROOT)} has not been built")
            return 1
        mark = clean / digest([source, *dependencies[output]], tool)
        if not mark.exists():
            waiting[source] = mark
    faults = 0
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        results = pool.map(lambda source: examine(build, source), waiting)
        for (source, mark), result in zip(waiting.items(), results):
            if result.returncode == 0:
                mark.touch()
            else:
                faults += 1
                print(result.stdout or result.stderr)
    print(f"clang-tidy: {len(waiting)} sources examined, {faults} with faults")
    return 1 if faults else 0


sys.exit(main())
