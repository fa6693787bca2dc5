# SPDX-License-Identifier: Apache-2.0
"""Every technology end to end, as processes: what the daemon simulates is shown, moves, is recorded and saved."""

import json
import plistlib
import re
import signal
import unittest

from live_support import DAEMON, PATIENCE, LiveTest, packets
from support import PROGRAM, pcap

# By technology: leaves that a display shows from the start on, as "section/row", and a pattern of measurements of which
# one moves.
TECHNOLOGIES = {
    "IFX": (("Power", "Network/PLMN/MCC"), r"Serving Cell/(RSCP|Received Level)"),
    "Orvane_GSM": (("01;Registration/Process CS/MM State", "01;Registration/Serving PLMN/Service Type"),
                   r"03;UMTS/UMTS Set/\d+/RSCP"),
    "Orvane_LTE": (("01;Serving Cell/Serving Cell Info/Freq Band Indicator",),
                   r"01;Serving Cell/Serving Cell Measurements/Measured RSRP"),
    "Orvane_UTRAN2": (("01;Serving Cell/RRC Info/State", "01;Serving Cell/Serving Cell Info/Downlink UARFCN"),
                      r"02;Neighbor Cells/Neighbor Cell List/\d+/Filter RSCP"),
    "Orvane_CDMA": (("01;1x/Device State", "03;EV-DO/Session State", "04;EV-DO Data Rates/Forward Link"),
                    r"01;1x/Active Set Ec/Io/.+|03;EV-DO/Active Set Pilots/.+|04;EV-DO Data Rates/.+"),
}
OBJECT_STREAM = "IFX"
MOST_DISPLAYS = 15


def leaves(value, path=""):
    """Paths of all leaves and their values."""
    if isinstance(value, dict):
        inside = value.items()
    elif isinstance(value, list):
        inside = enumerate(value)
    else:
        return {path: value}
    found = {}
    for key, entry in inside:
        found |= leaves(entry, f"{path}/{key}" if path else str(key))
    return found


def moved(before, after):
    """Paths of the leaves that showed something, and now show something else."""
    return {path for path, value in before.items() if value and after.get(path) and after[path] != value}


# What the session and the generators say at this level when all is well. The number is a record of LTE that is shown
# and complained of at once.
ROUTINE = (" ***** ", "Class Index: 1", "Creat", "Got log generated", "Starting the display update timer",
           "Received an unknown log message: 45249")


class Processes(LiveTest):
    def start_world(self, technology):
        # Fast, so that every drive has something new to tell between two updates.
        daemon = self.start([DAEMON, "--technology", technology, "--seed", "5", "--speed", "10"])
        self.await_line(daemon, "serving")

    def start_verb(self, verb, *arguments):
        """With the display templates of the program itself."""
        return self.start([PROGRAM, verb, *arguments])

    def record(self, technology):
        """Messages of several display updates: of the drive's first three quarters of a minute."""
        self.start_world(technology)
        recorder = self.start_verb("record", self.path("live.pcap"))
        self.wait_until(lambda: self.recorded_for() > 4.5)
        self.assertEqual(self.end(recorder)[0], 0)
        return [message for _, message in packets(self.read("live.pcap"))]

    def recorded_for(self):
        try:
            times = [time for time, _ in packets(self.read("live.pcap"))]
        except (FileNotFoundError, ValueError):
            return 0
        return times[-1] - times[0] if times else 0


class EndToEnd:
    """To be mixed into a test with a technology."""

    technology = ""

    def assert_shows_its_leaves(self, shown):
        for path in TECHNOLOGIES[self.technology][0]:
            self.assertTrue(shown.get(path), path)

    def measurement_among(self, paths):
        return any(re.fullmatch(TECHNOLOGIES[self.technology][1], path) for path in paths)

    def test_rows_are_shown_and_move(self):
        self.start_world(self.technology)
        monitor = self.start_verb("monitor", "--format", "json", "--log-stderr")
        displays, changes = [], []
        while len(displays) < 3 or (not self.measurement_among(changes) and len(displays) < MOST_DISPLAYS):
            displays.append(leaves(json.loads(monitor.stdout.readline())["display"]))
            changes += moved(*displays[-2:]) if len(displays) > 1 else ()
        status, _, log = self.end(monitor)
        self.assertEqual(status, 0)
        errors = [line[3:] for line in log.splitlines() if line.startswith("<3>")]
        self.assertEqual([line for line in errors if not line.startswith(ROUTINE)], [])
        self.assert_shows_its_leaves(displays[-1])
        self.assertTrue(self.measurement_among(changes), displays)

    def test_a_recording_becomes_a_snapshot(self):
        messages = self.record(self.technology)
        result = self.run_program("decode", "--technology", self.technology, "--snapshot", self.path("a.kelvasi"),
                                  "--description", self.technology, self.path("live.pcap"))
        self.assertEqual((result.returncode, result.stderr), (0, b""))
        snapshot = plistlib.loads(self.read("a.kelvasi"))
        self.assertEqual(snapshot["Description"], self.technology)
        history = snapshot["Data"]
        if self.technology != OBJECT_STREAM:
            dlf = history.pop()
            self.assertEqual(dlf["Description"], f"DLF binary ({len(dlf['DLF'])} bytes)")
            self.assertGreater(len(dlf["DLF"]), 161)
            self.assertTrue(history[-1]["DisplayState"].endswith(messages[-1]))
        else:
            self.assertEqual(history[-1]["DisplayState"], plistlib.loads(messages[-1]))
        self.assertGreaterEqual(len(history), 2)
        for entry in history:
            self.assertEqual(list(entry), ["DisplayState", "Display", "ExtraInfo", "Date", "Description"])
        self.assert_shows_its_leaves(leaves(history[-1]["Display"]))


for name in TECHNOLOGIES:
    globals()[name] = type(name, (EndToEnd, Processes), {"technology": name})


class ObjectStream(Processes):
    def test_messages_take_turns_between_xml_and_binary(self):
        messages = self.record(OBJECT_STREAM)
        self.assertGreater(len(messages), 4)
        forms = [message[:6] for message in messages]
        self.assertEqual(set(forms), {b"<?xml ", b"bplist"})
        self.assertTrue(all(one != other for one, other in zip(forms, forms[1:])), forms)
        for message in messages:
            self.assertIn("Serving Cell", plistlib.loads(message))

    def assert_ends_the_viewer(self, message, text):
        world = self.write("world.pcap", pcap(message))
        self.await_line(self.start([DAEMON, "--technology", OBJECT_STREAM, "--replay", world]), "serving")
        monitor = self.start_verb("monitor", "--log-stderr")
        _, log = monitor.communicate(timeout=PATIENCE)
        self.assertEqual(monitor.returncode, -signal.SIGABRT)
        self.assertIn(text, log.decode())

    def test_a_message_that_is_no_property_list_ends_the_viewer(self):
        self.assert_ends_the_viewer(b"no property list", "Could not deserialize the object")

    def test_a_number_ends_the_viewer(self):
        message = plistlib.dumps({"A": ["x", {"B": 7}]}, fmt=plistlib.FMT_BINARY)
        self.assert_ends_the_viewer(message, "Unknown object of type int encountered")

    def test_a_scenario_of_another_technology_is_told_by_the_names_a_user_gives(self):
        daemon = self.start([DAEMON, "--technology", "Orvane_LTE", "--scenario", "mobility"])
        self.assertEqual(daemon.communicate(timeout=PATIENCE)[1].decode(),
                         'telvon-sim: there is no scenario "mobility" for Orvane_LTE (try --list-scenarios)\n')
        self.assertEqual(daemon.returncode, 2)


if __name__ == "__main__":
    unittest.main()
