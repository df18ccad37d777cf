#!/usr/bin/env python3
"""Checks that the Linux resources mean what the Windows ones do: compiles the resource
script with windres into a .res file, reads its strings, menus and dialogs back, and
compares them with the model rc2cpp.py builds from the same script.

    rc_check.py WINDRES RC2CPP SCRIPT WORKDIR ROOT STAND_IN_INCLUDE

windres reads the real <windows.h>; rc2cpp.py reads the stand-in of STAND_IN_INCLUDE.

Exits 0 when they agree, 1 with the differences otherwise.
"""
import json
import struct
import subprocess
import sys
from pathlib import Path

RT_MENU, RT_DIALOG, RT_STRING = 4, 5, 6
MF_POPUP, MF_END = 0x10, 0x80
DS_SETFONT = 0x40
ATOM_CLASSES = {0x80: "BUTTON", 0x81: "EDIT", 0x82: "STATIC", 0x83: "LISTBOX"}


class Reader:
    def __init__(self, data, position=0):
        self.data, self.position = data, position

    def word(self):
        (value,) = struct.unpack_from("<H", self.data, self.position)
        self.position += 2
        return value

    def dword(self):
        (value,) = struct.unpack_from("<I", self.data, self.position)
        self.position += 4
        return value

    def short(self):
        (value,) = struct.unpack_from("<h", self.data, self.position)
        self.position += 2
        return value

    def text(self):
        chars = []
        while True:
            value = self.word()
            if value == 0:
                return "".join(chars)
            chars.append(chr(value))

    def name_or_number(self):
        """A text, or ("#", number) for a number."""
        first = self.word()
        if first == 0xFFFF:
            return ("#", self.word())
        if first == 0:
            return ""
        self.position -= 2
        return self.text()

    def align(self):
        self.position = (self.position + 3) & ~3


def resources(data):
    """(type, name, bytes) of every resource in a .res file."""
    reader, found = Reader(data), []
    while reader.position < len(data):
        start = reader.position
        size, header = reader.dword(), reader.dword()
        kind, name = reader.name_or_number(), reader.name_or_number()
        body = data[start + header:start + header + size]
        if size:
            found.append((kind, name, body))
        reader.position = start + header + size
        reader.align()
    return found


def strings(block, body):
    reader, table = Reader(body), {}
    for index in range(16):
        length = reader.word()
        text = "".join(chr(reader.word()) for _ in range(length))
        if length:
            table[str((block - 1) * 16 + index)] = text
    return table


def menu_items(reader):
    items = []
    while True:
        flags = reader.word()
        if flags & MF_POPUP:
            text = reader.text()
            items.append({"flags": flags & ~MF_END, "id": 0, "text": text, "items": menu_items(reader)})
        else:
            number, text = reader.word(), reader.text()
            separator = number == 0 and text == "" and (flags & ~MF_END) == 0
            items.append({"flags": 0x800 if separator else flags & ~MF_END, "id": number,
                          "text": text, "items": []})
        if flags & MF_END:
            return items


def dialog(body):
    reader = Reader(body)
    style, _ = reader.dword(), reader.dword()
    count = reader.word()
    x, y, cx, cy = (reader.short() for _ in range(4))
    reader.name_or_number()  # menu
    reader.name_or_number()  # class
    result = {"style": style, "x": x, "y": y, "cx": cx, "cy": cy, "caption": reader.text(),
              "font": None, "size": 0, "items": []}
    if style & DS_SETFONT:
        result["size"] = reader.word()
        result["font"] = reader.text()
    for _ in range(count):
        reader.align()
        item_style, _ = reader.dword(), reader.dword()
        ix, iy, icx, icy = (reader.short() for _ in range(4))
        number = reader.word()
        window_class = reader.name_or_number()
        if isinstance(window_class, tuple):
            window_class = ATOM_CLASSES[window_class[1]]
        text = reader.name_or_number()
        extra = reader.word()
        reader.position += extra
        result["items"].append({"class": window_class.upper(), "text": text if isinstance(text, str) else "",
                                "id": number, "style": item_style, "x": ix, "y": iy, "cx": icx, "cy": icy})
    return result


def read_res(path):
    model = {"strings": {}, "menus": {}, "dialogs": {}}
    for kind, name, body in resources(Path(path).read_bytes()):
        if kind == ("#", RT_STRING):
            model["strings"].update(strings(name[1], body))
        elif kind == ("#", RT_MENU):
            model["menus"][str(name[1])] = menu_items(Reader(body, 4))
        elif kind == ("#", RT_DIALOG):
            model["dialogs"][str(name[1])] = dialog(body)
    return model


def main():
    windres, rc2cpp, script, workdir, root, stand_in = sys.argv[1:7]
    work = Path(workdir)
    work.mkdir(parents=True, exist_ok=True)
    subprocess.run([windres, "-I", root, "-O", "res", "-o", str(work / "check.res"), script], check=True)
    subprocess.run([sys.executable, rc2cpp, script, "-o", str(work / "check.cpp"), "--model",
                    str(work / "check.json"), "-I", root, "-I", stand_in], check=True)
    compiled = read_res(work / "check.res")
    generated = json.loads((work / "check.json").read_text())
    differences = 0
    for kind in ("strings", "menus", "dialogs"):
        for number in sorted(set(compiled[kind]) | set(generated[kind]), key=int):
            if compiled[kind].get(number) != generated[kind].get(number):
                differences += 1
                print(f"{kind} {number}:\n  windres: {compiled[kind].get(number)}\n"
                      f"  rc2cpp:  {generated[kind].get(number)}")
    counts = {kind: len(compiled[kind]) for kind in compiled}
    print(f"compared {counts}: {differences} differences")
    return 1 if differences or not all(counts.values()) else 0


if __name__ == "__main__":
    sys.exit(main())
