# SPDX-License-Identifier: Apache-2.0
"""What a desktop reads: entries, icons, metadata, file types, the bus."""

import configparser
import os
import pathlib
import shlex
import tempfile
import unittest
import xml.etree.ElementTree as xml

from packaging_support import SOURCES, InstalledTest, needs, run
from support import MM_IDLE, pcap

NAME = "org.kelvasi.Kelvasi"


def entry(path):
    parser = configparser.ConfigParser(interpolation=None)
    parser.optionxform = str
    parser.read(path)
    return parser["Desktop Entry"]


class Entries(InstalledTest):
    @needs("desktop-file-validate")
    def test_the_entries_are_valid(self):
        entries = sorted((self.prefix / "share/applications").iterdir())
        self.assertEqual(len(entries), 2)
        for path in entries:
            self.assertEqual(self.passes("desktop-file-validate", path), "")

    def test_the_viewer_is_one_for_phones_too(self):
        self.assertIn("Mobile", entry(self.prefix / f"share/applications/{NAME}.desktop")["X-Purism-FormFactor"])

    @needs("less")
    def test_the_reader_shows_what_a_capture_ends_with(self):
        with tempfile.TemporaryDirectory() as directory:
            capture = pathlib.Path(directory, "a drive.pcap")
            capture.write_bytes(pcap(MM_IDLE))
            command = entry(self.prefix / "share/applications/org.kelvasi.Decode.desktop")["Exec"].split()
            result = run(*(capture if word == "%F" else word for word in command))
        self.assertIn("MM State\tMM_IDLE", result.stdout, result.stderr)


class Metadata(InstalledTest):
    def setUp(self):
        self.path = self.prefix / f"share/metainfo/{NAME}.metainfo.xml"

    @needs("appstreamcli")
    def test_appstream_takes_it_strictly(self):
        self.passes("appstreamcli", "validate", "--strict", "--no-net", self.path)

    def test_its_pictures_are_those_of_the_documents(self):
        for image in xml.parse(self.path).iter("image"):
            picture = SOURCES / "Docs/screenshots" / image.text.rsplit("/", 1)[1]
            header = picture.read_bytes()[16:24]
            size = int.from_bytes(header[:4], "big"), int.from_bytes(header[4:], "big")
            self.assertEqual((int(image.get("width")), int(image.get("height"))), size)

    def test_its_icons_are_there_and_sound(self):
        for name in (f"scalable/apps/{NAME}.svg", f"symbolic/apps/{NAME}-symbolic.svg"):
            root = xml.parse(self.prefix / "share/icons/hicolor" / name).getroot()
            self.assertEqual(root.tag, "{http://www.w3.org/2000/svg}svg")


class FileTypes(InstalledTest):
    @needs("update-mime-database")
    def test_names_and_beginnings_tell_them(self):
        said = self.passes("update-mime-database", "-V", self.prefix / "share/mime")
        self.assertNotIn("Error", said)
        globs = (self.prefix / "share/mime/globs2").read_text()
        self.assertIn(":application/x-kelvasi-snapshot:*.kelvasi\n", globs)
        self.assertIn(":application/x-dlf:*.dlf\n", globs)
        # length 161 and code 0x1FFD, little-endian
        self.assertIn(b"\xa1\x00\xfd\x1f", (self.prefix / "share/mime/magic").read_bytes())


class OnTheBus(InstalledTest):
    ACTIVATE = [NAME, "/org/kelvasi/Kelvasi", "org.freedesktop.Application", "Activate", "a{sv}", "0"]
    WHOSE = ["org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus", "GetConnectionUnixProcessID", "s", NAME]

    @needs("dbus-run-session")
    @needs("busctl")
    def test_a_desktop_starts_the_viewer_once_and_brings_it_to_the_front(self):
        call, whose = ("busctl --user call " + shlex.join(what) for what in (self.ACTIVATE, self.WHOSE))
        with tempfile.TemporaryDirectory() as home:
            environment = os.environ | {"XDG_DATA_DIRS": f"{self.prefix}/share", "QT_QPA_PLATFORM": "offscreen",
                                        "HOME": home, "XDG_RUNTIME_DIR": home, "XDG_CONFIG_HOME": home}
            script = f"{call} && first=$({whose}) && {call} && [ \"$first\" = \"$({whose})\" ]; status=$?\n" \
                     "kill ${first#u }; exit $status"
            result = run("dbus-run-session", "--", "sh", "-c", script, env=environment)
        self.assertEqual(result.returncode, 0, result.stderr)


class Flatpak(unittest.TestCase):
    MANIFEST = SOURCES / "packaging/flatpak" / f"{NAME}.yml"

    @needs("flatpak-builder")
    def test_flatpak_builder_takes_the_manifest(self):
        with tempfile.TemporaryDirectory() as folder:  # it leaves its cache where it is started
            shown = run("flatpak-builder", "--show-manifest", self.MANIFEST, cwd=folder)
        self.assertEqual(shown.returncode, 0, shown.stderr)
        self.assertIn(f'"id" : "{NAME}"', shown.stdout)


if __name__ == "__main__":
    unittest.main()
