#!/usr/bin/env python3
"""Draws the pictures of docs/bits.md from the rules of the numberings.

usage: draw_bits.py DIRECTORY
"""

import pathlib
import sys

CELL, ROW, LABEL = 34, 28, 190
SHADES = ("#dbe9f6", "#fbe3c8", "#dff0d8", "#f3dcec")


class Picture:
    def __init__(self, title):
        self.title, self.items, self.y, self.width = title, [], 10, 0

    def text(self, x, y, words, anchor="middle", weight="normal"):
        self.items.append(f'<text x="{x}" y="{y}" text-anchor="{anchor}" font-weight="{weight}">{words}</text>')

    def row(self, label, cells, shade=lambda i: "none"):
        """One line of cells; a cell is its words."""
        self.text(LABEL - 8, self.y + 19, label, "end")
        for i, words in enumerate(cells):
            x = LABEL + i * CELL
            self.items.append(f'<rect x="{x}" y="{self.y}" width="{CELL}" height="{ROW}" '
                              f'fill="{shade(i)}" stroke="#555"/>')
            self.text(x + CELL / 2, self.y + 19, words)
        self.width = max(self.width, LABEL + len(cells) * CELL + 10)
        self.y += ROW

    def heading(self, words):
        self.y += 14
        self.text(10, self.y + 10, words, "start", "bold")
        self.y += 18

    def svg(self):
        return "\n".join([
            f'<svg xmlns="http://www.w3.org/2000/svg" width="{self.width}" height="{self.y + 10}" '
            f'font-family="sans-serif" font-size="13">',
            f"<title>{self.title}</title>",
            '<rect width="100%" height="100%" fill="white"/>', *self.items, "</svg>", ""])


def numberings(length):
    """One column a storage position, the highest at the left, as a binary number is written."""
    picture = Picture("The numberings of a vector of %d bits" % length)
    positions = list(reversed(range(8 * ((length + 7) // 8))))
    by_byte = lambda i: SHADES[positions[i] // 8]
    used = lambda p, index: str(index) if p < length else "-"
    picture.heading("Storage, for a vector of %d bits" % length)
    picture.row("byte of data()", [str(p // 8) for p in positions], by_byte)
    picture.row("bit of the byte", [str(p % 8) for p in positions], by_byte)
    picture.row("storage position", [str(p) for p in positions], by_byte)
    picture.heading("The index that means this bit")
    picture.row("LRBitVec", [used(p, p) for p in positions], by_byte)
    picture.row("RLBitVec", [used(p, length - 1 - p) for p in positions], by_byte)
    picture.row("RLBitVec, forward", [used(p, p) for p in positions], by_byte)
    picture.row("RLBitVec, byte mirror", [used(p, p ^ 7) for p in positions], by_byte)
    return picture


def load(text, size, descending, byte_swap):
    """Index to (character, bit) for a text that fills the vector."""
    places = [i ^ 1 if byte_swap else i for i in range(len(text))]
    stream = [(text[i], int(text[i], 16) >> (b if byte_swap else 3 - b) & 1) for i in places for b in range(4)]
    return {size - 1 - k if descending else k: bit for k, bit in enumerate(stream)}


def hex_orders(text):
    picture = Picture("What the text %s becomes in the four orders" % text)
    size = 4 * len(text)
    for descending in (False, True):
        for byte_swap in (False, True):
            bits = load(text, size, descending, byte_swap)
            shade = lambda i: SHADES[text.index(bits[i][0])]
            value = sum(bits[i][1] << (size - 1 - i) for i in bits)
            data = " ".join("%02X" % byte for byte in value.to_bytes(size // 8, "little"))
            picture.heading("descending %s, byteSwap %s: data() is %s"
                            % (str(descending).lower(), str(byte_swap).lower(), data))
            picture.row("index", [str(i) for i in range(size)])
            picture.row("bit", [str(bits[i][1]) for i in range(size)], shade)
            picture.row("of the digit", [bits[i][0] for i in range(size)], shade)
            picture.row("storage position", [str(size - 1 - i) for i in range(size)])
    return picture


def main():
    target = pathlib.Path(sys.argv[1])
    target.mkdir(parents=True, exist_ok=True)
    for name, picture in (("numberings", numberings(12)), ("hex-orders", hex_orders("12a5"))):
        (target / (name + ".svg")).write_text(picture.svg(), encoding="utf-8", newline="\n")


main()
