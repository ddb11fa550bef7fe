#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Damaged plugins: whatever they do to the process that loads them, hmi-plugin-check comes back and says it."""

import collections
import json
import os
import pathlib
import random
import subprocess
import tempfile
import unittest

from faultcount import fault_count

CHECK = os.environ["HMI_PLUGIN_CHECK"]
PLUGINS = [pathlib.Path(name) for name in os.environ["HMI_PLUGINS"].split(":")]
TIME_LIMIT = 20  # s, for a plugin that hangs


def change_bytes(content, chance):
    """Up to a dozen bytes anywhere."""
    for _ in range(chance.randint(1, 12)):
        content[chance.randrange(len(content))] = chance.randrange(256)


def change_headers(content, chance):
    """The ELF header and the program headers behind it."""
    for _ in range(chance.randint(1, 4)):
        content[chance.randrange(4, 0x300)] = chance.randrange(256)


def change_section_table(content, chance):
    """The end of the file, where the section headers are."""
    for _ in range(chance.randint(1, 6)):
        content[len(content) - 1 - chance.randrange(2400)] = chance.randrange(256)


def cut(content, chance):
    del content[chance.randrange(len(content)):]


def clear_block(content, chance):
    begin = chance.randrange(len(content))
    length = min(chance.choice((16, 256, 4096)), len(content) - begin)
    content[begin:begin + length] = bytes(length)


def change_meta_data(content, chance):
    """What is read without loading: keys, interface, version."""
    begin = content.find(b"QTMETADATA")
    for _ in range(chance.randint(1, 8)):
        content[(begin if begin >= 0 else 0) + chance.randrange(200)] = chance.randrange(256)


DAMAGES = (change_bytes, change_headers, change_section_table, cut, clear_block, change_meta_data)


class DamagedPlugins(unittest.TestCase):
    def outcome(self, file):
        """The check's own end is that of a program that did its work: 0 or 1, with a report."""
        done = subprocess.run([CHECK, "--json", "--timeout", str(TIME_LIMIT), file], capture_output=True,
                              timeout=3 * TIME_LIMIT, check=False)
        self.assertIn(done.returncode, (0, 1), done.stderr)
        return json.loads(done.stdout)["headUnit"]

    def test_the_check_survives_all(self):
        chance = random.Random(4711)
        outcomes = collections.Counter()
        with tempfile.TemporaryDirectory() as folder:
            for number in range(fault_count(36, 2000)):
                content = bytearray(PLUGINS[number % len(PLUGINS)].read_bytes())
                damage = DAMAGES[number % len(DAMAGES)]
                damage(content, chance)
                file = pathlib.Path(folder, f"damaged{number}.so")
                file.write_bytes(content)
                with self.subTest(number=number, damage=damage.__name__):
                    outcomes[self.outcome(file)] += 1
                file.unlink()
        print(f"{sum(outcomes.values())} damaged plugins: the head unit " + ", ".join(
            f"{outcome} {count}" for outcome, count in sorted(outcomes.items())))
        self.assertGreater(len(outcomes), 1)


if __name__ == "__main__":
    unittest.main()
