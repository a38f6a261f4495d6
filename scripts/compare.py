#!/usr/bin/env python3
"""Measures tzconvert as a whole process beside other programs on the same document.

    compare.py BUILD [ROUNDS]    BUILD holds bin/tzconvert and tests/bare_pass; 9 rounds

Each round runs every program once. What counts is the median of the processor's time, so that other
work on the machine does not. Prints one line for each ratio with its bound, as ratios.py does, and
then the times and peaks of memory; exit status 1 when one is over. A program that is not
installed is left out, with a line that says so."""
import argparse
import os
import shutil
import statistics
import sys
import tempfile
import time

from ratios import line_of

CHANGES = (r"\b ", r"\b0 ", r"\f1 ", r"\f0 ", r"\fs40 ", r"\fs32 ", r"\cf1 ", r"\cf0 ", r"\ul ",
           r"\ul0 ", r"\i ", r"\i0 ")
HEAD = (r"{\rtf1\ansi\deff0{\fonttbl{\f0\fswiss Arial;}{\f1\froman Times New Roman;}}"
        r"{\colortbl;\red255\green0\blue0;}")
RUN = "a run of text that no code interrupts, i"
MILLION = 1000000
WARMING = 3  # rounds that are not counted: memory that a virtual machine touches first is slow
LETTERS = 100 * MILLION


def document(size):
    """Rich text with a change of the look every 40 characters."""
    block = "".join(change + RUN for change in CHANGES) + "\n\\par "
    return HEAD + block * ((size - len(HEAD)) // len(block)) + "}"


def run(command):
    """(seconds of the processor, peak of memory in bytes) of a program that must succeed."""
    null = [(os.POSIX_SPAWN_OPEN, fd, os.devnull, os.O_WRONLY, 0) for fd in (1, 2)]
    pid = os.posix_spawn(command[0], command, os.environ, file_actions=null)
    _, status, usage = os.wait4(pid, 0)
    if status != 0:
        sys.exit(f"{' '.join(command)}: exit status {os.waitstatus_to_exitcode(status)}")
    return usage.ru_utime + usage.ru_stime, usage.ru_maxrss * 1024


class Report:
    """Prints ratios and remembers whether one was over."""

    over = False

    def line(self, name, ratio, bound):
        self.over = self.over or ratio > bound
        print(line_of("process: " + name, ratio, bound), flush=True)


def compare_speed(report, convert, bare, file, rounds):
    others = {"bare pass": ([bare], 2.5), "catdoc": (["catdoc", "-d", "utf-8"], 1 / 1.2),
              "unrtf": (["unrtf", "--text"], 1 / 7)}
    commands = {"tzconvert": [convert, "to-mtext"]}
    for name, (command, _) in others.items():
        program = shutil.which(command[0])
        if program:
            commands[name] = [program] + command[1:]
        else:
            print(f"skipped  {name}: not installed")
    times = {name: [] for name in commands}
    peaks = {}
    for turn in range(-WARMING, rounds):
        for name, command in commands.items():
            seconds, peaks[name] = run(command + [file])
            if turn >= 0:
                times[name].append(seconds)
    medians = {name: statistics.median(each) for name, each in times.items()}
    size = os.path.getsize(file)
    for name in commands:
        print(f"         {name}: {medians[name] * 1000:.0f} ms, {peaks[name] / size:.1f} bytes of "
              "memory for one of the input")
    for name in commands:
        if name in others:
            report.line(f"time of to-mtext over {name}", medians["tzconvert"] / medians[name],
                        others[name][1])
    report.line("memory of to-mtext over its input", peaks["tzconvert"] / size, 12)


def measure_depth(report, convert, file):
    """Memory of a million levels: the peak at two million open groups less that at one million."""
    for way, level in (("to-mtext", r"{\b a"), ("to-rtf", "{a")):
        peaks = []
        for depth in (MILLION, 2 * MILLION):
            with open(file, "w", encoding="ascii") as out:
                out.write(level * depth)
            peaks.append(run([convert, way, file])[1])
        report.line(f"bytes for a level of groups, {way}", (peaks[1] - peaks[0]) / MILLION, 128)


SMALL_FILES = 2000
NOTE = r"{\fArial|b0|i0|c0|p34;Note %d}\P{\H1.5x;\Lunderlined\l} and {\C1;red}\Pa second line of it"


def write_renamed(contents, folder, is_flushed):
    """Seconds to write each file beside its place and rename it; one that is flushed as well is the old
    or the new one after a crash."""
    handle = os.open(folder, os.O_RDONLY)
    begin = time.monotonic()
    for number, content in enumerate(contents):
        part = os.path.join(folder, f".part{number}")
        with open(part, "wb", buffering=0) as out:
            out.write(content)
            if is_flushed:
                os.fsync(out.fileno())
        os.rename(part, os.path.join(folder, str(number)))
        if is_flushed:
            os.fsync(handle)
    seconds = time.monotonic() - begin
    os.close(handle)
    return seconds


def emptied(folder):
    shutil.rmtree(folder, ignore_errors=True)
    os.mkdir(folder)
    os.sync()  # no earlier work is waited for
    return folder


def measure_batch(report, convert, folder, rounds):
    """Time on the clock of a batch of small files, beside writing its results and no more."""
    notes, results = (emptied(os.path.join(folder, name)) for name in ("notes", "results"))
    files = [os.path.join(notes, f"{number}.txt") for number in range(SMALL_FILES)]
    for number, file in enumerate(files):
        with open(file, "w", encoding="ascii") as out:
            out.write(NOTE % number)
    times = {"batch": [], "written": [], "flushed": []}
    for _ in range(rounds):
        emptied(results)
        begin = time.monotonic()
        run([convert, "to-rtf", "-q", "--output-dir", results] + files)
        times["batch"].append(time.monotonic() - begin)
        contents = []
        for name in os.listdir(results):
            with open(os.path.join(results, name), "rb") as made:
                contents.append(made.read())
        for name in ("written", "flushed"):
            times[name].append(write_renamed(contents, emptied(results), name == "flushed"))
    medians = {name: statistics.median(each) for name, each in times.items()}
    print(f"         {SMALL_FILES} small files: {medians['batch']:.2f} s, written and renamed "
          f"{medians['written']:.2f} s, each flushed as well {medians['flushed']:.2f} s")
    report.line(f"{SMALL_FILES} small files over writing and renaming them",
                medians["batch"] / medians["written"], 3)


def measure_letters(report, convert, file):
    with open(file, "w", encoding="ascii") as out:
        for _ in range(100):
            out.write("a" * (LETTERS // 100))
    for way in ("to-mtext", "to-rtf"):
        seconds, peak = run([convert, way, file])
        print(f"         100 MB of one letter, {way}: {seconds:.2f} s")
        report.line(f"memory of {way} over 100 MB of one letter", peak / LETTERS, 12)


def main():
    arguments = argparse.ArgumentParser(description=__doc__,
                                        formatter_class=argparse.RawDescriptionHelpFormatter)
    arguments.add_argument("build", metavar="BUILD", type=os.path.abspath)
    arguments.add_argument("rounds", metavar="ROUNDS", nargs="?", type=int, default=9)
    options = arguments.parse_args()
    build, rounds = options.build, options.rounds
    convert = os.path.join(build, "bin", "tzconvert")
    report = Report()
    with tempfile.TemporaryDirectory() as folder:
        file = os.path.join(folder, "document.rtf")
        with open(file, "w", encoding="ascii") as out:
            out.write(document(10 * MILLION))
        compare_speed(report, convert, os.path.join(build, "tests", "bare_pass"), file, rounds)
        measure_batch(report, convert, folder, rounds)
        measure_depth(report, convert, file)
        measure_letters(report, convert, file)
    return 1 if report.over else 0


if __name__ == "__main__":
    sys.exit(main())
