# SPDX-License-Identifier: Apache-2.0
"""telvon-sim --write: a drive in a file, made at once."""

import json
import struct
import subprocess
import unittest

from live_support import DAEMON, PATIENCE, LiveTest, packets

WORLD_BEGIN = 1704067200  # 1 January 2024 UTC
TECHNOLOGIES = ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2")


def code_of(message):
    return struct.unpack_from("<H", message, 3)[0]


class WrittenDrive(LiveTest):
    def write_drive(self, *arguments, technology="Orvane_LTE", status=0):
        result = subprocess.run([DAEMON, "--technology", technology, *map(str, arguments)], env=self.environment,
                                capture_output=True, timeout=PATIENCE)
        error = result.stderr.decode()
        self.assertEqual(result.returncode, status, error)
        return error

    def written(self, *arguments, technology="Orvane_LTE", name="drive.pcap"):
        self.assertEqual(self.write_drive("--write", self.path(name), *arguments, technology=technology), "")
        return packets(self.read(name))

    def test_it_holds_so_many_messages_of_every_technology_and_can_be_decoded(self):
        for technology in TECHNOLOGIES:
            with self.subTest(technology):
                name = technology + ".pcap"
                messages = self.written("--messages", 777, technology=technology, name=name)
                self.assertEqual(len(messages), 777)
                times = [time for time, _ in messages]
                self.assertEqual(times, sorted(times))
                self.assertEqual(times[0], WORLD_BEGIN)
                self.assertGreater(times[-1], WORLD_BEGIN + 10)
                decoded = self.run_program("decode", "--technology", technology, self.path(name))
                self.assertEqual(decoded.returncode, 0)
                self.assertTrue(json.loads(decoded.stdout))

    def test_the_daemons_own_property_lists_are_among_the_messages(self):
        for technology in ("Orvane_GSM", "Orvane_LTE", "Orvane_UTRAN2"):
            messages = self.written("--messages", 2000, technology=technology, name=technology)
            lists = [code_of(message) for _, message in messages if message[13:].startswith(b"<?xml")]
            self.assertEqual(set(lists), {0, 1, 2}, technology)

    def test_the_seed_decides(self):
        self.written("--messages", 500, "--seed", 3, name="one")
        self.written("--messages", 500, "--seed", 3, name="same")
        self.written("--messages", 500, "--seed", 4, name="other")
        self.assertEqual(self.read("one"), self.read("same"))
        self.assertNotEqual(self.read("one"), self.read("other"))

    def test_it_can_begin_later_and_first_tells_of_the_present(self):
        whole = self.written("--messages", 20000, name="whole")
        late = self.written("--messages", 1000, "--start-at", 60, name="late")
        self.assertEqual(late[0][0], WORLD_BEGIN + 60)
        after = [message for time, message in late if time > WORLD_BEGIN + 60]
        begin = next(place for place, (time, _) in enumerate(whole) if time > WORLD_BEGIN + 60)
        self.assertEqual(after, [message for _, message in whole[begin:begin + len(after)]])
        self.assertIn(0, [code_of(message) for time, message in late if time == WORLD_BEGIN + 60])  # the SIM's files

    def test_no_file_is_overwritten_unless_that_is_asked_for(self):
        path = self.write("drive.pcap", b"precious")
        error = self.write_drive("--write", path, "--messages", 5, status=1)
        self.assertEqual(error, f"telvon-sim: {path}: there is such a file already; --force overwrites it\n")
        self.assertEqual(self.read("drive.pcap"), b"precious")
        self.assertEqual(len(self.written("--messages", 5, "--force")), 5)

    def test_a_file_that_cannot_be_written_is_named(self):
        for path in ("/nowhere/drive.pcap", "/dev/full"):
            error = self.write_drive("--write", path, "--messages", 5, "--force", status=1)
            self.assertRegex(error, rf"\Atelvon-sim: {path}: .*\n\Z")

    def test_wrong_usage_has_status_2(self):
        path = self.path("drive.pcap")
        for arguments in (["--write", path], ["--messages", 5], ["--force"], ["--write", path, "--messages", 0],
                          ["--write", path, "--messages", 5, "--seconds", 5],
                          ["--write", path, "--messages", 5, "--replay", path],
                          ["--write", path, "--messages", 5, "--start-at", -1],
                          ["--write", path, "--messages", 5, "--scenario", "none"]):
            with self.subTest(arguments):
                self.assertRegex(self.write_drive(*arguments, status=2), r"\Atelvon-sim: .*\n\Z")


if __name__ == "__main__":
    unittest.main()
