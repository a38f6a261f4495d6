#!/usr/bin/env python3
"""Checks the format of every C++ file, or of those named; with --fix rewrites what differs."""
import os
import shutil
import subprocess
import sys

import tree


def main():
    if not shutil.which("clang-format"):
        print("clang-format is missing: scripts/setup.sh installs it")
        return 1
    named = [name for name in sys.argv[1:] if name != "--fix"]
    fix = len(named) < len(sys.argv) - 1
    files = named or [os.path.join(tree.ROOT, name) for name in tree.tracked(".h", ".cpp")]
    mode = ["-i"] if fix else ["--dry-run", "-Werror"]
    return subprocess.run(["clang-format", *mode, *files]).returncode if files else 0


if __name__ == "__main__":
    sys.exit(main())
