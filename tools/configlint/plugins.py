# SPDX-License-Identifier: MIT
"""Rules for plugins.conf, and the names that plugins have in their metadata."""

import difflib
import os
import re
import struct

from documents import CONFIGURATION_LIMIT, Outcome, quoted, read_regular

GROUP = "Global"
KEYS = ("blacklist", "whitelist")
PLUGIN_LIMIT = 256 * 1024 * 1024  # bytes
METADATA_MAGICS = (b"QTMETADATA !", b"qt-project!\0")  # a section of its own in Qt 5, a note in Qt 6
VERSIONS_SIZE = 4  # bytes between the magic and the map
METADATA_KEY = 4


class _Cbor:
    """As much of CBOR as plugin metadata uses; ValueError for anything else."""

    def __init__(self, content):
        self.content = content
        self.at = 0

    def take(self, count):
        if self.at + count > len(self.content):
            raise ValueError("truncated")
        self.at += count
        return self.content[self.at - count:self.at]

    def count(self, kind):
        if kind < 24:
            return kind
        if kind > 27:
            raise ValueError("unexpected length")
        size = 1 << (kind - 24)
        return int.from_bytes(self.take(size), "big")

    def value(self, depth=0):
        if depth > 32:
            raise ValueError("too deep")
        first = self.take(1)[0]
        major, kind = first >> 5, first & 31
        if major in (4, 5):
            return self.nested(major, kind, depth + 1)
        if major == 7:
            return self.simple(kind)
        number = self.count(kind)
        if major == 0:
            return number
        if major == 1:
            return -1 - number
        if major in (2, 3):
            return self.take(number).decode("utf-8") if major == 3 else self.take(number)
        return self.value(depth + 1)  # a tag says more about the value after it

    def nested(self, major, kind, depth):
        values = []
        remaining = -1 if kind == 31 else self.count(kind) * (major - 3)
        while remaining != 0:
            if remaining < 0 and self.content[self.at:self.at + 1] == b"\xff":
                self.at += 1
                break
            values.append(self.value(depth))
            remaining -= 1
        return values if major == 4 else dict(zip(values[::2], values[1::2]))

    def simple(self, kind):
        if kind in (26, 27):
            return struct.unpack(">f" if kind == 26 else ">d", self.take(4 if kind == 26 else 8))[0]
        return {20: False, 21: True}.get(kind)


def plugin_name(path):
    """The "Name" in the metadata of a plugin; None for what is no plugin."""
    content, outcome, _problem = read_regular(path, PLUGIN_LIMIT)
    for magic in METADATA_MAGICS if outcome is Outcome.READ else ():
        at = content.find(magic)
        while at >= 0:
            start = at + len(magic) + VERSIONS_SIZE
            try:
                return _Cbor(content[start:start + 65536]).value()[METADATA_KEY]["Name"]
            except (ValueError, KeyError, TypeError):
                at = content.find(magic, at + 1)
    return None


def plugin_names(report, folder):
    """The names of all plugins of a folder; None, after a finding, if it cannot be listed."""
    try:
        files = sorted(os.listdir(folder))
    except OSError as error:
        report.error(folder, 1, f"the folder of plugins cannot be read: {error.strerror}", "build the plugins")
        return None
    names = {plugin_name(folder / file) for file in files} - {None}
    if not names:
        report.error(folder, 1, "there is no plugin with a name", "build the plugins")
    return names


class Setting:
    def __init__(self, key, names, line):
        self.key = key
        self.names = names
        self.line = line


def check_plugins(report, path, known):
    """plugins.conf; `known` are the plugins' names, or None if they are not known."""
    content, outcome, problem = read_regular(path, CONFIGURATION_LIMIT)
    if outcome is not Outcome.READ:
        report.error(path, 1,
                     f"the file cannot be read: {problem}", "add it, with empty lists if all plugins are to be loaded")
        return
    settings = {}
    for setting in settings_of(report, path, content.decode("utf-8", "replace")):
        if setting.key in settings:
            report.error(path, setting.line,
                         f"{quoted(setting.key)} is also in line {settings[setting.key].line},"
                         " and the later one counts",
                         "put both into one line")
        settings[setting.key] = setting
        check_names(report, path, setting, known)
    rescued = settings["whitelist"].names if "whitelist" in settings else []
    for name in rescued:
        if "blacklist" not in settings or name not in settings["blacklist"].names:
            report.warning(path, settings["whitelist"].line, f"{quoted(name)} is whitelisted, but not blacklisted",
                           "remove it, for a whitelist restricts nothing")


def settings_of(report, path, text):
    group = ""
    for number, line in enumerate(text.splitlines(), 1):
        line = line.strip()
        if not line or line[0] in ";#":
            continue
        if line[0] == "[":
            group = line.strip("[]").strip()
            if group != GROUP:
                report.error(path, number, f"the HMI does not read the group {quoted(group)}", f"use [{GROUP}]")
            continue
        key, separator, value = line.partition("=")
        key = key.strip()
        if not separator:
            report.error(path, number, f"{quoted(line)} sets nothing", "write name=value")
        elif group == "":
            report.error(path, number, f"{quoted(key)} is in no group", f"put it below [{GROUP}]")
        elif group == GROUP and key not in KEYS:
            report.error(path, number, f"the HMI does not read {quoted(key)}", f"use {' or '.join(KEYS)}")
        elif group == GROUP:
            yield Setting(key, names_of(value), number)


def names_of(value):
    return [name.strip().strip('"') for name in re.findall(r'\s*(?:"[^"]*"|[^,])+', value) if name.strip()]


def check_names(report, path, setting, known):
    for place, name in enumerate(setting.names):
        if name in setting.names[:place]:
            report.error(path, setting.line, f"{quoted(name)} is in the {setting.key} twice", "remove one")
        elif known is not None and name not in known:
            close = difflib.get_close_matches(name, known, 1)
            report.error(path, setting.line, f"no plugin has the name {quoted(name)}",
                         f"did you mean {quoted(close[0])}?" if close else "names are those of the plugins' metadata: "
                         + ", ".join(sorted(known)))
