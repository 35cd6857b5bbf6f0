#!/usr/bin/env python3
"""The game package written and read by a program of its own, to hold the C++ one against.

  package_format.py build PACKAGE NAME DOSNAME PICTURE ROM
    writes a package; the checksum is computed
  package_format.py read PACKAGE PICTURE ROM
    writes the two blocks there, and prints name, DOS name, checksum text and the ROM's own checksum, a line each

Names on the command line are texts; in the package they are bytes of code page 1252.
"""
import re
import sys
import zlib
from pathlib import Path

CODE_PAGE = "cp1252"
CHUNK = 1 << 20
HEADER_LIMIT = 10240
MARKER = b"|IMGROMDAT|"


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


def parse(content):
    """Name, DOS name, checksum text, picture and ROM of a package that nobody has tampered with, all as bytes."""
    header = content[:re.search(re.escape(MARKER), content, re.IGNORECASE).end()]

    def value(key):
        return re.search(re.escape(key) + rb"(.*?)\r\n", header, re.IGNORECASE | re.DOTALL).group(1)

    def block(start_key, length_key):
        start = len(header) + int(value(start_key)) - 1
        return content[start:start + int(value(length_key))]

    return value(b"NOME="), value(b"NOMEDOS="), value(b"CRC="), block(b"IIMG=", b"TIMG="), block(b"IROM=", b"TROM=")


def main(arguments):
    match arguments:
        case ["build", package, name, dos_name, picture, rom]:
            image, data = Path(picture).read_bytes(), Path(rom).read_bytes()
            names = (name.encode(CODE_PAGE), dos_name.encode(CODE_PAGE))
            Path(package).write_bytes(build(*names, str(checksum(data)).encode(), image, data))
        case ["read", package, *targets]:
            *texts, image, data = parse(Path(package).read_bytes())
            for text in texts:
                print(text.decode(CODE_PAGE, "backslashreplace"))
            print(checksum(data))
            for target, block in zip(targets, (image, data), strict=True):
                Path(target).write_bytes(block)
        case _:
            sys.exit(__doc__)


if __name__ == "__main__":
    sys.stdout.reconfigure(encoding="utf-8")
    main(sys.argv[1:])
