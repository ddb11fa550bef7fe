#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Writes the readings of Unihan as rows of a C++ table, by character, the most usual reading first.

usage: makereadings.py pinyin|zhuyin Unihan_Readings.txt.bz2 readings.inc

In Pinyin they are as typed, without tones; in Zhuyin each has one, made of the Pinyin.
"""
import bz2
import collections
import re
import sys
import unicodedata

# By how well they tell what is usual: counted in texts, customary, in the list of standard characters.
FIELDS = {
    "kMandarin": re.compile(r"(\S+)"),
    "kHanyuPinlu": re.compile(r"(\S+)\(\d+\)"),
    "kTGHZ2013": re.compile(r"(?:\S+:)?([^\s,]+)"),
}
LETTERS = re.compile(r"[a-z]{1,6}")

TONES = {"\u0304": "ˉ", "\u0301": "ˊ", "\u030c": "ˇ", "\u0300": "ˋ"}
INITIALS = dict(zip("b p m f d t n l g k h j q x zh ch sh r z c s".split(), "ㄅㄆㄇㄈㄉㄊㄋㄌㄍㄎㄏㄐㄑㄒㄓㄔㄕㄖㄗㄘㄙ"))
FINALS = dict(entry.split("=") for entry in (
    "a=ㄚ o=ㄛ e=ㄜ ai=ㄞ ei=ㄟ ao=ㄠ ou=ㄡ an=ㄢ en=ㄣ ang=ㄤ eng=ㄥ er=ㄦ ong=ㄨㄥ "
    "i=ㄧ ia=ㄧㄚ io=ㄧㄛ ie=ㄧㄝ iao=ㄧㄠ iu=ㄧㄡ iou=ㄧㄡ ian=ㄧㄢ in=ㄧㄣ iang=ㄧㄤ ing=ㄧㄥ iong=ㄩㄥ "
    "u=ㄨ ua=ㄨㄚ uo=ㄨㄛ uai=ㄨㄞ ui=ㄨㄟ uei=ㄨㄟ uan=ㄨㄢ un=ㄨㄣ uen=ㄨㄣ uang=ㄨㄤ ueng=ㄨㄥ "
    "v=ㄩ ve=ㄩㄝ van=ㄩㄢ vn=ㄩㄣ").split())
SYLLABLE = re.compile(r"(zh|ch|sh|[bpmfdtnlgkhjqxrzcs])?([a-z]+)")


def plain(reading):
    """The letters alone, with v for u with two dots; and the tone's mark, if there is one."""
    marked = unicodedata.normalize("NFD", reading).replace("u\u0308", "v")
    letters = "".join(letter for letter in marked if not unicodedata.combining(letter))
    return letters, next((mark for mark in marked if mark in TONES), None)


def pinyin(reading):
    """The letters typed for a reading: v is not written before e. None when it is none."""
    letters = plain(reading)[0].replace("ve", "ue")
    return letters if LETTERS.fullmatch(letters) else None


def final_of(initial, letters):
    """The final as if it were written out: y and w stand for i, u or v, and u for v after j, q and x."""
    if initial in ("j", "q", "x"):
        return re.sub("^u", "v", letters)
    for written, meant in (("yu", "v"), ("yi", "i"), ("y", "i"), ("wu", "u"), ("w", "u")):
        if letters.startswith(written):
            return meant + letters[len(written):]
    return letters


def zhuyin(reading):
    """None when it is no syllable of Mandarin."""
    spelt, mark = plain(reading)
    tone = TONES.get(mark, "˙")
    match = SYLLABLE.fullmatch(spelt)
    if not match:
        return None
    initial, letters = match.groups()
    if initial in ("zh", "ch", "sh", "r", "z", "c", "s") and letters == "i":
        return INITIALS[initial] + tone
    final = FINALS.get(final_of(initial, letters))
    return INITIALS.get(initial, "") + final + tone if final else None


def readings(path, spell):
    fields = collections.defaultdict(dict)
    with bz2.open(path, "rt", encoding="utf-8") as lines:
        for line in lines:
            parts = line.rstrip("\n").split("\t")
            if len(parts) == 3 and parts[1] in FIELDS:
                fields[int(parts[0][2:], 16)][parts[1]] = parts[2]
    for character in sorted(c for c in fields if c <= 0xFFFF):
        found = fields[character]
        spelt = [spell(r) for name, pattern in FIELDS.items() for r in pattern.findall(found.get(name, ""))]
        for syllable in dict.fromkeys(filter(None, spelt)):
            yield character, syllable


def main():
    spelling, source, target = sys.argv[1:]
    spell = {"pinyin": pinyin, "zhuyin": zhuyin}[spelling]
    rows = [f'{{0x{character:04X}, u"{syllable}"}},\n' for character, syllable in readings(source, spell)]
    if not rows:
        sys.exit(f"{source}: no readings")
    with open(target, "w", encoding="utf-8") as output:
        output.writelines(rows)


main()
