# SPDX-License-Identifier: Apache-2.0
"""Snapshots as captures: decoded, piped and replayed, and those in which there is nothing to decode."""

import json
import plistlib
import unittest

from live_support import PATIENCE, LiveTest, packets
from support import GMM_DEREGISTERED, GMM_REGISTERED, MM_IDLE, pcap, record, without_count

# By intervals. A snapshot keeps the last five, so nothing of the registration.
LOST = [[GMM_REGISTERED, MM_IDLE], [GMM_REGISTERED]]
CELLS = record(0x0001, b"bplist00", log_type=0xFF)
KEPT = [[record(0x7131, bytes([0x13, 0x08, count])), CELLS] for count in range(1, 5)] + [[CELLS, MM_IDLE]]
KEPT_MESSAGES = [message for interval in KEPT for message in interval]


def timed(intervals):
    return pcap(*[(3.0 * number, message) for number, interval in enumerate(intervals) for message in interval])


class SnapshotCapture(LiveTest):
    def save(self, contents, technology="Orvane_GSM"):
        """The snapshot of a capture, and what the capture is decoded to."""
        capture = self.write("a.pcap", contents)
        result = self.decode("--snapshot", self.path("a.kelvasi"), capture, technology=technology)
        self.assertEqual((result.returncode, without_count(result.stderr)), (0, b""))
        return self.path("a.kelvasi"), result.stdout

    def shown(self, *arguments, **options):
        result = self.decode(*arguments, **options)
        self.assertEqual((result.returncode, without_count(result.stderr)), (0, b""))
        return result.stdout

    def change_dlf(self, path, change):
        with open(path, "rb") as file:
            snapshot = plistlib.load(file)
        snapshot["Data"][-1]["DLF"] = change(snapshot["Data"][-1]["DLF"])
        return self.write("changed.kelvasi", plistlib.dumps(snapshot))

    def test_is_decoded_to_the_display_of_its_intervals(self):
        snapshot, shown = self.save(timed(KEPT))
        self.assertEqual(self.shown(snapshot), shown)

    def test_knows_nothing_of_intervals_that_it_did_not_keep(self):
        snapshot, shown = self.save(timed(LOST + KEPT))
        self.assertEqual(json.loads(shown)["Process PS"]["MM State"], "GMM_REGISTERED")
        again = self.shown("--dlf", self.path("a.dlf"), snapshot)
        self.assertEqual(again, self.shown(self.write("kept.pcap", timed(KEPT))))
        self.assertEqual(json.loads(again)["Process PS"], {})
        # One interval now, for its records have no stamps.
        self.assertEqual(self.read("a.dlf")[161:], b"".join(KEPT_MESSAGES)[1:])

    def test_needs_no_name_and_comes_in_a_pipe(self):
        _, shown = self.save(timed(KEPT))
        contents = self.read("a.kelvasi")
        self.assertEqual(self.shown(self.write("yesterday", contents)), shown)
        self.assertEqual(self.shown("-", input=contents), shown)

    def test_comes_in_a_row_with_other_captures(self):
        snapshot, _ = self.save(timed(KEPT))
        after = self.write("after.pcap", pcap(GMM_DEREGISTERED))
        display = json.loads(self.shown(snapshot, after))
        self.assertEqual(display["Process CS"]["MM State"], "MM_IDLE")
        self.assertIn("GMM_DEREGISTERED", display["Process PS"]["MM State"])

    def test_of_nothing_is_decoded_to_nothing(self):
        self.decode("--snapshot", self.path("a.kelvasi"), self.write("a.pcap", pcap()))
        result = self.decode(self.path("a.kelvasi"))
        self.assertEqual((result.returncode, result.stdout), (0, b"null\n"))
        self.assertEqual(result.stderr.decode(), f"kelvasictl: {self.path('a.kelvasi')}: holds no messages\n")

    def test_of_an_object_stream_holds_no_messages(self):
        message = plistlib.dumps({"Serving Cell": {"Channel": "1850"}})
        snapshot, _ = self.save(pcap(message), technology="IFX")
        result = self.decode(snapshot, technology="IFX")
        self.assert_fault(result, f"{snapshot}: the snapshot holds no DLF and so no messages")
        self.assertEqual(result.stdout, b"")

    def test_with_a_cut_dlf_is_decoded_up_to_the_cut(self):
        snapshot, _ = self.save(pcap(MM_IDLE, GMM_REGISTERED))
        result = self.decode(self.change_dlf(snapshot, lambda dlf: dlf[:-1]))
        place = 161 + len(MM_IDLE) - 1
        self.assert_fault(result, f"changed.kelvasi: DLF: byte {place}: no whole DLF record begins here")
        display = json.loads(result.stdout)
        self.assertEqual(display["Process CS"]["MM State"], "MM_IDLE")
        self.assertEqual(display["Process PS"], {})

    def test_that_is_cut_itself_is_refused(self):
        self.save(pcap(MM_IDLE))
        cut = self.write("cut.kelvasi", self.read("a.kelvasi")[:-20])
        result = self.decode(cut)
        self.assert_fault(result, "cut.kelvasi: byte ", ": the property list ends too early")
        self.assertEqual(result.stdout, b"")
        self.assert_fault(self.decode(self.write("a.plist", plistlib.dumps({"A": 1}))),
                          'a.plist: no snapshot: there is no "Data" array in it')

    def test_is_replayed_message_by_message(self):
        snapshot, _ = self.save(timed(LOST + KEPT))
        daemon = self.start_daemon("--replay", snapshot, "--speed", "max", "--leave")
        recorder = self.start_live("record", self.path("again.pcap"))
        self.assertEqual(daemon.wait(PATIENCE), 0)
        self.assertEqual(self.end(recorder)[0], 0)
        self.assertEqual([message for _, message in packets(self.read("again.pcap"))], KEPT_MESSAGES)


if __name__ == "__main__":
    unittest.main()
