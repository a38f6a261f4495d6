#!/usr/bin/env python3
"""Finds source files of the module with objects that are initialised when the module is loaded.
Looks at an optimised build; exit status 77 when no module layer was built."""
import argparse
import os
import re
import subprocess
import sys

import tree


def initialised(archive):
    """Source files in an archive that hold initialisers, as folder/file.cpp."""
    target = os.path.basename(archive)[len("lib"):-len(".a")]
    folder = next(row for row in tree.rows() if row.replace("/", "_") == target)
    text = subprocess.run(["nm", "-A", archive], check=True, capture_output=True, text=True).stdout
    found = re.findall(r"^[^:]*:([^:]+)\.o:.* t _GLOBAL__sub_I_", text, re.M)
    return {f"{folder}/{name}" for name in found}


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--archives", required=True)
    parser.add_argument("--list", required=True)
    options = parser.parse_args()
    archives = tree.module_archives(options.archives)
    if not archives:
        print("no layer of the module was built")
        return 77
    with open(options.list, encoding="utf-8") as lines:
        allowed = {line.split()[0] for line in lines if line.strip() and not line.startswith("#")}
    found = set().union(*map(initialised, archives))
    faults = [f"{name} initialises objects at load time" for name in sorted(found - allowed)]
    faults += [f"{name} is in the list but initialises nothing" for name in sorted(allowed - found)]
    print("\n".join(faults) or "nothing is initialised at load time but what is listed")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
