#!/usr/bin/env python3
"""Shows the office texts as other programs see them. Look at them after a change of the RTF writer.

  scripts/office_pages.py FOLDER [BUILD]      (build/release)

Converts each text of tests/markup/office.txt to RTF, lets a word processor print it, and puts the
pages into FOLDER: one picture a text (nnn.png) and all of them beside their markup (index.html).
Each word of a text must be on its page and in what unrtf reads. Two kinds of words are not looked
for: stacks, whose form in the document is for the module's own editor; and, in unrtf, words with
characters above 0x7F, since unrtf drops what follows such a character up to the next blank. Needs
soffice, unrtf, pdftotext and pdftoppm (scripts/setup.sh pages); without one of them nothing is done
and the exit status is 77.
"""
import argparse
import html
import os
import re
import shutil
import subprocess
import sys
from pathlib import Path

PROGRAMS = ["soffice", "unrtf", "pdftotext", "pdftoppm"]
ROOT = Path(__file__).resolve().parent.parent
OFFICE = ROOT / "tests/markup/office.txt"

# What a code leaves of itself on the page.
CODE = re.compile(r"""\\S[^;]*[/\#^][^;]*;            # a stack: left out
                    | \\[FfHCcTWQAp][^;]*;           # codes with an argument
                    | \\[LlOo] | [{}]
                    | \\U\+(?P<code>[0-9A-F]{4})
                    | \\(?P<sign>[P~\\{}])""", re.VERBOSE)
SIGNS = {"P": "\n", "~": "\u00a0"}


def office_texts():
    """The markup of each text: every third line that is neither empty nor a comment."""
    lines = [line for line in OFFICE.read_text().split("\n") if line and line[0] != ";"]
    return lines[::3]


def visible_words(markup):
    """The words that a page must show."""
    def seen(match):
        if match["code"]:
            return chr(int(match["code"], 16))
        sign = match["sign"]
        return SIGNS.get(sign, sign) if sign else " " if match[0].startswith("\\S") else ""
    return CODE.sub(seen, markup).split()


def output_of(*command):
    return subprocess.run(command, check=True, capture_output=True, text=True,
                          env=dict(os.environ, LC_ALL="C.UTF-8")).stdout


def missing(words, page):
    """Words that are not there; blanks, the order of lines and marks of direction do not count."""
    squeezed = re.sub(r"[\s\u202a-\u202e]+", "", page)
    return [word for word in words if word.strip(",") not in squeezed]


def main():
    arguments = argparse.ArgumentParser(description=__doc__,
                                        formatter_class=argparse.RawDescriptionHelpFormatter)
    arguments.add_argument("folder", metavar="FOLDER", type=Path)
    arguments.add_argument("build", metavar="BUILD", nargs="?", type=Path, default=ROOT / "build/release")
    options = arguments.parse_args()
    absent = [program for program in PROGRAMS if not shutil.which(program)]
    if absent:
        print("not installed:", ", ".join(absent))
        return 77
    folder, build = options.folder, options.build
    folder.mkdir(parents=True, exist_ok=True)
    texts = office_texts()
    names = [f"{number:03}" for number in range(1, len(texts) + 1)]
    for name, markup in zip(names, texts):
        (folder / f"{name}.txt").write_text(markup)
    files = [str(folder / f"{name}.txt") for name in names]
    subprocess.run([build / "bin/tzconvert", "to-rtf", "--font", "DejaVu Sans", "--pitch", "34",
                    "--output-dir", folder, *files], check=True)
    documents = [str(folder / f"{name}.rtf") for name in names]
    output_of("soffice", "--headless", "--convert-to", "pdf", "--outdir", str(folder), *documents)
    faults = 0
    rows = []
    for name, markup, document in zip(names, texts, documents):
        pdf = str(folder / f"{name}.pdf")
        output_of("pdftoppm", "-r", "80", "-png", "-singlefile", "-W", "640", "-H",
                  "260", pdf, str(folder / name))
        words = visible_words(markup)
        read = html.unescape(re.sub("<[^>]*>", "", output_of("unrtf", "--html", document)))
        readers = [("page", words, output_of("pdftotext", "-layout", pdf, "-")),
                   ("unrtf", [word for word in words if word.isascii()], read)]
        for reader, wanted, page in readers:
            lost = missing(wanted, page)
            if lost:
                faults += 1
                print(f"{name}: not in {reader}: {' '.join(lost)}\n     {markup}")
        rows.append(f"<p><code>{html.escape(markup)}</code><br><img src={name}.png></p>")
    (folder / "index.html").write_text("<meta charset=utf-8>" + "\n".join(rows))
    print(f"{len(texts)} texts, {faults} with words missing; look at {folder}/index.html")
    return 1 if faults else 0


if __name__ == "__main__":
    sys.exit(main())
