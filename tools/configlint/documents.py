# SPDX-License-Identifier: MIT
"""Findings, and files: read within limits and checked against the schemas of docs/schemas."""

import difflib
import enum
import itertools
import json
import os
import pathlib
import stat

import jsonschema

import positionedjson

PROJECT = pathlib.Path(__file__).resolve().parents[2]
SCHEMAS = PROJECT / "docs" / "schemas"

CONFIGURATION_LIMIT = 16 * 1024 * 1024  # bytes, of the core
DESCRIPTOR_LIMIT = 1024 * 1024  # bytes, of the view manager
MOST_CHECKED = 1000  # findings about one file's shape
MOST_PER_FILE = 200  # findings shown


def quoted(value):
    text = json.dumps(value, ensure_ascii=False)
    return text if len(text) <= 60 else text[:57] + "..."


class Report:
    """What was found, by file and line: what is wrong, and what to do about it."""

    def __init__(self):
        self.findings = set()

    def error(self, path, line, wrong, remedy):
        self.findings.add((str(path), line, "error", f"{wrong}; {remedy}"))

    def warning(self, path, line, wrong, remedy):
        self.findings.add((str(path), line, "warning", f"{wrong}; {remedy}"))

    def count(self, severity):
        return sum(1 for finding in self.findings if finding[2] == severity)

    def lines(self):
        shown = {}
        for path, line, severity, text in sorted(self.findings):
            shown.setdefault(path, []).append(f"{path}:{line}: {severity}: {printable(text)}")
        for path, lines in shown.items():
            yield from lines[:MOST_PER_FILE]
            if len(lines) > MOST_PER_FILE:
                yield f"{path}: {len(lines) - MOST_PER_FILE} more findings are not shown"


def printable(text):
    return "".join(c if c.isprintable() else f"\\u{ord(c):04x}" for c in text)


class Outcome(enum.Enum):
    READ = "read"
    MISSING = "does not exist"
    UNREADABLE = "cannot be read"
    MALFORMED = "is not JSON"


class File:
    """A JSON file as the HMI reads it: `root` when outcome is READ, otherwise `line` and `problem`."""

    def __init__(self, path, limit=CONFIGURATION_LIMIT):
        self.path = path
        self.root = None
        self.repeated = []
        self.line = 1
        self.problem = ""
        self.content = b""
        self.outcome = self._read(limit)

    def _read(self, limit):
        content, outcome, self.problem = read_regular(self.path, limit)
        if outcome is not Outcome.READ:
            return outcome
        self.content = content
        try:
            parsed = positionedjson.parse(content)
        except positionedjson.JsonError as error:
            self.line, self.problem = error.line, error.text
            return Outcome.MALFORMED
        self.root, self.repeated = parsed.root, parsed.repeated
        return outcome

    def array(self):
        """Index, object and line of each element at the top: what is no object counts as an empty one, as in the HMI."""
        if not isinstance(self.root, positionedjson.Items):
            return
        for element, line in zip(self.root, self.root.lines):
            yield (element if isinstance(element, positionedjson.Members) else positionedjson.Members(line)), line


def read_regular(path, limit):
    """Content, Outcome and problem. Never waits: only regular files are opened."""
    try:
        descriptor = os.open(path, os.O_RDONLY | os.O_NONBLOCK | os.O_CLOEXEC)
    except (FileNotFoundError, NotADirectoryError):
        return b"", Outcome.MISSING, "does not exist"
    except (OSError, ValueError) as error:
        return b"", Outcome.UNREADABLE, getattr(error, "strerror", None) or str(error)
    status = os.fstat(descriptor)
    if not stat.S_ISREG(status.st_mode):
        problem = "it is not a regular file"
    elif status.st_size > limit:
        problem = f"it is larger than {mebibytes(limit)}"
    else:
        with open(descriptor, "rb") as file:
            return file.read(limit), Outcome.READ, ""
    os.close(descriptor)
    return b"", Outcome.UNREADABLE, problem


def mebibytes(size):
    return f"{size // (1024 * 1024)} MiB"


def line_of(root, path):
    """The line of the value that a path of keys and indices leads to."""
    line = root.line
    for step in path:
        line = root.lines[step]
        root = root[step]
    return line


TYPE_NAMES = {"object": "an object", "array": "an array", "string": "a text", "integer": "a whole number",
              "boolean": "true or false"}


def _unknown_fields(error):
    known = list(error.schema.get("properties", {}))
    for name in error.instance:
        if name not in known:
            close = difflib.get_close_matches(name, known, 1)
            remedy = f"did you mean {quoted(close[0])}?" if close else f"known are {', '.join(sorted(known))}"
            yield error.instance.key_lines[name], f"{quoted(name)} is not a known field", remedy


def _missing_field(error):
    for name in error.validator_value:
        if name not in error.instance:
            yield error.instance.line, f"{quoted(name)} is missing", "add it"


# What a schema's keyword demands; the remedy is the schema's "description".
DEMANDS = {
    "type": lambda error: f"must be {TYPE_NAMES.get(error.validator_value, error.validator_value)}",
    "enum": lambda error: "must be " + " or ".join(map(quoted, error.validator_value)),
    "const": lambda error: f"must be {quoted(error.validator_value)}",
    "pattern": lambda error: error.schema.get("title", f"must match {error.validator_value}"),
    "minLength": lambda error: "must not be empty",
    "maxLength": lambda error: f"must not be longer than {error.validator_value} characters",
    "minItems": lambda error: "must not be empty",
    "minimum": lambda error: f"must be at least {error.validator_value}",
    "maximum": lambda error: f"must be at most {error.validator_value}",
}


def _name_of(path):
    name = ""
    for step in path:
        name += f"[{step}]" if isinstance(step, int) else ("." if name else "") + step
    return name or "the document"


def _demand(root, error):
    path = list(error.absolute_path)
    wrong = f"{_name_of(path)} {DEMANDS[error.validator](error)}"
    if error.instance and not isinstance(error.instance, (dict, list)) or error.instance in (0, False, None):
        wrong += f", not {quoted(error.instance)}"
    yield line_of(root, path), wrong, error.schema.get("description", "correct it")


SPECIAL = {"additionalProperties": _unknown_fields, "required": _missing_field}


def check_schema(report, file, schema_name):
    schema = json.loads((SCHEMAS / f"{schema_name}.schema.json").read_text(encoding="utf-8"))
    for error in itertools.islice(jsonschema.Draft7Validator(schema).iter_errors(file.root), MOST_CHECKED):
        special = SPECIAL.get(error.validator)
        for line, wrong, remedy in special(error) if special else _demand(file.root, error):
            report.error(file.path, line, wrong, remedy)


def check_file(report, path, schema_name, limit=CONFIGURATION_LIMIT):
    """The File, after findings about whether it can be read and what its schema says."""
    file = File(path, limit)
    if file.outcome is Outcome.MISSING:
        report.error(path, 1, "the file does not exist", "add it")
    elif file.outcome is Outcome.UNREADABLE:
        report.error(path, 1, f"the file cannot be read: {file.problem}",
                     f"make it a readable, regular file of at most {mebibytes(limit)}")
    elif file.outcome is Outcome.MALFORMED:
        report.error(path, file.line, f"the file is not JSON, so the HMI reads nothing of it: {file.problem}",
                     "correct it")
    else:
        check_keys(report, file)
        check_schema(report, file, schema_name)
    return file


def check_keys(report, file):
    for key, first, later in file.repeated:
        report.error(file.path, later,
                     f"the key {quoted(key)} is in the same object in line {first}, and the later one counts", "remove one")
    try:
        json.loads(file.content.decode("utf-8-sig"))
    except json.JSONDecodeError as error:
        line, problem = error.lineno, error.msg
    except UnicodeDecodeError as error:
        line, problem = file.content.count(b"\n", 0, error.start) + 1, "it is not UTF-8"
    else:
        return
    report.warning(file.path, line, f"other readers than the HMI's refuse this JSON: {problem}",
                   "write it as the standard has it")
