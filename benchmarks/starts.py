#!/usr/bin/env python3
"""Runs start_benchmark under Wine and adds the peak memory of each process that it starts: starts.py COMMAND...

Prints "start: TITLE", a tab and milliseconds, and "memory: TITLE", a tab and KiB, for each start. The memory is the
process's own highest resident size as Linux counts it, which Wine does not tell.
"""
import glob
import os
import subprocess
import sys

PROGRAMS = {"Tolvaris": b"tolvaris.exe", "Empty window": b"empty_window.exe"}


def peak_memory(program, prefix):
    """Of the youngest process of that program in the prefix, in KiB."""
    peaks = []
    for directory in glob.glob("/proc/[0-9]*"):
        try:
            with open(directory + "/cmdline", "rb") as file:
                first = file.read().split(b"\0")[0]
            with open(directory + "/environ", "rb") as file:
                environment = file.read().split(b"\0")
            with open(directory + "/status", encoding="utf-8") as file:
                status = dict(line.split(":", 1) for line in file)
        except OSError:  # ended meanwhile, or another user's
            continue
        if first.lower().endswith(program) and b"WINEPREFIX=" + os.fsencode(prefix) in environment:
            peaks.append((int(os.path.basename(directory)), int(status["VmHWM"].split()[0])))
    return max(peaks)[1]


def main():
    runner = subprocess.Popen(sys.argv[1:], stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True)
    for line in runner.stdout:
        title, _, milliseconds = line.strip().partition("\t")
        print(f"start: {title}\t{milliseconds}")
        print(f"memory: {title}\t{peak_memory(PROGRAMS[title], os.environ['WINEPREFIX'])}")
        runner.stdin.write("\n")
        runner.stdin.flush()
    return runner.wait()


if __name__ == "__main__":
    sys.exit(main())
