# SPDX-License-Identifier: MIT
"""Rules for language bundles, their properties, the markets that name them, and catalogues."""

import os
import re

from answers import ANY, LanguageProperties
from documents import Outcome, check_file, quoted, read_regular
from positionedjson import Items
from stores import check_unused_files

CATALOGUE_LIMIT = 64 * 1024 * 1024  # bytes, of the core
CATALOGUE_MAGIC = bytes.fromhex("3cb86418caef9c95cd211cbf60a1bddd")
CATALOGUE_NAME = re.compile(r"(?P<module>.+?)_(?P<language>[a-z]{2,3}(?:_[A-Z][A-Za-z]+)*)\.qm")
SCRIPTS = {"zh_CN": "Hans", "zh_TW": "Hant"}


class Bundle:
    def __init__(self, element, line):
        self.line = line
        self.locales = {}  # locale: line
        locales = element["locales"]
        for locale, locale_line in zip(locales, locales.lines) if isinstance(locales, Items) else ():
            if isinstance(locale, str):
                self.locales.setdefault(locale, locale_line)


def check_bundles(report, folder, known_locales):
    """Reports about languageBundles/config.json and returns the bundles by their ids."""
    file = check_file(report, folder / "config.json", "language-bundles")
    bundles = {}
    fallback_line = None
    for element, line in file.array():
        if not isinstance(element.get("bundleId"), str):
            continue
        name = element["bundleId"]
        if "fallbackBundle" in element:
            check_fallback_flag(report, file, element, fallback_line)
            fallback_line = fallback_line or element.key_lines["fallbackBundle"]
        if "locales" not in element:
            continue
        if name in bundles:
            report.error(file.path, line,
                         f"the bundle {quoted(name)} is also in line {bundles[name].line}, and the later one counts",
                         "remove one")
        bundles[name] = Bundle(element, line)
        check_locales(report, file, element, known_locales)
    if isinstance(file.root, Items) and fallback_line is None:
        report.warning(file.path, file.root.line, "no bundle is the fallback", 'mark one with "fallbackBundle": true')
    check_unused_files(report, folder, {os.path.normpath(folder / "properties.json")}, file.path)
    return bundles


def check_fallback_flag(report, file, element, decided):
    if decided and element["fallbackBundle"] is True:
        report.error(file.path, element.key_lines["fallbackBundle"],
                     f'this "fallbackBundle" is ignored: line {decided} has said which bundle is the fallback',
                     "leave only one, for the first counts whatever it says")
    elif not decided and element["fallbackBundle"] is not True:
        report.error(file.path, element.key_lines["fallbackBundle"],
                     'no bundle is the fallback: the first "fallbackBundle" counts, and it is not true',
                     "remove it here and leave the one that is true")


def check_locales(report, file, element, known_locales):
    locales = element["locales"]
    if not isinstance(locales, Items):
        return
    seen = {}
    for locale, line in zip(locales, locales.lines):
        if not isinstance(locale, str):
            continue
        if locale in seen:
            report.error(file.path, line, f"the locale {quoted(locale)} is in the bundle twice", "remove one")
        elif locale and locale not in known_locales:
            report.error(file.path, line, f"the platform has no language with the locale {quoted(locale)}",
                         "use one of " + ", ".join(sorted(known_locales)))
        seen[locale] = line
    default = element.get("default")
    if isinstance(default, str) and default and default not in seen:
        report.error(file.path, element.lines["default"],
                     f"the default {quoted(default)} is not among the bundle's locales",
                     "add it to them, or name one of them")


def check_markets_bundles(report, markets, bundles, document):
    """Every market names a bundle, and every bundle is named by a market."""
    named = set()
    for number in markets.configurations:
        properties = markets.properties(number) or {}
        if "languageBundle" not in properties:
            continue
        name = properties["languageBundle"]
        path, line = markets.file(number).path, properties.lines["languageBundle"]
        if not isinstance(name, str):
            report.error(path, line, "languageBundle must be a text", f"name a bundle of {document}")
        elif name not in bundles:
            report.error(path, line, f"there is no language bundle {quoted(name)}",
                         "use one of " + ", ".join(sorted(bundles)) if bundles else f"add it to {document}")
        else:
            named.add(name)
    for name in bundles.keys() - named if markets.document.outcome is Outcome.READ else ():
        report.warning(document, bundles[name].line, f"no market names the bundle {quoted(name)}",
                       'name it as a market\'s "languageBundle" or remove it')


def check_language_properties(report, folder, bundles):
    check_file(report, folder / "properties.json", "language-properties")
    store = LanguageProperties(folder)
    path = store.document.path
    first_lines = {}
    for element, line in store.document.array():
        bundle, locale = element.get("bundleId"), element.get("locale")
        if not isinstance(bundle, str) or not isinstance(locale, str) or "properties" not in element:
            continue
        if (bundle, locale) in first_lines:
            report.error(path, line,
                         f"the entry ({bundle}, {locale}) is also in line {first_lines[bundle, locale]},"
                         " and the later one counts",
                         "remove one")
        first_lines.setdefault((bundle, locale), line)
        check_selected(report, path, bundles, element, store)
    check_completeness(report, store)
    check_covered(report, store, bundles, folder / "config.json")


def check_selected(report, path, bundles, element, store):
    """An entry that no offered language selects."""
    bundle, locale = element["bundleId"], element["locale"]
    if bundle == ANY:
        if locale != ANY:
            report.error(path, element.lines["locale"], f"the entry (*, {locale}) is used only for the bundle \"*\"",
                         "name the bundle that it is for")
    elif bundle not in bundles:
        report.error(path, element.lines["bundleId"],
                     f"the entry is never selected: there is no bundle {quoted(bundle)}",
                     "name a bundle of config.json")
    elif locale == ANY:
        if all((bundle, each) in store.entries for each in bundles[bundle].locales):
            report.warning(path, element.lines["locale"],
                           f"the entry ({bundle}, *) is never selected: each locale of the bundle has its own", "remove it")
    elif locale not in bundles[bundle].locales:
        report.error(path, element.lines["locale"],
                     f"the entry is never selected: the bundle {quoted(bundle)} has no locale {quoted(locale)}",
                     "add it to the bundle, or remove the entry")


def check_completeness(report, store):
    for (bundle, locale), (properties, _line) in store.entries.items():
        for wider in store.candidates(bundle, locale)[1:] if bundle and locale else ():
            for name in sorted(store.entries.get(wider, ({}, 0))[0].keys() - properties.keys()):
                report.error(store.document.path, properties.line,
                             f"the entry ({bundle}, {locale}) lacks {quoted(name)}, which ({', '.join(wider)}) has",
                             "add it, for entries do not complete each other")


def check_covered(report, store, bundles, document):
    if store.document.outcome is not Outcome.READ:
        return
    for name, bundle in bundles.items():
        for locale, line in bundle.locales.items():
            if not store.selected(name, locale):
                report.error(document, line, f"({name}, {locale}) has no language properties",
                             f"add an entry ({name}, {locale}), ({name}, *) or (*, *) to properties.json")


def check_catalogues(report, folder, bundles, document, known_locales):
    """Each offered language needs the product's catalogue and one of each module that has catalogues at all."""
    product = files_of(report, folder / "app")
    files = files_of(report, folder)
    if product is None or files is None:
        return
    translated = sorted({match["module"] for match in map(CATALOGUE_NAME.fullmatch, files) if match})
    for bundle in bundles.values():
        for locale, line in bundle.locales.items():
            if locale not in known_locales:
                continue
            if not any(locale.lower() in name.lower() for name in product):
                report.error(document, line,
                             f"the product has no catalogue for {quoted(locale)}, so the HMI refuses the language",
                             f"add app/app_{locale}.qm")
            for module in translated:
                if files.isdisjoint(catalogue_names(module, locale)):
                    report.error(document, line,
                                 f"the module {quoted(module)} has no catalogue for {quoted(locale)},"
                                 " so the HMI refuses the language",
                                 f"add {module}_{locale.partition('_')[0]}.qm or {module}_{locale}.qm")


def catalogue_names(module, locale):
    """The files that a module's catalogue for a locale may have."""
    language, _, territory = locale.partition("_")
    variants = [locale, language]
    if locale in SCRIPTS:
        variants += [f"{language}_{SCRIPTS[locale]}", f"{language}_{SCRIPTS[locale]}_{territory}"]
    stems = [f"{module}_{variant}" for variant in variants + [variant.lower() for variant in variants]]
    return {stem + suffix for stem in stems for suffix in ("", ".qm")} | {module + "_", module}


def files_of(report, folder):
    """The names of the catalogues in a folder; None if it cannot be listed."""
    try:
        names = sorted(os.listdir(folder))
    except OSError as error:
        report.error(folder, 1, f"the folder of catalogues cannot be read: {error.strerror}", "build the translations")
        return None
    usable = set()
    for name in names:
        path = folder / name
        if path.is_dir():
            continue
        content, outcome, problem = read_regular(path, CATALOGUE_LIMIT)
        if outcome is Outcome.READ and not content.startswith(CATALOGUE_MAGIC):
            problem = "it is not a catalogue"
        if problem:
            report.error(path, 1, f"the catalogue cannot be used: {problem}", "build it again or remove it")
        else:
            usable.add(name)
    return usable
