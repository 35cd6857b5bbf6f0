"""Checks that the English translation is whole: a line for each text that the programs show, and no other lines."""

import re
import sys

from shown_texts import ROOT, keys

TRANSLATION = ROOT / "translation/english.ini"
LONGEST = 254  # bytes of a translation that are shown


def key_of(text):
    """What the system compares: blanks around a key and its letter case do not count."""
    return text.strip(" ").upper()


def check_line(key, value):
    """What is wrong with a line."""
    if not key.isprintable() or key != key.strip() or key.startswith((";", "[")) or not value.strip("| "):
        yield "is no line of a translation"
    if key.count("&") != value.count("&"):
        yield "does not keep the accelerator"
    if re.match(r"""[ '"]|.*[ '"]$""", value):
        yield "loses the blanks or quotation marks at its ends without bars around them"
    if len(value.encode("cp1252", errors="replace")) > LONGEST:
        yield f"is longer than {LONGEST} characters"
    if (key + value).encode("cp1252", errors="replace").decode("cp1252") != key + value:
        yield "has a character that code page 1252 lacks"


def main():
    faults, lines = [], {}
    section, *entries = [line for line in TRANSLATION.read_text(encoding="utf-8").splitlines()
                         if line and not line.startswith(";")]
    if section != "[TOLVARIS20]":
        faults.append("does not begin with its section")
    for entry in entries:
        key, separator, value = entry.partition("=")
        faults += [f"{entry}: {fault}" for fault in check_line(key, value if separator else "")]
        if key_of(key) in lines:
            faults.append(f"{entry}: is there already")
        lines[key_of(key)] = entry
    shown = {key_of(text): text for text in keys()}
    faults += [f"{shown[key]!r} has no line" for key in sorted(shown.keys() - lines.keys())]
    faults += [f"{lines[key]}: no text of the program" for key in sorted(lines.keys() - shown.keys())]
    for fault in faults:
        print(f"{TRANSLATION.relative_to(ROOT)}: {fault}")
    return 1 if faults or not shown else 0


sys.exit(main())
