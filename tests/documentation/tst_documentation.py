#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""The first module and the first product of docs/ are what they promise: their code is taken from the pages, built, and run."""

import os
import pathlib
import re
import shutil
import subprocess
import tempfile
import threading
import unittest

DOCS = pathlib.Path(__file__).resolve().parents[2] / "docs"
CMAKE = os.environ["HMI_CMAKE"]
COMPONENTS = ("HmiPlatform", "HmiPlatformDev", "HmiCore", "HmiCoreDev", "headunit")
DEADLINE = 600  # s
TELL = 'performanceLogger.log("start screen, modules:", _modulesModel.rowCount())'
START_SCREEN = "start screen, modules: "
NO_HOME = "No inital state found."


def files_of(page):
    """The page's files: each is named by the last `name.ext` of the text before its fenced block."""
    files = {}
    name = None
    block = None
    for line in (DOCS / page).read_text(encoding="utf-8").splitlines():
        if block is not None:
            if line == "```":
                files[block[0]] = "\n".join(block[1:]) + "\n"
                block = name = None
            else:
                block.append(line)
        elif line.startswith("```"):
            language = line[3:]
            if language == "cmake":
                name = "CMakeLists.txt"
            block = [name if language and name else "unnamed"]
        else:
            named = re.findall(r"`(\w+\.(?:cpp|h|json|qml|qrc|txt))`", line)
            name = named[0] if named else name
    files.pop("unnamed", None)
    return files


class Documentation(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.scratch = pathlib.Path(tempfile.mkdtemp(prefix="documentation-"))
        cls.addClassCleanup(shutil.rmtree, cls.scratch)
        os.environ.update(XDG_RUNTIME_DIR=str(cls.scratch), CCACHE_BASEDIR=str(cls.scratch), CCACHE_NOHASHDIR="1")
        cls.prefix = cls.scratch / "prefix"
        for component in COMPONENTS:
            subprocess.run([CMAKE, "--install", os.environ["HMI_BUILD"], "--prefix", str(cls.prefix), "--component",
                            component], check=True, stdout=subprocess.DEVNULL)
        cls.module = cls.build("first-module.md", {"helloplugin.h", "hello.json", "hello.qrc", "views.json", "Hello.qml",
                                                   "CMakeLists.txt"})
        cls.product = cls.build("product.md", {"main.cpp", "desk.h", "views.json", "Home.qml", "desk.qrc", "CMakeLists.txt"})

    @classmethod
    def build(cls, page, names):
        files = files_of(page)
        if set(files) != names:
            raise AssertionError(f"{page} has the files {sorted(files)}")
        folder = cls.scratch / page
        folder.mkdir()
        for name, content in files.items():
            if name == "Home.qml":  # it tells when it is there
                content = content.replace("Item {\n", f"Item {{\n    Component.onCompleted: {TELL}\n", 1)
            (folder / name).write_text(content, encoding="utf-8")
        build = folder / "build"
        for command in ([CMAKE, "-S", folder, "-B", build, "-G", "Ninja", f"-DCMAKE_PREFIX_PATH={cls.prefix}",
                         f"-DCMAKE_CXX_COMPILER_LAUNCHER={os.environ['HMI_CCACHE']}"], [CMAKE, "--build", build]):
            done = subprocess.run([str(word) for word in command], capture_output=True, encoding="utf-8", timeout=DEADLINE)
            if done.returncode != 0:
                raise AssertionError(f"{page}: {done.stdout}{done.stderr}")
        return build

    def lines_until(self, text):
        """What the product logs until a line with this text comes; it is ended then."""
        os.environ["QT_LOGGING_RULES"] = "kest.hmicore.debug=true;hmi.performance.debug=true"
        os.environ["QT_MESSAGE_PATTERN"] = "%{type} %{category}: %{message}"
        process = subprocess.Popen([self.product / "desk"], stderr=subprocess.PIPE, encoding="utf-8")
        deadline = threading.Timer(DEADLINE / 10, process.kill)
        deadline.start()
        lines = []
        for line in process.stderr:
            lines.append(line.rstrip())
            if text in line:
                break
        deadline.cancel()
        process.kill()
        process.communicate()
        del os.environ["QT_LOGGING_RULES"], os.environ["QT_MESSAGE_PATTERN"]
        self.assertTrue(lines and text in lines[-1], "\n".join(lines))
        return lines

    def warnings(self, lines):
        return [line for line in lines if line.startswith(("warning", "critical", "fatal"))
                and " al2hmi.bridge: " not in line]  # there is no vehicle

    def test_the_module_is_in_the_head_unit(self):
        plugin = self.module / "libhello.so"
        check = subprocess.run([self.prefix / "bin" / "hmi-plugin-check", "--strict", plugin], capture_output=True,
                               encoding="utf-8", timeout=DEADLINE)
        self.assertEqual(check.returncode, 0, check.stdout)
        shutil.copy(plugin, self.prefix / os.environ["HMI_LIBDIR"] / "headunit" / "plugins")
        views = subprocess.run([self.prefix / "bin" / "headunit", "--list-views"], capture_output=True, encoding="utf-8",
                               timeout=DEADLINE)
        self.assertIn("HELLO.Main", views.stdout.splitlines())

    def told(self, lines):
        """Without the lines that depend on the folder: its name, and what else lies in it."""
        return [line for line in lines if "Looking for plugins in:" not in line and not line.endswith("Skipping")]

    def test_the_product_starts_without_modules_as_the_page_says(self):
        lines = self.lines_until(START_SCREEN)
        self.assertTrue(lines[-1].endswith(START_SCREEN + "0"), lines[-1])
        self.assertEqual(self.warnings(lines), [f"warning kest.hmicore: {NO_HOME}"])
        core = self.told([line.split(" ", 1)[1] for line in lines if " kest.hmicore: " in line])
        page = (DOCS / "product.md").read_text(encoding="utf-8")
        excerpt = self.told(re.search(r"```text\n(.*?)```", page, re.DOTALL).group(1).splitlines())
        self.assertGreater(len(excerpt), 3)
        self.assertEqual(core[-len(excerpt):], excerpt)

    def test_the_product_has_its_modules(self):
        (self.product / "plugins").mkdir()
        self.addCleanup(shutil.rmtree, self.product / "plugins")
        shutil.copy(self.module / "libhello.so", self.product / "plugins")
        lines = self.lines_until(START_SCREEN)
        self.assertTrue(lines[-1].endswith(START_SCREEN + "1"), lines[-1])
        self.assertEqual(self.warnings(lines), [])


if __name__ == "__main__":
    unittest.main()
