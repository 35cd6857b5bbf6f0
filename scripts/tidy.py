"""Runs clang-tidy over the sources that builds compile, each as the first build that has it does: tidy.py BUILD...

The builds need only be configured. A source is examined again only when it, a header of ours that it includes, the
rules, or a tool has changed since it was last found to be clean.
"""

import concurrent.futures
import functools
import hashlib
import json
import os
import pathlib
import re
import shlex
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
INCLUDE = re.compile(rb'^\s*#\s*include\s*"([^"]+)"', re.MULTILINE)


def output_of(*command):
    return subprocess.run(command, check=True, capture_output=True, text=True)


@functools.cache
def arguments_for(compiler):
    """What makes clang understand a command of another compiler."""
    if "mingw" not in compiler:
        return []
    # clang looks for the headers of the language in another place than Debian puts them, and knows UTF-8 alone.
    told = output_of(compiler, "-v", "-E", "-x", "c++", os.devnull).stderr
    folders = [line.strip() for line in told.splitlines() if line.startswith(" /") and "/c++" in line]
    return ["--target=x86_64-w64-mingw32", *(f"-isystem{folder}" for folder in folders), "-fexec-charset=UTF-8",
            "-Wno-error"]


def options_of(command):
    """How a source is compiled, without what goes in and out; precompiled headers are another compiler's."""
    words = iter(shlex.split(command))
    compiler = next(word for word in words if word.endswith("++") or "++-" in word)
    options = []
    for word in words:
        if word in ("-o", "-c", "-include"):
            next(words)
        elif word != "-Winvalid-pch":
            options.append(word)
    return options + arguments_for(compiler)


def sources(builds):
    """Each source with the options of the first build that compiles it."""
    found = {}
    for build in builds:
        for command in json.loads((build / "compile_commands.json").read_text()):
            path = pathlib.Path(command["directory"], command["file"])
            if path.suffix == ".cpp" and path.is_relative_to(ROOT) and path not in found:
                found[path] = options_of(command["command"])
    return found


@functools.cache
def included(path):
    """The headers of ours that a file names; they are named from the project's root."""
    named = (ROOT / name.decode() for name in INCLUDE.findall(path.read_bytes()))
    return [header for header in named if header.is_file()]


def with_headers(source):
    files, waiting = set(), [source]
    while waiting:
        path = waiting.pop()
        if path not in files:
            files.add(path)
            waiting += included(path)
    return files


def digest(source, rules):
    total = hashlib.sha256(rules)
    for path in sorted(with_headers(source)):
        total.update(str(path).encode() + b"\0" + path.read_bytes())
    return total.hexdigest()


def examine(source, options):
    # Of templates only what is used is read, which of the language's own is little: a fifth less time (2026-11-23).
    return subprocess.run(["clang-tidy", "--quiet", source, "--", *options, "-fdelayed-template-parsing"],
                          capture_output=True, text=True, check=False)


def main():
    builds = [pathlib.Path(name).resolve() for name in sys.argv[1:]]
    rules = [output_of("clang-tidy", "--version").stdout.encode(), pathlib.Path(__file__).read_bytes()]
    for where in (".clang-tidy", "*/.clang-tidy", "*/*/.clang-tidy"):
        rules += [path.read_bytes() for path in sorted(ROOT.glob(where))]
    clean = builds[0] / "tidy"
    clean.mkdir(exist_ok=True)
    waiting = {}
    for source, options in sources(builds).items():
        mark = clean / digest(source, b"".join(rules))
        if not mark.exists():
            waiting[source] = (options, mark)
    faults = 0
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        results = pool.map(lambda source: examine(source, waiting[source][0]), waiting)
        for (_, mark), result in zip(waiting.values(), results):
            if result.returncode == 0:
                mark.touch()
            else:
                faults += 1
                print(result.stdout or result.stderr)
    print(f"clang-tidy: {len(waiting)} sources examined, {faults} with faults")
    return 1 if faults else 0


sys.exit(main())
