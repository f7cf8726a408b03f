# Run by gdb with the printers loaded and the program of views.cpp: what gdb shows, in docs/debugger.md too, and what
# the natvis file's expressions give, which gdb can evaluate.
import pathlib
import re
import xml.etree.ElementTree

import gdb

VIEWS = [
    ("text", '"device \\"7\\""'),
    ("emptyText", '""'),
    ("textWithZero", '"a\\000b"'),
    ("longText", "'x' <repeats 20 times>..."),
    ("movedText", '""'),
    ("*(HkString*)noText", "<no text at 0x0>"),
    ("left", "12 bits 1010_0101_0011 (capacity 19)"),
    ("emptyLeft", "0 bits (capacity 8)"),
    ("movedLeft", "0 bits (capacity 0)"),
    ("longLeft", "1000 bits 1111_1111_1111_1111_1111... (capacity 1007)"),
    ("right", "12 bits 1100_1010_0101 (capacity 19, usual index)"),
    ("longRight", "1001 bits 0_1000_0000_0000_0000_000... (capacity 1008, usual index)"),
    ("*(RLBitVec*)&forward", "12 bits 1010_0101_0011 (capacity 19, forward index)"),
    ("*(RLBitVec*)&byteMirror", "12 bits 1010_0101_0000 (capacity 19, byte mirror index)"),
    ("*(RLBitVec*)noVector", "0 bits (capacity 0, usual index)"),
    ("*(LRBitVec*)wildVector",
     "6148914691236517205 bits <no array at 0x5555555555555555> (capacity 6148914691236517205)"),
    ("bit", "true (bit 2 of the byte 0xa5)"),
    ("*(BitOperations*)noBit", "<no byte at 0x0>"),
    ("device", "parts ahead of the total = {"
               "address = 4 bits 0101 (capacity 11, usual index), data = 8 bits 1010_0101 (capacity 15, usual index), "
               "status = 2 bits 01 (capacity 9, usual index), "
               "total = 14 bits 00_0000_0000_0000 (capacity 21, usual index)}"),
    ("emptyDevice", "in step = {address = 0x0, data = 0x0, status = 0x0, total = 0x0}"),
]
NATVIS_BITS = {"LRBitVec": {"left": "101001010011"},
               "RLBitVec": {"right": "110010100101", "forward": "101001010011", "byteMirror": "101001010000"}}
NATVIS_OBJECTS = {"HostKit::HkString": ["text", "emptyText"], "LRBitVec": ["left", "movedLeft"],
                  "RLBitVec": ["right", "forward", "byteMirror"], "BitOperations": ["bit"], "Register": ["device"]}
ROOT = pathlib.Path(__file__).parents[2]
faults = []


def expect(what, got, wanted):
    if got != wanted:
        faults.append("%s\n  shows    %s\n  expected %s" % (what, got, wanted))


def evaluate(expression, subject):
    return gdb.parse_and_eval(re.sub(r"\bm_\w+", lambda field: "(%s).%s" % (subject, field.group()), expression))


def evaluate_node(node, subject):
    """Evaluates what a node of the natvis file holds, where its condition is met."""
    condition, text = node.get("Condition"), (node.text or "").strip()
    if condition and not evaluate(condition, subject):
        return
    for shown_text in re.findall(r"{([^}]*)}", text) if node.tag.endswith("DisplayString") else filter(None, [text]):
        value, count = re.fullmatch(r"(.*?)(?:,(?:\[(.*)\])?na)?", shown_text).groups()
        for expression in filter(None, (value, count)):
            evaluate(expression.replace("$i", "0"), subject)
    for child in node:
        evaluate_node(child, subject)


def bits_by_natvis(view, subject):
    for items in view.findall(".//{*}IndexListItems"):
        if evaluate(items.get("Condition"), subject):
            size, value = evaluate(items.find("{*}Size").text, subject), items.find("{*}ValueNode").text
            return "".join(str(int(evaluate(value.replace("$i", str(i)), subject))) for i in range(int(size)))
    return None


def check_natvis(path):
    for view in xml.etree.ElementTree.parse(path).getroot().findall("{*}Type"):
        name = view.get("Name")
        for subject in NATVIS_OBJECTS[name]:
            evaluate_node(view, subject)
        for subject, bits in NATVIS_BITS.get(name, {}).items():
            expect("natvis of " + subject, bits_by_natvis(view, subject), bits)


def check_page(path):
    commands = re.findall(r"^\(gdb\) (.*)\n(.*)$", path.read_text(encoding="utf-8"), re.MULTILINE)
    expect("number of commands in the page", len(commands), 6)
    for command, wanted in commands:
        expect(command, gdb.execute(command, to_string=True).rstrip("\n"), wanted)


def shown(expression):
    return gdb.execute("output " + expression, to_string=True)


gdb.execute("break shown")
gdb.execute("run")
check_page(ROOT / "docs" / "debugger.md")
gdb.execute("set print elements 20")
for expression, wanted in VIEWS:
    expect(expression, shown(expression), wanted)
check_natvis(ROOT / "debug" / "TessalUtility.natvis")

gdb.execute("set var right.m_data = 0")
expect("a vector without array", shown("right"), "12 bits <no array at 0x0> (capacity 19, usual index)")
gdb.execute("set print elements 0")
expect("a vector shown whole", shown("longLeft"), "1000 bits %s (capacity 1007)" % "_".join(["1111"] * 250))
print("\n".join(faults) if faults else "all views are as expected")
