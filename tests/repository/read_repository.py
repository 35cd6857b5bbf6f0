#!/usr/bin/env python3
"""Reads a repository as a client does, by other means than the program's: read_repository.py DIRECTORY

OpenSSL checks the signature, and every file must be what its name says. Prints the title and the serial number, then
the names of the games; what cannot be used ends it with a message and the exit code 1.
"""
import base64
import hashlib
import subprocess
import sys
import tempfile
from pathlib import Path

# A SubjectPublicKeyInfo of the curve P-256, up to the point.
KEY_HEADER = bytes.fromhex("3059301306072a8648ce3d020106082a8648ce3d030107034200")


def stanzas(text):
    assert text.endswith("\n") and "\r" not in text
    for stanza in text[:-1].split("\n\n"):
        yield dict(line.split(": ", 1) for line in stanza.split("\n") if not line.startswith("Espelho"))


def integer(number):
    """A number of a signature in DER."""
    digits = number.lstrip(b"\0")
    if digits[0] >= 0x80:
        digits = b"\0" + digits
    return bytes([2, len(digits)]) + digits


def check_signature(entry, content):
    key = base64.b64decode(entry["Chave"], validate=True)
    signature = base64.b64decode(entry["Assinatura"], validate=True)
    assert len(key) == 65 and len(signature) == 64
    numbers = integer(signature[:32]) + integer(signature[32:])
    with tempfile.TemporaryDirectory() as directory:
        files = {"key": KEY_HEADER + key, "signature": bytes([0x30, len(numbers)]) + numbers,
                 "signed": content[:content.rindex(b"Assinatura: ")]}
        for name, data in files.items():
            (Path(directory) / name).write_bytes(data)
        subprocess.run(["openssl", "dgst", "-sha256", "-verify", "key", "-keyform", "DER", "-signature", "signature", "signed"],
                       cwd=directory, check=True, capture_output=True)


def read(directory, value, extension):
    """The file that a value names, after a look whether it is whole."""
    digest, length, *_ = value.split(" ")
    content = (directory / f"{digest}.{extension}").read_bytes()
    assert len(content) == int(length) and hashlib.sha256(content).hexdigest() == digest, f"{digest} has other bytes"
    return content


def main():
    root = Path(sys.argv[1])
    content = (root / "entrada.txt").read_bytes()
    (entry,) = stanzas(content.decode())
    check_signature(entry, content)
    print(entry["Titulo"], entry["Serie"])
    games = list(stanzas(read(root / "indice", entry["Indice"], "txt").decode()))
    assert [game["Nome"] for game in games] == sorted((game["Nome"] for game in games), key=str.encode)
    for game in games:
        package = read(root / "pacotes", game["Pacote"], "tvk")
        picture = read(root / "figuras", game["Figura"], game["Figura"].split(" ")[2])
        assert picture in package and f"NOME={game['Nome']}\r\n".encode("cp1252") in package
        print(game["Nome"])


try:
    main()
except (AssertionError, KeyError, OSError, ValueError, subprocess.CalledProcessError) as fault:
    sys.exit(f"{type(fault).__name__}: {fault}")
