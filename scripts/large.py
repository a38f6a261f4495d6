#!/usr/bin/env python3
"""Tests large drawings with the whole program of the release build, which must be there.

    large.py speed  [--entities N]            making, opening and saving: times and memory
    large.py saving [--entities N] [--kills N] [--limits N]
                                              saves that are killed, cut short or refused

Prints each figure beside its bound; exit status 1 when one is not held. With 100,000 entities, the
default, speed takes half a minute of processor time and saving 200 kills a quarter of an hour."""
import argparse
import os
import random
import re
import resource
import shutil
import signal
import subprocess
import sys
import tempfile
import time
from pathlib import Path

BUILD = Path(__file__).resolve().parent.parent / "build/release"
PROGRAM = BUILD / "bin/tzdraft"
PART = 1000  # entities of the small runs that a large one is compared with
NOBODY = 65534


def environment(folder):
    """The environment of a run: fixed fonts, and no settings of any user."""
    return os.environ | {"FONTCONFIG_FILE": str(BUILD / "tests/fonts/fonts.conf"),
                         "XDG_CONFIG_HOME": str(folder / "settings"), "LC_ALL": "C.UTF-8"}


class Run:
    """One run of the program with its status, processor seconds and peak of memory in bytes."""

    def __init__(self, folder, script, *words):
        file = folder / "script.scr"
        file.write_text(script, encoding="utf-8")
        with open(folder / "transcript.txt", "wb") as out:
            process = subprocess.Popen([PROGRAM, "--script", file, *words], stdout=out,
                                       stderr=subprocess.STDOUT, env=environment(folder))
            _, status, used = os.wait4(process.pid, 0)
        process.returncode = self.status = os.waitstatus_to_exitcode(status)
        self.seconds = used.ru_utime + used.ru_stime
        self.peak = used.ru_maxrss * 1024
        if self.status != 0:
            sys.exit(f"status {self.status}: {file} {' '.join(map(str, words))}")


def texts(count):
    """A script that makes so many MTEXTs."""
    return "NEW\n" + "".join(f"-MTEXT\n{i % 100},{i // 100}\n@5,2\nNote {i}\n\n"
                             for i in range(count)) + "QUIT\n"


class Report:
    def __init__(self):
        self.over = 0

    def line(self, what, value, bound, unit=""):
        is_over = value > bound
        self.over += is_over
        print(f"{'OVER' if is_over else 'within':8} {value:8.2f} of {bound:8.2f}{unit}  {what}",
              flush=True)

    def count(self, what, wrong, tried):
        self.over += wrong > 0
        print(f"{'WRONG' if wrong else 'right':8} {tried - wrong:8} of {tried:8}  {what}", flush=True)


def memory_at_rest(folder, drawing):
    """Bytes in use while the opened drawing waits for a command, and the peak up to there."""
    with subprocess.Popen([PROGRAM, "--script", "-", drawing], stdin=subprocess.PIPE,
                          stdout=subprocess.PIPE, env=environment(folder)) as process:
        process.stdin.write(b"SETVAR\nTEXTSIZE\n\n")
        process.stdin.flush()
        while b"TEXTSIZE" not in process.stdout.readline():
            pass
        status = Path(f"/proc/{process.pid}/status").read_text(encoding="ascii")
        process.stdin.close()
        process.stdout.read()
    return [int(re.search(rf"{name}:\s+(\d+)", status)[1]) * 1024 for name in ("VmRSS", "VmHWM")]


def speed(folder, options, report):
    count = options.entities
    small, large = folder / "small.json", folder / "large.json"
    parts = [Run(folder, texts(PART), "--save", small) for _ in range(count // PART)]
    whole = Run(folder, texts(count), "--save", large)
    base = min(run.peak for run in parts)
    report.line(f"making {count} MTEXTs over {count // PART} times {PART}",
                whole.seconds / sum(run.seconds for run in parts), 1.5)
    report.line("memory for each entity made", (whole.peak - base) / (count - PART), 1024, " bytes")

    part = Run(folder, "QUIT\n", small).seconds - Run(folder, "QUIT\n").seconds
    opened = Run(folder, "QUIT\n", large)
    report.line("opening, an entity over one of the small drawing",
                opened.seconds / count / max(part / PART, 1e-9), 1.5)
    rest, peak = memory_at_rest(folder, large)
    report.line("peak of memory while opening over what stays", peak / rest, 1.1)
    again = Run(folder, "QUIT\n", large, "--save", folder / "again.json")
    report.line("peak of memory while opening and saving over making", again.peak / whole.peak, 1)
    same = (folder / "again.json").read_bytes() == large.read_bytes()
    report.count("opened and saved with nothing changed", not same, 1)


def wait_for_size(process, temporaries, wanted, whole):
    """Until the new temporary file has the wanted size; what is wanted beyond the whole of it is
    time, up to 0.3 seconds, in which it is flushed and renamed."""
    reached = 0
    while process.poll() is None and reached < min(wanted, whole * 0.999):
        try:
            reached = max((each.stat().st_size for each in temporaries()), default=reached)
        except FileNotFoundError:
            break
        time.sleep(0.0005)
    if wanted > whole:
        time.sleep(wanted / whole - 1)


class Saves:
    """Saves of one large drawing, each with another TEXTSIZE in it, to the same file."""

    def __init__(self, folder, count, report):
        self.folder, self.report = folder, report
        self.plans = folder / "plans"
        self.plans.mkdir()
        self.file = self.plans / "plan.json"
        Run(folder, texts(count), "--save", self.file)
        self.number = 0
        self.save()
        self.head, self.rest = self.file.read_bytes().split(b'"TEXTSIZE":1,')
        start = time.monotonic()
        self.save()
        print(f"one run takes {time.monotonic() - start:.1f} s", flush=True)

    def start(self, **how):
        self.number += 1
        script = self.folder / "size.scr"
        script.write_text(f"SETVAR\nTEXTSIZE\n{self.number}\nQUIT\n", encoding="ascii")
        command = [PROGRAM, "--script", script, self.file, "--save", self.file]
        return subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.PIPE,
                                env=environment(self.folder), **how)

    def save(self):
        process = self.start()
        errors = process.communicate()[1].decode()
        if process.returncode != 0:
            sys.exit(f"a save by itself fails: {errors}")

    def held(self):
        """The number of the save that the file is of; None when it is none whole."""
        data = self.file.read_bytes()
        size = re.search(rb'"TEXTSIZE":(\d+),', data[:2000])
        is_whole = size and data == self.head + size[0] + self.rest
        return int(size[1]) if is_whole else None

    def temporaries(self):
        return [each for each in self.plans.iterdir() if each != self.file]

    def kill(self, times):
        """Kills saves when the temporary file has a random size, or a little after it has all."""
        wrong, new, litter = 0, 0, 0
        size = self.file.stat().st_size
        for _ in range(times):
            before, left = self.held(), set(self.temporaries())
            process = self.start()
            wait_for_size(process, lambda: set(self.temporaries()) - left,
                          random.uniform(0, 1.3) * size, size)
            process.send_signal(signal.SIGKILL)
            process.communicate()
            after = self.held()
            wrong += after not in (before, self.number)
            new += after == self.number
            for each in set(self.temporaries()) - left:
                litter += 1
                if left:  # one stays, in the way of all that follow
                    each.unlink()
        self.report.count(f"files whole after kill -9, {new} of them the new one, "
                          f"{litter} times with a temporary file beside", wrong, times)
        before = self.number
        self.save()
        self.report.count("saves after them", self.held() != before + 1, 1)
        for each in self.temporaries():
            each.unlink()

    def refused(self, what, times, how):
        """Each save ends with one line and status 2, and leaves the old file and nothing else."""
        wrong = 0
        for _ in range(times):
            before = self.file.read_bytes()
            process = self.start(**how())
            errors = process.communicate()[1].decode()
            is_right = (process.returncode == 2 and errors.count("\n") == 1
                        and f"tzdraft: {self.file}: cannot be written: " in errors
                        and self.file.read_bytes() == before and not self.temporaries())
            if not is_right:
                print(process.returncode, errors, [each.name for each in self.temporaries()])
            wrong += not is_right
        self.report.count(what, wrong, times)


def file_size_limit(size):
    def limit():
        most = random.randrange(1, size)
        resource.setrlimit(resource.RLIMIT_FSIZE, (most, most))
    return limit


def full_disk(folder, saves):
    """A file system with room for the old file and a part of the new one; None without one."""
    room = folder / "room"
    room.mkdir()
    size = int(saves.file.stat().st_size * 1.5)
    mount = ["mount", "-t", "tmpfs", "-o", f"size={size}", "tmpfs", room]
    if os.geteuid() != 0 or subprocess.run(mount, stderr=subprocess.DEVNULL).returncode != 0:
        return None
    shutil.copy(saves.file, room / "plan.json")
    saves.plans, saves.file = room, room / "plan.json"
    return room


def saving(folder, options, report):
    saves = Saves(folder, options.entities, report)
    saves.kill(options.kills)
    size = saves.file.stat().st_size
    saves.refused("saves under a file size limit", options.limits,
                  lambda: {"preexec_fn": file_size_limit(size)})
    if os.geteuid() == 0:
        other = {"user": NOBODY, "group": NOBODY, "extra_groups": []}
        folder.chmod(0o755)
        saves.refused("saves into a folder of another user", 3, lambda: other)
    else:
        saves.plans.chmod(0o555)
        saves.refused("saves into a folder without write permission", 3, dict)
        saves.plans.chmod(0o755)
    room = full_disk(folder, saves)
    if room is None:
        print("no file system can be mounted: a full disk was not tried")
        return
    try:
        saves.refused("saves on a full disk", 3, dict)
    finally:
        subprocess.run(["umount", room], check=True)


def main():
    parser = argparse.ArgumentParser(usage=__doc__)
    parser.add_argument("what", choices=["speed", "saving"])
    parser.add_argument("--entities", type=int, default=100000)
    parser.add_argument("--kills", type=int, default=200)
    parser.add_argument("--limits", type=int, default=20)
    options = parser.parse_args()
    report = Report()
    with tempfile.TemporaryDirectory(prefix="tz-large-") as name:
        folder = Path(name)
        (speed if options.what == "speed" else saving)(folder, options, report)
    return 1 if report.over else 0


if __name__ == "__main__":
    sys.exit(main())
