# SPDX-License-Identifier: Apache-2.0
"""Alarms in the window and on the desktop, which is a double on a session bus of the test's own."""

import json
import os
import select
import unittest

from live_support import PATIENCE
from viewer_support import ViewerTest

DESKTOP = os.path.join(os.path.dirname(os.path.abspath(__file__)), "desktop_double.py")
PYTHON = "/usr/bin/python3"  # the one that has the distribution's libraries
RULE = "rsrp < -30"


class Alarms(ViewerTest):
    def start_bus(self):
        bus = self.start(["dbus-daemon", "--session", "--nofork", "--nopidfile", "--print-address"])
        self.environment["DBUS_SESSION_BUS_ADDRESS"] = bus.stdout.readline().decode().strip()

    def start_desktop(self, *services):
        desktop = self.start([PYTHON, "-B", DESKTOP, *services])
        self.assertEqual(desktop.stdout.readline(), b"ready\n")
        return desktop

    def start_alarmed(self, rule=RULE, speed="1"):
        self.start_daemon("--seed", "1", "--speed", speed, technology="Orvane_LTE")
        self.write("window.ini", f"[Window]\nSize=@Size(390 1300)\n[Cockpit]\nAlarms={rule}\n".encode())
        return self.start_viewer("--memory", self.path("window.ini"))

    def calls(self, desktop, count):
        said = b""  # read by hand: what a buffer holds is hidden from select
        while said.count(b"\n") < count:
            self.assertTrue(select.select([desktop.stdout], [], [], PATIENCE)[0], f"no more than {said}")
            said += os.read(desktop.stdout.fileno(), 65536)
        return [json.loads(line) for line in said.splitlines()[:count]]

    def test_an_alarm_is_told_in_the_window_wherever_one_is(self):
        viewer = self.start_alarmed()
        state = viewer.await_state(lambda state: state["cockpit"]["banner"])
        self.assertRegex(state["cockpit"]["banner"], r"^RSRP \N{MINUS SIGN}\d+(\.\d+)? dBm, LTE \d+/\d+$")
        self.assertEqual(state["cockpit"]["alarms"][0]["rule"], RULE)
        self.assertTrue(state["cockpit"]["alarms"][0]["raised"])
        viewer.do("press O")
        face = viewer.state()["cockpit"]["texts"]
        self.assertRegex(face[0], r"^Alarm, RSRP ")
        viewer.do("press A")
        self.assertEqual(viewer.state()["cockpit"]["page"], "Alarms")

    def test_the_desktop_gets_a_notice_and_the_phone_vibrates(self):
        self.start_bus()
        desktop = self.start_desktop("notifications", "feedback")
        viewer = self.start_alarmed()
        calls = {call["method"]: call for call in self.calls(desktop, 2)}
        self.assertEqual(calls.keys(), {"Notify", "TriggerFeedback"})
        application, replaces, icon, title, text, actions, hints, timeout = calls["Notify"]["arguments"]
        self.assertEqual((application, replaces, icon, title), ("Kelvasi", 0, "org.kelvasi.Kelvasi", "Alarm"))
        self.assertRegex(text, r"^RSRP \N{MINUS SIGN}\d+(\.\d+)? dBm, LTE \d+/\d+$")
        self.assertEqual((actions, hints["urgency"], hints["sound-name"], timeout), ([], 2, "alarm-clock-elapsed", -1))
        self.assertEqual(calls["TriggerFeedback"]["arguments"],
                         ["org.kelvasi.Kelvasi", "alarm-clock-elapsed", {}, -1])
        self.assertEqual((viewer.close(), viewer.said()), (0, ""))

    def test_where_nothing_vibrates_the_desktop_is_asked_whether_it_sounds(self):
        self.start_bus()
        desktop = self.start_desktop("notifications")
        self.start_alarmed()
        methods = [call["method"] for call in self.calls(desktop, 2)]
        self.assertEqual(sorted(methods), ["GetCapabilities", "Notify"])

    def test_a_later_alarm_of_a_rule_takes_the_place_of_its_notice(self):
        self.start_bus()
        desktop = self.start_desktop("notifications", "feedback")
        self.start_alarmed("event cell_change", speed="30")
        notices = [call for call in self.calls(desktop, 8) if call["method"] == "Notify"]
        replaced = [call["arguments"][1] for call in notices]
        self.assertEqual(replaced[0], 0)
        self.assertEqual(set(replaced[1:]), {7})  # the double's number

    def test_without_a_bus_nothing_is_missed(self):
        viewer = self.start_alarmed()
        viewer.await_state(lambda state: state["cockpit"]["banner"])
        self.assertEqual((viewer.close(), viewer.said()), (0, ""))


if __name__ == "__main__":
    unittest.main()
