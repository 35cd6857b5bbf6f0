"""Checks what is written about the programs' texts against the programs: check_what_it_shows.py [--write]

With --write the rows of docs/what-it-shows.md get the texts, titles, buttons and icons that the messages have now.

docs/what-it-shows.md: each message has its row, whose text, title, buttons and icon are those of the message; every other
text stands there; every test that it names exists. LEIAME.md: each message has a row that says what to do.
"""

import re
import sys

from shown_texts import ROOT, SEPARATORS, VALUE, shown

PAGE = ROOT / "docs/what-it-shows.md"
GUIDE = ROOT / "LEIAME.md"

TEST = re.compile(r"^TEST(?:_F|_P)?\(\s*(\w+),\s*(\w+)\s*\)", re.MULTILINE)
NAMED = re.compile(r"`(\w+/[A-Z]\w*\.\w+)`")
ROW = re.compile(r"^\| (?!---)[^\n]*\n(?!\| ---)", re.MULTILINE)  # but the heads of tables


def tests():
    for path in (ROOT / "tests").rglob("*.cpp"):
        folder = path.relative_to(ROOT / "tests").parts[0]
        for suite, name in TEST.findall(path.read_text(encoding="utf-8")):
            yield f"{folder}/{suite}.{name}"


def row_of(message):
    """How a message's row begins."""
    pieces = ["…" if piece == VALUE else f'"{piece}"' for piece in message.pieces if piece not in SEPARATORS]
    return f'| `{message.name}` | {" ".join(pieces)} | "{message.title}", {message.buttons}, {message.icon} | '


def rewritten(page, messages):
    """The page with each message's row beginning as it should."""
    for message in messages:
        row = re.compile(rf'^\| `{message.name}` \|[^|]*\|[^|]*\| ', re.MULTILINE)
        page = row.sub(lambda _, message=message: row_of(message), page)
    return page


def bare(text):
    """Without what the guide writes as it reads best: blanks, full stops and the value."""
    return re.sub(r"[ .…]", "", text)


def explained(guide):
    """The first cell of each row of the guide's tables."""
    return {bare(row.split(" | ")[0].lstrip("| ")) for row in ROW.findall(guide)}


def main():
    messages, texts = shown()
    if sys.argv[1:] == ["--write"]:
        PAGE.write_text(rewritten(PAGE.read_text(encoding="utf-8"), messages), encoding="utf-8")
    page, existing = PAGE.read_text(encoding="utf-8"), set(tests())
    rows = ROW.findall(page)
    faults = [f"{PAGE.name}: {name} does not exist" for name in sorted(set(NAMED.findall(page)) - existing)]
    faults += [f"{PAGE.name}: no test is named: {row.strip()}" for row in rows if not NAMED.search(row)]
    faults += [f"{PAGE.name}: no row begins with {row_of(message)}" for message in messages
               if not any(row.startswith(row_of(message)) for row in rows)]
    faults += [f'{PAGE.name}: "{text}" is missing' for text in sorted(texts)
               if not any(f'"{text.strip(" ")}"' in row for row in rows)]
    guide = explained(GUIDE.read_text(encoding="utf-8"))
    faults += [f"{GUIDE.name}: what to do at {message.name} is missing" for message in messages
               if bare("".join(message.texts())) not in guide]
    print("\n".join(faults))
    return 1 if faults or not (rows and existing and messages) else 0


sys.exit(main())
