#!/usr/bin/env python3
"""Turns the module's list of exported names into a linker version script, or compares it with the
module. Exit status 77 when there is no module to compare with."""
import argparse
import fnmatch
import os
import re
import subprocess
import sys

PLAIN = re.compile(r"^[A-Za-z_.$][\w.$]*$")


def read_list(path):
    names = []
    with open(path, encoding="utf-8") as lines:
        for line in lines:
            name = line.strip()
            if name and not name.startswith("#"):
                names.append(name)
    return names


def version_script(names):
    plain = [name for name in names if PLAIN.match(name)]
    cxx = [name for name in names if not PLAIN.match(name)]
    lines = ["{"]
    if names:
        lines.append("global:")
        lines += [f"    {name};" for name in plain]
    if cxx:
        lines.append('    extern "C++" {')
        for name in cxx:
            lines.append(f"        {name[5:]};" if name.startswith("glob ") else f'        "{name}";')
        lines.append("    };")
    return "\n".join(lines + ["local:", "    *;", "};", ""])


def exported(module):
    """Pairs of mangled and readable name."""
    def nm(*options):
        command = ["nm", "-D", "--defined-only", "--format=posix", *options, module]
        return subprocess.run(command, check=True, capture_output=True, text=True).stdout.splitlines()

    mangled = [line.split(" ")[0] for line in nm()]
    readable = subprocess.run(["c++filt"], input="\n".join(mangled), check=True,
                              capture_output=True, text=True).stdout.splitlines()
    return list(zip(mangled, readable))


def fits(entry, mangled, readable):
    if entry.startswith("glob "):
        return fnmatch.fnmatchcase(readable, entry[5:])
    return entry in (mangled, readable)


def compare(names, module):
    symbols = exported(module)
    faults = [f"exported but not in the list: {readable}" for mangled, readable in symbols
              if not any(fits(entry, mangled, readable) for entry in names)]
    faults += [f"in the list but not exported: {entry}" for entry in names
               if not any(fits(entry, *symbol) for symbol in symbols)]
    faults += [f"twice in the list: {name}" for name in sorted(set(names)) if names.count(name) > 1]
    return faults


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--list", required=True)
    parser.add_argument("--version-script")
    parser.add_argument("--module")
    options = parser.parse_args()
    names = read_list(options.list)
    if options.version_script:
        with open(options.version_script, "w", encoding="utf-8") as out:
            out.write(version_script(names))
    if options.module:
        if not os.path.exists(options.module):
            print("no module was built")
            return 77
        faults = compare(names, options.module)
        print("\n".join(faults) or f"{len(names)} names, all exported, nothing else")
        return 1 if faults else 0
    return 0


if __name__ == "__main__":
    sys.exit(main())
