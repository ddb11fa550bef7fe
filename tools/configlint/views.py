# SPDX-License-Identifier: MIT
"""Rules for view descriptors."""

import os
import urllib.parse

from documents import DESCRIPTOR_LIMIT, check_file, quoted
from positionedjson import Items, Members

SECTIONS = {"views": "name", "popups": "name", "transients": "name", "components": "key"}


def check_views(report, path):
    file = check_file(report, path, "view-descriptor", DESCRIPTOR_LIMIT)
    if not isinstance(file.root, Members):
        return
    check_url(report, file, file.root, "shell")
    keys = set()
    for section, identifier in SECTIONS.items():
        seen = {}
        for entry in entries_of(file.root, section):
            name = entry.get(identifier)
            if isinstance(name, str) and name in seen:
                report.error(path, entry.lines[identifier],
                             f"{quoted(name)} is already in {quoted(section)}, in line {seen[name]}", "name it otherwise")
            elif isinstance(name, str):
                seen[name] = entry.lines[identifier]
            check_url(report, file, entry, "url")
            for variation in entry.get("variations", {}) if isinstance(entry.get("variations"), Members) else ():
                check_url(report, file, entry["variations"], variation)
        if section == "components":
            keys = set(seen)
    for entry in entries_of(file.root, "transients"):
        component = entry.get("component")
        if isinstance(component, str) and component not in keys:
            report.error(path, entry.lines["component"], f"there is no component with the key {quoted(component)}",
                         'add it to "components"')


def entries_of(root, section):
    entries = root.get(section)
    return [entry for entry in entries if isinstance(entry, Members)] if isinstance(entries, Items) else []


def check_url(report, file, owner, key):
    """A file relative to the descriptor; other URLs only the running HMI can resolve."""
    text = owner.get(key)
    if not isinstance(text, str) or not text:
        return
    url = urllib.parse.urlsplit(text)
    if url.scheme or url.netloc:
        return
    path = os.path.join(os.path.dirname(file.path), urllib.parse.unquote(url.path))
    if not os.path.isfile(path):
        report.error(file.path, owner.lines[key],
                     f"the QML file {quoted(text)} does not exist, so the HMI leaves the entry out",
                     "name a file relative to the descriptor")
