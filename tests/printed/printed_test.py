#!/usr/bin/env python3
"""Plots as a reader finds them: the places of words and lines on paper, measured by pdftotext and
on a raster of pdftoppm, and the words of each example."""
import json
import os
import re
import shutil
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
    """What it said on standard error."""
    return subprocess.run((TZDRAFT, "--module", MODULE, *arguments), check=True, text=True,
                          capture_output=True, stdin=subprocess.DEVNULL, timeout=120).stderr


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


class Letters(unittest.TestCase):
    """Texts that a plot could lose, each on a line of its own."""
    # Style, text, what a reader finds in the PDF, and the label in the SVG.
    ROWS = (
        ("Hebrew", "\u05e9\u05dc\u05d5\u05dd \u05e2\u05d5", "\u05e9\u05dc\u05d5\u05dd", None),
        ("Latin", "of \u05d0\u05d1 7 fi", "fi", "of \u05d0\u05d1 7 fi"),
        ("Latin", "office e\u0301tude", "office e\u0301tude", None),
        ("Latin", "a\u0001b\uffff<&\">", None, 'a b <&">'),
        ("Backward", "Mirrored words", "Mirrored", None),
        ("Locked", "No embedding", None, None),
        ("Off", "Hidden", None, None),
    )
    REMARK = "Lockedface Sans: may not be embedded, its letters are outlines"

    @classmethod
    def setUpClass(cls):
        cls.lock_a_face()
        styles = [{"name": style, "typeface": face, "backward": style == "Backward"}
                  for style, face in (("Latin", "DejaVu Sans"), ("Hebrew", "Noto Sans Hebrew"),
                                      ("Locked", "Lockedface Sans"), ("Backward", "DejaVu Sans"))]
        texts = [{"type": "TEXT", "style": "Latin" if style == "Off" else style, "text": text,
                  "layer": "Off" if style == "Off" else "0", "position": [0, -4 * line, 0]}
                 for line, (style, text, _, _) in enumerate(cls.ROWS)]
        long_line = {"type": "TEXT", "style": "Latin", "position": [0, 9, 0], "textHeight": 2.5,
                     "text": "a line of letters " * 9 + "ends", "space": "paper"}
        hidden = {"type": "TEXT", "text": "Alone", "space": "paper", "visible": False}
        drawing = {"format": "tz-drawing", "version": 1, "textStyles": styles,
                   "layers": [{"name": "Off", "off": True}], "entities": [*texts, hidden]}
        (SCRATCH / "texts.json").write_text(json.dumps(drawing))
        drawing["entities"] = [long_line]
        (SCRATCH / "long.json").write_text(json.dumps(drawing))

    @classmethod
    def lock_a_face(cls):
        """A copy of a face whose makers do not let it be embedded, among the fonts of the test."""
        shown = os.environ["FONTCONFIG_FILE"]
        face = Path(shown).parent / "files/LiberationSans-Regular.ttf"
        font = bytearray(face.read_bytes())
        for code in ("ascii", "utf-16-be"):
            font = font.replace("Liberation Sans".encode(code), "Lockedface Sans".encode(code))
        tables = (font[at:at + 16] for at in range(12, 12 + 16 * font[5], 16))
        start = next(int.from_bytes(table[8:12]) for table in tables if table[:4] == b"OS/2")
        font[start + 8:start + 10] = (2).to_bytes(2)
        shutil.rmtree(SCRATCH / "fonts", ignore_errors=True)
        (SCRATCH / "fonts").mkdir()
        (SCRATCH / "fonts/locked.ttf").write_bytes(font)
        conf = Path(shown).read_text().replace("<dir>", f"<dir>{SCRATCH / 'fonts'}</dir><dir>", 1)
        (SCRATCH / "fonts.conf").write_text(conf)
        os.environ["FONTCONFIG_FILE"] = str(SCRATCH / "fonts.conf")
        cls.addClassCleanup(os.environ.update, FONTCONFIG_FILE=shown)

    def test_are_found(self):
        pdf, svg = SCRATCH / "texts.pdf", SCRATCH / "texts.svg"
        said = tzdraft(SCRATCH / "texts.json", "--pdf", pdf, "--space", "all")
        tzdraft(SCRATCH / "texts.json", "--svg", svg)
        self.assertEqual(said, f"tzdraft: {pdf}: {self.REMARK}\n")
        page = re.sub("[\u202a-\u202e]", "", run("pdftotext", "-raw", pdf, "-"))
        self.assertEqual(page.count("\f"), 1, "no page for what is hidden")
        labels = [group.get("aria-label") for group in xml.parse(svg).iter()]
        for style, text, found, label in self.ROWS:
            if found:
                self.assertIn(found, page)
            if style == "Off":
                self.assertNotIn(text, page)
            self.assertEqual((label or text) in labels, style != "Off", labels)

    def test_larger_than_the_page_show_their_part(self):
        drawing = json.dumps({"format": "tz-drawing", "version": 1, "entities": [
            {"type": "TEXT", "text": "H", "style": "Latin", "textHeight": 2}],
            "textStyles": [{"name": "Latin", "typeface": "DejaVu Sans"}]})
        (SCRATCH / "large.json").write_text(drawing)
        pdf = SCRATCH / "large.pdf"
        tzdraft(SCRATCH / "large.json", "--paper", "100x80", "--margin", "0",
                "--window", "0.35,0.9,0.41,0.95", "--pdf", pdf)
        run("pdftoppm", "-r", "40", "-gray", "-singlefile", pdf, SCRATCH / "large")
        self.assertEqual((SCRATCH / "large.pgm").read_bytes()[-50 * 158 + 79], 0)

    def test_end_a_long_line_in_their_place(self):
        saved, pdf = SCRATCH / "measured.json", SCRATCH / "long.pdf"
        tzdraft(SCRATCH / "long.json", "--space", "paper", "--paper", "A3", "--scale", "1:1",
                "--script", "/dev/null", "--save", saved, "--pdf", pdf)
        measured = json.loads(saved.read_text())["entities"][0]["measured"]
        words = run("pdftotext", "-bbox", pdf, "-")
        left, = re.findall('xMin="(.*)" yMin.*>a<', words)[:1]
        right, = re.findall('xMax="(.*)" yMax.*>ends<', words)
        width = measured["upperRight"][0] - measured["lowerLeft"][0]
        self.assertLess(abs((float(right) - float(left)) * POINT - width), WITHIN / 4)


if __name__ == "__main__":
    unittest.main()
