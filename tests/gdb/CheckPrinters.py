"""Runs inside gdb: compares what the pretty-printers show of the values in Values.cpp. Exit status 77: nothing can be run."""

import gdb

EXPECTED = {
    "mark": "60.06 s (15256200960000 ticks)",
    "invalid": "kTime_Invalid",
    "ntsc": "29.97 fps (8475667200 ticks a frame)",
    "noRate": "kFrameRate_Zero",
    "channel": "BackLeft",
    "name": "'bgra'",
    "anyName": "any",
    "oddName": "0x1",
    "format": "'v210' 0x40443",
    "properties": "0x3c000",
    "ratio": "1024/702",
    "flags": "0xc",
    "text": '"Länge"',
    "empty": '""',
}


def check():
    gdb.execute("set debuginfod enabled off")
    gdb.execute("break StopHere", to_string=True)
    try:
        gdb.execute("run", to_string=True)
    except gdb.error as error:
        print(f"gdb cannot run a program here: {error}")
        return 77
    gdb.execute("up", to_string=True)
    wrong = 0
    for name, text in EXPECTED.items():
        shown = gdb.parse_and_eval(name).format_string()
        if shown != text:
            print(f"{name} is shown as {shown}, not as {text}")
            wrong = 1
    return wrong


gdb.execute(f"quit {check()}")
