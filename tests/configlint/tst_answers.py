#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""configlint explains what the core answers: both are asked the same about the head unit's configuration and about others
made at random, damaged ones among them. COREANSWERS names the program that asks the core."""

import json
import os
import pathlib
import random
import subprocess
import sys
import tempfile
import unittest

sys.dont_write_bytecode = True
HERE = pathlib.Path(__file__).resolve().parent
PROJECT = HERE.parents[1]
CONFIGLINT = PROJECT / "tools" / "configlint" / "configlint"
sys.path.insert(0, str(CONFIGLINT.parent))

import answers  # noqa: E402

COREANSWERS = os.environ["COREANSWERS"]
FOLDERS = 150
DEADLINE = 60  # s


class Questioner:
    """Asks configlint about one folder, as its command `explain` does."""

    def __init__(self, folder):
        self.markets = answers.PropertyStore(folder / "markets")
        self.regions = answers.PropertyStore(folder / "regions")
        self.languages = answers.LanguageProperties(folder / "languageBundles")
        self.mapper = answers.ValueMapper(folder / "valuemappings.json")

    def ask(self, question):
        if "country" in question:
            return self.markets.ask(question["country"], question["property"])
        if "region" in question:
            return self.regions.ask(question["region"], question["property"])
        if "bundle" in question:
            return self.languages.ask(question["bundle"], question["locale"], question["property"])
        return self.mapper.ask(question["value"], question["number"])


def ask_core(folder, questions):
    done = subprocess.run([COREANSWERS, folder], input="".join(json.dumps(question) + "\n" for question in questions),
                          stdout=subprocess.PIPE, encoding="utf-8", timeout=DEADLINE, check=True)
    return [json.loads(line) for line in done.stdout.splitlines()]


def ask_program(folder, question):
    """The last line of `configlint explain`."""
    if "country" in question or "region" in question:
        kind = "country" if "country" in question else "region"
        arguments = [f"--{kind}={question[kind]:x}", f"--property={question['property']}"]
    elif "bundle" in question:
        arguments = [f"--{name}={question[name]}" for name in ("bundle", "locale", "property")]
    else:
        arguments = ["--value", question["value"], str(question["number"])]
    done = subprocess.run([sys.executable, CONFIGLINT, "explain", folder, *arguments], stdout=subprocess.PIPE,
                          encoding="utf-8", timeout=DEADLINE, check=True)
    return done.stdout.splitlines()[-1].removeprefix("answer: ")


class RandomConfiguration:
    """Documents with few names and ids, so that they meet, and with everything that can be wrong in them."""

    IDS = ["-1", "1", "1A", "1a", "0x1A", "0X2b", "2B", "7FFFFFFF", "80000000", "-80000000", "123456789", " 2B ", "+2b", "",
           "0x", "--1", "xyz", "1 A", "٣", 26, None, True, ["1"]]
    NUMBERS = [-1, 0, 1, 2, 26, 43, 3, 0x7FFFFFFF, -0x80000000]
    NAMES = ["unit", "clock", "languageBundle", "", "ü"]
    FILES = ["a.json", "b.json", "c.json", "missing.json", "folder", "", "folder/d.json", "../regions/a.json", 7, None]
    VALUES = ["km", "", "tab\t\u0001", "𝄞", 1, 0, -2.5, 1e300, True, False, None, [1, "x", [None]], {"a": {"b": 2}}, [], {}]
    BUNDLES = ["*", "Europe", "Asia", "", 1]
    LOCALES = ["*", "de_DE", "en_GB", "", None]
    DAMAGES = [b"", b",", b"]", b"}", b'"', b"\\", b"\n", b"0", b".", b"-", b"e", b":", b"\xff", b"\xc3\xa4", b"nul", b"/",
               b"\\u00e4", b"\\q", b"\t", b"\\\xc3\xa4", b"\0", b"\xed\xa0\x80", b"\x7f"]
    RAW = [0, 1, 2, -1, 1.0, 1.5, "1", True, None, 3000000000, -2147483648, 2147483647, [1], 1e2]

    def __init__(self, seed):
        self.random = random.Random(seed)

    def some(self, values):
        return self.random.choice(values)

    def often(self):
        return self.random.random() < 0.9

    def write(self, folder):
        for store in ("markets", "regions"):
            (folder / store / "folder").mkdir(parents=True)
            self.write_json(folder / store / "config.json", self.array(self.configuration, 12))
            for name in ("a.json", "b.json", "c.json", "folder/d.json"):
                self.write_json(folder / store / name, self.properties() if self.often() else self.some(self.VALUES))
        (folder / "languageBundles").mkdir()
        self.write_json(folder / "languageBundles" / "properties.json", self.array(self.entry, 10))
        self.write_json(folder / "valuemappings.json", self.array(self.mapping, 6))

    def array(self, make, most):
        if not self.often() and not self.often():
            return self.some(self.VALUES)
        return [make() if self.often() else self.some(self.VALUES) for _ in range(self.random.randrange(most))]

    def members(self, **values):
        """An object that may lack some of its members."""
        return {name: value for name, value in values.items() if self.often()}

    def configuration(self):
        return self.members(id=self.some(self.IDS), propertyFile=self.some(self.FILES[:3] if self.often() else self.FILES),
                            isFallback=self.some([False, False, False, True, "true", 1, None]))

    def properties(self):
        return {self.some(self.NAMES): self.some(self.VALUES) for _ in range(self.random.randrange(5))}

    def entry(self):
        return self.members(bundleId=self.some(self.BUNDLES), locale=self.some(self.LOCALES),
                            properties=self.properties() if self.often() else self.some(self.VALUES))

    def mapping(self):
        listed = [self.members(value=self.some(self.RAW), mapping=self.some(self.VALUES)) if self.often()
                  else self.some(self.VALUES) for _ in range(self.random.randrange(8))]
        return self.members(valueName=self.some(self.NAMES + [5]), default=self.some(self.VALUES),
                            values=listed if self.often() else self.some(self.VALUES))

    def write_json(self, path, value):
        content = bytearray(json.dumps(value, ensure_ascii=self.often(), indent=self.some([None, 1])).encode())
        if self.random.random() < 0.15:
            self.damage(content)
        path.write_bytes(content)

    def damage(self, content):
        for _ in range(self.random.randint(1, 3)):
            at = self.random.randrange(len(content) + 1)
            width = self.random.randrange(3)
            piece = self.some(self.DAMAGES)
            if content[at - 1:at] != b"\\" or piece.isascii():  # the core makes nothing sensible of such a byte
                content[at:at + width] = piece
        if self.random.random() < 0.1:
            content[:0] = b"\xef\xbb\xbf"

    def questions(self):
        return ([{kind: number, "property": name} for kind in ("country", "region") for number in self.NUMBERS
                 for name in self.NAMES + ["other"]]
                + [{"bundle": bundle, "locale": locale, "property": name} for bundle in ("*", "Europe", "Asia", "", "x")
                   for locale in ("*", "de_DE", "en_GB", "", "y") for name in self.NAMES]
                + [{"value": name, "number": number} for name in self.NAMES for number in (0, 1, 2, -1, 100, *self.NUMBERS)])


class Answers(unittest.TestCase):
    def compare(self, folder, questions):
        """Returns what the core answered."""
        configlint = Questioner(folder)
        replies = ask_core(folder, questions)
        self.assertEqual(len(replies), len(questions))
        for question, reply in zip(questions, replies):
            answer = configlint.ask(question)
            self.assertEqual(answer.value is not answers.INVALID, reply["valid"], (question, reply, answer.steps))
            if reply["valid"]:
                self.assertEqual(json.dumps(answer.value, sort_keys=True), json.dumps(reply["value"], sort_keys=True),
                                 (question, answer.steps))
            self.assertTrue(answer.steps)
        return replies

    def test_head_unit(self):
        folder = PROJECT / "headunit" / "config"
        markets = answers.PropertyStore(folder / "markets")
        regions = answers.PropertyStore(folder / "regions")
        names = {name for store in (markets, regions) for number in store.configurations for name in store.properties(number)}
        languages = answers.LanguageProperties(folder / "languageBundles")
        keys = {name for properties, _line in languages.entries.values() for name in properties}
        bundles = {bundle for bundle, _locale in languages.entries} | {"Europe", "nowhere"}
        locales = {locale for _bundle, locale in languages.entries} | {"de_DE", "en_GB", "xx_XX"}
        self.assertGreater(len(markets.configurations), 5)
        self.assertGreater(len(keys), 2)
        questions = [{"country": number, "property": name} for number in [*markets.configurations, 0, 9999]
                     for name in sorted(names | {"none"})]
        questions += [{"region": number, "property": name} for number in [*regions.configurations, 0, 9999]
                      for name in sorted(names | {"none"})]
        questions += [{"bundle": bundle, "locale": locale, "property": name} for bundle in sorted(bundles)
                      for locale in sorted(locales) for name in sorted(keys | {"none"})]
        questions += [{"value": name, "number": number} for name in ("audioSourceIcon", "none") for number in range(-1, 40)]
        replies = self.compare(folder, questions)
        self.assertTrue(all(reply["valid"] for reply, question in zip(replies, questions) if "country" in question))
        for question, reply in list(zip(questions, replies))[::97]:
            self.assertEqual(ask_program(folder, question),
                             json.dumps(reply["value"], ensure_ascii=False) if reply["valid"] else "nothing")

    def test_random(self):
        found = set()
        for seed in range(FOLDERS):
            with self.subTest(seed=seed), tempfile.TemporaryDirectory() as name:
                configuration = RandomConfiguration(seed)
                configuration.write(pathlib.Path(name))
                found |= {json.dumps(reply) for reply in self.compare(pathlib.Path(name), configuration.questions())}
        self.assertGreater(len(found), len(RandomConfiguration.VALUES))  # they are not all refused


if __name__ == "__main__":
    unittest.main()
