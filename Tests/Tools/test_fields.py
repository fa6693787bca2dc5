# SPDX-License-Identifier: Apache-2.0
"""kelvasictl fields: every row that a record can write, with what stands behind it."""

import json
import subprocess
import unittest

from live_support import DAEMON
from support import CAPTURES, TEMPLATES, KelvasictlTest

ROOT = CAPTURES.parent.parent
TECHNOLOGIES = ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2")
KEYS = ["technology", "section", "list", "row", "code", "key", "of", "byte", "bit", "width", "signed", "digits",
        "quantity", "unit", "states", "reason"]
# What property lists of the telephony daemon hold under names of their own, and what is no row.
PLAIN = {"text", "integer", "real", "boolean", "data", "date", "list", "group", None}


class FieldsTest(KelvasictlTest):
    def fields(self, *arguments):
        result = self.run_program("fields", *arguments)
        self.assertEqual(result.returncode, 0, result.stderr)
        return json.loads(result.stdout)

    def rows(self, *arguments):
        return self.fields(*arguments)["rows"]

    def row(self, technology, section, row, code):
        found = [each for each in self.rows("--technology", technology)
                 if (each["section"], each["row"], each["code"]) == (section, row, code)]
        self.assertEqual(len(found), 1)
        return found[0]


class Catalog(FieldsTest):
    def test_a_field_with_its_bits(self):
        self.assertEqual(self.row("Orvane_LTE", "Serving Cell Measurements", "Average RSRP", "0xB17F"), dict(zip(KEYS, [
            "Orvane_LTE", "Serving Cell Measurements", None, "Average RSRP", "0xB17F", None, None, 22, 1, 9, False,
            None, "rsrp", "dBm", [], None])))

    def test_a_state_with_its_names(self):
        state = self.row("Orvane_GSM", "UMTS RR Info", "RRC State", "0x4125")
        self.assertEqual(state["quantity"], "rrc_state")
        self.assertEqual([(each["value"], each["text"]) for each in state["states"]],
                         list(enumerate(["Disconnected", "Connecting", "CELL_FACH", "CELL_DCH", "CELL_PCH", "URA_PCH"])))

    def test_entries_of_a_list_inside_a_section(self):
        row = self.row("Orvane_GSM", "BLER", "CRC Received", "0x4116")
        self.assertEqual((row["list"], row["of"], row["byte"], row["width"]), ("Transport Channels", "entry", 1, 32))

    def test_digits_one_by_one(self):
        row = self.row("Orvane_GSM", "Serving PLMN", "Mobile Country Code", "0x7135")
        self.assertEqual((row["byte"], row["width"], row["digits"]), (15, 4, 3))

    def test_what_the_daemon_tells_by_a_key(self):
        row = self.row("Orvane_LTE", "Serving Cell Info", "Tracking Area Code", "0xFF0001")
        self.assertEqual((row["key"], row["byte"], row["quantity"]), ("kTelvonCellMonitorTAC", None, "tac"))

    def test_every_row_has_every_key_and_no_two_are_the_same(self):
        rows = self.rows()
        self.assertEqual({each["technology"] for each in rows}, set(TECHNOLOGIES))
        for each in rows:
            self.assertEqual(list(each), KEYS)
        self.assertEqual(len({json.dumps(each) for each in rows}), len(rows))

    def test_every_quantity_of_a_row_is_described(self):
        fields = self.fields()
        units = {each["id"]: each["unit"] for each in fields["quantities"]}
        for each in fields["rows"]:
            self.assertEqual(units[each["quantity"]], each["unit"])

    def test_what_has_no_quantity_says_why(self):
        for each in self.rows():
            self.assertEqual(each["quantity"] == "none", each["reason"] is not None, each)

    def test_the_page_is_current(self):
        page = self.run_program("fields", "--format", "markdown").stdout.decode()
        self.assertEqual((ROOT / "Docs" / "fields.md").read_text(), page,
                         "kelvasictl fields --format markdown >Docs/fields.md makes it anew")

    def test_wrong_usage(self):
        self.assert_fault(self.run_program("fields", "--format", "xml"), "--format", status=2)
        self.assert_fault(self.run_program("fields", "--technology", "5G"), 'there is no technology "5G"', status=2)


class Emitted(FieldsTest):
    """Whatever a record writes is in the catalog, with its code and quantity."""

    def check(self, technology, capture, resources):
        # What an aborted decoder has printed before counts too.
        result = self.run_program("readings", "--technology", technology, "--resources", resources, capture)
        known = {(row["section"], name, row["code"], row["quantity"])
                 for row in self.rows("--technology", technology, "--resources", resources)
                 for name in (row["row"], row["list"])}
        lines = [json.loads(line) for line in result.stdout.splitlines()]
        for line in lines:
            if line["quantity"] not in PLAIN:
                section = None if technology == "IFX" else line["section"]
                self.assertTrue((section, line["row"], line["code"], line["quantity"]) in known, line)
        return lines

    def test_by_the_captures(self):
        empty = self.path("empty")
        subprocess.run(["mkdir", empty], check=True)
        for technology in TECHNOLOGIES:
            for capture in sorted((CAPTURES / technology).rglob("*.pcap")):
                with self.subTest(capture=capture.name, technology=technology):
                    self.check(technology, capture, empty if capture.parent.name == "no-templates" else TEMPLATES)

    def test_by_the_drives(self):
        for technology in TECHNOLOGIES:
            with self.subTest(technology):
                path = self.path(technology + ".pcap")
                subprocess.run([DAEMON, "--technology", technology, "--write", path, "--messages", "3000"], check=True,
                               capture_output=True, env=self.environment, timeout=60)
                self.assertGreater(len(self.check(technology, path, ROOT / "Resources")), 3000)


if __name__ == "__main__":
    unittest.main()
