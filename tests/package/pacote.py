#!/usr/bin/env python3
"""The game package written, read and checked by a program of its own, to hold the C++ one against.

  pacote.py montar PACKAGE NAME DOSNAME PICTURE ROM    writes a package; the checksum is computed
  pacote.py ler PACKAGE [PICTURE ROM]                  prints name, DOS name, checksum text and the ROM's own checksum, a
                                                       line each; with two more paths it writes the two blocks there
  pacote.py crc FILE                                   prints a file's checksum, or "None"

Names on the command line are texts; in the package they are bytes of code page 1252. Exit code 3: refused.
"""
import re
import sys
import zlib
from pathlib import Path

CODE_PAGE = "cp1252"
CHUNK = 1 << 20
HEADER_LIMIT = 10240
MARKER = b"|IMGROMDAT|"
LARGEST = 2**31 - 1
DEVICE = re.compile(rb"(CON|PRN|AUX|NUL|CONIN\$|CONOUT\$|(COM|LPT)[0-9\xb9\xb2\xb3]) *(\.|$)", re.IGNORECASE)


class Refused(Exception):
    pass


def checksum(data):
    """The sum of the signed CRC-32 values at the end of each full chunk and at the end of the data.

    None when no bytes are left after the last full chunk."""
    if len(data) % CHUNK == 0:
        return None
    total = crc = 0
    for start in range(0, len(data), CHUNK):
        crc = zlib.crc32(data[start:start + CHUNK], crc)
        total += crc - (1 << 32) if crc >> 31 else crc
    return total


def build(name, dos_name, crc_text, picture, rom):
    lines = [b"TOLVARIS", b"NOME=" + name, b"NOMEDOS=" + dos_name, b"CRC=" + crc_text, b"iIMG=1",
             b"tIMG=%d" % len(picture), b"iROM=%d" % (len(picture) + 1), b"tROM=%d" % len(rom)]
    return b"".join(line + b"\r\n" for line in lines) + MARKER + picture + rom


def number(text):
    text = text.strip(b" \t")
    if not re.fullmatch(rb"[0-9]+", text) or not 1 <= int(text) <= LARGEST:
        raise Refused(f"not a number from 1 to {LARGEST}: {text!r}")
    return int(text)


def parse(content):
    """Name, DOS name, checksum text, picture and ROM, all as bytes."""
    marker = re.search(re.escape(MARKER), content[:HEADER_LIMIT], re.IGNORECASE)
    if content[:8].upper() != b"TOLVARIS" or not marker:
        raise Refused("no magic or no marker")
    header = content[:marker.end()]

    def value(key):
        found = re.search(re.escape(key) + rb"(.*?)\r\n", header, re.IGNORECASE | re.DOTALL)
        if not found:
            raise Refused(f"no line with {key!r}")
        return found.group(1)

    name, dos_name, crc_text = value(b"NOME="), value(b"NOMEDOS="), value(b"CRC=")
    blocks = []
    for start_key, length_key in ((b"IIMG=", b"TIMG="), (b"IROM=", b"TROM=")):
        start = len(header) + number(value(start_key)) - 1
        blocks.append(content[start:start + number(value(length_key))])
    if any(re.search(rb"[\x00-\x1f\\/:]", text) or DEVICE.match(text) for text in (name, dos_name)):
        raise Refused("a name that leaves its directory")
    return name, dos_name, crc_text, blocks[0], blocks[1]


def main(arguments):
    match arguments:
        case ["montar", package, name, dos_name, picture, rom]:
            image, data = Path(picture).read_bytes(), Path(rom).read_bytes()
            total = checksum(data)
            if total is None:
                raise Refused("the ROM has no checksum")
            names = (name.encode(CODE_PAGE), dos_name.encode(CODE_PAGE))
            Path(package).write_bytes(build(*names, str(total).encode(), image, data))
        case ["ler", package, *targets] if len(targets) in (0, 2):
            *texts, image, data = parse(Path(package).read_bytes())
            for text in texts:
                print(text.decode(CODE_PAGE, "backslashreplace"))
            print(checksum(data))
            for target, block in zip(targets, (image, data)):
                Path(target).write_bytes(block)
        case ["crc", file]:
            print(checksum(Path(file).read_bytes()))
        case _:
            sys.exit(__doc__)


if __name__ == "__main__":
    sys.stdout.reconfigure(encoding="utf-8")
    try:
        main(sys.argv[1:])
    except Refused as refusal:
        print(f"refused: {refusal}", file=sys.stderr)
        sys.exit(3)
