#!/usr/bin/env python3
"""tools/strings against a small checkout: what it finds, and what it makes of a new key."""
import pathlib
import subprocess
import sys
import tempfile
import unittest

TOOL = sys.argv.pop(1)
SOURCE = '''
// localizedString("not a key", "a comment is no call")
constexpr std::string_view note = "A \\"kind\\" of fruit, "
                                  "in the nominative";
const auto kinds = {localizable("pear", note), localizable("plum", note)};
std::string fruit(int kind) { return platform::localizedString(kinds[kind], note); }
std::string basket(int count) { return localizedString("%1$@ of %2$@ (" "fruit)", "%1$@ and %2$@ are numbers"); }
'''
KEYS = {"%1$@ of %2$@ (fruit)": "%1$@ and %2$@ are numbers", "pear": 'A "kind" of fruit, in the nominative',
        "plum": 'A "kind" of fruit, in the nominative'}
GERMAN = {"%1$@ of %2$@ (fruit)": "%2$@, davon %1$@", "pear": "Birne", "plum": "Pflaume"}


class StringsTool(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.root = pathlib.Path(folder.name)
        (self.root / "src").mkdir()
        (self.root / "resources/translations").mkdir(parents=True)
        self.write_source(SOURCE)
        self.run_tool("add", "en", "de")
        self.edit_german(lambda text: text.replace(' type="unfinished"', ""))
        for key, translation in GERMAN.items():
            self.edit_german(lambda text, key=key, translation=translation: text.replace(
                f"<translation>{key}</translation>", f"<translation>{translation}</translation>"))

    def write_source(self, text, name="fruit.cpp"):
        (self.root / "src" / name).write_text(text, encoding="utf-8")

    @property
    def german(self):
        return self.root / "resources/translations/Localizable_de.ts"

    def edit_german(self, change):
        self.german.write_text(change(self.german.read_text(encoding="utf-8")), encoding="utf-8")

    def run_tool(self, *arguments):
        result = subprocess.run([TOOL, "--root", self.root, *arguments], capture_output=True, text=True, check=False)
        return result.returncode, result.stdout + result.stderr

    def test_keys_and_notes_are_found(self):
        status, output = self.run_tool("list")
        self.assertEqual(status, 0, output)
        self.assertEqual(output, "".join(f"{key}\n    {note}\n" for key, note in KEYS.items()))

    def test_a_complete_table_passes(self):
        status, output = self.run_tool("check", "--finished")
        self.assertEqual(status, 0, output)

    def test_faults_of_a_table(self):
        whole = self.german.read_text(encoding="utf-8")
        pear = whole[whole.index("    <message>\n        <source>pear"):whole.index("    <message>\n        <source>plum")]
        for name, change, complaint in (
                ("lacking key", lambda text: text.replace(pear, ""), 'lacks "pear"'),
                ("set aside", lambda text: text.replace("<translation>Birne", '<translation type="vanished">Birne'),
                 'lacks "pear"'),
                ("unknown key", lambda text: text.replace("<source>pear", "<source>apple"), 'nobody asks for "apple"'),
                ("empty text", lambda text: text.replace("Birne", " "), 'the text for "pear" is empty'),
                ("a placeholder less", lambda text: text.replace("%2$@, davon", "davon"), "other placeholders"),
                ("a placeholder more", lambda text: text.replace("Birne", "%@"), "other placeholders"),
                ("another number", lambda text: text.replace("davon %1$@", "davon %2$@"), "other placeholders"),
                ("an old note", lambda text: text.replace("are numbers", "were numbers"), "is not that of the sources"),
        ):
            with self.subTest(name):
                self.german.write_text(change(whole), encoding="utf-8")
                status, output = self.run_tool("check")
                self.assertEqual(status, 1, output)
                self.assertIn(complaint, output)

    def test_faults_of_the_sources(self):
        for name, source, complaint in (
                ("a key from nowhere", "auto a = localizedString(kind, note);", "comes from a variable"),
                ("no note", 'auto a = localizedString("apple", note);', "no literal"),
                ("two notes", 'auto a = localizedString("pear", "Half of a pair");', "has another note"),
        ):
            with self.subTest(name):
                self.write_source(source, "other.cpp")
                status, output = self.run_tool("check")
                self.assertEqual(status, 1, output)
                self.assertIn(complaint, output)
        self.write_source("", "other.cpp")
        for text in ('Text { text: "Apple" }', 'Accessible.name: "Apple"', 'text: qsTr("Apple")'):
            with self.subTest(text):
                self.write_source(text, "Fruit.qml")
                status, output = self.run_tool("check")
                self.assertEqual(status, 1, output)
                self.assertIn("in no table", output)

    def test_a_new_key_waits_for_its_translator(self):
        self.write_source(SOURCE.replace('localizable("plum", note)', 'localizable("apple", note)'))
        status, output = self.run_tool("add")
        self.assertEqual(status, 0, output)
        text = self.german.read_text(encoding="utf-8")
        self.assertIn('<translation type="unfinished">apple</translation>', text)
        self.assertIn('<translation type="vanished">Pflaume</translation>', text)
        self.assertIn("<translation>Birne</translation>", text)
        self.assertEqual(self.run_tool("check")[0], 0)
        self.assertEqual(self.run_tool("check", "--finished")[0], 1)
        # What was translated once comes back with its key.
        self.write_source(SOURCE)
        self.run_tool("add")
        status, output = self.run_tool("check", "--finished")
        self.assertEqual(status, 0, output)
        self.assertIn("<translation>Pflaume</translation>", self.german.read_text(encoding="utf-8"))

    def test_pseudo_locales_keep_placeholders(self):
        folder = self.root / "pseudo"
        self.assertEqual(self.run_tool("pseudo", folder)[0], 0)
        accented = (folder / "Localizable_en-XA.ts").read_text(encoding="utf-8")
        self.assertIn("<translation>[%1$@ öƒ %2$@ (ƒŕûîţ) on]</translation>", accented)
        mirrored = (folder / "Localizable_ar-XB.ts").read_text(encoding="utf-8")
        self.assertIn("<translation>\u200f\u202epear\u202c\u200f</translation>", mirrored)
        self.assertEqual(mirrored.count("%1$@"), 2)


unittest.main()
