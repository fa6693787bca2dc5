# SPDX-License-Identifier: Apache-2.0
"""The viewer by AT-SPI, as a screen reader goes through it: on a bus and a compositor of the test's own."""

import json
import os
import subprocess
import unittest

from live_support import PATIENCE
from viewer_support import ViewerTest

READER = os.path.join(os.path.dirname(os.path.abspath(__file__)), "reader.py")
PYTHON = "/usr/bin/python3"  # the one that has the distribution's libraries
LISTENING = 9  # seconds


class Reader(ViewerTest):
    def setUp(self):
        super().setUp()
        del self.environment["QT_QPA_PLATFORM"]
        bus = self.start(["dbus-daemon", "--session", "--nofork", "--nopidfile", "--print-address"],
                         stderr=subprocess.DEVNULL)
        self.environment |= {
            "ASAN_OPTIONS": os.environ.get("ASAN_OPTIONS", "") + ":detect_leaks=0",
            "DBUS_SESSION_BUS_ADDRESS": bus.stdout.readline().decode().strip(),
            "GSETTINGS_BACKEND": "memory",
            "QT_LINUX_ACCESSIBILITY_ALWAYS_ON": "1",
            "WAYLAND_DISPLAY": "screen",
        }
        compositor = self.start(
            ["weston", "--backend=headless-backend.so", "--socket=screen", "--idle-time=0", "--no-config",
             "--width=1400", "--height=1400"],
            stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        self.wait_until(lambda: os.path.exists(self.path("screen")) or compositor.poll() is not None)
        self.assertIsNone(compositor.poll())
        self.start_daemon("--seed", "1", "--start-at", "60", technology="Orvane_LTE")

    def start_sized(self, width=390, height=1300):
        self.write("window.ini", f"[Window]\nSize=@Size({width} {height})\n".encode())
        viewer = self.start_viewer("--memory", self.path("window.ini"))
        viewer.await_updated()
        viewer.await_state(lambda state: any("value" in level
                                             for level in state["cockpit"]["serving"].get("levels", [])))
        return viewer

    def read_aloud(self, *arguments):
        result = subprocess.run([PYTHON, "-B", READER, *arguments], env=self.environment, capture_output=True,
                                timeout=PATIENCE)
        self.assertEqual(result.returncode, 0, result.stderr.decode())
        return [json.loads(line) for line in result.stdout.splitlines()]

    def test_every_row_of_a_pane_is_met_with_its_value(self):
        viewer = self.start_sized()
        viewer.do("open Serving Cell Measurements")
        met = self.read_aloud("walk")
        state = viewer.state()
        self.assertIn(("list", state["title"]), [(each["role"], each["name"]) for each in met])
        rows = {each["name"]: each["value"] for each in met if each["role"] == "list item"}
        self.assertEqual([name for name, _ in state["rows"]], list(rows))
        self.assertRegex(rows["Measured RSRP"], r"^-\d+\.\d\d dBm$")

    def test_values_of_a_pane_are_heard_to_change(self):
        viewer = self.start_sized()
        viewer.do("open Serving Cell Measurements")
        self.assertEqual(viewer.state()["title"], "Serving Cell Measurements")
        first, *heard = self.read_aloud("listen", str(LISTENING))
        self.assertEqual(first, "listening")
        rows = [each for each in heard if each["role"] == "list item"]
        self.assertGreaterEqual(len([each for each in rows if each["name"] == "Measured RSRP"]), 2, heard)

    def test_the_cockpit_is_a_list_of_names_and_values(self):
        viewer = self.start_sized()
        viewer.do("press O", "press Down")
        met = self.read_aloud("walk")
        lines = {each["name"]: each for each in met if each["role"] == "list item"}
        self.assertRegex(lines["RSRP"]["value"], "^\N{MINUS SIGN}\\d+ dBm, (excellent|good|fair|poor|very poor)")
        self.assertIn("selected", lines["RSRP"]["states"])
        self.assertEqual(lines["SINR"]["value"], "not reported")
        neighbours = [each for each in lines.values() if each["name"].startswith("PCI ")]
        self.assertTrue(neighbours)
        for each in neighbours:
            self.assertRegex(each["value"], "^\N{MINUS SIGN}\\d+ dBm")
        heard = self.read_aloud("listen", str(LISTENING))[1:]
        self.assertIn("RSRP", [each["name"] for each in heard])

    def test_the_save_view_is_a_modal_dialog(self):
        viewer = self.start_sized()
        viewer.do("press Ctrl+S")
        viewer.state()
        dialogs = [each for each in self.read_aloud("walk") if "modal" in each["states"]]
        self.assertEqual([each["role"] for each in dialogs], ["dialog"])


if __name__ == "__main__":
    unittest.main()
