#!/usr/bin/env python3
"""Draws the layer table as floors of boxes: python3 scripts/lint/picture.py OUTPUT.svg [STORED.svg]

A box stands on the lowest floor above every folder that it uses. A line leads from a folder to one
that it uses; lines that follow from others are left out, and so are those to sdk/, which all use.
The picture is also compared with a stored one, if one is named; a difference is status 1.
"""
import sys

import tree

BOX_WIDTH, BOX_HEIGHT, GAP, FLOOR_HEIGHT, MARGIN = 130, 26, 12, 58, 16
SIDES = ["module", "host"]  # left to right; programs stand above both
COLOURS = {"sdk": "#e8e8e8", "module": "#dbe9f6", "host": "#e6f2dc", "apps": "#f9ead3"}


def reduced(table):
    """The uses of each folder without those that a used folder has already."""
    edges = {}
    for folder, (uses, _) in table.items():
        behind = set().union(*(table[used][0] for used in uses)) if uses else set()
        edges[folder] = sorted(uses - behind - {"sdk"})
    return edges


def floors(table):
    """The number of the floor that each folder stands on."""
    floor = {}
    for folder, (uses, _) in table.items():  # rows stand bottom to top
        floor[folder] = max((floor[used] + 1 for used in uses), default=0)
    top = max(floor[folder] for folder in table if not folder.startswith("apps/"))
    return {folder: top + 1 if folder.startswith("apps/") else floor[folder] for folder in table}


def side_of(folder):
    return folder.split("/")[0]


def label_of(folder):
    """The folder within its side, which the colour tells."""
    return folder.split("/", 1)[-1] if side_of(folder) in SIDES else folder


def placed(table, floor):
    """The left upper corner of each box, and the size of the picture."""
    widest = {side: 0 for side in SIDES}
    rows = {}
    for folder in table:
        rows.setdefault((side_of(folder), floor[folder]), []).append(folder)
    for (side, _), row in rows.items():
        if side in widest:
            widest[side] = max(widest[side], len(row) * (BOX_WIDTH + GAP) - GAP)
    left = {SIDES[0]: MARGIN, SIDES[1]: MARGIN + widest[SIDES[0]] + 3 * GAP}
    width = left[SIDES[1]] + widest[SIDES[1]] + MARGIN
    height = (max(floor.values()) + 1) * FLOOR_HEIGHT + MARGIN
    corners = {}
    for (side, number), row in rows.items():
        room_left, room = left.get(side, MARGIN), widest.get(side, width - 2 * MARGIN)
        start = room_left + (room - (len(row) * (BOX_WIDTH + GAP) - GAP)) / 2
        for index, folder in enumerate(row):
            corners[folder] = (start + index * (BOX_WIDTH + GAP),
                               height - (number + 1) * FLOOR_HEIGHT)
    return corners, width, height


def svg(table):
    table = {folder: row for folder, row in table.items() if folder != "examples"}
    floor = floors(table)
    corners, width, height = placed(table, floor)
    parts = [f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 {width:.0f} {height:.0f}" '
             'font-family="sans-serif" font-size="11">',
             '<rect width="100%" height="100%" fill="white"/>']
    for folder, uses in reduced(table).items():
        for used in uses:
            x1, y1 = corners[folder]
            x2, y2 = corners[used]
            parts.append(f'<line x1="{x1 + BOX_WIDTH / 2:.0f}" y1="{y1 + BOX_HEIGHT:.0f}" '
                         f'x2="{x2 + BOX_WIDTH / 2:.0f}" y2="{y2:.0f}" stroke="#999"/>')
    for folder, (x, y) in corners.items():
        box_left, box_width = (x, BOX_WIDTH) if folder != "sdk" else (MARGIN, width - 2 * MARGIN)
        parts.append(f'<rect x="{box_left:.0f}" y="{y:.0f}" width="{box_width:.0f}" '
                     f'height="{BOX_HEIGHT}" rx="4" fill="{COLOURS[side_of(folder)]}" stroke="#555"/>')
        parts.append(f'<text x="{box_left + box_width / 2:.0f}" y="{y + 17:.0f}" '
                     f'text-anchor="middle">{label_of(folder)}</text>')
    for side in SIDES:
        left = min(x for folder, (x, _) in corners.items() if side_of(folder) == side)
        parts.append(f'<text x="{left:.0f}" y="{MARGIN + FLOOR_HEIGHT + 16}" font-size="16">{side}/</text>')
    return "\n".join(parts + ["</svg>", ""])


def main():
    output, *stored = sys.argv[1:]
    picture = svg(tree.rows())
    with open(output, "w", encoding="utf-8") as file:
        file.write(picture)
    if not stored:
        return 0
    with open(stored[0], encoding="utf-8") as file:
        if picture == file.read():
            return 0
    print(f"{stored[0]} is not the picture of the layer table; copy {output} over it")
    return 1


if __name__ == "__main__":
    sys.exit(main())
