#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""What `./hmi new` makes: projects that build against the installed head unit, pass their own tests and run in it."""

import filecmp
import os
import pathlib
import shutil
import subprocess
import tempfile
import unittest

PROJECT = pathlib.Path(__file__).resolve().parents[2]
BUILD = os.environ["HMI_BUILD"]
CMAKE = os.environ["HMI_CMAKE"]
CTEST = os.environ["HMI_CTEST"]
COMPONENTS = ("HmiPlatform", "HmiPlatformDev", "HmiCore", "HmiCoreDev", "headunit")
DEADLINE = 600  # s


def run(*command, folder=None):
    """A command's code, output and errors."""
    done = subprocess.run([str(word) for word in command], cwd=folder, capture_output=True, encoding="utf-8",
                          timeout=DEADLINE, stdin=subprocess.DEVNULL)
    return done.returncode, done.stdout, done.stderr


class NewPlugin(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.scratch = pathlib.Path(tempfile.mkdtemp(prefix="newplugin-"))
        cls.addClassCleanup(shutil.rmtree, cls.scratch)
        os.environ["XDG_RUNTIME_DIR"] = str(cls.scratch)
        os.environ["CCACHE_BASEDIR"] = str(cls.scratch)
        os.environ["CCACHE_NOHASHDIR"] = "1"
        cls.prefix = cls.scratch / "prefix"
        cls.headunit = cls.prefix / os.environ["HMI_LIBDIR"] / "headunit"
        for component in COMPONENTS:
            code, output, errors = run(CMAKE, "--install", BUILD, "--prefix", cls.prefix, "--component", component)
            if code != 0:
                raise RuntimeError(output + errors)

    def succeed(self, *command, folder=None):
        code, output, errors = run(*command, folder=folder)
        self.assertEqual(code, 0, f"{command}\n{output}\n{errors}")
        return output

    def make(self, kind, name):
        """A project in the folder that the command chooses by itself."""
        output = self.succeed(PROJECT / "hmi", "new", kind, name, folder=self.scratch)
        folder = self.scratch / name.lower()
        self.assertIn(f"{folder} is ready.", output)
        return folder

    def build(self, folder):
        build = folder / "build"
        output = self.succeed(CMAKE, "-S", folder, "-B", build, "-G", "Ninja", f"-DCMAKE_PREFIX_PATH={self.prefix}",
                              f"-DCMAKE_CXX_COMPILER_LAUNCHER={os.environ['HMI_CCACHE']}",
                              "-DCMAKE_COMPILE_WARNING_AS_ERROR=ON")
        self.assertIn(f"cmake --install puts the plugin into {self.headunit}", output)
        self.succeed(CMAKE, "--build", build)
        return build

    def headunit_says(self, *arguments):
        """What the installed head unit prints; it must not warn."""
        code, output, errors = run(self.prefix / "bin" / "headunit", *arguments)
        self.assertEqual((code, errors), (0, ""), f"{arguments}\n{output}")
        return output.splitlines()

    def picture(self, name, *arguments):
        file = self.scratch / name
        self.headunit_says("--shot", file, *arguments)
        return file

    def test_a_module_gets_into_the_launcher(self):
        before = self.picture("before.png")
        self.assertTrue(filecmp.cmp(before, self.picture("again.png"), shallow=False), "pictures differ by themselves")
        self.assertNotIn("TRIPCOMPUTER.Main", self.headunit_says("--list-views"))

        folder = self.make("module", "TripComputer")
        build = self.build(folder)
        self.succeed(CTEST, "--test-dir", build, "--output-on-failure", "--no-tests=error")
        self.succeed(CMAKE, "--install", build)
        self.assertTrue((self.headunit / "plugins" / "tripcomputer.so").is_file())

        self.assertIn("TRIPCOMPUTER.Main", self.headunit_says("--list-views"))
        self.assertFalse(filecmp.cmp(before, self.picture("after.png"), shallow=False), "the launcher is as before")
        english = self.picture("english.png", "--view", "TRIPCOMPUTER.Main")
        german = self.picture("german.png", "--view", "TRIPCOMPUTER.Main", "--language", "de_DE")
        self.assertFalse(filecmp.cmp(english, german, shallow=False), "the screen is not translated")

        # Its own test is no decoration.
        screen = folder / "qml" / "TripComputerScreen.qml"
        screen.write_text(screen.read_text().replace("PushButton {", "PushButtn {"))
        self.succeed(CMAKE, "--build", build)
        code, output, _ = run(CTEST, "--test-dir", build, "--output-on-failure")
        self.assertNotEqual(code, 0)
        self.assertIn("PushButtn is not a type", output)

    def test_an_input_method_is_registered(self):
        build = self.build(self.make("inputmethod", "Morse"))
        self.succeed(CTEST, "--test-dir", build, "--output-on-failure", "--no-tests=error")
        self.succeed(CMAKE, "--install", build)
        plugin = self.headunit / "inputmethod-plugins" / "morse.so"
        self.assertTrue(plugin.is_file())
        self.assertIn("class MorseEngine", self.succeed(self.prefix / "bin" / "hmi-plugin-check", "--strict", plugin))
        self.picture("engine.png")  # the head unit starts with it, and has nothing to warn of

    def test_what_the_installed_check_says_of_installed_plugins(self):
        for plugin in sorted(self.headunit.glob("*plugins/libhmi_*.so")):
            with self.subTest(plugin.name):
                self.succeed(self.prefix / "bin" / "hmi-plugin-check", "--strict", plugin)

    def test_odd_requests_are_refused(self):
        taken = self.scratch / "taken"
        taken.mkdir(exist_ok=True)
        (taken / "notes.txt").write_text("mine\n")
        letters = "it needs a letter first and then letters and digits of ASCII, 32 at most"
        requests = {
            ("module",): "new needs 'module' or 'inputmethod' and a name",
            ("module", "A", "b", "c"): "new needs 'module' or 'inputmethod' and a name",
            ("theme", "Dark"): "there is no kind 'theme'; it is 'module' or 'inputmethod'",
            ("module", "9lives"): f"'9lives' cannot be a name: {letters}",
            ("module", "../up"): f"'../up' cannot be a name: {letters}",
            ("module", "two words"): f"'two words' cannot be a name: {letters}",
            ("module", "Wétter"): f"'Wétter' cannot be a name: {letters}",
            ("module", "x" * 33): f"'{'x' * 33}' cannot be a name: {letters}",
            ("module", ""): f"'' cannot be a name: {letters}",
            ("module", "Radio"): "the head unit already has a plugin 'radio' (headunit/modules/radio)",
            ("inputmethod", "latin"): "the head unit already has a plugin 'latin' (headunit/inputmethods/latin)",
            ("module", "System"): "'System' is taken by the head unit itself",
            ("module", "Ok", PROJECT / "ok"): f"{PROJECT / 'ok'} is inside this repository; name a folder outside of it",
            ("module", "Ok", "taken"): f"{taken} is not empty; nothing was changed",
            ("module", "Ok", "taken/notes.txt"): f"{taken / 'notes.txt'} is a file",
        }
        for request, message in requests.items():
            with self.subTest(request):
                code, output, errors = run(PROJECT / "hmi", "new", *request, folder=self.scratch)
                self.assertEqual((code, output, errors), (2, "", f"hmi: {message}\n"))
        self.assertEqual([file.name for file in taken.iterdir()], ["notes.txt"])
        self.assertFalse((PROJECT / "ok").exists())


if __name__ == "__main__":
    unittest.main()
