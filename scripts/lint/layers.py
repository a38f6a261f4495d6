#!/usr/bin/env python3
"""Reads every #include of the project against the table in cmake/layers.cmake."""
import re
import sys

import tree

INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]')
LIBRARIES = [
    ("nlohmann/", "json"), ("rapidjson/", "fastjson"), ("boost/", "boxes"), ("SimpleIni", "ini"), ("fontconfig/", "fontconfig"), ("pango/", "pango"),
    ("glib", "pango"), ("cairo", "cairo"), ("CLI/", "cli"), ("histedit", "editline"),
    ("editline/", "editline"), ("gtest/", "tests"), ("gmock/", "tests"), ("benchmark/", "tests"),
]
# The headers of the C++20 standard library, and those that it takes over from C.
STANDARD = set("""
algorithm any array atomic barrier bit bitset charconv chrono codecvt compare complex concepts
condition_variable coroutine deque exception execution filesystem format forward_list fstream
functional future initializer_list iomanip ios iosfwd iostream istream iterator latch limits list
locale map memory memory_resource mutex new numbers numeric optional ostream queue random ranges
ratio regex scoped_allocator semaphore set shared_mutex source_location span sstream stack
stdexcept stop_token streambuf string string_view strstream syncstream system_error thread tuple
type_traits typeindex typeinfo unordered_map unordered_set utility valarray variant vector version
cassert cctype cerrno cfenv cfloat cinttypes climits clocale cmath csetjmp csignal cstdarg cstddef
cstdint cstdio cstdlib cstring ctime cuchar cwchar cwctype
""".split())

# The smallest host opens the module with the system's loader, which no standard header declares.
ALLOWED = {("examples", "dlfcn.h")}


def folder_of(name, table):
    """The row that a file or an include belongs to, or None."""
    if name.startswith("tz/"):
        return "sdk"
    fitting = [folder for folder in table if name.startswith(folder + "/")]
    return max(fitting, key=len) if fitting else None


def fault(folder, quote, target, table):
    uses, libraries = table[folder]
    if quote == '"':
        # An example can be taken out of the tree, so its files name each other as neighbours.
        if folder == "examples" and "/" not in target:
            return None
        goal = folder_of(target, table)
        if goal is None:
            return "is not spelled from one of the include roots"
        return None if goal == folder or goal in uses else f"{folder} may not include {goal}"
    if folder.startswith(("sdk", "module/", "examples")):
        allowed = target in STANDARD or (folder, target) in ALLOWED
        return None if allowed else f"{folder} uses the standard library alone"
    for prefix, library in LIBRARIES:
        if target.startswith(prefix) and library not in libraries:
            return f"{folder} may not use {library}"
    return None


def main():
    table = tree.rows()
    faults = []
    for name in tree.tracked(".h", ".cpp"):
        folder = folder_of(name, table)
        if folder is None:
            continue
        for number, line in enumerate(tree.text_of(name), 1):
            match = INCLUDE.match(line)
            if match:
                found = fault(folder, match.group(1), match.group(2), table)
                if found:
                    faults.append(f"{name}:{number}: {match.group(2)}: {found}")
    print("\n".join(faults) or "every include is in the table")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
