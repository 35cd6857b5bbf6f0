#!/usr/bin/env python3
"""checksum.py ROM: writes the checksum and its complement into the header of a 32 KiB image."""
import struct
import sys

COMPLEMENT = 0x7FDC

with open(sys.argv[1], "r+b") as file:
    image = bytearray(file.read())
    if len(image) != 32768:
        sys.exit(f"{sys.argv[1]}: {len(image)} bytes instead of 32768")
    # The four bytes count as FF FF 00 00; whatever they become, their sum stays the same.
    image[COMPLEMENT:COMPLEMENT + 4] = b"\xff\xff\x00\x00"
    checksum = sum(image) & 0xFFFF
    file.seek(COMPLEMENT)
    file.write(struct.pack("<HH", checksum ^ 0xFFFF, checksum))
