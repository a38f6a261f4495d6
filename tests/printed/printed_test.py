#!/usr/bin/env python3
"""Plots as a reader finds them: the places of words and lines on paper, measured by pdftotext and
on a raster of pdftoppm, and the words of each example."""
import json
import os
import re
import subprocess
import unittest
import xml.etree.ElementTree as xml
from pathlib import Path

SCRATCH = Path(os.environ["TZ_TEST_SCRATCH"])
EXAMPLES = Path(os.environ["TZ_TEST_SOURCE"]) / "examples"
TZDRAFT = Path(os.environ["TZ_TEST_BIN"]) / "tzdraft"
MODULE = Path(os.environ["TZ_TEST_LIB"]) / "tzmted.tzx"
WITHIN = 0.1  # millimetres
POINT = 25.4 / 72  # millimetres


def run(*command):
    return subprocess.run(command, check=True, capture_output=True, timeout=120).stdout.decode()


def tzdraft(*arguments):
    run(TZDRAFT, "--module", MODULE, *arguments)


def played(example):
    """The drawing that an example makes, and the files of its plots."""
    start = example.with_suffix(".json")
    arguments = [start] if start.exists() else []
    arguments += ["--script", example]
    drawing, pdf, svg = (SCRATCH / (example.stem + end) for end in (".json", ".pdf", ".svg"))
    tzdraft(*arguments, "--save", drawing, "--pdf", pdf, "--space", "all")
    tzdraft(*arguments, "--svg", svg, "--space", "model")
    return json.loads(drawing.read_text()), pdf, svg


class TitleBlockOnA3(unittest.TestCase):
    """The block is 18 by 6 metres, at 1:50, in the middle of the paper."""
    SIZE, SCALE = 100, 50
    # Parts of the font's size: the height of capitals, and what lies above and below the baseline.
    CAPITALS, ABOVE, BELOW = 0.729, 0.928, 0.236
    LINE = 0.18  # millimetres

    @classmethod
    def setUpClass(cls):
        drawing, _, _ = played(EXAMPLES / "title-block.scr")
        cls.entities = drawing.pop("entities")
        own = [{name: value for name, value in each.items() if name not in ("handle", "space")}
               for each in cls.entities]
        drawing["blocks"] = [{"name": "Title", "entities": own}]
        drawing["entities"] = [{"type": "INSERT", "block": "Title", "scale": cls.SIZE}]
        (SCRATCH / "block.json").write_text(json.dumps(drawing))
        cls.pdf = SCRATCH / "block.pdf"
        tzdraft(SCRATCH / "block.json", "--paper", "A3", "--scale", f"1:{cls.SCALE}",
                "--pdf", cls.pdf)

    def on_paper(self, length):
        return length * self.SIZE / self.SCALE

    def place(self, x, y):
        """Of a point of the block, in millimetres from the paper's upper left corner."""
        return 210 + self.on_paper(x - 90), 148.5 - self.on_paper(y - 30)

    def assert_near(self, found, wanted, what):
        for one, other in zip(found, wanted, strict=True):
            self.assertLess(abs(one - other), WITHIN, f"{what}: {found}, not {wanted}")

    def box(self, text):
        """Of a text of one line: left, top, right and bottom, as the font reaches."""
        width, height = text["measured"]["width"], text["measured"]["height"]
        across, down = (text["attachment"] - 1) % 3, (text["attachment"] - 1) // 3
        x, y, _ = text["location"]
        left, baseline = self.place(x - width * across / 2, y - height + height * down / 2)
        size = self.on_paper(height) / self.CAPITALS
        return (left, baseline - size * self.ABOVE, left + self.on_paper(width),
                baseline + size * self.BELOW)

    def test_words_stand_where_the_drawing_says(self):
        word = r'<word xMin="(.*)" yMin="(.*)" xMax="(.*)" yMax="(.*)">(.*)</word>'
        found = {text: [float(side) * POINT for side in sides]
                 for *sides, text in re.findall(word, run("pdftotext", "-bbox", self.pdf, "-"))}
        texts = [each for each in self.entities
                 if each["type"] == "MTEXT" and "\\P" not in each["contents"]]
        self.assertEqual(len(texts), 7)
        for text in texts:
            words = text["contents"].split()
            left, top, _, bottom = found[words[0]]
            self.assert_near((left, top, found[words[-1]][2], bottom), self.box(text), words)

    def darkness(self, x, y):
        """The edges of what is drawn within a millimetre of a point: left, top, right, bottom."""
        dot = 25.4 / 600
        first_x, first_y, side = round((x - 1) / dot), round((y - 1) / dot), round(2 / dot)
        run("pdftoppm", "-r", "600", "-gray", "-singlefile", "-x", str(first_x), "-y", str(first_y),
            "-W", str(side), "-H", str(side), self.pdf, SCRATCH / "end")
        pixels = (SCRATCH / "end.pgm").read_bytes()[-side * side:]
        dark = [divmod(at, side) for at, shade in enumerate(pixels) if shade < 128]
        columns, rows = [column for _, column in dark], [row for row, _ in dark]
        return ((min(columns) + first_x) * dot, (min(rows) + first_y) * dot,
                (max(columns) + 1 + first_x) * dot, (max(rows) + 1 + first_y) * dot)

    def test_lines_end_where_the_drawing_says(self):
        for x, y in ((0, 0), (180, 0), (0, 60), (180, 60)):
            left, top, right, bottom = self.darkness(*self.place(x, y))
            outer = (right if x else left, top if y else bottom)
            end_x, end_y = self.place(x, y)
            edge = self.LINE / 2
            self.assert_near(outer, (end_x + (edge if x else -edge),
                                     end_y + (-edge if y else edge)), (x, y))


# Codes part words, since the look changes there; a stack is read part by part.
CODE = re.compile(r"""\\S(?P<stack>[^;]*); | \\[ACcFfHpQTW][^;]*; | \\[LlOo] | [{}] | \^I
                    | \\M\+[0-9A-F]{5} | \\U\+(?P<code>[0-9A-F]{4})
                    | \\(?P<sign>[P~\\{}])""", re.VERBOSE)


def read_aloud(markup):
    def seen(match):
        if match["stack"] is not None:
            return f" {read_aloud(re.sub('[/#^]', ' ', match['stack']))} "
        if match["code"]:
            return chr(int(match["code"], 16))
        return match["sign"] if match["sign"] in ("\\", "{", "}") else " "
    return CODE.sub(seen, markup)


class Examples(unittest.TestCase):
    def texts(self, drawing, entities):
        """What is written, each with its style."""
        blocks = {block["name"]: block["entities"] for block in drawing["blocks"]}
        for each in entities:
            if each["type"] == "INSERT":
                own = [part for part in blocks[each["block"]] if part["type"] != "ATTDEF"]
                yield from self.texts(drawing, own + each["attributes"])
            else:
                text = each.get("mtext") or each
                yield text.get("style"), text.get("contents") or text.get("text", "")

    def lost(self, drawing, page):
        """The words that are not on the page. Those of a vertical style stand letter by letter, and
        lines of Chinese break within words."""
        vertical = {style["name"] for style in drawing["textStyles"]
                    if style["vertical"] or style["typeface"].startswith("@")}
        joined = "".join(page.split())
        for style, text in self.texts(drawing, drawing["entities"]):
            for word in read_aloud(text).split():
                standing = "\n".join(word) if style in vertical else word
                is_chinese = re.search("[\u4e00-\u9fff]", standing)
                if standing not in page and not (is_chinese and standing in joined):
                    yield word

    def test_have_all_their_words(self):
        examples = sorted(EXAMPLES.glob("*.scr"))
        self.assertGreater(len(examples), 10)
        for example in examples:
            with self.subTest(example.name):
                drawing, pdf, svg = played(example)
                page = run("pdftotext", "-raw", pdf, "-")
                self.assertEqual(list(self.lost(drawing, page)), [], "in the PDF")
                labels = [group.get("aria-label", "") for group in xml.parse(svg).iter()]
                # An SVG shows one space.
                drawing["entities"] = [each for each in drawing["entities"]
                                       if each["space"] == "model"]
                spoken = "\n".join(filter(None, labels))
                self.assertEqual(list(self.lost(drawing, spoken)), [], "in the SVG")


if __name__ == "__main__":
    unittest.main()
