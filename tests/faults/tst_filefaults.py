#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""A head unit whose files cannot be read, and disks that are full: it starts all the same, or says what it cannot write."""

import os
import pathlib
import random
import shutil
import subprocess
import tempfile
import unittest

from faultcount import fault_count

BASE = pathlib.Path(os.environ["HMI_BASE_DIR"])
FOLDERS = ("languageBundles", "markets", "regions", "settings", "translations", "plugins", "inputmethod-plugins",
           "valuemappings.json")
DEADLINE = 60  # s
PNG = b"\x89PNG"


def make_folder(file):
    file.mkdir()


def make_dangling_link(file):
    file.symlink_to("nowhere")


def make_pipe(file):
    os.mkfifo(file)


def make_empty(file):
    file.touch()


def make_zeros(file):
    file.write_bytes(bytes(4096))


def make_device_that_never_ends(file):
    file.symlink_to("/dev/zero")


DAMAGES = (make_folder, make_dangling_link, make_pipe, make_empty, make_zeros, make_device_that_never_ends)


class FileFaults(unittest.TestCase):
    def setUp(self):
        self.folder = pathlib.Path(tempfile.mkdtemp(prefix="filefaults-"))
        self.addCleanup(shutil.rmtree, self.folder)
        self.base = self.folder / "base"
        (self.base / "bin").mkdir(parents=True)
        shutil.copy2(BASE / "bin/headunit", self.base / "bin")  # a link would lead it to the whole files
        for name in FOLDERS:
            if (BASE / name).is_dir():
                shutil.copytree(BASE / name, self.base / name, copy_function=os.symlink)
            elif (BASE / name).exists():
                os.symlink(BASE / name, self.base / name)

    def headunit(self, *arguments):
        done = subprocess.run([self.base / "bin/headunit", *map(str, arguments)], capture_output=True, text=True,
                              timeout=DEADLINE, check=False, stdin=subprocess.DEVNULL)
        self.assertIn(done.returncode, (0, 1, 2), done.stderr)  # not a signal's
        return done

    def test_every_file_in_every_way(self):
        files = sorted(path for path in self.base.rglob("*") if path.is_symlink())
        self.assertGreater(len(files), 80)
        cases = [(file, damage) for file in files for damage in DAMAGES]
        random.Random(4711).shuffle(cases)
        shot = self.folder / "shot.png"
        for file, damage in cases[:fault_count(12, len(cases))]:
            with self.subTest(file=file.relative_to(self.base), damage=damage.__name__):
                whole = os.readlink(file)
                file.unlink()
                damage(file)
                done = self.headunit("--shot", shot)
                self.assertEqual(done.returncode, 0, done.stderr)
                self.assertEqual(shot.read_bytes()[:4], PNG)
                shot.unlink()
                shutil.rmtree(file) if file.is_dir() and not file.is_symlink() else file.unlink()
                file.symlink_to(whole)

    def test_full_disk_is_told_with_the_file(self):
        full = self.folder / "full.svg"
        full.symlink_to("/dev/full")
        for option in ("--record", "--shot"):
            with self.subTest(option=option):
                extra = ("--shot", self.folder / "shot.png") if option == "--record" else ()
                done = self.headunit(option, full, *extra)
                self.assertIn("full.svg", done.stderr)

    def test_folder_that_is_none_is_told_with_the_file(self):
        (self.folder / "occupied").touch()
        file = self.folder / "occupied/file.svg"
        for option in ("--record", "--shot", "--startup-report"):
            with self.subTest(option=option):
                done = self.headunit(option, file)
                self.assertEqual(done.returncode, 1)
                self.assertIn(str(file), done.stderr)


if __name__ == "__main__":
    unittest.main()
