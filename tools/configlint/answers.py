# SPDX-License-Identifier: MIT
"""What the HMI answers with a configuration, and which file, line and rule the answer comes from.

The stores and the mapper of the core, told step by step; tests compare them with the core's own.
"""

import re

from documents import File, Outcome, quoted
from positionedjson import Members

INVALID = object()  # the core's invalid variant
UNKNOWN = "Unknown property"
NO_ID = -1  # as fallback: none; as configuration: the default properties
ANY = "*"

_ID = re.compile(r"[+-]?(0[xX])?[0-9A-Fa-f]+")
_SPACE = " \t\n\v\f\r"
INT_RANGE = range(-2**31, 2**31)


def parse_id(value):
    """The number of a configuration's id, or None for what the core skips.

    Qt's versions differ about a NUL or a no-break space beside the digits; here both make it no number.
    """
    text = value.strip(_SPACE) if isinstance(value, str) else ""
    if not _ID.fullmatch(text):
        return None
    number = int(text, 16)
    return number if number in INT_RANGE else None


def hexadecimal(number):
    return f"{number:X}"


def text_of(value):
    return value if isinstance(value, str) else ""


class Answer:
    """`value`, or INVALID, and the `steps` to it: (path, line, text)."""

    def __init__(self):
        self.value = INVALID
        self.steps = []

    def step(self, path, line, text):
        self.steps.append((str(path), line, text))

    def give(self, value):
        self.value = value
        return self


class Configuration:
    """What a store knows about one id."""

    def __init__(self, line, name):
        self.line = line
        self.name = name


class PropertyStore:
    """A property store with its configuration document and the files that it names."""

    def __init__(self, folder):
        self.folder = folder
        self.document = File(folder / "config.json")
        self.configurations = {}
        self.fallback = NO_ID
        self.fallback_line = 1
        self._files = {}
        for element, line in self.document.array():
            number = parse_id(element.get("id"))
            if number is None:
                continue
            if "propertyFile" in element:
                self.configurations[number] = Configuration(line, text_of(element["propertyFile"]))
            if element.get("isFallback") is True:
                self.fallback, self.fallback_line = number, line

    def file(self, number):
        """The property file of a known id, read once."""
        name = self.configurations[number].name
        if name not in self._files:
            # An empty name is the folder itself, which pathlib would not tell from a file.
            self._files[name] = File(f"{self.folder}/{name}")
        return self._files[name]

    def properties(self, number):
        """The properties of an id as the core has them, or None when it takes the id for an unknown one."""
        if number not in self.configurations or self.file(number).outcome is not Outcome.READ:
            return None
        root = self.file(number).root
        return root if isinstance(root, Members) else Members(root.line)

    def ask(self, number, name):
        answer = Answer()
        if self.document.outcome is not Outcome.READ:
            answer.step(self.document.path, self.document.line, f"{self.document.problem}: no configuration is known")
        return self._ask(answer, number, name)

    def _ask(self, answer, number, name):
        if self._take(answer, number, name, "the configuration's own file"):
            return answer
        if self.properties(number) is not None:
            if self._take(answer, NO_ID, name, "the file of default properties"):
                return answer
            answer.step(self.document.path, 1, f'neither of them has {quoted(name)}: the text "{UNKNOWN}" stands for it')
            return answer.give(UNKNOWN)
        if self.fallback == NO_ID:
            answer.step(self.document.path, 1, "no other configuration is the fallback")
        elif self.fallback == number:
            answer.step(self.document.path, self.fallback_line, "it is the fallback itself")
        else:
            answer.step(self.document.path, self.fallback_line,
                        f"the fallback {hexadecimal(self.fallback)} is asked instead")
            return self._ask(answer, self.fallback, name)
        return answer

    def _take(self, answer, number, name, whose):
        """Whether the file of an id has the property; tells how that was found out."""
        known = self.configurations.get(number)
        if known is None:
            answer.step(self.document.path, 1, f"no file is named for {hexadecimal(number)}")
            return False
        answer.step(self.document.path, known.line, f"{hexadecimal(number)} has the file {quoted(known.name)}")
        properties = self.properties(number)
        file = self.file(number)
        if properties is None:
            answer.step(file.path, file.line, f"{file.problem}: as if it had no file")
            return False
        if name not in properties:
            answer.step(file.path, properties.line, f"{whose} has no {quoted(name)}")
            return False
        answer.step(file.path, properties.key_lines[name], f"{whose} has {quoted(name)}")
        answer.give(properties[name])
        return True


class LanguageProperties:
    """The language property store: one entry answers, and entries do not complete each other."""

    def __init__(self, folder):
        self.document = File(folder / "properties.json")
        self.entries = {}
        for element, line in self.document.array():
            if {"bundleId", "locale", "properties"} <= element.keys():
                properties = element["properties"]
                if not isinstance(properties, Members):
                    properties = Members(element.lines["properties"])
                self.entries[text_of(element["bundleId"]), text_of(element["locale"])] = (properties, line)

    @staticmethod
    def candidates(bundle, locale):
        keys = [(bundle, locale)]
        if locale != ANY:
            keys.append((bundle, ANY))
        if bundle != ANY:
            keys.append((ANY, ANY))
        return keys

    def selected(self, bundle, locale):
        return next((key for key in self.candidates(bundle, locale) if key in self.entries), None)

    def ask(self, bundle, locale, name):
        answer = Answer()
        if self.document.outcome is not Outcome.READ:
            answer.step(self.document.path, self.document.line, f"{self.document.problem}: there are no entries")
        for key in self.candidates(bundle, locale):
            described = f"({', '.join(key)})"
            if key not in self.entries:
                answer.step(self.document.path, 1, f"there is no entry {described}")
                continue
            properties, line = self.entries[key]
            answer.step(self.document.path, line, f"the entry {described} is selected; no other is asked")
            if name in properties:
                answer.step(self.document.path, properties.key_lines[name], f"it has {quoted(name)}")
                return answer.give(properties[name])
            answer.step(self.document.path, properties.line, f"it has no {quoted(name)}")
            return answer
        return answer


def raw_value(value):
    """A number of a value mapping as the core reads it."""
    is_whole = isinstance(value, (int, float)) and not isinstance(value, bool) and value == int(value)
    return int(value) if is_whole and int(value) in INT_RANGE else 0


class ValueMapper:
    def __init__(self, path):
        self.document = File(path)
        self.mappings = {}
        self.defaults = {}
        for element, _line in self.document.array():
            if "valueName" not in element:
                continue
            name = text_of(element["valueName"])
            if "default" in element:
                self.defaults[name] = (element["default"], element.lines["default"])
            if "values" in element:
                self.mappings[name] = dict(self._listed(element["values"]))

    @staticmethod
    def _listed(values):
        for entry in values if isinstance(values, list) else ():
            if isinstance(entry, Members) and {"value", "mapping"} <= entry.keys():
                yield raw_value(entry["value"]), (entry["mapping"], entry.lines["mapping"])

    def ask(self, name, number):
        answer = Answer()
        path = self.document.path
        if self.document.outcome is not Outcome.READ:
            answer.step(path, self.document.line, f"{self.document.problem}: there are no mappings")
        listed = self.mappings.get(name, {})
        if number in listed:
            mapping, line = listed[number]
            answer.step(path, line, f"{quoted(name)} lists {number}")
            return answer.give(mapping)
        answer.step(path, 1, f"{quoted(name)} does not list {number}")
        if name not in self.defaults:
            answer.step(path, 1, f"{quoted(name)} has no default")
            return answer
        default, line = self.defaults[name]
        answer.step(path, line, f"the default of {quoted(name)}")
        return answer.give(default)
