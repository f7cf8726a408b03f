"""Shows the library's texts, bit vectors and registers in gdb.

    source .../TessalUtility-gdb.py

`print /r` shows the fields as they are; `set print elements` cuts long texts and vectors, as it does with arrays.
"""

import gdb
import gdb.printing

GROUP = 4  # bits between two separators
MOST = 65536  # bits shown of a vector where gdb sets no limit
UNREADABLE = (gdb.error, OverflowError)  # what reading at an address that cannot be gives


def read_bytes(pointer, first, count):
    return bytes(gdb.selected_inferior().read_memory(int(pointer) + first, count))


def is_readable(pointer):
    try:
        read_bytes(pointer, 0, 1)
    except UNREADABLE:
        return False
    return True


class TextPrinter:
    """HkString: the length word stands in the four bytes before the text."""

    def __init__(self, value):
        self.text, self.length = value["m_text"], None
        try:
            self.length = int.from_bytes(read_bytes(self.text, -4, 4), "little")
        except UNREADABLE:
            pass

    def to_string(self):
        if self.length is None:
            return "<no text at %#x>" % int(self.text)
        return self.text.lazy_string(length=self.length)

    def display_hint(self):
        return "string" if self.length is not None else None


class VectorPrinter:
    """LRBitVec: the bits from index 0 on, in groups counted from index 0."""

    def __init__(self, value):
        self.length, self.capacity, self.data = (
            int(value[field]) for field in ("m_numberBits", "m_capacity", "m_data"))

    def position(self, index):
        return index

    def is_group_end(self, index):
        return (index + 1) % GROUP == 0

    def notes(self):
        return ["capacity %d" % self.capacity]

    def bits(self):
        count = min(self.length, gdb.parameter("print elements") or MOST)  # None where there is no limit
        positions = [self.position(index) for index in range(count)]
        first = min(positions) >> 3
        array = read_bytes(self.data, first, (max(positions) >> 3) - first + 1)
        text = ""
        for index, position in enumerate(positions):
            text += str(array[(position >> 3) - first] >> (position & 7) & 1)
            if self.is_group_end(index) and index + 1 < count:
                text += "_"
        return text + ("..." if count < self.length else "")

    def content(self):
        if self.length == 0:
            return ""
        if self.length > self.capacity:
            return " <damaged or not yet constructed>"
        try:
            return " " + self.bits()
        except UNREADABLE:
            return " <no array at %#x>" % self.data

    def to_string(self):
        return "%d bits%s (%s)" % (self.length, self.content(), ", ".join(self.notes()))


class NumberedVectorPrinter(VectorPrinter):
    """RLBitVec: the bits from index 0 on, as a number in groups counted from its right end."""

    def __init__(self, value):
        super().__init__(value)
        self.is_mirrored, self.is_forward = (
            int(value[field]) != 0 for field in ("m_byteMirrorIndex", "m_forwardIndex"))

    def position(self, index):
        if self.is_mirrored:
            return index ^ 7
        return index if self.is_forward else self.length - 1 - index

    def is_group_end(self, index):
        return (self.length - 1 - index) % GROUP == 0

    def notes(self):
        numbering = "byte mirror" if self.is_mirrored else "forward" if self.is_forward else "usual"
        return super().notes() + [numbering + " index"]


class BitPrinter:
    """BitOperations: the bit, and where it stands."""

    def __init__(self, value):
        self.byte, self.mask = value["m_byte"], int(value["m_mask"])

    def to_string(self):
        if not is_readable(self.byte):
            return "<no byte at %#x>" % int(self.byte)
        byte = read_bytes(self.byte, 0, 1)[0]
        return "%s (bit %d of the byte 0x%02x)" % (
            "true" if byte & self.mask else "false", self.mask.bit_length() - 1, byte)


class RegisterPrinter:
    """Register: its parts in index order, the total, and which of the two is ahead."""

    PARTS = (("address", "m_address"), ("data", "m_data"), ("status", "m_status"), ("total", "m_totalData"))

    def __init__(self, value):
        self.value = value

    def to_string(self):
        if self.value["m_rebuildTotal"]:
            return "parts ahead of the total"
        return "total ahead of the parts" if self.value["m_splitTotal"] else "in step"

    def children(self):
        for name, field in self.PARTS:
            part = self.value[field]
            yield name, part.dereference() if is_readable(part) else part


def where_known(printer):
    """The printer, for values whose fields the debug information tells; gdb tells of the others itself."""
    return lambda value: printer(value) if value.type.strip_typedefs().fields() else None


def build_printers():
    printers = gdb.printing.RegexpCollectionPrettyPrinter("TessalUtility")
    for name, printer in (("HostKit::HkString", TextPrinter), ("LRBitVec", VectorPrinter),
                          ("RLBitVec", NumberedVectorPrinter), ("BitOperations", BitPrinter),
                          ("Register", RegisterPrinter)):
        printers.add_printer(name, "^%s$" % name, where_known(printer))
    return printers


gdb.printing.register_pretty_printer(gdb.current_objfile(), build_printers(), replace=True)
