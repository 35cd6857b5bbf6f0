#!/usr/bin/env python3
"""Joins the table of figures with what was measured: report.py PART TABLE RESULTS...

Results are Google Benchmark's JSON, of which the medians count, or lines of a name, a tab and a number. Prints one line
a figure; fails when a figure's limit is missed, or one was not measured though PART is "all".
"""
import json
import statistics
import sys

MILLISECONDS = {"ns": 1e-6, "us": 1e-3, "ms": 1.0, "s": 1e3}


def read_json(path):
    with open(path, encoding="utf-8") as file:
        for run in json.load(file)["benchmarks"]:
            if run.get("error_occurred"):
                print(f"{run['name']}: {run['error_message']}", file=sys.stderr)
            elif run.get("aggregate_name") == "median":
                yield run["run_name"], run["cpu_time"] * MILLISECONDS[run["time_unit"]]


def read_lines(path):
    with open(path, encoding="utf-8") as file:
        for line in file:
            name, _, number = line.rstrip("\r\n").partition("\t")
            yield name, float(number)


def read_results(paths):
    values = {}
    for path in paths:
        for name, value in (read_json if path.endswith(".json") else read_lines)(path):
            values.setdefault(name, []).append(value)
    return {name: statistics.median(each) for name, each in values.items()}


def read_figures(path):
    with open(path, encoding="utf-8") as file:
        for line in file:
            if not line.startswith("#"):
                yield line.rstrip("\n").split("\t")


def told(figure, results):
    """The figure's line, and whether it is as it should be."""
    name, measured, peer, unit, limit = figure
    missing = [each for each in (measured, peer) if not results.get(each)]
    if missing:
        return f"{name}: NOT MEASURED ({', '.join(missing)})", False
    ratio = results[measured] / results[peer]
    line = f"{name}: {results[measured]:.4g} {unit}, peer {results[peer]:.4g} {unit}, ratio {ratio:.4g}"
    if limit == "-":
        return line, True
    missed = ratio > float(limit)
    return f"{line}, limit {limit}{' MISSED' if missed else ''}", not missed


def main():
    results = read_results(sys.argv[3:])
    figures = [each for each in read_figures(sys.argv[2]) if sys.argv[1] == "all" or each[1] in results]
    lines = [told(figure, results) for figure in figures]
    for line, _ in lines:
        print(line)
    return 0 if lines and all(good for _, good in lines) else 1


if __name__ == "__main__":
    sys.exit(main())
