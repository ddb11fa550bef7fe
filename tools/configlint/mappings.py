# SPDX-License-Identifier: MIT
"""Rules for value mappings: valuemappings.json."""

from answers import raw_value
from documents import check_file, quoted
from positionedjson import Items, Members


def check_mappings(report, path):
    file = check_file(report, path, "value-mappings")
    first_lines = {}
    for element, line in file.array():
        name = element.get("valueName")
        if not isinstance(name, str):
            continue
        if name in first_lines:
            report.error(path, line,
                         f"the value name {quoted(name)} is also in line {first_lines[name]}, and the later \"values\" "
                         "replace all earlier ones", "put both into one element")
        first_lines.setdefault(name, line)
        if "values" in element:
            check_values(report, path, name, element["values"])
        elif "default" not in element:
            report.warning(path, line, f"{quoted(name)} maps nothing", 'add "values" or a "default"')


def check_values(report, path, name, values):
    first_lines = {}
    for entry, line in zip(values, values.lines) if isinstance(values, Items) else ():
        if not isinstance(entry, Members) or "value" not in entry or "mapping" not in entry:
            continue
        number = raw_value(entry["value"])
        if number != entry["value"]:
            continue
        if number in first_lines:
            report.error(path, line,
                         f"{quoted(name)} lists {number} also in line {first_lines[number]}, and the later one counts",
                         "remove one")
        first_lines.setdefault(number, line)
