"""What the programs show, as build/native/tests/shown_texts prints it."""

import pathlib
import subprocess
from typing import NamedTuple

ROOT = pathlib.Path(__file__).resolve().parent.parent
PRINTER = ROOT / "build/native/tests/shown_texts"

SEPARATORS = {r"\n": "\r\n", r"\n\n": "\r\n\r\n", " ": " "}
VALUE = "%"


class Message(NamedTuple):
    name: str
    title: str
    buttons: str
    icon: str
    pieces: list  # those that are translated, separators and the value

    def texts(self):
        """The pieces that are translated."""
        return [piece for piece in self.pieces if piece not in SEPARATORS and piece != VALUE]


def shown():
    """The messages, and all other texts."""
    printed = subprocess.run([PRINTER], check=True, capture_output=True).stdout.decode("cp1252")
    messages, texts = [], set()
    for line in printed.splitlines():
        kind, *fields = line.split("\t")
        if kind == "message":
            name, title, buttons, icon, *pieces = fields
            messages.append(Message(name, title, buttons, icon, pieces))
        else:
            texts.add(fields[0])
    return messages, texts


def keys():
    """Every text that goes through the translation."""
    messages, texts = shown()
    never = {"Tolvaris"}  # the program's name
    return {text for message in messages for text in [message.title, *message.texts()]} | (texts - never)
