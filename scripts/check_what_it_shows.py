"""Checks docs/what-it-shows.md: every text of the program stands there, and every test that it names exists.

What the texts of the program are, check_translation.py sees to: they are the keys of the English translation.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
PAGE = ROOT / "docs/what-it-shows.md"
TRANSLATION = ROOT / "translation/english.ini"

TEST = re.compile(r"^TEST(?:_F|_P)?\(\s*(\w+),\s*(\w+)\s*\)", re.MULTILINE)
NAMED = re.compile(r"`(\w+/\w+\.\w+)`")
ROW = re.compile(r"^\| (?!---)[^\n]*\n(?!\| ---)", re.MULTILINE)  # but the heads of tables


def tests():
    for path in (ROOT / "tests").rglob("*.cpp"):
        folder = path.relative_to(ROOT / "tests").parts[0]
        for suite, name in TEST.findall(path.read_text(encoding="utf-8")):
            yield f"{folder}/{suite}.{name}"


def texts():
    for line in TRANSLATION.read_text(encoding="utf-8").splitlines():
        if line and line[0] not in ";[":
            yield line.partition("=")[0]


def main():
    page = PAGE.read_text(encoding="utf-8")
    rows = ROW.findall(page)
    existing, expected = set(tests()), list(texts())
    faults = [f"{name} does not exist" for name in sorted(set(NAMED.findall(page)) - existing)]
    faults += [f'"{text}" is missing' for text in expected if not any(f'"{text}"' in row for row in rows)]
    faults += [f"no test is named: {row.strip()}" for row in rows if not NAMED.search(row)]
    for fault in faults:
        print(f"{PAGE.relative_to(ROOT)}: {fault}")
    return 1 if faults or not (rows and existing and expected) else 0


sys.exit(main())
