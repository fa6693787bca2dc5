# SPDX-License-Identifier: Apache-2.0
"""kelvasictl top with a recorded drive."""

import subprocess
import unittest

from live_support import DAEMON, packets
from test_top import TopTest


class Drive(TopTest):
    def setUp(self):
        super().setUp()
        self.drive = self.path("drive.pcap")
        subprocess.run([DAEMON, "--technology", "Orvane_LTE", "--seed", "7", "--write", self.drive, "--messages", "6000"],
                       env=self.environment, check=True, capture_output=True)

    def rows_at(self, seconds):
        """What the display says of the serving cell so many seconds before the drive's end."""
        contents = self.read("drive.pcap")
        times = [time for time, _ in packets(contents)]
        kept = 24
        for (_, message), time in zip(packets(contents), times):
            if time > times[-1] - seconds + 1e-7:
                break
            kept += 16 + len(message)
        path = self.write(f"cut{seconds}.pcap", contents[:kept])
        tree = self.run_program("decode", "--format", "tree", path).stdout.decode()
        begin = "/Serving Cell/Serving Cell Measurements/"
        return [line[len(begin):].split("\t") for line in tree.splitlines() if line.startswith(begin)]

    def await_rows(self, terminal, rows):
        def are_there(lines):
            shown = [line.split("  ") for line in lines]
            return all(any(line[0] == name and line[-1].strip() == value for line in shown) for name, value in rows)
        terminal.await_screen(are_there)

    def test_a_moment_is_what_decoding_up_to_it_says(self):
        terminal = self.top(self.drive, columns=99, rows=70)
        terminal.await_text("6,000 messages", "□ recorded ")
        terminal.press("enter", "down", "enter")
        terminal.await_text("── Serving Cell / Serving Cell Measurements ──")
        moments = [self.rows_at(seconds) for seconds in (0, 10, 20, 30)]
        self.assertGreater(len({str(rows) for rows in moments}), 2)
        self.await_rows(terminal, moments[0])
        for key, at in (("{", 1), ("{", 2), ("{", 3), ("}", 2), ("}", 1), (">", 0)):
            terminal.press(key)
            self.await_rows(terminal, moments[at])

    def test_events_are_steps(self):
        terminal = self.top(self.drive, rows=30)
        terminal.await_text("6,000 messages")
        end = terminal.line(28)
        terminal.press("[")
        terminal.await_screen(lambda lines: lines[28] != end and "going" not in lines[28])
        last = terminal.line(28)
        terminal.press("E")
        terminal.await_text("Enter its moment")
        newest = terminal.line(2)[:8]
        self.assertIn(newest, last)
        terminal.press("escape", "<")
        terminal.await_text(terminal.line(28)[:8] + "  2")
        terminal.press("[")
        terminal.await_text("Nothing before this")
        terminal.press("]")
        terminal.await_gone("Nothing before this")

    def test_it_plays(self):
        terminal = self.top(self.drive, rows=30)
        terminal.await_text("6,000 messages")
        terminal.press("<", "P")
        terminal.await_text("playing")
        before = terminal.line(28)
        terminal.await_screen(lambda lines: lines[28] != before)
        terminal.press("P")
        terminal.await_gone("playing")

    def test_what_is_no_capture_is_told(self):
        terminal = self.top(self.write("text", b"no capture"))
        self.assertEqual(terminal.wait(), 1)
        self.assertIn("kelvasictl: ", str(terminal))
        self.assertNotIn(b"\x1b[?1049h", terminal.received)


class Line(TopTest):
    def test_a_quiet_drive_fits_through_9600_baud(self):
        terminal = self.live_top()
        terminal.read_for(3)
        before = len(terminal.received)
        terminal.read_for(10)
        a_second = (len(terminal.received) - before) / 10
        print(f"{a_second:.0f} bytes a second")
        self.assertLess(a_second, 960)

    def test_keys_are_answered_under_load(self):
        self.start_daemon("--start-at", "370", "--speed", "400", technology="Orvane_LTE")
        self.has_daemon = True
        terminal = self.live_top()
        for _ in range(3):
            terminal.press("enter")
            terminal.await_text("── Serving Cell ──")
            terminal.press("escape")
            terminal.await_text("── Kelvasi ──")


if __name__ == "__main__":
    unittest.main()
