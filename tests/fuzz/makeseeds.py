#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Makes seeds of the fuzzers, and their dictionaries, from this tree's own files: makeseeds.py TREE FOLDER"""
import json
import shutil
import sys
from pathlib import Path

tree = Path(sys.argv[1])
out = Path(sys.argv[2])
LARGEST = 16 * 1024  # bytes; larger files keep a fuzzer busy with copying

# Which files are seeds of which reader of documents.cpp.
DOCUMENTS = [
    ("p", "headunit/config/markets/*.json"),
    ("p", "headunit/config/regions/*.json"),
    ("c", "headunit/config/*/config.json"),
    ("v", "headunit/config/valuemappings.json"),
    ("b", "headunit/config/languageBundles/config.json"),
    ("l", "headunit/config/languageBundles/properties.json"),
    ("t", "headunit/ui/theme.json"),
    ("k", "headunit/app/layouts/*.json"),
    ("o", "headunit/tour/*.jsonl"),
    ("s", "headunit/scenarios/*.jsonl"),
    ("w", "headunit/modules/navigation/data/town.json"),
    ("m", "vehicle/evdev/keymap.json"),
    ("i", "headunit/config/plugins.conf"),
    ("i", "tests/configlint/cases/plugins-*/config/plugins.conf"),
]


def write(fuzzer, name, content):
    folder = out / fuzzer
    folder.mkdir(parents=True, exist_ok=True)
    (folder / name).write_bytes(content)


def smaller(content):
    """Whole lines of a file that is too large; a JSON document with its lists cut short."""
    if len(content) <= LARGEST:
        return content
    try:
        document = json.loads(content)
    except ValueError:
        lines = content[:LARGEST].split(b"\n")
        return b"\n".join(lines[:-1]) + b"\n"
    def cut(value):
        if isinstance(value, list):
            return [cut(entry) for entry in value[:8]]
        if isinstance(value, dict):
            return {key: cut(entry) for key, entry in value.items()}
        return value
    return json.dumps(cut(document), ensure_ascii=False).encode()


def documents():
    for letter, pattern in DOCUMENTS:
        files = sorted(tree.glob(pattern))
        if not files:
            sys.exit(f"makeseeds: there is no {pattern}")
        for number, file in enumerate(files):
            write("documents", f"{letter}-{file.parent.name}-{number}-{file.name}", letter.encode() + smaller(file.read_bytes()))


def descriptors():
    for number, file in enumerate(sorted(tree.glob("headunit/**/*views.json"))):
        write("viewdescriptors", f"{number}-{file.parent.name}.json", smaller(file.read_bytes()))


def words_of(value, words):
    if isinstance(value, dict):
        for key, entry in value.items():
            words.add(key)
            words_of(entry, words)
    elif isinstance(value, list):
        for entry in value:
            words_of(entry, words)
    elif isinstance(value, str) and len(value) < 32:
        words.add(value)


def dictionary(fuzzer, words):
    quoted = []
    for word in sorted(words):
        escaped = "".join(c if 32 <= ord(c) < 127 and c not in '"\\' else "".join(f"\\x{b:02x}" for b in c.encode()) for c in word)
        if escaped:
            quoted.append(f'"{escaped}"')
    (out / f"{fuzzer}.dict").write_text("\n".join(quoted) + "\n")


def dictionaries():
    words = set()
    for _, pattern in DOCUMENTS:
        for file in sorted(tree.glob(pattern))[:3]:
            if file.suffix == ".json" and file.name != "town.json":
                words_of(json.loads(file.read_text()), words)
    words |= {"class", "minor", "main", "motorway", "points", "streets", "places", "areas", "kind", "at", "start", "heading"}
    words |= {"whitelist", "blacklist", "[Global]", "@Variant(", "@ByteArray(", "@Invalid()", "t", "direction", "line", "text", "dropped"}
    short = {word for word in words if len(word) > 0}
    dictionary("documents", sorted(short)[:600])
    words = set()
    for file in tree.glob("headunit/**/*views.json"):
        document = json.loads(file.read_text())
        words |= set(document)
        for section in document.values():
            if isinstance(section, list):
                for entry in section:
                    words |= set(entry)
    dictionary("viewdescriptors", words | {"qrc:/", "file:", "../", "variations", "priority", "timeout", "fade", "1e999", "-1"})


def example(table, source, item, other):
    kind = item["type"]
    if kind == "bool":
        return other
    if kind == "int":
        return item.get("max", 3) if other else item.get("min", 0)
    if kind == "real":
        return item.get("min", 0) + 1.25
    if kind == "text":
        return "98.5" if other else "Gr\u00fc\u00dfe"
    if kind == "intList":
        return [0, 2, 3] if other else []
    if kind == "records":
        fields = next(record["fields"] for record in table["records"] if record["name"] == item["record"])
        return [{field["name"]: example(table, source, field, other) for field in fields}]
    enums = next((enum for part in (source, base_of(table, source)) for enum in part.get("enums", []) if enum["name"] == kind))
    return enums["values"][-1 if other else 0]["value"]


def base_of(table, source):
    return next((base for base in table["sources"] if base["name"] == source.get("base")), {})


def bridge():
    table = json.loads((tree / "platform/AL2HMIBridge/sources.json").read_text())
    channels = {"messages": b"", "priority": b"\1", "touch": b"\1\1"}
    lines = []
    words = {"source", "state", "event", "args", "snapshot", "complete", "protocol", "peer", "application-layer", "null", "true", "1e999"}
    for source in table["sources"]:
        if source.get("abstract"):
            continue
        items = base_of(table, source).get("state", []) + source.get("state", [])
        words |= {source["name"]} | {item["name"] for item in items}
        way = channels[source.get("channel", "messages")]
        for other in (False, True):
            if items:
                state = {item["name"]: example(table, source, item, other) for item in items}
                lines.append((way, {"source": source["name"], "state": state}))
        for event in source.get("events", []):
            words.add(event["name"])
            arguments = [7 for _ in event.get("args", [])]
            lines.append((way, {"source": source["name"], "event": event["name"], "args": arguments}))
    for record in table["records"]:
        words |= {field["name"] for field in record["fields"]}
    wrong = [1 << 31, 0.5, "x" * 65, True, None, [0.5], [{}], -3]
    for source in table["sources"]:
        for item in {item["type"]: item for item in source.get("state", [])}.values():
            for value in wrong:
                lines.append((b"", {"source": source["name"], "state": {item["name"]: value}}))
    encoded = [(way, json.dumps(line, ensure_ascii=False, separators=(",", ":")).encode()) for way, line in lines]
    encoded.append((b"", b'{"protocol":1,"peer":"application-layer"}'))
    encoded.append((b"", b'{"snapshot":"complete"}'))
    for number, (way, line) in enumerate(encoded):
        write("bridgeline", f"{number}.json", line)
        half = len(line) // 2
        write("bridgesession", f"{number}-pieces", way + (b"\4" if way else b"") + line[:half] + b"\0" + line[half:] + b"\n\6")
        write("bridgesession", f"{number}-lost", way + b"\4" + line + b"\n" + line[:half] + b"\2\6\4" + line + b"\n\6")
        greeting = b'{"protocol":1,"peer":"application-layer"}\n'
        write("bridgesession", f"{number}-snapshot", b"\3" + greeting + line + b"\n\6" + b'{"snapshot":"complete"}\n\6\10')
    write("bridgesession", "long-line", b"\7\7\7\n\6" + encoded[2][1] + b"\n\6")
    write("bridgesession", "calls", b"\5\14\2\5\2\4\5\0")
    dictionary("bridgeline", words)
    dictionary("bridgesession", words)


def intents():
    """Steps as intents.cpp reads them: who is added, how many intents and which, how they behave; then requests."""
    def add(number, intents, kind, *more):
        return bytes([0, number, len(intents), *intents, kind, *more])
    def request(intent, kind):
        return bytes([6, intent, kind])
    performing, refusing, dying, killing, changing = 0, 1, 3, 5, 6
    write("intents", "newest-first", add(1, [0, 1], performing) + add(2, [0], refusing) + request(0, 0) + request(0, 1) + request(1, 3))
    write("intents", "until-one-does", add(1, [0], performing) + add(2, [0], performing) + request(0, 1) + request(0, 0))
    write("intents", "nobody", request(3, 0) + add(1, [0], refusing) + request(0, 2) + bytes([2, 1]) + request(0, 0))
    write("intents", "dies-when-asked", add(1, [0], performing) + add(2, [0], dying) + request(0, 0) + request(0, 0))
    write("intents", "kills-the-next", add(1, [0], performing) + add(2, [0], killing, 1) + request(0, 0))
    write("intents", "watched", add(1, [0], changing, 0) + bytes([4, 0, 5, 1, 0, 1, 5, 1, 0, 0]) + request(0, 0) + bytes([2, 1]))
    write("intents", "registered-twice", add(1, [2, 2], refusing) + bytes([3, 1]) + request(2, 0))


def strokes():
    """Sizes and points as strokes.cpp reads them; a pad of 100 by 100."""
    half = lambda value: bytes([3, value])
    point = lambda x, y: bytes([5, *half(2 * x), *half(2 * y)])
    stroke = lambda *points: bytes([1, len(points)]) + b"".join(points)
    pad = half(200) + half(200)
    write("strokes", "steps-of-two", pad + stroke(point(1, 1), point(2, 1), point(3, 1), point(3, 2), point(4, 3), point(9, 9)))
    write("strokes", "other-sides", half(100) + half(50) + stroke(point(1, 1), point(7, 3), point(7, 4)) + stroke())


def keys():
    """Steps as keys.cpp reads them: changes of the world and presses of keys."""
    def press(key, state):
        return bytes([5, 0, key, state])
    everything = b"".join(press(key, state) for key in range(100) for state in range(6))
    source = lambda number: bytes([0, 0, number])
    number = lambda which, value: bytes([0, 2, which, value])
    switch = lambda which: bytes([0, 1, which, 1])
    tuner = lambda which, *values: bytes([0, 4, which, *values])
    lost_signal, replay, projection = number(0, 1), number(1, 1), number(3, 2)
    for which in range(7):
        write("keys", f"source-{which}", source(which) + everything)
        write("keys", f"projection-{which}", source(which) + projection + everything)
    write("keys", "lost-signal", source(1) + lost_signal + everything)
    write("keys", "replay", source(2) + replay + everything)
    for which in range(12):
        write("keys", f"switch-{which}", switch(which) + everything + projection + everything)
    for which in range(4):
        write("keys", f"tuner-{which}", source(which) + tuner(which, 1, 1, 2, 7, 1) + everything)
    write("keys", "voices", number(5, 2) + switch(8) + everything + switch(4) + switch(5) + switch(6) + everything)
    write("keys", "bystander", bytes([4, 1]) + press(60, 2) + bytes([4, 0, 4, 0]) + press(60, 2))
    write("keys", "combinations", bytes([3, 7, 5, 3, 7, 4, 3, 8, 5]))


shutil.rmtree(out, ignore_errors=True)
documents()
descriptors()
dictionaries()
bridge()
intents()
strokes()
keys()
(out / "made").touch()
