#!/usr/bin/env python3
"""Draws the pictures of docs/bits.md from bits.csv, which the tests compare with what the library does.

usage: bits.py DIRECTORY
"""

import csv
import pathlib
import sys

CELL, ROW, LABEL, MARGIN = 34, 28, 190, 10
SHADES = ("#dbe9f6", "#fbe3c8", "#dff0d8", "#f3dcec")


class Picture:
    """Dark on a white card of its own, which reads the same on a light and on a dark page."""

    def __init__(self, title):
        self.title, self.items, self.y, self.width = title, [], MARGIN, 0

    def text(self, x, y, words, more=""):
        self.items.append(f'<text x="{x}" y="{y}"{more}>{words}</text>')

    def row(self, label, cells, shades=()):
        """One line of cells; a cell is its words."""
        self.text(LABEL - 8, self.y + 19, label, ' text-anchor="end"')
        for i, words in enumerate(cells):
            x = LABEL + i * CELL
            fill = f' fill="{shades[i]}"' if shades else ' fill="none"'
            self.items.append(f'<rect x="{x}" y="{self.y}" width="{CELL}" height="{ROW}"{fill} stroke="#555"/>')
            self.text(x + CELL // 2, self.y + 19, words)
        self.width = max(self.width, LABEL + len(cells) * CELL + MARGIN)
        self.y += ROW

    def heading(self, words):
        self.y += 14
        self.text(MARGIN, self.y + 10, words, ' text-anchor="start" font-weight="bold"')
        self.y += 18

    def svg(self):
        return "\n".join([
            f'<svg xmlns="http://www.w3.org/2000/svg" width="{self.width}" height="{self.y + MARGIN}" '
            'font-family="sans-serif" font-size="13" text-anchor="middle" fill="#111">',
            f"<title>{self.title}</title>",
            '<rect width="100%" height="100%" rx="6" fill="white"/>', *self.items, "</svg>", ""])


def numberings(rows):
    """One column a storage position, the highest at the left, as a binary number is written."""
    length = len(rows[0]["values"].split())
    picture = Picture(f"The numberings of a vector of {length} bits")
    positions = list(reversed(range((length + 7) // 8 * 8)))
    by_byte = [SHADES[p // 8] for p in positions]
    picture.heading(f"Storage, for a vector of {length} bits")
    picture.row("byte of data()", [p // 8 for p in positions], by_byte)
    picture.row("bit of the byte", [p % 8 for p in positions], by_byte)
    picture.row("storage position", positions, by_byte)
    picture.heading("The index that means this bit")
    for row in rows:
        index_at = {int(position): index for index, position in enumerate(row["values"].split())}
        picture.row(row["of"], [index_at.get(p, "–") for p in positions], by_byte)
    return picture


def hex_orders(rows):
    text = rows[0]["of"].split()[0]
    picture = Picture(f"What the text {text} becomes in the four orders")
    for load in dict.fromkeys(row["of"] for row in rows):
        values = {row["what"]: row["values"].split() for row in rows if row["of"] == load}
        digits = [text[int(place)] for place in values["character"]]
        by_digit = [SHADES[int(place)] for place in values["character"]]
        picture.heading(f"{load[len(text) + 1:]}: data() is {' '.join(values['data'])}")
        picture.row("index", range(len(digits)))
        picture.row("bit", values["bit"], by_digit)
        picture.row("of the digit", digits, by_digit)
        picture.row("storage position", values["position"])
    return picture


def main():
    with open(pathlib.Path(__file__).with_name("bits.csv"), encoding="utf-8", newline="") as table:
        rows = list(csv.DictReader(table))
    indexes = [row for row in rows if row["what"] == "index"]
    loads = [row for row in rows if row["what"] != "index"]
    target = pathlib.Path(sys.argv[1])
    target.mkdir(parents=True, exist_ok=True)
    for name, picture in (("numberings", numberings(indexes)), ("hex-orders", hex_orders(loads))):
        (target / f"{name}.svg").write_text(picture.svg(), encoding="utf-8", newline="\n")


main()
