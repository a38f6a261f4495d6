#!/usr/bin/env python3
"""Prints the ratios of benchmark runs, each beside its bound.

    ratios.py REPORT...    reports of the benchmarks without their .json

Exit status 1 when a ratio is over its bound or a benchmark failed."""
import json
import os
import sys


def rows_of(report):
    """(name, ratio, bound) of each benchmark that has a ratio; one that failed has none."""
    with open(report + ".json", encoding="utf-8") as file:
        runs = json.load(file)["benchmarks"]
    for run in runs:
        name = run["name"].replace("/manual_time", "").replace("/iterations:1", "")
        name = f"{os.path.basename(report)}: {name} {run.get('label', '')}".rstrip()
        if run.get("error_occurred"):
            yield f"{name}: {run['error_message']}", None, 0
        elif "ratio" in run:
            yield name, run["ratio"], run["bound"]


def line_of(name, ratio, bound):
    """The line of one ratio."""
    return f"{'OVER' if ratio > bound else 'within':8} {ratio:7.2f} of {bound:5.2f}  {name}"


def main():
    over = 0
    for report in sys.argv[1:]:
        for name, ratio, bound in rows_of(report):
            if ratio is None:
                over += 1
                print(f"failed   {name}")
                continue
            over += ratio > bound
            print(line_of(name, ratio, bound))
    return 1 if over else 0


if __name__ == "__main__":
    sys.exit(main())
