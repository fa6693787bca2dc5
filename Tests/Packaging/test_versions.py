# SPDX-License-Identifier: Apache-2.0
"""One version: that of CMake's project()."""

import os
import re
import unittest
import xml.etree.ElementTree as xml

from packaging_support import PROGRAMS, SOURCES, run

VERSION = os.environ["VERSION"]


class Versions(unittest.TestCase):
    def test_programs_say_it(self):
        for program in PROGRAMS.values():
            self.assertEqual(run(program, "--version").stdout, VERSION + "\n")

    def test_it_is_the_newest_in_the_changes(self):
        text = (SOURCES / "CHANGELOG.md").read_text()
        self.assertEqual(re.findall(r"^## (\d+\.\d+\.\d+), \d{4}-\d\d-\d\d$", text, re.MULTILINE)[0], VERSION)

    def test_it_is_the_newest_of_the_package(self):
        self.assertEqual(re.match(r"kelvasi \(([\d.]+)-\d", (SOURCES / "debian/changelog").read_text())[1], VERSION)

    def test_it_is_the_newest_in_the_metadata(self):
        root = xml.parse(SOURCES / "Resources/org.kelvasi.Kelvasi.metainfo.xml").getroot()
        self.assertEqual(root.find("releases/release").get("version"), VERSION)


if __name__ == "__main__":
    unittest.main()
