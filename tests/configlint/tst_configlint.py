#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""What configlint finds, rule by rule.

Each folder of cases/ lies over the clean configuration of base/: `expected` has the exact lines, `absent` what is left out.
"""

import os
import pathlib
import shutil
import subprocess
import sys
import tempfile
import unittest

sys.dont_write_bytecode = True
HERE = pathlib.Path(__file__).resolve().parent
PROJECT = HERE.parents[1]
CONFIGLINT = PROJECT / "tools" / "configlint" / "configlint"
sys.path.insert(0, str(CONFIGLINT.parent))

import languages  # noqa: E402
import plugins  # noqa: E402

CATALOGUES = ["app/app_de_DE", "app/app_en_GB", "app/app_zh_CN", "radio_de", "radio_en", "radio_zh_CN"]
NO_CONFIGURATION = ("expected", "absent")
DEADLINE = 60  # s


def run(folder, *arguments):
    """configlint in a folder: its code, its lines, and what it says besides."""
    done = subprocess.run([sys.executable, CONFIGLINT, *arguments], cwd=folder, capture_output=True, encoding="utf-8",
                          timeout=DEADLINE, stdin=subprocess.DEVNULL)
    return done.returncode, done.stdout.splitlines(), done.stderr


def write_plugin(path, name):
    """As much of a plugin as tells its name: two entries of a map, of which 4 is the metadata."""
    def text(content):
        return bytes([0x60 + len(content)]) + content.encode()
    metadata = b"\xbf\x02" + text("an.interface") + b"\x04\xa1" + text("Name") + text(name) + b"\xff"
    path.write_bytes(b"\x7fELF QTMETADATA !\x00\x05\x0f\x00" + b"QTMETADATA !\x00\x05\x0f\x00" + metadata)


class Folder(unittest.TestCase):
    """A test with the clean configuration in a folder of its own."""

    CHECK = ("check", "config", "--headunit", ".", "--views", "views.json")

    def setUp(self):
        scratch = tempfile.TemporaryDirectory()
        self.addCleanup(scratch.cleanup)
        self.folder = pathlib.Path(scratch.name)
        shutil.copytree(HERE / "base", self.folder, dirs_exist_ok=True)
        (self.folder / "translations" / "app").mkdir(parents=True)
        for catalogue in CATALOGUES:
            (self.folder / "translations" / f"{catalogue}.qm").write_bytes(languages.CATALOGUE_MAGIC)
        (self.folder / "plugins").mkdir()
        for name in ("radio", "climate"):
            write_plugin(self.folder / "plugins" / f"lib{name}.so", name)

    def check(self, *arguments):
        return run(self.folder, *self.CHECK, *arguments)

    def assert_finds(self, expected):
        code, lines, rest = self.check()
        self.assertEqual(lines, expected)
        for line in lines:
            self.assertRegex(line, r"^[^:;]+:\d+: (error|warning): [^;]+; [^;]+$")
        errors = sum(": error: " in line for line in expected)
        warnings = sum(": warning: " in line for line in expected)
        self.assertEqual(code, 1 if errors else 0)
        self.assertEqual(rest, f"configlint: {errors} errors, {warnings} warnings\n")


class Rules(Folder):
    def lay_over(self, case):
        for source in sorted(case.rglob("*")):
            target = self.folder / source.relative_to(case)
            if source.is_dir():
                target.mkdir(exist_ok=True)
            elif source.name not in NO_CONFIGURATION:
                target.write_bytes(source.read_bytes())
        for name in (case / "absent").read_text().split() if (case / "absent").exists() else ():
            target = self.folder / name
            target.rmdir() if target.is_dir() else target.unlink()


def add_rule(case):
    def test(self):
        self.lay_over(case)
        self.assert_finds((case / "expected").read_text(encoding="utf-8").splitlines())
    setattr(Rules, "test_" + case.name.replace("-", "_"), test)


for each in sorted((HERE / "cases").iterdir()):
    add_rule(each)


class Files(Folder):
    """What is no ordinary file never makes it wait or end otherwise than with a finding."""

    ASIA = "config/markets/config.json:4: error: the file \"asia.json\" cannot be read, so the HMI takes 2B for unknown: {}; " \
           "make it a readable, regular file of at most 16 MiB"

    def replace(self, name):
        path = self.folder / "config" / name
        path.unlink()
        return path

    def without_asia(self):
        return 'config/languageBundles/config.json:9: warning: no market names the bundle "Asia"; name it as a market\'s ' \
               '"languageBundle" or remove it'

    def test_pipe(self):
        os.mkfifo(self.replace("markets/asia.json"))
        self.assert_finds([self.without_asia(), self.ASIA.format("it is not a regular file")])

    def test_device(self):
        self.replace("markets/asia.json").symlink_to("/dev/zero")
        self.assert_finds([self.without_asia(), self.ASIA.format("it is not a regular file")])

    def test_link_to_itself(self):
        self.replace("markets/asia.json").symlink_to("asia.json")
        self.assert_finds([self.without_asia(), self.ASIA.format("Too many levels of symbolic links")])

    def test_too_large(self):
        path = self.replace("markets/asia.json")
        path.touch()
        os.truncate(path, 16 * 1024 * 1024 + 1)
        self.assert_finds([self.without_asia(), self.ASIA.format("it is larger than 16 MiB")])

    def test_pipes_instead_of_documents(self):
        for name in ("markets/config.json", "languageBundles/config.json", "languageBundles/properties.json",
                     "valuemappings.json", "plugins.conf"):
            os.mkfifo(self.replace(name))
        (self.folder / "views.json").unlink()
        os.mkfifo(self.folder / "views.json")
        os.mkfifo(self.folder / "translations" / "app" / "app_fr_FR.qm")
        os.mkfifo(self.folder / "plugins" / "pipe.so")
        code, lines, _rest = self.check()
        self.assertEqual(code, 1)
        self.assertEqual(sum("it is not a regular file" in line for line in lines), 7, lines)

    def test_view_descriptors_have_a_smaller_limit(self):
        os.truncate(self.folder / "views.json", 1024 * 1024 + 1)
        self.assert_finds(["views.json:1: error: the file cannot be read: it is larger than 1 MiB; "
                           "make it a readable, regular file of at most 1 MiB"])

    def assert_mapping_problem(self, content, line, problem):
        (self.folder / "config" / "valuemappings.json").write_bytes(content)
        self.assert_finds([f"config/valuemappings.json:{line}: error: the file is not JSON, so the HMI reads nothing "
                           f"of it: {problem}; correct it"])

    def test_empty(self):
        self.assert_mapping_problem(b"", 1, "the file is empty")

    def test_a_text_at_the_top(self):
        self.assert_mapping_problem(b'"text"', 1, "an array or an object is expected")

    def test_not_utf_8(self):
        self.assert_mapping_problem(b'[\n"\xff"]', 2, "it is not UTF-8")

    def test_too_deep(self):
        self.assert_mapping_problem(b"\n" + 1025 * b"[" + 1025 * b"]", 2, "there are more than 1024 levels")

    def test_deep(self):
        (self.folder / "config" / "valuemappings.json").write_bytes(
            b'[{"valueName": "deep", "default": ' + 1022 * b"[" + 1022 * b"]" + b"}]")
        self.assert_finds_nothing()

    def test_trailing(self):
        self.assert_mapping_problem(b"[]\n\n[]", 3, "something follows the end of the document")

    def test_no_end(self):
        self.assert_mapping_problem(b'[\n{"valueName":\n"x]', 3, "a text has no end")

    def test_bad_escape(self):
        self.assert_mapping_problem(b'[\n"\\u12G4"]', 2, r"after \u four hexadecimal digits are expected")

    def test_huge_number(self):
        self.assert_mapping_problem(b"[1e999]", 1, "a number is too large")

    def test_byte_order_mark(self):
        (self.folder / "config" / "valuemappings.json").write_bytes(b"\xef\xbb\xbf[]")
        self.assert_finds_nothing()

    def assert_finds_nothing(self):
        self.assertEqual(self.check("--strict"), (0, [], ""))

    def test_base_is_clean(self):
        self.assert_finds_nothing()

    def test_findings_are_printed_on_one_line(self):
        (self.folder / "config" / "valuemappings.json").write_text('[{"valueName": "a\\n\\u001b[31m", "other": 1}, {"\\n": 1}]')
        _code, lines, _rest = self.check()
        self.assertIn(r'config/valuemappings.json:1: error: "\n" is not a known field; known are default, valueName, values',
                      lines)
        self.assertFalse([line for line in lines if not line.isprintable()])

    def test_many_findings_of_a_file_are_counted(self):
        (self.folder / "config" / "valuemappings.json").write_text("[" + ",".join(["1"] * 300) + "]")
        _code, lines, rest = self.check()
        self.assertEqual(lines[-1], "config/valuemappings.json: 100 more findings are not shown")
        self.assertEqual(len(lines), 201)
        self.assertEqual(rest, "configlint: 300 errors, 0 warnings\n")


class CommandLine(Folder):
    def test_warnings_count_when_strict(self):
        (self.folder / "config" / "markets" / "notes.txt").touch()
        self.assertEqual(self.check()[0], 0)
        self.assertEqual(self.check("--strict")[0], 1)

    def test_a_head_unit_without_plugins(self):
        for plugin in (self.folder / "plugins").iterdir():
            plugin.write_bytes(b"\x7fELF QTMETADATA !\x00\x05\x0f\x00\xbf\x04")
        self.assertEqual(self.check()[1][-1], "plugins:1: error: there is no plugin with a name; build the plugins")
        shutil.rmtree(self.folder / "plugins")
        self.assertEqual(self.check()[1], ["plugins:1: error: the folder of plugins cannot be read: No such file or "
                                           "directory; build the plugins"])

    def test_catalogues_may_lie_elsewhere(self):
        (self.folder / "translations").rename(self.folder / "elsewhere")
        self.assertEqual(run(self.folder, "check", "config", "--strict", "--translations", "elsewhere"), (0, [], ""))
        (self.folder / "elsewhere" / "radio_en.qm").unlink()
        code, lines, _rest = run(self.folder, "check", "config", "--translations", "elsewhere")
        self.assertEqual((code, len(lines)), (1, 2), lines)

    def test_locales_of_another_platform(self):
        (self.folder / "sources.json").write_text(
            '{"sources": [{"enums": [{"values": [{"locale": "de_DE"}, {"locale": "zh_CN"}]}]}]}')
        _code, lines, _rest = self.check("--sources", "sources.json")
        self.assertEqual(lines, [f'config/languageBundles/config.json:{line}: error: the platform has no language with the '
                                 'locale "en_GB"; use one of de_DE, zh_CN' for line in (7, 12)])

    def test_wrong_usage(self):
        for arguments, complaint in (
                ([], "required"),
                (["check"], "required"),
                (["check", "nowhere"], "there is no folder 'nowhere'"),
                (["check", "views.json"], "there is no folder 'views.json'"),
                (["check", "config", "--translations", "nowhere"], "there is no folder 'nowhere'"),
                (["check", "config", "--sources", "nowhere"], "there is no file 'nowhere'"),
                (["explain", "config"], "required"),
                (["explain", "config", "--country", "1A"], "--property is needed"),
                (["explain", "config", "--country", "xyz", "--property", "clock"], "not a hexadecimal number"),
                (["explain", "config", "--bundle", "Asia", "--property", "keyboard"], "belong together"),
                (["explain", "config", "--value", "driveMode", "one"], "not a whole number"),
                (["explain", "config", "--value", "driveMode", "1", "--country", "1A"], "not allowed")):
            with self.subTest(arguments):
                code, lines, rest = run(self.folder, *arguments)
                self.assertEqual((code, lines), (2, []))
                self.assertIn(complaint, rest)

    def test_plugins_conf_is_found_where_it_is_installed(self):
        (self.folder / "config" / "settings").mkdir()
        (self.folder / "config" / "plugins.conf").rename(self.folder / "config" / "settings" / "plugins.conf")
        self.assertEqual(self.check("--strict"), (0, [], ""))


class Explanations(Folder):
    def explain(self, *arguments):
        code, lines, rest = run(self.folder, "explain", "config", *arguments)
        self.assertEqual((code, rest), (0, ""))
        return lines

    def test_own_file(self):
        self.assertEqual(self.explain("--country", "2b", "--property", "clock"), [
            'config/markets/config.json:4: 2B has the file "asia.json"',
            'config/markets/asia.json:3: the configuration\'s own file has "clock"',
            "answer: 12"])

    def test_default_properties(self):
        self.assertEqual(self.explain("--country", "1A", "--property", "unit"), [
            'config/markets/config.json:3: 1A has the file "europe.json"',
            'config/markets/europe.json:1: the configuration\'s own file has no "unit"',
            'config/markets/config.json:2: -1 has the file "default.json"',
            'config/markets/default.json:2: the file of default properties has "unit"',
            'answer: "km"'])

    def test_fallback_and_unknown(self):
        self.assertEqual(self.explain("--country", "7", "--property", "toll"), [
            "config/markets/config.json:1: no file is named for 7",
            "config/markets/config.json:3: the fallback 1A is asked instead",
            'config/markets/config.json:3: 1A has the file "europe.json"',
            'config/markets/europe.json:1: the configuration\'s own file has no "toll"',
            'config/markets/config.json:2: -1 has the file "default.json"',
            'config/markets/default.json:1: the file of default properties has no "toll"',
            'config/markets/config.json:1: neither of them has "toll": the text "Unknown property" stands for it',
            'answer: "Unknown property"'])

    def test_missing_store(self):
        self.assertEqual(self.explain("--region", "1", "--property", "sources"), [
            "config/regions/config.json:1: does not exist: no configuration is known",
            "config/regions/config.json:1: no file is named for 1",
            "config/regions/config.json:1: no other configuration is the fallback",
            "answer: nothing"])

    def test_language_properties(self):
        self.assertEqual(self.explain("--bundle", "Asia", "--locale", "zh_CN", "--property", "font"), [
            "config/languageBundles/properties.json:7: the entry (Asia, zh_CN) is selected; no other is asked",
            'config/languageBundles/properties.json:10: it has no "font"',
            "answer: nothing"])
        self.assertEqual(self.explain("--bundle", "Asia", "--locale", "en_GB", "--property", "keyboard"), [
            "config/languageBundles/properties.json:1: there is no entry (Asia, en_GB)",
            "config/languageBundles/properties.json:1: there is no entry (Asia, *)",
            "config/languageBundles/properties.json:2: the entry (*, *) is selected; no other is asked",
            'config/languageBundles/properties.json:5: it has "keyboard"',
            'answer: "Latin"'])

    def test_values(self):
        self.assertEqual(self.explain("--value", "driveMode", "1"), [
            'config/valuemappings.json:7: "driveMode" lists 1', 'answer: "sport"'])
        self.assertEqual(self.explain("--value", "driveMode", "-1"), [
            'config/valuemappings.json:1: "driveMode" does not list -1',
            'config/valuemappings.json:4: the default of "driveMode"', 'answer: "unknown"'])


class BuiltPlugins(unittest.TestCase):
    @unittest.skipUnless("HMI_BASE_DIR" in os.environ, "HMI_BASE_DIR names no head unit")
    def test_names_are_those_of_the_metadata(self):
        names = {plugins.plugin_name(file) for file in (pathlib.Path(os.environ["HMI_BASE_DIR"]) / "plugins").iterdir()}
        self.assertEqual(names, {"apps", "climate", "media", "messages", "navigation", "phone", "radio", "settings"})


if __name__ == "__main__":
    unittest.main()
