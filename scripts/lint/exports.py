#!/usr/bin/env python3
"""Turns the module's list of exported names into a linker version script, or compares it with the
module, with the bodies that carry the export mark and with the headers that declare them. A line
"owed NAME" is a promise: no body yet, so it is refused as soon as there is one. Exit status 77 when
there is no module."""
import argparse
import fnmatch
import os
import re
import subprocess
import sys

import tree

INTERFACE = "sdk/tz/mte/"
MARKED_FUNCTION = re.compile(r"TZ_API[^;{}()]*?\b(\w+)\(")
OWED = "owed "
PLAIN = re.compile(r"^[A-Za-z_.$][\w.$]*$")


def read_list(path):
    names = []
    with open(path, encoding="utf-8") as lines:
        for line in lines:
            name = line.strip()
            if name and not name.startswith("#"):
                names.append(name)
    return names


def needed_words(entry):
    """What headers must hold for an entry: the names of its class and of itself."""
    return re.findall(r"\w+", entry.split("(")[0].removeprefix("glob ").split(" for ")[-1])


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


def output_of(*command, **options):
    return subprocess.run(command, check=True, capture_output=True, text=True, **options).stdout


def readable(mangled):
    """Pairs of mangled and readable name."""
    return list(zip(mangled, output_of("c++filt", input="\n".join(mangled)).splitlines()))


def exported(module):
    lines = output_of("nm", "-D", "--defined-only", "--format=posix", module).splitlines()
    return readable([line.split(" ")[0] for line in lines])


def marked(folder):
    """What the layers of the module define with the export mark. Weak names are inline functions of
    the interface, which every user of it holds."""
    names = set()
    for archive in tree.module_archives(folder):
        for line in output_of("readelf", "-sW", archive).splitlines():
            fields = line.split()
            if len(fields) == 8 and fields[3] in ("FUNC", "OBJECT") and fields[6] != "UND" \
                    and fields[4:6] == ["GLOBAL", "DEFAULT"] \
                    and not fields[7].startswith("__odr_asan."):
                names.add(fields[7])
    return readable(sorted(names))


def fits(entry, mangled, readable):
    if entry.startswith("glob "):
        return fnmatch.fnmatchcase(readable, entry[5:])
    return entry in (mangled, readable)


def misdeclared(names, symbols):
    """Faults of the headers: other modules see sdk/ alone, what it declares must be there, and it
    declares what is there."""
    bodies = {shown.split("(")[0] for _, shown in symbols}
    faults = []
    words = set()
    for name in tree.tracked(".h"):
        if not name.startswith(("module/", INTERFACE)):
            continue
        code = re.sub(r"//.*", "", "\n".join(tree.text_of(name)))
        if name.startswith(INTERFACE):
            words |= set(re.findall(r"\w+", code))
            faults += [f"{name}: declared but not exported: {function}"
                       for function in MARKED_FUNCTION.findall(code) if function not in bodies]
        elif "TZ_API" in code:
            faults.append(f"{name}: what the module exports is declared in {INTERFACE}")
    return faults + [f"in the list but not declared in {INTERFACE}: {entry}" for entry in names
                     if not words.issuperset(needed_words(entry))]


def compare(names, owed, module, archives):
    def unlisted(symbols):
        return [shown for mangled, shown in symbols
                if not any(fits(entry, mangled, shown) for entry in names)]

    symbols = exported(module)
    faults = [f"exported but not in the list: {name}" for name in unlisted(symbols)]
    faults += [f"marked and defined but not in the list: {name}" for name in unlisted(marked(archives))]
    faults += [f"in the list but not exported: {entry}" for entry in names
               if not any(fits(entry, *symbol) for symbol in symbols)]
    faults += misdeclared(names, symbols)
    faults += [f"no longer owed: {entry}" for entry in owed
               if any(entry == shown.split("(")[0] for _, shown in symbols + marked(archives))]
    faults += [f"twice in the list: {name}" for name in sorted(set(names)) if names.count(name) > 1]
    return faults


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--list", required=True)
    parser.add_argument("--version-script")
    parser.add_argument("--module", help="the built module, to compare with")
    parser.add_argument("--archives", help="the folder of the layers that it was made of")
    options = parser.parse_args()
    entries = read_list(options.list)
    names = [entry for entry in entries if not entry.startswith(OWED)]
    owed = [entry.removeprefix(OWED) for entry in entries if entry.startswith(OWED)]
    if options.version_script:
        with open(options.version_script, "w", encoding="utf-8") as out:
            out.write(version_script(names))
    if options.module:
        if not os.path.exists(options.module):
            print("no module was built")
            return 77
        faults = compare(names, owed, options.module, options.archives)
        print("\n".join(faults) or f"{len(names)} names, all exported, nothing else; {len(owed)} owed")
        return 1 if faults else 0
    return 0


if __name__ == "__main__":
    sys.exit(main())
