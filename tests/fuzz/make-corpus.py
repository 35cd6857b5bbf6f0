#!/usr/bin/env python3
"""Writes the packages that the fuzzer begins with: make-corpus.py DIRECTORY"""
import sys
from pathlib import Path

sys.dont_write_bytecode = True
sys.path.insert(0, str(Path(__file__).parent.parent / "package"))
from pacote import HEADER_LIMIT, build  # noqa: E402

EXAMPLE = build(b"Super Jogo", b"SUPERJOG", b"-873187034", b"GIF89a", b"123456789")
LONGEST = HEADER_LIMIT - len(build(b"", b"", b"1", b"I", b"R")) + len(b"IR")

SEEDS = {
    "example": EXAMPLE,
    "accents": build("Ação|Pão=1".encode("cp1252"), b"ACAO", b"1", b"BM", b"PK\3\4"),
    "other-case": EXAMPLE[:104].swapcase() + EXAMPLE[104:],
    "other-order": b"TOLVARIStROM= 9 \r\nIROM=7\r\nTIMG=06\r\nIIMG=1\r\nCRC=\r\nNOMEDOS=\r\nNOME=\r\n" + EXAMPLE[93:],
    "no-picture": build(b"", b"", b"", b"", b"R"),
    "key-in-name": build(b"Jogo CRC=5 tROM=1", b"iROM=1", b"1", b"I", b"R"),
    "marker-in-name": build(b"Jogo |IMGROMDAT|", b"JOGO", b"1", b"I", b"R"),
    "elsewhere": build(b"..\\Jogo", b"COM1", b"1", b"I", b"R"),
    "huge-numbers": EXAMPLE.replace(b"tROM=9", b"tROM=2147483647").replace(b"iROM=7", b"iROM=2147483647"),
    "longest-header": build(b"x" * LONGEST, b"", b"1", b"I", b"R"),
    "pieces": b"Super Jogo\nSUPERJOG\n-873187034\nGIF89a\n123456789",
    "pieces-odd": b" \xe7.\nLPT0 .a\n\r\r\n\0\n\n",
}

for file, content in SEEDS.items():
    (Path(sys.argv[1]) / file).write_bytes(content)
