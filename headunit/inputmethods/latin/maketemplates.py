#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Writes what characters look like as rows of a C++ table: from stroke fonts, and from a list of other ways to write some.

usage: maketemplates.py VARIANTS templates.inc FONT.jhf...

A row is the character and its strokes, as text: a point is two letters, their distance from R its x and y, and a space ends a
stroke. A capital is from -12 to 9 high, a small letter from -5, a tail reaches to 16.
"""
import string
import sys

WANTED = string.ascii_letters + string.digits + ".,?!-'@&/:;+*()\"#=_%$"
FIRST = 32  # the character of a font's first glyph
ORIGIN = ord("R")
PEN_UP = " R"


def glyphs(path):
    """The vertices of each glyph as text. Lines of a glyph's record go on in the next one when it is long."""
    with open(path, encoding="ascii") as file:
        text = file.read().replace("\n", "").replace("\r", "")
    position = 0
    while position < len(text):
        count = int(text[position + 5 : position + 8])
        yield text[position + 10 : position + 8 + 2 * count]
        position += 8 + 2 * count


def font(path):
    for code, vertices in enumerate(glyphs(path), FIRST):
        pairs = [vertices[i : i + 2] for i in range(0, len(vertices), 2)]
        if chr(code) in WANTED:
            yield chr(code), "".join(" " if pair == PEN_UP else pair for pair in pairs)


def variants(path):
    with open(path, encoding="ascii") as lines:
        for number, line in enumerate(lines, 1):
            if line.startswith("# ") and not line.startswith("# |"):
                continue
            character, *strokes = line.rstrip("\n").split(" | ")
            try:
                points = [[tuple(map(int, point.split(","))) for point in stroke.split(" ")] for stroke in strokes]
                if character not in WANTED or not points:
                    raise ValueError("not a character and its strokes")
                yield character, " ".join("".join(chr(ORIGIN + x) + chr(ORIGIN + y) for x, y in stroke) for stroke in points)
            except ValueError as error:
                sys.exit(f"{path}:{number}: {error}")


def main():
    listed, target, *fonts = sys.argv[1:]
    found = [row for path in fonts for row in font(path)] + list(variants(listed))
    rows = dict.fromkeys((character, strokes) for character, strokes in found if strokes.strip())
    missing = set(WANTED) - {character for character, _ in rows}
    if missing:
        sys.exit(f"no strokes for {sorted(missing)}")
    with open(target, "w", encoding="ascii") as output:
        for character, strokes in rows:
            quoted = [text.replace("\\", "\\\\").replace('"', '\\"').replace("'", "\\'") for text in (character, strokes)]
            output.write("{u'%s', \"%s\"},\n" % tuple(quoted))


main()
