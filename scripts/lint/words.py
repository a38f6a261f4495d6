#!/usr/bin/env python3
"""Finds words that tell where a file was written instead of what it does: references to outside
documents and absolute paths of one machine."""
import re
import sys

import tree

PATTERNS = [
    (r"\b[Ss]pecification\b", "explain what the code does instead of naming a document"),
    (r"\b(the|per|see|our) specs?\b", "explain what the code does instead of naming a document"),
    (r"\bspec\.md\b|\bdesign\.md\b|\bsettled(\.md| point)|\bstyle\.md\b",
     "explain what the code does instead of naming a document"),
    (r"\b(Part|part|Parts) \d+\.\d|\bPart \d+\b|\bthe Parts?\b",
     "explain what the code does instead of naming a document"),
    (r"(?<![\w.$}/])/(work|home|root|Users)/", "a path of one machine"),
]
# This file holds the patterns themselves.
EXEMPT = ("scripts/lint/words.py",)


def main():
    faults = []
    for name in tree.tracked():
        if name in EXEMPT or name.startswith("fuzz/corpus/"):
            continue
        for number, line in enumerate(tree.text_of(name), 1):
            faults += [f"{name}:{number}: {line.strip()[:100]}: {why}"
                       for pattern, why in PATTERNS if re.search(pattern, line)]
    print("\n".join(faults) or "no such words")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
