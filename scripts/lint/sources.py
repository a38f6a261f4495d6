#!/usr/bin/env python3
"""Finds source files that no CMakeLists.txt builds, so that no test and no lint sees them."""
import fnmatch
import os
import re
import sys

import tree

FOLDERS = ("module/", "host/", "apps/", "tests/", "fuzz/", "bench/", "examples/")
# Built by the rules of the programs, of the fuzzers and of the benchmarks themselves.
EXEMPT = re.compile(
    r"apps/\w+/main\.cpp|fuzz/support/replay_main\.cpp|bench/support/against_floor\.cpp")


def is_built(name):
    """Whether the CMakeLists.txt nearest to a source file names it, or takes it by a pattern."""
    folder = os.path.dirname(name)
    while folder and not os.path.exists(os.path.join(tree.ROOT, folder, "CMakeLists.txt")):
        folder = os.path.dirname(folder)
    if not folder:
        return False
    words = re.split(r"[\s()\"]+", "\n".join(tree.text_of(folder + "/CMakeLists.txt")))
    inside = name[len(folder) + 1:]
    return any(fnmatch.fnmatchcase(inside, re.sub(r"^\$\{CMAKE_CURRENT_SOURCE_DIR\}/", "", word))
               for word in words if word.endswith(".cpp"))


def main():
    faults = [f"{name}: no CMakeLists.txt builds it" for name in tree.tracked(".cpp")
              if name.startswith(FOLDERS) and not EXEMPT.fullmatch(name) and not is_built(name)]
    print("\n".join(faults) or "every source file is built")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
