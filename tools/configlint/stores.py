# SPDX-License-Identifier: MIT
"""Rules for property stores: markets/ and regions/."""

import os

from answers import NO_ID, PropertyStore, hexadecimal, parse_id
from documents import CONFIGURATION_LIMIT, Outcome, check_file, mebibytes, quoted
from positionedjson import Items, Members


def check_store(report, folder):
    """Reports about one store's folder and returns the store."""
    check_file(report, folder / "config.json", "property-configuration")
    store = PropertyStore(folder)
    if isinstance(store.document.root, Items):
        check_ids(report, store)
        check_fallback(report, store)
        check_property_files(report, store)
        check_gaps(report, store)
        check_unused_files(report, folder, used_files(store), store.document.path)
    return store


def check_ids(report, store):
    first_lines = {}
    for element, line in store.document.array():
        number = parse_id(element.get("id"))
        if number is None:
            if isinstance(element.get("id"), str) and is_out_of_range(element["id"]):
                report.error(store.document.path, element.lines["id"],
                             f"the id {quoted(element['id'])} is too large, so the HMI skips the element",
                             "use a number of 32 bits with a sign")
            continue
        if number in first_lines:
            report.error(store.document.path, line,
                         f"the id {hexadecimal(number)} is that of line {first_lines[number]} too,"
                         " and the later file counts",
                         "remove one")
        first_lines.setdefault(number, line)
        if "propertyFile" not in element:
            report.error(store.document.path, line,
                         f"{hexadecimal(number)} has no file, so the HMI takes it for unknown",
                         'name one in "propertyFile"')


def is_out_of_range(text):
    try:
        int(text, 16)
    except ValueError:
        return False
    return True


def check_fallback(report, store):
    path = store.document.path
    marked = [(parse_id(element.get("id")), line) for element, line in store.document.array()
              if element.get("isFallback") is True and parse_id(element.get("id")) is not None]
    for number, line in marked[:-1]:
        report.error(path, line,
                     f"{hexadecimal(number)} is not the fallback: the last one counts, in line {marked[-1][1]}",
                     'leave only one "isFallback": true')
    if not marked:
        report.warning(path, store.document.root.line, "no configuration is the fallback, so unknown ids have no properties",
                       'mark one with "isFallback": true')
    elif store.fallback == NO_ID:
        report.error(path, store.fallback_line, "-1 cannot be the fallback: it stands for none",
                     "mark another one, for default properties only complete known ids")


def check_property_files(report, store):
    path = store.document.path
    for number, known in store.configurations.items():
        file = store.file(number)
        if file.outcome is Outcome.MISSING:
            report.error(path, known.line,
                         f"the file {quoted(known.name)} does not exist,"
                         f" so the HMI takes {hexadecimal(number)} for unknown",
                         "add it")
        elif file.outcome is Outcome.UNREADABLE:
            report.error(path, known.line,
                         f"the file {quoted(known.name)} cannot be read, so the HMI takes {hexadecimal(number)} for unknown: "
                         f"{file.problem}", f"make it a readable, regular file of at most {mebibytes(CONFIGURATION_LIMIT)}")
        else:
            check_file(report, file.path, "property-file")
            if isinstance(file.root, Members) and not file.root:
                report.warning(file.path, file.root.line, "the file has no properties",
                               "add some, or remove the file and the ids that name it")


def check_gaps(report, store):
    """A property that one configuration has is asked of all."""
    owners = {}
    for number in store.configurations:
        for name in store.properties(number) or ():
            owners.setdefault(name, store.file(number))
    defaults = store.properties(NO_ID) or {}
    for number in store.configurations:
        properties = store.properties(number)
        if number == NO_ID or properties is None:
            continue
        for name in owners.keys() - properties.keys() - defaults.keys():
            owner = owners[name]
            report.error(store.file(number).path, properties.line,
                         f"{quoted(name)} is missing here and in the default properties, so the HMI answers \"Unknown property\"",
                         f"add it as line {owner.root.key_lines[name]} of {os.path.basename(owner.path)} has it")


def check_regions(report, markets, regions):
    """Markets name their region by its number; the ids of regions are hexadecimal."""
    for number in markets.configurations:
        properties = markets.properties(number) or {}
        region = properties.get("region")
        if "region" in properties and (isinstance(region, bool) or region not in list(regions.configurations)):
            report.error(markets.file(number).path, properties.lines["region"], f"there is no region {quoted(region)}",
                         f"use the number of an id in {regions.document.path}, which are hexadecimal")


def used_files(store):
    return {os.path.normpath(store.file(number).path) for number in store.configurations}


def check_unused_files(report, folder, used, document):
    for directory, folders, names in os.walk(folder):
        folders.sort()
        for name in sorted(names):
            path = os.path.join(directory, name)
            if os.path.normpath(path) not in used | {os.path.normpath(document)}:
                report.warning(path, 1, "nothing refers to this file", f"name it in {document.name} or remove it")
