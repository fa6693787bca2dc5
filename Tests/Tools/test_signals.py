# SPDX-License-Identifier: Apache-2.0
"""What a hang-up does to programs that run until a signal."""

import os
import signal
import unittest

from live_support import PATIENCE, LiveTest, packets
from support import MM_IDLE, pcap


def ignore_hangup():
    signal.signal(signal.SIGHUP, signal.SIG_IGN)


class HangUp(LiveTest):
    def start_world(self):
        return self.start_daemon("--replay", self.write("world.pcap", pcap(MM_IDLE)))

    def names(self):
        return sorted(os.listdir(self.path("run")))

    def test_a_recorder_keeps_and_tells_what_it_has(self):
        self.start_world()
        recorder = self.start_live("record", self.path("a.pcap"))
        self.wait_until(lambda: os.path.exists(self.path("a.pcap")) and os.path.getsize(self.path("a.pcap")) > 24)
        status, _, error = self.end(recorder, signal.SIGHUP)
        self.assertEqual((status, error), (0, f"kelvasictl: 1 messages recorded in {self.path('a.pcap')}\n"))
        self.assertEqual([message for _, message in packets(self.read("a.pcap"))], [MM_IDLE])

    def test_a_monitor_ends_well_and_leaves_no_socket(self):
        self.start_world()
        monitor = self.start_live("monitor")
        monitor.stdout.readline()
        self.assertEqual(self.end(monitor, signal.SIGHUP)[0], 0)
        self.assertFalse([name for name in self.names() if name.startswith("KelvasiApp.")])

    def test_a_daemon_removes_its_socket(self):
        daemon = self.start_world()
        self.assertIn("telvon", self.names())
        self.assertEqual(self.end(daemon, signal.SIGHUP)[0], 0)
        self.assertEqual(self.names(), [".lock"])

    def test_one_that_was_told_to_ignore_it_goes_on(self):
        daemon = self.start([os.environ["TELVON_SIM"], "--technology", "Orvane_GSM"], preexec_fn=ignore_hangup)
        self.await_line(daemon, "serving")
        daemon.send_signal(signal.SIGHUP)
        monitor = self.start_live("monitor", "--once")
        monitor.communicate(timeout=PATIENCE)
        self.assertEqual((monitor.returncode, daemon.poll()), (0, None))
        self.assertEqual(self.end(daemon)[0], 0)


if __name__ == "__main__":
    unittest.main()
