#!/usr/bin/env python3
"""Measures tvk beside a program that only reads the same files, or reads and deflates them: keeper.py WINE ROUNDS

Prints, for each run, what was done and the milliseconds from the start of the process to its end, and its peak in KiB,
the highest resident size as Linux counts it. The programs lie on drive D:, where the collections are made.
"""
import os
import random
import shutil
import subprocess
import sys
import time

DISK = "build/bench/wine"  # what lies on drive D:
GAMES = (100, 1000)
OFTENER = 4  # in each round, what a disk does in a moment, and in another one in twice the time
LENGTH = 256 << 10  # bytes of a game: no ROM is shorter
GIF = b"GIF89a\1\0\1\0\x80\0\0\0\0\0\xff\xff\xff,\0\0\0\0\1\0\1\0\0\2\2D\1\0;"


def game(chance):
    """Pieces of noise and of patterns: it becomes shorter as games do."""
    left, pieces = LENGTH, []
    while left > 0:
        length = min(left, chance.randint(200, 4000))
        piece = chance.randbytes(length if chance.random() < 0.6 else 24)
        pieces.append((piece * (length // len(piece) + 1))[:length])
        left -= length
    return b"".join(pieces)


def make_collection(games):
    """An installation with so many games, each with a picture that a package takes as it is."""
    chance = random.Random(games)
    for directory in ("Roms", "Imgs"):
        os.makedirs(f"{DISK}/keeper{games}/{directory}")
    for number in range(games):
        name = f"JG{number:06}"
        with open(f"{DISK}/keeper{games}/Roms/{name}.smc", "wb") as file:
            file.write(game(chance))
        with open(f"{DISK}/keeper{games}/Imgs/{name}.gif", "wb") as file:
            file.write(GIF)


def leave_memory(directory):
    """The files have to be read from the disk again."""
    for entry in os.scandir(f"{DISK}/{directory}"):
        file = os.open(entry.path, os.O_RDONLY)
        os.fsync(file)
        os.posix_fadvise(file, 0, 0, os.POSIX_FADV_DONTNEED)
        os.close(file)


def run(wine, arguments):
    """Milliseconds that a program of drive D: takes, and its peak in KiB."""
    begin = time.perf_counter()
    process = subprocess.Popen([wine, *arguments], stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL)
    _, status, usage = os.wait4(process.pid, 0)
    if status != 0:
        sys.exit(f"keeper.py: {' '.join(arguments)} failed")
    return (time.perf_counter() - begin) * 1000, usage.ru_maxrss


def main():
    wine, rounds = sys.argv[1], int(sys.argv[2])
    for games in GAMES:
        make_collection(games)
    for _ in range(rounds):
        for games in GAMES:
            collection, packages = f"keeper{games}", f"packages{games}"
            shutil.rmtree(f"{DISK}/{packages}", ignore_errors=True)
            pack = ["tvk.exe", "criar", "--instalacao", f"D:\\{collection}", "--saida", f"D:\\{packages}"]
            verify, read = ["tvk.exe", "verificar", f"D:\\{packages}"], ["read_games.exe", "read", f"D:\\{packages}"]
            packing = (
                ("packing", f"{collection}/Roms", pack),
                ("reading and deflating games", f"{collection}/Roms",
                 ["read_games.exe", "deflate", f"D:\\{collection}\\Roms"]),
            )
            reading = (
                ("verifying", packages, verify),
                ("reading packages", packages, read),
                ("verifying cached packages", None, verify),
                ("reading cached packages", None, read),
            )
            for name, from_disk, arguments in packing + OFTENER * reading:
                if from_disk:
                    leave_memory(from_disk)
                milliseconds, memory = run(wine, ["D:\\" + arguments[0], *arguments[1:]])
                print(f"{name}, {games}\t{milliseconds}")
                print(f"memory: {name}, {games}\t{memory}")


if __name__ == "__main__":
    sys.exit(main())
