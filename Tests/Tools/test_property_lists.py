# SPDX-License-Identifier: Apache-2.0
"""What the daemon says in property lists, as it may come: padded, and with numbers that are no cell's."""

import json
import plistlib

from support import KelvasictlTest, pcap, record

CELL_LIST = 1
SIM_FILES = 0
FROM_DAEMON = 0xFF
KEY = "kTelvonCellMonitor"

DOCUMENT_WITH_AN_EMPTY_KEY = b"<plist><dict><key/><string>x</string><key>ICCID</key><data>mEk=</data></dict></plist>"


def cell_list(**numbers):
    cell = {KEY + "CellRadioAccessTechnology": KEY + "RadioAccessTechnologyGSM",
            KEY + "CellType": KEY + "CellTypeServing"}
    return [cell | {KEY + key: number for key, number in numbers.items()}]


class PropertyLists(KelvasictlTest):
    def shown(self, code, payload):
        capture = self.write("a.pcap", pcap(record(code, payload, FROM_DAEMON)))
        result = self.decode(capture, "--log-stderr")
        self.assertEqual(result.returncode, 0, result.stderr)
        return json.loads(result.stdout), result.stderr.decode()

    def test_a_number_past_63_bits_is_no_cells_number(self):
        for form in (plistlib.FMT_XML, plistlib.FMT_BINARY):
            for number in (2**63, 2**64 - 1):
                payload = plistlib.dumps(cell_list(MCC=number, MNC=3, LAC=number), fmt=form)
                display, log = self.shown(CELL_LIST, payload)
                rows = display["Serving PLMN"]
                self.assertEqual(rows.get("Mobile Network Code"), "3")
                self.assertNotIn("Mobile Country Code", rows)
                self.assertNotIn("Location Area Code", rows)
                self.assertIn("<3>ServingPLMN: Failed to retrieve MCC\n", log)
                self.assertIn("<3>ServingPLMN: Failed to retrieve LAC\n", log)

    def test_padding_behind_a_property_list_changes_nothing(self):
        for form in (plistlib.FMT_XML, plistlib.FMT_BINARY):
            for code, payload in ((CELL_LIST, cell_list(MCC=262)), (SIM_FILES, {"ICCID": b"\x98\x49"})):
                payload = plistlib.dumps(payload, fmt=form)
                display, log = self.shown(code, payload)
                self.assertNotIn("could not be constructed", log)
                for padding in (b"\0", b"\0\0\0", b" ", b"\n", b"\r\n \0\n\0"):
                    self.assertEqual(self.shown(code, payload + padding)[0], display, (form, padding))

    def test_a_key_may_be_an_empty_tag(self):
        self.assertNotIn("could not be constructed", self.shown(SIM_FILES, DOCUMENT_WITH_AN_EMPTY_KEY)[1])
