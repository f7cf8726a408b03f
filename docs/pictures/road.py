#!/usr/bin/env python3
"""Draws the road of one batch line for docs/architecture.md.

usage: road.py DIRECTORY
"""

import html
import pathlib
import sys

BOX, GAP, ROW, MARGIN = 250, 36, 92, 14
LINE = 'program -p 1 2 -v -u 1A2B'
# What is done, the classes that do it, and what it makes; one row a step.
STEPS = (
    ("Split", "CommandSet", "[program] [-p] [0] [1] [-v] [-u] [1A2B]", "positions count from 0 now"),
    ("Check", "TessalCmdargs, HkCmdArgs", "-p = 0 1, -v, -u = 1A2B", "by the format in tessal.acd"),
    ("Set options", "DeviceOptionsMgr", "-v -u 1A2B", "from a table of rows, in their order"),
    ("Take the port", "Access", "one process has the cable", "no waiting; free again if it is killed"),
    ("Talk", "TessalPortMux, DataBuffer", "02 00 00 00 61 62 ...", "pipe or TCP, the same bytes"),
    ("Tell progress", "ProgressInterfaceClass", "12 of 100", "at most once a percent"),
    ("Compare", "RLBitVec, PromUtility", "000000aa0", "sums of each row, one verdict"),
    ("Give back", "Access", "the next one has the cable", ""),
)


def text(x, y, words, more=""):
    return f'<text x="{x}" y="{y}"{more}>{html.escape(words)}</text>'


def box(x, y, width, height, fill):
    return f'<rect x="{x}" y="{y}" width="{width}" height="{height}" rx="5" fill="{fill}" stroke="#555"/>'


def arrow(x, y1, y2):
    return f'<line x1="{x}" y1="{y1}" x2="{x}" y2="{y2}" stroke="#555" stroke-width="2" marker-end="url(#head)"/>'


def step(index, name, classes, result, remark):
    """The step with its classes at the left, what it makes at the right, and the way to the next one."""
    y, middle = 64 + index * ROW, MARGIN + BOX // 2
    right = MARGIN + BOX + GAP
    items = [box(MARGIN, y, BOX, 56, "#dbe9f6"),
             text(middle, y + 22, f"{index + 1}. {name}", ' text-anchor="middle" font-weight="bold"'),
             text(middle, y + 43, classes, ' text-anchor="middle" font-family="monospace"'),
             text(right, y + 24, result, ' font-family="monospace"'), text(right, y + 43, remark, ' fill="#555"')]
    if index + 1 < len(STEPS):
        items.append(arrow(middle, y + 56, y + ROW - 3))
    return items


def side(y1, y2, words):
    """A bar at the right edge over several steps."""
    x = 690
    return [f'<line x1="{x}" y1="{y1}" x2="{x}" y2="{y2}" stroke="#e0a04f" stroke-width="6"/>',
            text(x + 12, (y1 + y2) // 2, words)]


def main():
    height = 64 + len(STEPS) * ROW
    items = [f'<svg xmlns="http://www.w3.org/2000/svg" width="860" height="{height}" font-family="sans-serif" '
             'font-size="13" fill="#111">', "<title>The road of one batch line</title>",
             '<defs><marker id="head" viewBox="0 0 8 8" refX="7" refY="4" markerWidth="6" markerHeight="6" '
             'orient="auto"><path d="M0 0L8 4L0 8z" fill="#555"/></marker></defs>',
             '<rect width="100%" height="100%" rx="6" fill="white"/>',
             box(MARGIN, 14, 340, 28, "#fbe3c8"), text(MARGIN + 10, 33, LINE, ' font-family="monospace"'),
             arrow(MARGIN + BOX // 2, 42, 61)]
    for index, words in enumerate(STEPS):
        items += step(index, *words)
    items += side(64 + 3 * ROW, 64 + 7 * ROW + 56, "under the port's lock")
    items += side(64, 64 + 2 * ROW + 56, "without the device")
    target = pathlib.Path(sys.argv[1])
    target.mkdir(parents=True, exist_ok=True)
    (target / "road.svg").write_text("\n".join([*items, "</svg>", ""]), encoding="utf-8", newline="\n")


main()
