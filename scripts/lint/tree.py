"""What the lints share: the files of the project and the layer table."""
import os
import re
import subprocess

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))


def everything():
    """Names of all files but build products; a tree without git (an archive) is walked."""
    command = ["git", "-C", ROOT, "ls-files", "-z", "--cached", "--others", "--exclude-standard"]
    if os.path.exists(os.path.join(ROOT, ".git")):
        return subprocess.run(command, check=True, capture_output=True, text=True).stdout.split("\0")
    names = []
    for folder, folders, files in os.walk(ROOT):
        folders[:] = [name for name in folders if os.path.join(folder, name) != ROOT + "/build"]
        names += [os.path.relpath(os.path.join(folder, name), ROOT) for name in files]
    return names


def tracked(*suffixes):
    """Tracked and new files with one of the suffixes, relative to the root; all without suffixes."""
    return sorted(name for name in set(everything()) if name
                  and os.path.isfile(os.path.join(ROOT, name))
                  and (not suffixes or name.endswith(suffixes)))


def text_of(name):
    """The lines of a text file; none of a binary one."""
    with open(os.path.join(ROOT, name), "rb") as file:
        data = file.read()
    return [] if b"\0" in data else data.decode("utf-8", "replace").splitlines()


def rows():
    """The layer table: folder -> (folders that it may use, libraries that it may use)."""
    table = {}
    for line in text_of("cmake/layers.cmake"):
        match = re.match(r"tz_row\(([\w/]+)\s*(.*)\)\s*$", line)
        if match:
            words = match.group(2).split()
            at = words.index("LIBRARIES") if "LIBRARIES" in words else len(words)
            table[match.group(1)] = (set(words[1:at]), set(words[at + 1:]))
    return table


def module_archives(folder):
    """The archives of the layers that have a row. Archives of former layers do not count."""
    paths = [os.path.join(folder, f"lib{row.replace('/', '_')}.a")
             for row in rows() if row.startswith("module/")]
    return [path for path in paths if os.path.exists(path)]
