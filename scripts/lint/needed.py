#!/usr/bin/env python3
"""Reads which libraries the products ask for at run time, and where they would look for them."""
import argparse
import os
import re
import subprocess
import sys

RUNTIME = r"ld-linux.*|lib(c|m|stdc\+\+|gcc_s|asan|ubsan)\.so\.\d+"
# product, the only libraries that it may need (or None), those it must need, those it never may
RULES = [
    ("lib/tzmted.tzx", rf"{RUNTIME}|libtz\.so\.1", ["libtz.so.1"], None),
    ("bin/tzdraft", None, ["libtz.so.1"], r"tzmted.*"),
    ("bin/tzconvert", None, [], r"libtz\..*|libpango.*|libcairo.*|libgobject.*|libglib.*|tzmted.*"),
    ("lib/libtz.so.1", None, [], r"tzmted.*"),
]


def dynamic(path):
    command = ["readelf", "-dW", path]
    text = subprocess.run(command, check=True, capture_output=True, text=True).stdout
    needed = re.findall(r"\(NEEDED\).*\[(.*)\]", text)
    paths = re.findall(r"\((?:RPATH|RUNPATH)\).*\[(.*)\]", text)
    return needed, [part for entry in paths for part in entry.split(":") if part]


def check(build, product, only, must, never):
    needed, paths = dynamic(os.path.join(build, product))
    faults = [f"{product} needs {name}" for name in needed
              if (only and not re.fullmatch(only, name)) or (never and re.fullmatch(never, name))]
    faults += [f"{product} does not need {name}" for name in must if name not in needed]
    faults += [f"{product} looks for libraries in {path}" for path in paths
               if not path.startswith("$ORIGIN")]
    return faults


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--build", required=True)
    build = parser.parse_args().build
    rules = [rule for rule in RULES if os.path.exists(os.path.join(build, rule[0]))]
    if not rules:
        print("no product was built")
        return 77
    faults = [fault for rule in rules for fault in check(build, *rule)]
    print("\n".join(faults) or f"{len(rules)} products need what they may")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
