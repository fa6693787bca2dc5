# SPDX-License-Identifier: Apache-2.0
"""kelvasictl decode --dlf and --snapshot: what Save would write."""

import datetime
import os
import plistlib
import stat
import struct
import unittest

from support import GMM_REGISTERED, MM_IDLE, START, KelvasictlTest, pcap, record, without_count


class Dlf(KelvasictlTest):
    def test_holds_a_version_report_and_the_intervals_without_their_first_bytes(self):
        capture = self.write("a.pcap", pcap((0.0, MM_IDLE), (0.5, GMM_REGISTERED), (3.0, MM_IDLE)))
        result = self.decode("--dlf", self.path("a.dlf"), capture)
        self.assertEqual((result.returncode, result.stderr), (0, b""))
        dlf = self.read("a.dlf")
        self.assertEqual(struct.unpack_from("<HH", dlf), (161, 0x1FFD))
        self.assertEqual(dlf[161:], MM_IDLE[1:] + GMM_REGISTERED + MM_IDLE[1:])

    def test_is_decoded_to_the_same_display(self):
        cells = record(0x0001, b"bplist00", log_type=0xFF)
        capture = self.write("a.pcap", pcap((0.0, MM_IDLE), (0.5, cells), (3.0, GMM_REGISTERED), (5.5, MM_IDLE)))
        shown = self.decode("--dlf", self.path("a.dlf"), capture)
        again = self.decode(self.path("a.dlf"))
        self.assertEqual((again.returncode, without_count(again.stderr)), (0, b""))
        self.assertEqual(again.stdout, shown.stdout)

    def test_replaces_an_older_file_and_leaves_nothing_else(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        self.write("a.dlf", bytes(10000))
        self.decode("--dlf", self.path("a.dlf"), capture)
        self.assertEqual(len(self.read("a.dlf")), 161 + len(MM_IDLE) - 1)
        self.assertEqual(sorted(os.listdir(self.directory.name)), ["a.dlf", "a.pcap"])

    def test_outputs_are_their_owners_alone(self):
        os.chmod(self.write("older.dlf", b"older"), 0o644)
        for name in ("new.dlf", "older.dlf"):
            self.decode("--dlf", self.path(name), "--snapshot", self.path("a.kelvasi"), self.write("a.pcap", pcap(MM_IDLE)))
            for written in (name, "a.kelvasi"):
                self.assertEqual(stat.S_IMODE(os.stat(self.path(written)).st_mode), 0o600)

    def test_a_place_that_cannot_be_written_is_named_after_the_display(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        for option in ("--dlf", "--snapshot"):
            with self.subTest(option):
                result = self.decode(option, self.path("missing/file"), capture)
                self.assert_fault(result, "missing/file: No such file or directory")
                self.assertIn(b"MM_IDLE", result.stdout)


class Snapshot(KelvasictlTest):
    def snapshot(self, *arguments, said="", **options):
        result = self.decode("--snapshot", self.path("a.kelvasi"), *arguments, **options)
        self.assertEqual((result.returncode, result.stderr.decode()), (0, said))
        return plistlib.loads(self.read("a.kelvasi"))

    def test_holds_a_time_the_save_contents_and_a_description(self):
        capture = self.write("a.pcap", pcap((0.0, MM_IDLE), (3.0, GMM_REGISTERED)))
        snapshot = self.snapshot("--description", "at the bench", capture)
        self.assertEqual(sorted(snapshot), ["Data", "Description", "Timestamp"])
        self.assertEqual(snapshot["Description"], "at the bench")
        datetime.datetime.strptime(snapshot["Timestamp"], "%Y-%m-%d %H:%M:%S +0000")
        first, second, dlf = snapshot["Data"]
        self.assertEqual(sorted(first), ["Date", "Description", "Display", "DisplayState", "ExtraInfo"])
        self.assertEqual(second["DisplayState"], GMM_REGISTERED)
        self.assertEqual(dlf["Description"], f"DLF binary ({len(dlf['DLF'])} bytes)")

    def test_all_times_are_the_captures(self):
        capture = self.write("a.pcap", pcap((0.0, MM_IDLE), (3.0, GMM_REGISTERED), (5.5, MM_IDLE)))
        snapshot = self.snapshot("--dlf", self.path("a.dlf"), capture)
        dates = [f"2024-03-05 14:07:{second} +0000" for second in ("11", "13", "14")]  # its ticks: after 2.0, 4.0 and 5.5 s
        self.assertEqual([entry["Date"] for entry in snapshot["Data"][:-1]], dates)
        self.assertEqual([entry["Description"] for entry in snapshot["Data"][:-1]],
                         [f"Snapshot ({date})" for date in dates])
        self.assertEqual(snapshot["Timestamp"], dates[-1])
        created = struct.unpack_from("<I", self.read("a.dlf"), 81)[0]
        self.assertEqual(created, START + 5)
        self.assertEqual(snapshot["Data"][-1]["DLF"], self.read("a.dlf"))

    def test_keeps_the_last_five_ticks(self):
        messages = [(3.0 * count, MM_IDLE) for count in range(8)]
        self.assertEqual(len(self.snapshot(self.write("a.pcap", pcap(*messages)))["Data"]), 6)

    def test_the_description_is_empty_unless_it_is_given(self):
        self.assertEqual(self.snapshot(self.write("a.pcap", pcap(MM_IDLE)))["Description"], "")

    def test_of_nothing_holds_an_empty_history(self):
        capture = self.write("a.pcap", pcap())
        (dlf,) = self.snapshot(capture, said=f"kelvasictl: {capture}: holds no messages\n")["Data"]
        self.assertEqual(len(dlf["DLF"]), 161)

    def test_of_cdma_holds_both_readings_of_the_rate_counters(self):
        # Sequence number and one counter each: of 1024 bits at byte 29, of 128 bits at byte 18.
        def forward(sequence, packets):
            return record(0x1192, bytes([sequence]) + bytes(15) + bytes([packets]) + bytes(211))

        def reverse(sequence, packets):
            return record(0x127E, bytes([0, sequence, 0, 0, 0, packets]) + bytes(1731))

        capture = self.write("a.pcap", pcap((0.0, forward(5, 1)), (0.1, reverse(10, 2)),
                                            (3.0, forward(7, 3)), (3.1, reverse(11, 6))))
        first, second, _ = self.snapshot(capture, technology="Orvane_CDMA")["Data"]
        before = {"FLDataSeqNum1": 5, "FLDataSent1": 1024, "RLDataSeqNum1": 10, "RLDataSent1": 256}
        self.assertEqual(first["ExtraInfo"], before)
        self.assertEqual(second["ExtraInfo"],
                         {"FLDataSeqNum1": 7, "FLDataSent1": 3072, "RLDataSeqNum1": 11, "RLDataSent1": 768}
                         | {key[:-1] + "2": value for key, value in before.items()})

    def test_is_written_of_what_precedes_a_fault(self):
        contents = pcap(MM_IDLE, GMM_REGISTERED)
        result = self.decode("--snapshot", self.path("a.kelvasi"), self.write("a.pcap", contents[:-1]))
        self.assert_fault(result, "a.pcap: byte 56: ")
        self.assertEqual(plistlib.loads(self.read("a.kelvasi"))["Data"][0]["DisplayState"], MM_IDLE)


if __name__ == "__main__":
    unittest.main()
