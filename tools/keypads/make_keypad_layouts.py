#!/usr/bin/env python3
"""Writes the keypad layout files of opt/GUI/Keypad/.

Each layout keeps the rows of the language's own keyboard on the normal page
(digits on top, three letter rows) and puts its accented letters and the
punctuation on the special page. Keys are 26 x 55, rows centred on the
320-pixel screen; the rows end at 389, where the function row starts.

Run from anywhere: tools/keypads/make_keypad_layouts.py
"""
import os
from xml.sax.saxutils import quoteattr

KEY_W, KEY_H = 26, 55
ROWS_Y = (170, 225, 280, 335)

# A row is a string: each character is a key; letters get their capital in
# the capital layer and their small form in the lower-case layer.
LAYOUTS = {
    "de": {
        "normal": ["1234567890ß", "QWERTZUIOPÜ", "ASDFGHJKLÖÄ", "YXCVBNM"],
        "special": ["!\"§$%&/()=?", "+*#'-_.,:;", "@€°^<>|~µ", "[]{}\\²³"],
    },
    "fr": {
        "normal": ["1234567890", "AZERTYUIOP", "QSDFGHJKLM", "WXCVBN"],
        "special": ["ÉÈÊËÀÂÇ", "ÙÛÜÔÎÏŒÆ", "&\"'(-_)=+€", "@#%*/.,:;!?"],
    },
    "es": {
        "normal": ["1234567890", "QWERTYUIOP", "ASDFGHJKLÑ", "ZXCVBNM"],
        "special": ["ÁÉÍÓÚÜÇ", "¿?¡!\"'()-_", "@#€$%&*/+=", ".,:;ºª<>"],
    },
    "it": {
        "normal": ["1234567890", "QWERTYUIOP", "ASDFGHJKL", "ZXCVBNM"],
        "special": ["ÀÈÉÌÒÙ", "!\"£$%&/()=", "?'^-_+*@#€", ".,:;§°<>"],
    },
    "pt": {
        "normal": ["1234567890", "QWERTYUIOP", "ASDFGHJKLÇ", "ZXCVBNM"],
        "special": ["ÁÀÂÃÉÊÍ", "ÓÔÕÚÜºª", "!\"#$%&/()=?", "@€'-_+*.,:;"],
    },
    # The Wi-Fi password keypad: English letters and every printable ASCII
    # sign, since a passphrase may hold any of them.
    "wifi": {
        "normal": ["1234567890", "QWERTYUIOP", "ASDFGHJKL", "ZXCVBNM"],
        "special": ["!@#$%^&*()", "-_=+[]{}\\|", ";:'\",.<>/?", "`~"],
    },
}


def row_keys(row, y, special):
    left = (320 - len(row) * KEY_W) // 2
    for i, ch in enumerate(row):
        cap, low = ch.upper(), ch.lower()
        if ch in "ßµºª":  # no capital of their own on a keyboard
            cap = low = ch
        attrs = {
            "characterCap": str(ord(cap)),
            "characterLow": str(ord(low)),
            "xCoord": str(left + i * KEY_W),
            "yCoord": str(y),
            "width": str(KEY_W),
            "height": str(KEY_H),
        }
        if special:
            attrs["special"] = "true"
        yield "    <key " + " ".join(f"{k}={quoteattr(v)}" for k, v in attrs.items()) + "/>"


def write(code, layout, folder):
    lines = ['<?xml version="1.0" encoding="UTF-8"?>', '<keypad ContentVersion="0.1 alpha">']
    for page in ("normal", "special"):
        lines.append(f"    <!-- {page} page -->")
        for y, row in zip(ROWS_Y, layout[page]):
            assert len(row) * KEY_W <= 320, (code, row)
            lines.extend(row_keys(row, y, page == "special"))
    lines.append("</keypad>")
    with open(os.path.join(folder, f"keypad_{code}.xml"), "w", encoding="utf-8") as f:
        f.write("\n".join(lines) + "\n")


if __name__ == "__main__":
    folder = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "opt", "GUI", "Keypad")
    for code, layout in LAYOUTS.items():
        write(code, layout, folder)
