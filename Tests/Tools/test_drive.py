# SPDX-License-Identifier: Apache-2.0
"""The usual scenario of a technology, from the simulated daemon to the display of its own template."""

import json
import unittest

from live_support import LiveTest
from support import CAPTURES

RESOURCES = CAPTURES.parent.parent / "Resources"
HINT = "_sorted"

# Their decoder builds its rows and shows none.
NEVER_FILLED = {"GSM Neighbor Cell List"}


def sections(display):
    """The sections of a display by name, beneath the groups of its template."""
    return {name: rows for group, members in display.items() if group != HINT for name, rows in members.items()}


class Drive(LiveTest):
    def displays(self, technology):
        self.start_daemon("--seed", "7", "--speed", "30", technology=technology)
        monitor = self.start_live("monitor", "--format", "json", resources=RESOURCES)
        for line in monitor.stdout:
            yield sections(json.loads(line)["display"])
        self.fail("the monitor ended: " + monitor.stderr.read().decode())

    def see_every_section(self, technology, look):
        """Watches until each section has had rows, and looks at each display."""
        missing = None
        for count, display in enumerate(self.displays(technology), 1):
            missing = (set(display) if missing is None else missing) - {name for name in display if display[name]}
            look(display)
            if missing <= NEVER_FILLED:
                return display
            self.assertLess(count, 30, f"still empty: {missing}")
        return None

    def test_lte_fills_every_section(self):
        def look(display):
            measured = display["Serving Cell Measurements"]
            if measured:
                rsrp, unit = measured["Measured RSRP"].split()
                self.assertEqual(unit, "dBm")
                self.assertTrue(-140 <= float(rsrp) <= -44, rsrp)
                self.assertIn(int(measured["E-ARFCN"]), (3350, 1575, 6300, 3100, 1850, 6400))
                codes = [cell["Physical Cell ID"] for cell in display["Neighbor Cells List"]]
                if measured["E-ARFCN"] == display["Neighbor Measurements"]["E-ARFCN"]:
                    self.assertNotIn(measured["Physical Cell ID"], codes)

        display = self.see_every_section("Orvane_LTE", look)
        self.assertIn(display["Serving Cell Info"]["Freq Band Indicator"], ("7", "3", "20"))
        self.assertEqual(display["SIM Info"]["EF-RAT MODE"], "GSM, UMTS and LTE")

    def test_utran_fills_every_section_but_the_one_that_stays_empty(self):
        def look(display):
            self.assertNotEqual(display["RRC Info"].get("State"), "Unknown RRC Mode")
            self.assertEqual(display["GSM Neighbor Cell List"], [])

        display = self.see_every_section("Orvane_UTRAN2", look)
        self.assertIn(display["Serving Cell Info"]["Downlink UARFCN"], ("10055", "10063", "10071", "10079", "10087", "10095"))


if __name__ == "__main__":
    unittest.main()
