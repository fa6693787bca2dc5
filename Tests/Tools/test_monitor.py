# SPDX-License-Identifier: Apache-2.0
"""kelvasictl monitor beside a simulated daemon, both as processes."""

import json
import os
import pty
import signal
import unittest

from live_support import PATIENCE, LiveTest
from support import GMM_REGISTERED, MM_IDLE, OUTPUT_CLOSED, pcap, record


class Monitor(LiveTest):
    def replay(self, *messages):
        return self.start_daemon("--replay", self.write("world.pcap", pcap(*messages)))

    def test_once_prints_the_first_display_and_ends(self):
        self.replay(MM_IDLE)
        out, error = self.start_live("monitor", "--once").communicate(timeout=PATIENCE)
        lines = out.decode().splitlines()
        self.assertEqual(error, b"")
        self.assertEqual((lines[0], lines[-1]), ("/\t", "---"))
        self.assertIn("/Process CS/MM State\tMM_IDLE", lines)

    def test_json_is_a_line_with_the_time_and_the_display(self):
        self.replay(MM_IDLE)
        monitor = self.start_live("monitor", "--once", "--format", "json")
        line = json.loads(monitor.communicate(timeout=PATIENCE)[0])
        self.assertEqual(list(line), ["time", "display"])
        self.assertEqual(line["display"]["Process CS"]["MM State"], "MM_IDLE")

    def test_every_update_is_printed_at_once(self):
        self.replay((0.0, MM_IDLE), (2.5, GMM_REGISTERED))
        monitor = self.start_live("monitor", "--format", "json")
        first, second = json.loads(monitor.stdout.readline()), json.loads(monitor.stdout.readline())
        self.assertEqual(first["display"]["Process PS"], {})
        self.assertEqual(second["display"]["Process PS"]["MM State"], "GMM_REGISTERED")
        self.assertEqual(self.end(monitor)[0], 0)

    def test_the_daemon_may_come_later_and_come_back(self):
        monitor = self.start_live("monitor", "--format", "json")
        daemon = self.replay(MM_IDLE)
        monitor.stdout.readline()
        daemon.kill()
        daemon.wait()
        self.replay(GMM_REGISTERED)
        # A new generator was made for the same state: what was shown stays, and goes on moving.
        display = json.loads(monitor.stdout.readline())["display"]
        self.assertEqual(display["Process CS"]["MM State"], "MM_IDLE")
        self.assertEqual(display["Process PS"]["MM State"], "GMM_REGISTERED")

    def test_a_display_of_another_technology_stays_and_is_said_to_be_it(self):
        daemon = self.replay(MM_IDLE)
        monitor = self.start_live("monitor", "--format", "json", "--log-stderr")
        first = json.loads(monitor.stdout.readline())["display"]
        daemon.kill()
        daemon.wait()
        measured = record(0xB17F, bytes(40))
        self.start_daemon("--replay", self.write("lte.pcap", pcap(measured)), technology="Orvane_LTE")
        self.assertEqual(json.loads(monitor.stdout.readline())["display"], first)
        status, _, error = self.end(monitor)
        self.assertEqual(status, 0)
        self.assertEqual(error.count("kelvasictl: the daemon's technology has changed; "), 1, error)
        self.assertEqual(error.count("<5>The display is that of another technology than the daemon's"), 1, error)

    def test_a_signal_ends_it_well(self):
        for number in (signal.SIGINT, signal.SIGTERM):
            with self.subTest(number):
                self.replay(MM_IDLE)
                monitor = self.start_live("monitor")
                monitor.stdout.readline()
                status, _, error = self.end(monitor, number)
                self.assertEqual((status, error), (0, ""))
                self.doCleanups()
                self.setUp()

    def test_it_says_that_it_waits_and_fails_when_nothing_came_by_the_stated_time(self):
        monitor = self.start_live("monitor", "--seconds", "0.2")
        out, error = monitor.communicate(timeout=PATIENCE)
        self.assertEqual((monitor.returncode, out), (1, b""))
        self.assertEqual(error.decode().splitlines(), [
            f"kelvasictl: waiting for a telephony daemon in {self.path('run')}",
            f"kelvasictl: nothing came from a telephony daemon in {self.path('run')}",
        ])

    def test_a_signal_is_no_failure_without_a_daemon(self):
        monitor = self.start_live("monitor", "--seconds", "60")
        self.assertIn(b"waiting", monitor.stderr.readline())
        self.assertEqual(self.end(monitor), (0, b"", ""))

    def test_a_runtime_directory_that_is_refused_is_named_with_the_reason(self):
        os.mkdir(self.path("run"))
        os.chmod(self.path("run"), 0o755)
        monitor = self.start_live("monitor", "--seconds", "0.2")
        _, error = monitor.communicate(timeout=PATIENCE)
        reason = f"the runtime directory {self.path('run')} is refused: its mode is not 0700"
        self.assertEqual(monitor.returncode, 1)
        self.assertEqual(error.decode().splitlines()[0], f"kelvasictl: waiting for a telephony daemon; {reason}")

    def test_a_runtime_directory_that_nothing_names_is_told(self):
        for variable in ("TELVON_RUNTIME_DIR", "XDG_RUNTIME_DIR"):
            self.environment[variable] = ""
        monitor = self.start_live("monitor", "--seconds", "0.2")
        error = monitor.communicate(timeout=PATIENCE)[1].decode()
        self.assertIn("neither TELVON_RUNTIME_DIR nor XDG_RUNTIME_DIR is set", error.splitlines()[0])

    def test_a_daemon_that_was_reached_is_enough(self):
        self.start_daemon("--replay", self.write("world.pcap", pcap(MM_IDLE)))
        monitor = self.start_live("monitor", "--seconds", "1")
        _, error = monitor.communicate(timeout=PATIENCE)
        self.assertEqual((monitor.returncode, error), (0, b""))

    def test_a_reader_that_leaves_ends_it(self):
        self.replay(MM_IDLE)
        reading, writing = os.pipe()
        os.close(reading)
        with os.fdopen(writing, "wb") as pipe:
            monitor = self.start_live("monitor", stdout=pipe)
        _, error = monitor.communicate(timeout=PATIENCE)
        self.assertEqual((monitor.returncode, error), (OUTPUT_CLOSED, b""))

    def test_a_decoders_exception_ends_it_by_sigabrt(self):
        extra = bytes([0xFF]) + bytes(2) + bytes(2) + bytes(8) + b"no property list"
        self.replay(extra)
        monitor = self.start_live("monitor", "--log-stderr", "--seconds", "5")
        _, error = monitor.communicate(timeout=PATIENCE)
        if b"SIM File dictionary data" not in error:
            self.skipTest("the SIM decoder does not exist yet")
        self.assertEqual(monitor.returncode, -signal.SIGABRT)

    def test_the_end_by_an_assertion_is_told(self):
        self.start_daemon("--replay", self.write("world.pcap", pcap(b"no property list")), technology="IFX")
        monitor = self.start_live("monitor")
        out, error = monitor.communicate(timeout=PATIENCE)
        self.assertEqual((monitor.returncode, out), (-signal.SIGABRT, b""))
        self.assertRegex(error.decode(), r"\Akelvasictl: Terminating: uncaught .+\n\Z")


class MonitorOnATerminal(LiveTest):
    def setUp(self):
        super().setUp()
        self.terminal, self.line = pty.openpty()
        self.addCleanup(os.close, self.terminal)
        self.seen = b""

    def start_monitor(self, *arguments):
        monitor = self.start_live("monitor", *arguments, stdout=self.line, stderr=self.line)
        os.close(self.line)
        return monitor

    def see(self, text):
        while text not in self.seen:
            self.seen += os.read(self.terminal, 4096)

    def test_it_says_that_it_connects_until_it_is_connected(self):
        self.start_monitor()
        self.see(b"\r\x1b[KConnecting...")
        self.start_daemon("--replay", self.write("world.pcap", pcap(MM_IDLE)))
        self.see(b"Connecting...\r\x1b[K")
        self.see(b"/Process CS/MM State\tMM_IDLE\x1b[K")

    def test_what_it_ends_with_is_a_line_of_its_own(self):
        self.start_monitor("--seconds", "1")
        self.see(b"waiting for a telephony daemon in " + self.path("run").encode() + b"\r\n\r\x1b[KConnecting...")
        self.see(b"Connecting...\r\x1b[Kkelvasictl: nothing came")

    def test_updates_are_drawn_over_one_another_without_clearing_in_between(self):
        self.start_daemon("--replay", self.write("world.pcap", pcap((0.0, MM_IDLE), (2.5, GMM_REGISTERED))))
        monitor = self.start_monitor()
        self.see(b"GMM_REGISTERED\x1b[K")
        self.see(b"\x1b[?7h\x1b[J")
        self.assertEqual(self.seen.count(b"\x1b[2J"), 1)
        self.assertEqual(self.seen.count(b"\x1b[H"), 2)
        monitor.send_signal(signal.SIGINT)
        self.assertEqual(monitor.wait(PATIENCE), 0)


if __name__ == "__main__":
    unittest.main()
