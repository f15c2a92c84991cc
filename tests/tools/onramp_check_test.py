"""Makes one mistake at a time in a copy of the example medium, and compares the findings of
onramp-check with the expected ones. Arguments: the program, and the example medium with the
application on it."""

import json
import os
import plistlib
import re
import shutil
import subprocess
import sys
import tempfile
import unittest
from pathlib import Path

PROGRAM, MEDIUM = sys.argv[1:]
ROOT = Path(__file__).resolve().parents[2]
APPLICATION = "Onramp OSX.app/Contents"
COMMON = "MacResources/CDCommonInfo.plist"
DESCRIPTION = "MacResources/CDInfo.plist"
MODELS = "MacResources/ModelInfo.plist"
MESSAGES = "MacResources/CDCommonMessage.bundle/Contents"
ENGLISH = f"{MESSAGES}/Resources/en.lproj/Localizable.strings"
TOOL = "Utilities/Kestrel Wireless Setup.app/Contents"
PROGRAM_OF_TOOL = f"{TOOL}/MacOS/Kestrel Wireless Setup"
PACKAGE = "Packages/Kestrel Imaging Installer.pkg"
MODEL = "Kestrel Model 100"
PICTURE = "MacResources/Images/usb.png"


def make_medium(folder):
    shutil.copytree(MEDIUM, folder, ignore=shutil.ignore_patterns("Linux"))
    (folder / APPLICATION / "MacOS").mkdir()
    (folder / APPLICATION / "MacOS/Onramp OSX").touch(0o755)


def run(*arguments, **options):
    return subprocess.run((PROGRAM,) + arguments, capture_output=True, text=True, timeout=60,
                          check=False, **options)


# Most of the functions below return a breaker: a function that makes one mistake in a medium. A
# breaker's argument is the medium's folder.

def edit(path, change, form=plistlib.FMT_XML):
    def breaker(folder):
        contents = plistlib.loads((folder / path).read_bytes())
        change(contents)
        (folder / path).write_bytes(plistlib.dumps(contents, fmt=form))
    return breaker


def put(path, *keys_and_value):
    *keys, last, value = keys_and_value

    def change(contents):
        for key in keys:
            contents = contents[key]
        contents[last] = value
    return edit(path, change)


def take(path, *keys):
    def change(contents):
        for key in keys[:-1]:
            contents = contents[key]
        del contents[keys[-1]]
    return edit(path, change)


def rename(path, old, new, *keys):
    def change(contents):
        for key in keys:
            contents = contents[key]
        contents[new] = contents.pop(old)
    return edit(path, change)


def replace(path, old, new):
    def breaker(folder):
        text = (folder / path).read_text(encoding="utf-8")
        assert old in text, old
        (folder / path).write_text(text.replace(old, new, 1), encoding="utf-8")
    return breaker


def remove(path):
    def breaker(folder):
        place = folder / path
        shutil.rmtree(place) if place.is_dir() else place.unlink()
    return breaker


def write(path, contents):
    def breaker(folder):
        (folder / path).write_bytes(contents)
    return breaker


def cut_binary(folder):
    edit(MODELS, lambda contents: None, plistlib.FMT_BINARY)(folder)
    (folder / MODELS).write_bytes((folder / MODELS).read_bytes()[:-20])


def many_texts(path):
    return write(path, plistlib.dumps({f"key {i}": "x" for i in range(140000)}))


def both(*breakers):
    return lambda folder: [breaker(folder) for breaker in breakers]


def rename_model(new, old=MODEL):
    return both(rename(DESCRIPTION, old, new, "ContainedModel"), rename(MODELS, old, new, "Model"))


def packages(**keys):
    return put(COMMON, "PkgInfo", {"PkgLocation": "Packages"} |
               {key.removeprefix("v"): Path(PACKAGE).name for key in keys})


def maximum(major, minor, bug_fix):
    return put(COMMON, "SystemMax", {"Major": major, "Minor": minor, "BugFix": bug_fix})


# Each row has a breaker, the identifier of the only finding that it causes, and parts of the text
# that words() returns for that finding.
MISTAKES = [
    # Property lists.
    (rename(COMMON, "ModelInfo", "ModellInfo"), "key-misspelt", "ModelInfo", "opens at once"),
    (rename(COMMON, "BonjourNetwork", "BonjorNetwork"), "key-misspelt", "BonjourNetwork"),
    (put(COMMON, "CDInfo", "MacResources/cdinfo.plist"), "path-capitals", "CDInfo.plist"),
    (put(COMMON, "CDInfo", "MacResources/none.plist"), "path-missing", "none.plist"),
    (put(COMMON, "CDInfo", "../CDInfo.plist"), "path-outside", "outside the medium"),
    (put(COMMON, "CDInfo", __file__), "path-outside", "from the medium's top"),
    (put(COMMON, "Comment", "x"), "key-unknown", "does not read"),
    (rename(COMMON, "SystemMin", "MinSystem"), "key-misspelt", "SystemMin"),
    (replace(COMMON, ">Kestrel Imaging<", ">Kestrel & Imaging<"), "list-unreadable", "&amp;"),
    (take(COMMON, "PkgInfo"), "key-missing", "PkgInfo", "nothing opens"),
    (put(COMMON, "SystemMin", "10.6"), "value-kind", 'the string "10.6"', "a dictionary"),
    (rename(DESCRIPTION, "PKG_WebLink", "PKG_WebLnk", "InstallPKG"), "key-misspelt", "PKG_WebLink"),
    (put(MODELS, "Model", MODEL, "Interfaces", "USB", "NO"), "value-kind", '"NO"', "<false/>"),
    (put(MODELS, "Model", MODEL, "x"), "value-kind", "a dictionary", "USB only"),
    (cut_binary, "list-unreadable", "trailer", "opens at once"),
    (replace(MODELS, "</dict>", "</array>"), "list-unreadable", '"</dict>" is expected'),
    (replace(MODELS, "<true/>", "<treu/>"), "list-unreadable", "<treu>", "line 12"),
    (replace(MODELS, "<true/>", ""), "list-unreadable", "no value follows"),
    (write(MODELS, b""), "list-unreadable", "empty"),
    (write(MODELS, plistlib.dumps(["x"])), "list-unreadable", "a dictionary"),
    (many_texts(MODELS), "list-unreadable", "more than 262144 elements"),
    (write(MODELS, b"<plist>" + b" " * (16 << 20)), "list-unreadable", "at most 16777216 bytes"),
    (put(f"{APPLICATION}/Info.plist", "CommonResourcePath", 5), "value-kind", "a path"),
    (remove("Onramp OSX.app"), "application-missing", "double-click"),
    (remove(f"{APPLICATION}/MacOS/Onramp OSX"), "program-missing", "does not start"),
    (replace(MODELS, f"<key>{MODEL}</key>", f"<key>{MODEL}</key><dict><key>KSCID</key><string>x</string></dict>"
             f"<key>{MODEL}</key>"), "key-twice", "every key once"),
    # The models.
    (rename(DESCRIPTION, MODEL, "Kestrel Model 10 0", "ContainedModel"), "model-undescribed", MODEL),
    (take(MODELS, "Model", MODEL), "model-undescribed", "does not have", "USB only"),
    (take(DESCRIPTION, "ContainedModel", MODEL), "model-unoffered", "cannot be chosen"),
    (take(MODELS, "Model", MODEL, "KSCID"), "key-missing", "KSCID", "no connection at all"),
    (take(MODELS, "Model", MODEL, "Interfaces"), "key-missing", "Interfaces", "USB only"),
    (lambda folder: write(MODELS, plistlib.dumps(plistlib.loads((folder / MODELS).read_bytes())["Model"]))(folder),
     "model-key-missing", 'under "Model"'),
    (put(MODELS, "Model", MODEL, "Interfaces", dict.fromkeys(("USB", "WiredLAN", "WirelessLAN"), False)),
     "model-unconnected", "as for a model with USB only"),
    (rename_model("Kestrel100"), "model-unannounceable", "without a space"),
    (rename_model(MODEL + " "), "model-blanks", "some devices do"),
    (rename_model("kestrel Model 100"), "maker-capitals", "usb_MFG"),
    (rename_model(MODEL.capitalize(), "Kestrel Model 105"), "model-twice", "capital letters"),
    (both(put(DESCRIPTION, "ContainedModel", {}), put(MODELS, "Model", {}),
          take(COMMON, "BonjourNetwork"), take(COMMON, "WLANtool")), "models-none", "at once"),
    # Systems and packages.
    (packages(v109=1), "package-none", "systems: 10.6.0 up to, but not including, 10.9.0"),
    (put(COMMON, "PkgInfo", {"PkgLocation": "", "PkgName": ""}), "package-unnamed", "an empty name"),
    (both(remove(PACKAGE), write(PACKAGE, b"")), "package-empty", "nothing can be installed"),
    (put(COMMON, "PkgInfo", "PkgName", PACKAGE), "path-missing", f'"Packages/{PACKAGE}"', f'has "{PACKAGE}"'),
    (both(packages(v106=1, v107=1, v108=1, v109=1), put(COMMON, "PkgInfo", "108", Path(PACKAGE).stem + "2.pkg")),
     "path-missing", "put it at that path, or correct the path"),
    (put(COMMON, "PkgInfo", "PkgName", Path(PACKAGE).stem), "path-missing", f'write "{Path(PACKAGE).name}"'),
    (put(COMMON, "PkgInfo", "PkgLocation", "Pakete"), "path-missing", "PkgLocation", "the packages' folder"),
    (put(COMMON, "PkgInfo", "109", "Old.pkg"), "package-shadowed", '"109"', "every system gets"),
    (put(COMMON, "PkgInfo", "110", "New.pkg"), "package-key-unknown", "no system uses"),
    (packages(v105=1, v106=1, v107=1, v108=1, v109=1), "package-key-unused", "outside"),
    (maximum("10", "15", "7"), "range-excludes-maximum", "10.15.7 itself is refused",
     "10.6.0 up to, but not including, 10.15.7"),
    (maximum("10", "5", "x"), "range-empty", "every system is refused"),
    (maximum(14, 0, "x"), "range-stops-at-minor", "14.1 is refused", "write 15, 0, 0"),
    (maximum("14", "x", "x"), "version-number", "write 15, 0, 0"),
    (maximum("10", "16", "last"), "version-number", '"last"', '"x"'),
    (maximum("10", "14", "x"), "range-before-application", "10.15 and later"),
    # The set-up tool.
    (remove(PROGRAM_OF_TOOL), "program-missing", "Contents/MacOS/Kestrel Wireless Setup"),
    (lambda folder: os.chmod(folder / PROGRAM_OF_TOOL, 0o644), "program-not-executable", "chmod"),
    (write(PROGRAM_OF_TOOL, b"#!/bin/sh\r\n"), "program-line-ends", "carriage return"),
    (take(f"{TOOL}/Info.plist", "CFBundleExecutable"), "program-unnamed", "CFBundleExecutable"),
    (take(f"{TOOL}/Info.plist", "CFBundleDisplayName"), "tool-unnamed", "menu"),
    (replace(f"{TOOL}/Resources/ja.lproj/InfoPlist.strings", "Kestrel", "Lumora"),
     "tool-name-left-over", "Lumora", "without \"Kestrel\""),
    (replace(f"{TOOL}/Resources/ja.lproj/InfoPlist.strings", "CFBundleDisplayName", "CFBundleName"),
     "tool-name-untranslated", "Kestrel Wireless Setup"),
    (remove(f"{TOOL}/Resources/ko.lproj"), "language-not-in-tool", "de, en, ja, zh_CN"),
    (take(COMMON, "WLANtool"), "tool-none", "no set-up tool runs"),
    (put(COMMON, "WLANtool", COMMON), "tool-no-bundle", ".app"),
    # Texts.
    (replace(ENGLISH, '"INST_TXT_WIFI" = "Wireless Network (Wi-Fi)";\n', ""),
     "text-missing", "INST_TXT_WIFI", "de, ja, ko, zh_CN"),
    (lambda folder: shutil.copy(folder / ENGLISH, folder / ENGLISH.replace("en.", "ja.")),
     "texts-copied", '31 texts that are the same in "en"', "translate"),
    (replace(ENGLISH, "INST_TXT_WIFI", "INST_TXT_WFI"), "text-misspelt", "INST_TXT_WIFI", "line "),
    (replace(ENGLISH, "macOS %@", "%@ %@ %@"), "text-placeholders", "3 times", "once or twice"),
    (replace(ENGLISH, "Wireless Network", "Wireless Network, " * 5), "text-wide", "450 points"),
    (replace(ENGLISH, '"Next";', '"";'), "text-empty", "button"),
    (replace(ENGLISH, '"Next";', '"Next"'), "strings-unreadable", '";" expected', "line 9"),
    (replace(ENGLISH, '"Next"', "“Next”"), "strings-unreadable", "straight quotation marks"),
    (replace(ENGLISH, '"Next"', '"Go „on" now"'), "strings-unreadable", "inside a text as \\\""),
    (take(f"{MESSAGES}/Info.plist", "CFBundleDevelopmentRegion"), "region-missing", "usually English"),
    (both(take(f"{MESSAGES}/Info.plist", "CFBundleDevelopmentRegion"), remove(ENGLISH.rsplit("/", 1)[0])),
     "region-missing", 'keys such as "INST_TXT_MODEL"'),
    (put(f"{MESSAGES}/Info.plist", "CFBundleDevelopmentRegion", "fr"), "region-without-texts",
     "de, en, ja, ko, zh_CN"),
    (remove(f"{APPLICATION}/Resources/ko.lproj"), "language-not-in-application", "ko.lproj"),
    (remove("MacResources/CDCommonMessage.bundle"), "path-missing", "INST_TXT_MODEL"),
    (replace(ENGLISH, '"BTN_NEXT"', '"OTHER" = "x";\n"BTN_NEXT"'), "text-unknown", "not show"),
    (lambda folder: (folder / MESSAGES / "Resources/de_old.lproj").mkdir(), "language-unknown", "nobody sees"),
    (lambda folder: (folder / MESSAGES / "Resources/de.lproj").rename(folder / MESSAGES / "Resources/de.lprj"),
     "language-folder", "de.lproj"),
    (lambda folder: (folder / MESSAGES / "Resources/jp.lproj").mkdir(), "language-unknown", "ja.lproj"),
    # Pictures.
    (remove(PICTURE), "path-missing", "no picture beside USB"),
    (remove(f"{APPLICATION}/Resources/Background@2x.png"), "picture-not-dense", "blurred"),
    (lambda folder: shutil.copy(ROOT / "resources/Background.png", folder / PICTURE),
     "picture-size", "680 × 480", "192 × 192"),
    (lambda folder: os.truncate(folder / PICTURE, 900), "picture-unreadable", "not an intact PNG"),
    # Names on the network and in files.
    (put(COMMON, "BonjourNetwork", "_pdl-datastream._tcp"), "service-dot", "_pdl-datastream._tcp.", "add the dot"),
    (put(COMMON, "BonjourNetwork", "pdl-datastream.tcp."), "service-malformed", "15 letters"),
    (put(COMMON, "BonjourNetwork", "_http._tcp."), "service-unknown", "cannot read a maker or model"),
    (take(COMMON, "BonjourNetwork"), "service-none", 'no "BonjourNetwork"'),
    (put(COMMON, "BonjourNetwork", ""), "service-none", "an empty service type", "BonjourNetwork"),
    (put(f"{APPLICATION}/Info.plist", "NSBonjourServices", ["_ipp._tcp"]), "service-undeclared", "_pdl-"),
    (put(COMMON, "VenderName", "Kestrel/Imaging"), "vendor-folder", "the name of a folder"),
    (put(COMMON, "VenderName", "Kestrel " * 40), "vendor-long", "at most", "shorten"),
    (put(COMMON, "VenderName", "Kestrél"), "vendor-letters", "outside ASCII"),
    (put(COMMON, "VenderName", " "), "vendor-empty", "an empty name"),
    (put(DESCRIPTION, "KSCSeriesCode", "K S"), "series-address", "opens nothing"),
]


def name_tool(text, *languages):
    return lambda folder: [(folder / TOOL / f"Resources/{language}.lproj/InfoPlist.strings").write_text(text)
                           for language in languages]


def norwegian(folder):
    for resources, name in ((f"{MESSAGES}/Resources", "nb"), (f"{APPLICATION}/Resources", "no"),
                            (f"{TOOL}/Resources", "no")):
        (folder / resources / "ko.lproj").rename(folder / resources / f"{name}.lproj")


# Breakers that make the medium unusual but leave it correct.
HARMLESS = [
    norwegian,
    both(*(remove(f"{TOOL}/Resources/{language}.lproj") for language in ("de", "ja", "ko", "zh_CN"))),
    name_tool('NSHumanReadableCopyright = "Kestrel";', "en"),
    name_tool("/* no name */", "de", "en", "ja", "ko", "zh_CN"),
    write(f"{MESSAGES}/Resources/._de.lproj", b""),
    both(*((lambda folder, name=name: shutil.copytree(folder / name / "de.lproj", folder / name / "de-1996.lproj"))
           for name in (f"{MESSAGES}/Resources", f"{APPLICATION}/Resources", f"{TOOL}/Resources"))),
    both(maximum("14", "0", "x"), put(COMMON, "SystemMin", {"Major": "14", "Minor": "0", "BugFix": "0"})),
]


def words(finding):
    line = f'line {finding["line"]}' if "line" in finding else ""
    return " ".join([*(str(finding.get(part, "")) for part in (
        "found", "expected", "nearest", "effect", "remedy")), *finding["key"], line])


class OnrampCheck(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.medium = Path(folder.name) / "medium"
        make_medium(self.medium)

    def broken(self, breaker):
        copy = self.medium.parent / "copy"
        shutil.rmtree(copy, ignore_errors=True)
        shutil.copytree(self.medium, copy)
        breaker(copy)
        return str(copy)

    def test_finds_nothing_on_the_example_medium_and_says_what_users_will_see(self):
        result = run("--strict", str(self.medium))
        self.assertEqual((0, ""), (result.returncode, result.stderr), result.stdout)
        for line in ("  Kestrel Model 320   ---  wired  wireless", "Starts with: the model list",
                     "Application: Onramp OSX.app, identifier com.kestrelimaging.onramp, for macOS only",
                     f": {PACKAGE}", "Languages: " + " ".join(
                         f"{language} (31 texts)" for language in "de en ja ko zh_CN".split()),
                     "0 errors, 0 warnings, 17 models"):
            self.assertIn(line, result.stdout)

    def test_reports_each_mistake_once_and_nothing_else(self):
        for breaker, identifier, *parts in MISTAKES:
            with self.subTest(identifier, parts=parts):
                result = run("--json", "--strict", self.broken(breaker))
                findings = json.loads(result.stdout)["findings"]
                self.assertEqual([identifier], [finding["id"] for finding in findings], findings)
                for part in parts:
                    self.assertIn(part, words(findings[0]))
                self.assertTrue(findings[0]["effect"] and findings[0]["remedy"], findings)
                self.assertEqual(1, result.returncode)

    def test_reports_nothing_about_unusual_but_correct_media(self):
        for breaker in HARMLESS:
            result = run("--json", self.broken(breaker))
            self.assertEqual([], json.loads(result.stdout)["findings"])

    def test_every_rule_is_among_the_mistakes(self):
        sources = "".join(path.read_text() for path in (ROOT / "tools/check").glob("*.cpp"))
        rules = set(re.findall(r'\bid = (?:\w+ \? )?"([a-z-]+)"', sources))
        rules |= set(re.findall(r'\? "([a-z]+-[a-z]+)" : "[a-z]+-[a-z]+"', sources))
        self.assertGreater(len(rules), 40)
        self.assertEqual(set(), rules - {identifier for _, identifier, *_ in MISTAKES})

    def test_a_line_has_the_place_the_cause_and_the_effect(self):
        result = run(self.broken(replace(ENGLISH, '"Next";', '"Next"')))
        self.assertEqual(1, result.returncode)
        self.assertRegex(result.stdout, f'^{ENGLISH}:9: error: ";" expected.* Effect: ')

    def test_warnings_change_the_exit_status_only_with_the_option_strict(self):
        medium = self.broken(put(COMMON, "Comment", "x"))
        self.assertEqual([0, 1], [run(medium).returncode, run("--strict", medium).returncode])

    def test_bad_arguments_fail_with_a_message(self):
        for arguments in (["/nowhere"], [], ["--jsn", "."], ["--keys", "."], [__file__],
                          [str(self.medium.parent)], [str(self.medium / "MacResources/Images")], [str(self.medium / "Onramp OSX.app")]):
            result = run(*arguments)
            self.assertEqual((2, ""), (result.returncode, result.stdout))
            self.assertTrue(result.stderr)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
