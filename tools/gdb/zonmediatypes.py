"""Shows the values of zonmediatypes in gdb as people read them.

    (gdb) print mark
    $1 = 60.06 s (15256200960000 ticks)
    (gdb) print layout
    $2 = std::vector of length 2, capacity 2 = {FrontLeft, FrontRight}

An installed library brings this file where gdb loads it on its own; elsewhere: source tools/gdb/zonmediatypes.py
"""

import re

import gdb
import gdb.types

TICKS_PER_SECOND = 254016000000
NO_RATE = 2**63 - 1
INVALID_TIME = -400000 * TICKS_PER_SECOND


def number(value):
    """A double as people write it: up to six decimals, no zeros behind."""
    return f"{value:.6f}".rstrip("0").rstrip(".")


def tick_time(value):
    ticks = int(value["mTicks"])
    if ticks == INVALID_TIME:
        return "kTime_Invalid"
    return f"{number(ticks / TICKS_PER_SECOND)} s ({ticks} ticks)"


def frame_rate(value):
    ticks = int(value["mTicksPerFrame"])
    if ticks == NO_RATE:
        return "kFrameRate_Zero"
    if ticks == 0:
        return "0 ticks a frame"
    rate = f"{TICKS_PER_SECOND / ticks:.3f}".rstrip("0").rstrip(".")
    return f"{rate} fps ({ticks} ticks a frame)"


def name_code(value):
    """The four characters of a pixel format's name, from the lowest byte up."""
    code = int(value) & 0xFFFFFFFF
    if code == 0:
        return "any"
    characters = code.to_bytes(4, "little")
    if all(0x20 <= byte < 0x7F for byte in characters):
        return "'" + characters.decode("ascii") + "'"
    return hex(code)


def pixel_format(value):
    return f"{name_code(value['mName'])} {hex(int(value['mProperties']['mValue']))}"


def label(value):
    return re.sub(r".*kAudioChannelLabel_", "", str(value["mLabel"]))


class Summary:
    """A value whose whole text is made by one function."""

    def __init__(self, value, text):
        self.value = value
        self.text = text

    def to_string(self):
        return self.text(self.value)


class UTF16String:
    """Read from memory as a whole, since gdb knows 16-bit characters as numbers."""

    LONGEST = 2000   # code units shown

    def __init__(self, value, _):
        self.value = value

    def to_string(self):
        length = int(self.value["_M_string_length"])
        address = int(self.value["_M_dataplus"]["_M_p"])
        shown = min(length, self.LONGEST)
        if shown == 0:
            return ""
        units = gdb.selected_inferior().read_memory(address, 2 * shown).tobytes()
        return units.decode("utf-16-le", errors="replace") + ("..." if shown < length else "")

    def display_hint(self):
        return "string"


PRINTERS = [(re.compile(pattern), printer, text) for pattern, printer, text in (
    (r"^zonmediatypes::TickTime$", Summary, tick_time),
    (r"^zonmediatypes::FrameRate$", Summary, frame_rate),
    (r"^zonmediatypes::AudioChannelDescription$", Summary, label),
    (r"^zonmediatypes::PixelFormat$", Summary, pixel_format),
    (r"^zonmediatypes::PixelFormatName$", Summary, name_code),
    (r"^zonmediatypes::PixelFormatProperties$", Summary, lambda value: hex(int(value["mValue"]))),
    (r"^zonmediatypes::PixelAspectRatio$", Summary, lambda value: f"{int(value['mNumerator'])}/{int(value['mDenominator'])}"),
    (r"^zoncore::Flags<.*>$", Summary, lambda value: hex(int(value["mBits"]))),
    (r"^std::(__cxx11::)?basic_string<unsigned short,.*SmallBlockAllocator.*>$", UTF16String, None),
)]


def find_printer(value):
    name = str(gdb.types.get_basic_type(value.type))
    for pattern, printer, text in PRINTERS:
        if pattern.match(name):
            return printer(value, text)
    return None


find_printer.name = "zonmediatypes"


def register(objfile):
    # In front of the standard library's printers, which show 16-bit text as numbers. gdb asks the program's own first.
    if find_printer not in objfile.pretty_printers:
        objfile.pretty_printers.insert(0, find_printer)


for loaded in gdb.objfiles():
    register(loaded)
gdb.events.new_objfile.connect(lambda event: register(event.new_objfile))
