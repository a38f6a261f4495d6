#!/usr/bin/env python3
"""Checks the format of every C++ file; with --fix rewrites what differs."""
import shutil
import subprocess
import sys

import tree


def main():
    if not shutil.which("clang-format"):
        print("clang-format is missing: scripts/setup.sh installs it")
        return 1
    files = tree.tracked(".h", ".cpp")
    mode = ["-i"] if "--fix" in sys.argv[1:] else ["--dry-run", "-Werror"]
    return subprocess.run(["clang-format", *mode, *files], cwd=tree.ROOT).returncode if files else 0


if __name__ == "__main__":
    sys.exit(main())
