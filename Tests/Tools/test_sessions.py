# SPDX-License-Identifier: Apache-2.0
"""How sessions end, and what peers that misbehave can cost a daemon and a viewer: all of it as processes."""

import os
import pathlib
import plistlib
import re
import signal
import threading
import time
import unittest

from live_support import PATIENCE, LiveTest
from support import GMM_REGISTERED, MM_IDLE, pcap
from wire_daemon import WireDaemon, wire

OWN_PORT = "KelvasiApp.test"
HOURS = 10_000.0
MEBIBYTE = 1 << 20


def command(**entries):
    return wire.frame(wire.MESSAGE, plistlib.dumps(entries))


class ReplayThatLeaves(LiveTest):
    """telvon-sim --replay --leave, with a capture that takes hours to be played."""

    def setUp(self):
        super().setUp()
        capture = self.write("long.pcap", pcap((0.0, MM_IDLE), (HOURS, GMM_REGISTERED)))
        self.daemon = self.start_daemon("--replay", capture, "--leave")

    def start_monitor(self):
        monitor = self.start_live("monitor", "--format", "json")
        monitor.stdout.readline()
        return monitor

    def test_ends_when_the_viewer_leaves_first(self):
        for number in (signal.SIGTERM, signal.SIGKILL):
            with self.subTest(number):
                self.end(self.start_monitor(), number)
                self.assertEqual(self.daemon.wait(timeout=PATIENCE), 0)
                self.assertIn(b"the last application has left", self.daemon.stderr.read())
                self.doCleanups()
                self.setUp()

    def test_stays_while_another_viewer_is_there(self):
        staying = self.start_monitor()
        leaving = self.start_live("monitor", "--log-stderr")  # for which nothing is left to show
        self.await_line(leaving, "Starting the display update timer")
        self.end(leaving)
        time.sleep(2.5)  # two looks of the daemon
        self.assertIsNone(self.daemon.poll())
        self.end(staying)
        self.assertEqual(self.daemon.wait(timeout=PATIENCE), 0)

    def test_waits_for_the_first_viewer(self):
        time.sleep(2.5)
        self.assertIsNone(self.daemon.poll())


class Application(LiveTest):
    """An application that the test plays, at a daemon that streams."""

    def setUp(self):
        super().setUp()
        self.daemon = self.start_daemon("--speed", "10")
        self.directory_of_ports = wire.Directory(self.path("run"))
        listener = self.directory_of_ports.listen(OWN_PORT)
        self.addCleanup(listener.close)
        asking = self.connect("telvon")
        asking.send(wire.frame(wire.CHANNEL_REQUEST, OWN_PORT.encode(), token=1))
        self.port = asking.read_frame()[3][8:].decode()
        self.commands = self.connect(self.port)
        self.messages = self.directory_of_ports.accept(listener)
        self.messages.socket.settimeout(PATIENCE)
        self.addCleanup(self.messages.close)

    def connect(self, name):
        connection = self.directory_of_ports.connect(name)
        connection.socket.settimeout(PATIENCE)
        self.addCleanup(connection.close)
        return connection

    def start_stream(self):
        self.commands.send(command(SetState="Streaming"))
        self.assertEqual(self.messages.read_frame()[0], wire.MESSAGE)

    def read_to_end(self):
        deadline = time.monotonic() + PATIENCE
        while self.messages.read_frame():
            self.assertLess(time.monotonic(), deadline, "the daemon goes on sending")

    def test_the_end_of_the_command_connection_ends_the_session(self):
        self.start_stream()
        self.commands.close()
        self.read_to_end()
        self.wait_until(lambda: self.port not in os.listdir(self.path("run")))

    def test_a_connection_that_said_nothing_ends_nothing(self):
        self.connect(self.port).close()
        self.start_stream()
        self.connect(self.port).close()
        for _ in range(20):
            self.assertEqual(self.messages.read_frame()[0], wire.MESSAGE)

    def test_useless_commands_are_logged_ten_times_and_counted(self):
        count = 50_000
        for _ in range(count // 1000):
            self.commands.send(wire.frame(wire.MESSAGE, b"?") * 1000)
        self.commands.send(wire.frame(wire.REQUEST, b"last", token=7))
        self.assertEqual(self.commands.read_frame(), (wire.EMPTY_REPLY, 0, 7, b""))
        _, _, error = self.end(self.daemon)
        lines = [line for line in error.splitlines() if "a command that is none" in line]
        self.assertLessEqual(len(lines), 2 * 11, lines[:30])
        told = sum(int((re.match(r"<3>(\d+) more", line) or [0, 1])[1]) for line in lines)
        self.assertEqual(told, count + 1)


class UnfinishedFrames(LiveTest):
    """A daemon whose connections hold frames back."""

    def setUp(self):
        super().setUp()
        os.mkdir(self.path("run"), 0o700)
        self.daemon = WireDaemon(self.path("run"))
        self.addCleanup(self.daemon.close)
        self.monitor = self.start_live("monitor", "--format", "json", "--log-stderr")
        self.messages = self.daemon.serve(self.daemon.open_channel())

    def peak_mebibytes(self):
        status = pathlib.Path(f"/proc/{self.monitor.pid}/status").read_text()
        return int(re.search(r"VmHWM:\s+(\d+) kB", status).group(1)) // 1024

    def hold_back(self, mebibytes):
        connection = self.daemon.connect()
        piece = bytes(MEBIBYTE)
        try:
            connection.send(wire.HEADER.pack(16 * MEBIBYTE, 1, wire.MESSAGE, 0, 0, 0))
            for _ in range(mebibytes):
                connection.send(piece)
        except (BrokenPipeError, ConnectionResetError):
            pass  # the viewer has had enough

    @unittest.skipIf(os.environ.get("KELVASI_SANITIZE"), "sanitizers keep memory back")
    def test_cost_a_bounded_amount_of_memory_in_all(self):
        log = []
        threading.Thread(target=lambda: log.extend(self.monitor.stderr), daemon=True).start()
        before = self.peak_mebibytes()
        for _ in range(40):
            self.hold_back(15)
        self.messages.send(wire.frame(wire.MESSAGE, MM_IDLE))
        self.assertIn(b"MM_IDLE", self.monitor.stdout.readline())
        self.assertLess(self.peak_mebibytes() - before, 200)
        self.assertTrue(any(b"hold more than 64 MiB" in line for line in log))
