#!/usr/bin/env python3
"""Measures the start of Tolvaris with its list beside an empty window's: starts.py WINE ENTRIES ROUNDS

Prints, for each start, "start: TITLE" and the milliseconds from the start of the process until its window stands, and
"memory: TITLE" and the process's peak in KiB, its highest resident size as Linux counts it. The programs lie on drive
D:.
"""
import glob
import os
import subprocess
import sys
import time

PAUSE = 0.2  # seconds, until what is left of the program before is gone


def peak_memory(program):
    """Of the youngest process of that program in this prefix, in KiB."""
    prefix = b"WINEPREFIX=" + os.fsencode(os.environ["WINEPREFIX"])
    peaks = []
    for directory in glob.glob("/proc/[0-9]*"):
        try:
            with open(directory + "/cmdline", "rb") as file:
                command = file.read().lower()
            with open(directory + "/environ", "rb") as file:
                environment = file.read().split(b"\0")
            with open(directory + "/status", encoding="utf-8") as file:
                status = dict(line.split(":", 1) for line in file)
        except OSError:  # ended meanwhile, or another user's
            continue
        if program.lower().encode() in command and prefix in environment:
            peaks.append((int(os.path.basename(directory)), int(status["VmHWM"].split()[0])))
    return max(peaks)[1]


class Watcher:
    """The Windows program that sees the windows come."""

    def __init__(self, wine):
        self.wine = wine
        self.process = subprocess.Popen([wine, r"D:\start_benchmark.exe"], stdin=subprocess.PIPE,
                                        stdout=subprocess.PIPE, text=True)

    def tell(self, line):
        self.process.stdin.write(line + "\n")
        self.process.stdin.flush()

    def answer(self):
        line = self.process.stdout.readline()
        if not line:
            sys.exit("starts.py: a window did not come, or did not go")
        return line.strip()

    def start(self, title, entries, program):
        """Milliseconds from the start of the process, and its peak memory."""
        self.tell(f"{title}\t{entries}")
        begin = time.perf_counter()
        started = subprocess.Popen([self.wine, program], stdin=subprocess.DEVNULL)
        self.answer()
        milliseconds = (time.perf_counter() - begin) * 1000
        memory = peak_memory(program)
        self.tell("")
        self.answer()
        started.wait()
        time.sleep(PAUSE)
        return milliseconds, memory


def main():
    wine, entries, rounds = sys.argv[1], int(sys.argv[2]), int(sys.argv[3])
    watcher = Watcher(wine)
    programs = [("Tolvaris", entries, r"D:\tolvaris.exe"), ("Empty window", 0, r"D:\empty_window.exe")]
    for _ in range(rounds):
        for program in programs:
            milliseconds, memory = watcher.start(*program)
            print(f"start: {program[0]}\t{milliseconds}")
            print(f"memory: {program[0]}\t{memory}")
    watcher.process.stdin.close()
    return watcher.process.wait()


if __name__ == "__main__":
    sys.exit(main())
