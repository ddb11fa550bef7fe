# SPDX-License-Identifier: MIT
"""JSON as the HMI reads it, with the line of every value.

It accepts what the core's parser accepts and refuses what that refuses, so that an answer about a document is the answer
of the head unit: at most 1024 levels, the last of two equal keys counts, at the top an array or an object. Only what a
text has from a byte-order mark in it, or from a backslash before a byte that is not ASCII, may differ.
"""

import bisect
import re
import sys

DEEPEST = 1024
_SPACE = re.compile(r"[ \t\n\r]*")
_STRING = re.compile(r'"([^"\\]*(?:\\.[^"\\]*)*)"', re.DOTALL)
_ESCAPE = re.compile(r"\\(u[0-9A-Fa-f]{4}|[^u])", re.DOTALL)
_NUMBER = re.compile(r"-?(?:0|[0-9]*)(?:\.[0-9]*)?(?:[eE][-+]?[0-9]*)?")
_ESCAPED = {"b": "\b", "f": "\f", "n": "\n", "r": "\r", "t": "\t"}
_LITERALS = {"true": True, "false": False, "null": None}

sys.setrecursionlimit(max(sys.getrecursionlimit(), 8 * DEEPEST))


class JsonError(Exception):
    def __init__(self, line, text):
        super().__init__(text)
        self.line = line
        self.text = text


class Members(dict):
    """A JSON object. `line` is that of its brace, `lines` those of its values, `key_lines` those of its keys."""

    def __init__(self, line):
        super().__init__()
        self.line = line
        self.lines = {}
        self.key_lines = {}


class Items(list):
    """A JSON array. `line` is that of its bracket, `lines` those of its values."""

    def __init__(self, line):
        super().__init__()
        self.line = line
        self.lines = []


class _Parser:
    def __init__(self, text):
        self.text = text
        self.at = 0
        self.depth = 0
        self.repeated = []
        self.line_ends = [match.start() for match in re.finditer("\n", text)]

    def line(self, at=None):
        return bisect.bisect_left(self.line_ends, self.at if at is None else at) + 1

    def fail(self, text, at=None):
        raise JsonError(self.line(at), text)

    def skip_space(self):
        self.at = _SPACE.match(self.text, self.at).end()

    def peek(self):
        self.skip_space()
        return self.text[self.at:self.at + 1]

    def document(self):
        if self.peek() not in ("[", "{"):
            self.fail("an array or an object is expected" if self.peek() else "the file is empty")
        root = self.value()
        if self.peek():
            self.fail("something follows the end of the document")
        return root

    def value(self):
        start = self.peek()
        if start == "{":
            return self.nested(self.members)
        if start == "[":
            return self.nested(self.items)
        if start == '"':
            return self.string()
        for literal, value in _LITERALS.items():
            if self.text.startswith(literal, self.at):
                self.at += len(literal)
                return value
        return self.number()

    def nested(self, read):
        self.depth += 1
        if self.depth > DEEPEST:
            self.fail(f"there are more than {DEEPEST} levels")
        value = read()
        self.depth -= 1
        return value

    def members(self):
        members = Members(self.line())
        self.at += 1
        if self.peek() != "}":
            self.member(members)
            while self.peek() == ",":
                self.at += 1
                self.member(members)
            if self.peek() != "}":
                self.fail('"," or "}" is expected')
        self.at += 1
        return members

    def member(self, members):
        if self.peek() != '"':
            self.fail("a name in double quotes is expected")
        key_line = self.line()
        key = self.string()
        if self.peek() != ":":
            self.fail('":" is expected')
        self.at += 1
        self.skip_space()
        if key in members:
            self.repeated.append((key, members.key_lines[key], key_line))
        line = self.line()
        members[key] = self.value()
        members.lines[key] = line
        members.key_lines[key] = key_line

    def items(self):
        items = Items(self.line())
        self.at += 1
        if self.peek() != "]":
            self.item(items)
            while self.peek() == ",":
                self.at += 1
                self.item(items)
            if self.peek() != "]":
                self.fail('"," or "]" is expected')
        self.at += 1
        return items

    def item(self, items):
        self.skip_space()
        items.lines.append(self.line())
        items.append(self.value())

    def string(self):
        match = _STRING.match(self.text, self.at)
        if not match:
            self.fail("a text has no end")
        start, self.at = self.at, match.end()
        content = match[1]
        if "\\" not in content:
            return self.utf8(content, start)
        pieces = _ESCAPE.split(content)
        for place, piece in enumerate(pieces):
            pieces[place] = _unescape(piece) if place % 2 else self.utf8(piece, start)
            if "\\" in piece and place % 2 == 0:
                self.fail(r"after \u four hexadecimal digits are expected", start)
        return "".join(pieces).encode("utf-16", "surrogatepass").decode("utf-16", "surrogatepass")

    def utf8(self, content, at):
        try:
            return content if content.isascii() else content.encode("latin-1").decode("utf-8")
        except UnicodeDecodeError:
            self.fail("it is not UTF-8", at)

    def number(self):
        match = _NUMBER.match(self.text, self.at)
        try:
            number = float(match[0])
        except ValueError:
            self.fail("a value is expected")
        if number in (float("inf"), float("-inf")):
            self.fail("a number is too large")
        self.at = match.end()
        return int(number) if number.is_integer() and abs(number) < 2**53 else number


def _unescape(escaped):
    return chr(int(escaped[1:], 16)) if len(escaped) == 5 else _ESCAPED.get(escaped, escaped)


class Parsed:
    """`root`, and in `repeated` (key, line of the first, line of the later one)."""

    def __init__(self, root, repeated):
        self.root = root
        self.repeated = repeated


def parse(content):
    """A Parsed of bytes; JsonError for what the HMI cannot read."""
    # Byte by byte: only texts are UTF-8, and a backslash may stand before any byte.
    parser = _Parser(content.removeprefix(b"\xef\xbb\xbf").decode("latin-1"))
    return Parsed(parser.document(), parser.repeated)
