"""Runs clang-tidy over the sources that builds compile, each as the first build that has it does: tidy.py BUILD...

The builds need only be configured. Sources are examined again only when one that is read with them, a header of ours
that they include, the rules, or a tool has changed since they were last found to be clean.
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
import tempfile

TOGETHER = 12  # sources that are read as one
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


def digest(group, rules):
    total = hashlib.sha256(rules)
    for path in sorted(set().union(*map(with_headers, group))):
        total.update(str(path).encode() + b"\0" + path.read_bytes())
    return total.hexdigest()


def groups(found):
    """Sources of one folder that are compiled alike, some at a time."""
    alike = {}
    for source, options in sorted(found.items()):
        alike.setdefault((source.parent, tuple(options)), []).append(source)
    return [(tuple(members[start:start + TOGETHER]), options)
            for (_, options), members in alike.items() for start in range(0, len(members), TOGETHER)]


def examine(group, options):
    """What is wrong in a group of sources; nothing when nothing is.

    They are read as one, for what clang-tidy spends its time on is the language's own headers. Where two of them have a
    name in common they are read apart. Of templates only what is used is read. What one file hides of another is no fault.
    """
    with tempfile.TemporaryDirectory() as place:
        together, overlay = pathlib.Path(place, "together.cpp"), pathlib.Path(place, "overlay.json")
        together.write_text("".join(f'#include "{source}"  // NOLINT(bugprone-suspicious-include)\n' for source in group))
        # To clang-tidy the file stands in the sources' folder, whose rules hold for it.
        seen = group[0].parent / together.name
        overlay.write_text(json.dumps({"version": 0, "roots": [
            {"type": "file", "name": str(seen), "external-contents": str(together)}]}))
        command = ["clang-tidy", "--quiet", f"--vfsoverlay={overlay}", seen, "--", *options,
                   "-fdelayed-template-parsing", "-Wno-shadow"]
        result = subprocess.run(command, capture_output=True, text=True, check=False)
    if result.returncode == 0:
        return ""
    if len(group) > 1 and "clang-diagnostic-error" in result.stdout:
        middle = len(group) // 2
        return examine(group[:middle], options) + examine(group[middle:], options)
    return result.stdout or result.stderr


def main():
    builds = [pathlib.Path(name).resolve() for name in sys.argv[1:]]
    rules = [output_of("clang-tidy", "--version").stdout.encode(), pathlib.Path(__file__).read_bytes()]
    for where in (".clang-tidy", "*/.clang-tidy", "*/*/.clang-tidy"):
        rules += [path.read_bytes() for path in sorted(ROOT.glob(where))]
    clean = builds[0] / "tidy"
    clean.mkdir(exist_ok=True)
    found = sources(builds)
    waiting = {}
    for group, options in groups(found):
        mark = clean / digest(group, b"".join(rules))
        if not mark.exists():
            waiting[group] = (options, mark)
    faults = 0
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        results = pool.map(lambda group: examine(group, waiting[group][0]), waiting)
        for (_, mark), told in zip(waiting.values(), results):
            if told:
                faults += 1
                print(told)
            else:
                mark.touch()
    examined = sum(map(len, waiting))
    print(f"clang-tidy: {examined} of {len(found)} sources examined, faults in {faults} of {len(waiting)} groups")
    return 1 if faults or not found else 0


sys.exit(main())
