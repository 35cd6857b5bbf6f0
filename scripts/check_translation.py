"""Checks that the English translation is whole: a line for each text that the program shows, and no other lines.

Every literal of the programs' sources is either a text, with its line, or one of the literals below. A new one must be
put on one side or the other.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
TRANSLATION = ROOT / "translation/english.ini"
FOLDERS = ("app", "autoconfig", "catalog", "controller", "mainwindow", "package", "savemanager", "support")
LONGEST = 254  # bytes of a translation that are shown

# What is never shown, and what is shown in every language as it is.
FORMS = re.compile(
    r"[^A-Za-zÀ-ÿ]*"                               # no letters
    r"|\0?(\w*\*?\.[\w*]+;?)+\0?|\w+\*(;\w+\*)*"  # files and patterns
    r"|[Aa]:\\|\w+\\")                             # directories
NAMES = {
    # settings and where they are
    "AvisoALTF4", "AvisoControle", "Disquete", "EmuCFG", "EmuExe", "ImgDir", "LRom", "RomDir", "SaveDir",
    r"Software\Roms\Tolvaris", "pl", "pt",
    # environment variables
    "PATH", "ProgramFiles", "ProgramFiles(x86)", "ProgramW6432",
    # the translation's section
    "TOLVARIS20",
    # the emulator's configuration file and its saves
    "GameDirectory = ", "SaveDirectory = ", "ROMPath=", "SRAMPath=", "ZSNES", "ZSNESW", "ZS", "t", " [State ",
    # packages
    "|IMGROMDAT|", "CRC=", "NOME=", "NOMEDOS=", "IIMG=", "IROM=", "TIMG=", "TROM=", "TOLVARIS", "TOLVARIS\r\n",
    "iIMG=1\r\n", "iROM=", "tIMG=", "tROM=", "CON", "PRN", "AUX", "NUL", "CONIN$", "CONOUT$", "COM1", "LPT1",
    # types of files; the pattern of all files comes with the label that file dialogs have without ours
    "SMC", "TVK", "ZIP", "smc", "tvk;", "zip", ".novo~", "0123456789abcdef",
    "Todos os arquivos (*.*)\0*.*\0",
    # processors
    "pclmul",
}

STRING = r'"((?:[^"\\\n]|\\.)*)"'
# Comments, directives and characters are passed over; neighbouring strings are one text.
TOKEN = re.compile(r"//[^\n]*|/\*.*?\*/|^\s*#[^\n]*|'(?:[^'\\\n]|\\\w+|\\.)'|(?P<texts>(?:" + STRING + r"\s*)+)",
                   re.DOTALL | re.MULTILINE)
ESCAPE = re.compile(r"\\(x[0-9A-Fa-f]+|.)")
ESCAPED = {"r": "\r", "n": "\n", "t": "\t", "0": "\0"}


def unescape(match):
    code = match[1]
    return chr(int(code[1:], 16)) if len(code) > 1 else ESCAPED.get(code, code)


def literals(source):
    """The literals of a source with the numbers of their lines."""
    for match in TOKEN.finditer(source):
        if match["texts"]:
            text = "".join(re.findall(STRING, match["texts"]))
            yield source.count("\n", 0, match.start()) + 1, ESCAPE.sub(unescape, text)


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
    faults, lines, shown = [], {}, set()
    section, *entries = [line for line in TRANSLATION.read_text(encoding="utf-8").splitlines()
                         if line and not line.startswith(";")]
    if section != "[TOLVARIS20]":
        faults.append(f"{TRANSLATION.name}: does not begin with its section")
    for entry in entries:
        key, separator, value = entry.partition("=")
        faults += [f"{TRANSLATION.name}: {entry}: {fault}" for fault in check_line(key, value if separator else "")]
        if key_of(key) in lines:
            faults.append(f"{TRANSLATION.name}: {entry}: is there already")
        lines[key_of(key)] = entry
    for path in sorted(path for folder in FOLDERS for path in (ROOT / folder).rglob("*.[ch]*")):
        for number, text in literals(path.read_text(encoding="utf-8")):
            if text in NAMES:
                continue
            if key_of(text) in lines:
                shown.add(key_of(text))
            elif not FORMS.fullmatch(text):
                faults.append(f"{path.relative_to(ROOT)}:{number}: {text!r} has no line in {TRANSLATION.name}")
    faults += [f"{TRANSLATION.name}: {entry}: no text of the program" for key, entry in lines.items()
               if key not in shown]
    print("\n".join(faults))
    return 1 if faults or not shown else 0


sys.exit(main())
