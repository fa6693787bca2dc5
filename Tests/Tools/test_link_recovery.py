# SPDX-License-Identifier: Apache-2.0
"""The daemon and the viewer's model as two processes that find, lose and find each other again."""

import os
import pathlib
import queue
import re
import shutil
import signal
import subprocess
import tempfile
import threading
import unittest

from support import pcap, record
from wire_daemon import WireDaemon, wire

KELVASICTL = os.environ["KELVASICTL"]
TELVON_SIM = os.environ["TELVON_SIM"]
RESTARTS = int(os.environ.get("LINK_RESTARTS", "5"))
RESOURCES = pathlib.Path(__file__).resolve().parent.parent.parent / "Resources"
PATIENCE = 60  # seconds until a line that never comes fails the test

RUNNING = "Starting the display update timer"
INVALIDATED = re.compile(r"<3> \*\*\*\*\* INVALIDATED 0x[0-9a-f]+ \*\*\*\*\*$")


class Process:
    """A program whose lines can be waited for: those of standard error, and of `stdout` if that is a pipe."""

    def __init__(self, *arguments, environment, stdout=subprocess.DEVNULL):
        self.lines = []
        self._arriving = queue.Queue()
        self._process = subprocess.Popen(
            arguments, stdout=stdout, stderr=subprocess.PIPE, text=True, env=environment
        )
        self.pid = self._process.pid
        self._rows = queue.Queue()
        if stdout == subprocess.PIPE:
            threading.Thread(target=self._read_rows, daemon=True).start()
        self._reader = threading.Thread(target=self._read, daemon=True)
        self._reader.start()

    def _read(self):
        for line in self._process.stderr:
            self._arriving.put(line.rstrip("\n"))
        self._arriving.put(None)

    def _read_rows(self):
        with self._process.stdout:
            for line in self._process.stdout:
                self._rows.put(line)

    def wait_for_row(self, row):
        """Until a line of standard output holds `row`."""
        while row not in self._rows.get(timeout=PATIENCE):
            pass

    def wait_for(self, part):
        """Lines up to the first that contains `part`."""
        seen = []
        while True:
            line = self._arriving.get(timeout=PATIENCE)
            if line is None:
                raise AssertionError(f"ended before it wrote {part!r}: {seen}")
            self.lines.append(line)
            seen.append(line)
            if part in line:
                return seen

    def end(self, how=signal.SIGTERM):
        self._process.send_signal(how)
        return self.status()

    def status(self):
        """Waits for the program to end."""
        status = self._process.wait(timeout=PATIENCE)
        self._reader.join(timeout=PATIENCE)
        self._process.stderr.close()
        return status

    def is_running(self):
        return self._process.poll() is None

    def descriptors(self):
        return len(os.listdir(f"/proc/{self.pid}/fd"))

    def resident_kilobytes(self):
        status = pathlib.Path(f"/proc/{self.pid}/status").read_text()
        return int(re.search(r"VmRSS:\s+(\d+) kB", status).group(1))

    def socket_inodes(self):
        links = pathlib.Path(f"/proc/{self.pid}/fd").iterdir()
        targets = [os.readlink(link) for link in links]
        return {target[8:-1] for target in targets if target.startswith("socket:[")}


class LinkTest(unittest.TestCase):
    def setUp(self):
        self.directory = tempfile.mkdtemp()
        self.addCleanup(shutil.rmtree, self.directory)
        self.environment = os.environ | {"TELVON_RUNTIME_DIR": self.directory}
        self.environment.pop("KELVASI_LOG_LEVEL", None)

    def start(self, *arguments, **options):
        process = Process(*arguments, environment=self.environment, **options)
        self.addCleanup(lambda: process.is_running() and process.end(signal.SIGKILL))
        return process

    def daemon(self, *options):
        return self.start(TELVON_SIM, "--technology", "Orvane_GSM", *options)

    def serving_daemon(self, *options):
        daemon = self.daemon(*options)
        daemon.wait_for("telvon-sim: serving")
        return daemon

    def monitor(self, **options):
        command = (KELVASICTL, "monitor", "--format", "json", "--log-stderr", "--resources", str(RESOURCES))
        return self.start(*command, **options)


class Order(LinkTest):
    def test_the_daemon_first(self):
        self.serving_daemon()
        monitor = self.monitor()
        monitor.wait_for(RUNNING)
        self.assertEqual(monitor.end(), 0)

    def test_the_viewer_first(self):
        monitor = self.monitor()
        monitor.wait_for("Could not create the ports necessary")
        self.serving_daemon()
        monitor.wait_for(RUNNING)
        self.assertEqual(monitor.end(), 0)


class Recovery(LinkTest):
    def daemon_with_area(self, area):
        """One that shows this location area code."""
        registered = bytes([0, 3, 0x13, 0xF0, 0x10]) + area.to_bytes(2, "big") + bytes(12)
        world = pathlib.Path(self.directory) / "world.pcap"
        world.write_bytes(pcap(record(0x7135, registered)))
        return self.serving_daemon("--replay", str(world))

    def area_row(self, area):
        return f'"Location Area Code":"{area}"'

    def test_every_death_of_the_daemon_is_noticed_and_costs_nothing(self):
        daemon = self.daemon_with_area(1000)
        monitor = self.monitor(stdout=subprocess.PIPE)
        monitor.wait_for(RUNNING)
        monitor.wait_for_row(self.area_row(1000))
        settled = None
        for number in range(RESTARTS):
            daemon.end(signal.SIGKILL)
            daemon = self.daemon_with_area(number)
            seen = monitor.wait_for(RUNNING)
            self.assertRegex(next(line for line in seen if "INVALIDATED" in line), INVALIDATED)
            if number == RESTARTS // 10:
                monitor.wait_for_row(self.area_row(number))
                settled = (monitor.descriptors(), monitor.resident_kilobytes())
        monitor.wait_for_row(self.area_row(RESTARTS - 1))
        self.assertEqual(sum("INVALIDATED" in line for line in monitor.lines), RESTARTS)
        self.assertEqual(monitor.descriptors(), settled[0])
        if RESTARTS >= 100:  # a short run has settled nothing
            self.assertLess(monitor.resident_kilobytes(), settled[1] + 1024)
        self.assertEqual(monitor.end(), 0)

    def test_a_daemon_that_stops_is_given_up_and_found_again(self):
        daemon = self.serving_daemon()
        os.kill(daemon.pid, signal.SIGSTOP)
        monitor = self.monitor()
        monitor.wait_for("Could not create the ports necessary")
        os.kill(daemon.pid, signal.SIGCONT)
        monitor.wait_for(RUNNING)
        self.assertEqual(monitor.end(), 0)

    def test_a_second_daemon_is_refused_while_one_lives(self):
        self.serving_daemon()
        second = self.daemon()
        self.assertEqual(second.status(), 1)


class Faults(LinkTest):
    def expect(self, fault, line):
        self.serving_daemon("--fault", fault)
        monitor = self.monitor()
        monitor.wait_for(line)
        self.assertEqual(monitor.end(), 0)

    def test_an_answer_without_the_key(self):
        self.expect("answer-without-key", "<3> ***** Reply to GetTechnology had no answer; cannot configure")

    def test_no_answer(self):
        self.expect("no-answer", "<3> ***** No response to GetTechnology; cannot configure")

    def test_an_answer_that_is_no_property_list(self):
        self.expect("answer-garbage", "<3> ***** Could not parse reply to GetTechnology; cannot configure")

    def test_an_unknown_technology(self):
        self.expect("unknown-technology", "<3>No log generator technology works")

    def test_an_error_pair(self):
        self.expect(
            "error-pair=49", "<3>_TelvonServerConnectionNetworkMonitorCreateLogChannel returns error: 49!"
        )

    def test_an_empty_port(self):
        self.expect("empty-port", "<3>Could not create a log channel (Telvon returned null port)!")

    def test_a_port_where_nobody_listens(self):
        self.expect("dead-port", "<3>Could not create the remote port!")


class Stalled(LinkTest):
    """A daemon that stops while the viewer waits for its answer to "GetTechnology"."""

    def setUp(self):
        super().setUp()
        self.stalling = WireDaemon(self.directory)
        self.addCleanup(self.stalling.close)

    def expect_recovery(self, monitor):
        # Nothing but the viewer's own patience ends its wait: the daemon says nothing more on this channel.
        seen = monitor.wait_for("No log generator technology works")
        self.assertIn("<3> ***** Could not send the GetTechnology command (got error=-2)", seen)
        self.stalling.serve(self.stalling.open_channel())
        monitor.wait_for(RUNNING)
        self.assertEqual(monitor.end(), 0)

    def test_a_daemon_that_never_reads_the_technology_request(self):
        monitor = self.monitor()
        self.stalling.open_channel()
        self.expect_recovery(monitor)

    def test_a_daemon_that_stops_before_it_replies(self):
        monitor = self.monitor()
        self.assertEqual(self.stalling.open_channel().read_frame()[0], wire.REQUEST)
        self.expect_recovery(monitor)

    def test_a_daemon_that_stops_inside_its_reply(self):
        monitor = self.monitor()
        commands = self.stalling.open_channel()
        token = commands.read_frame()[2]
        commands.send(wire.frame(wire.REPLY, b"<plist>", token=token)[:-1])
        self.expect_recovery(monitor)


class Privacy(LinkTest):
    def network_inodes(self):
        inodes = set()
        for table in ("tcp", "tcp6", "udp", "udp6", "raw", "raw6", "udplite", "udplite6"):
            path = pathlib.Path("/proc/net") / table
            if path.exists():
                inodes |= {line.split()[9] for line in path.read_text().splitlines()[1:]}
        return inodes

    def test_neither_side_has_a_network_socket(self):
        daemon = self.serving_daemon()
        monitor = self.monitor()
        monitor.wait_for(RUNNING)
        for process in (daemon, monitor):
            self.assertTrue(process.socket_inodes())
            self.assertFalse(process.socket_inodes() & self.network_inodes())

    def traced(self, trace, *command):
        """A command that writes its socket calls to the file `trace`; skips the test where that is not allowed."""
        if not shutil.which("strace"):
            self.skipTest("strace is not installed")
        probe = subprocess.run(["strace", "-o", os.devnull, "true"], capture_output=True, check=False)
        if probe.returncode != 0:
            self.skipTest("this machine does not let strace trace")
        return ["strace", "-f", "-e", "trace=socket", "-o", trace, *command]

    def assert_unix_sockets_only(self, trace):
        calls = [line for line in pathlib.Path(trace).read_text().splitlines() if "socket(" in line]
        self.assertTrue(calls)
        self.assertEqual([line for line in calls if "AF_UNIX" not in line], [])

    def test_the_viewer_asks_the_system_for_unix_sockets_only(self):
        self.environment["ASAN_OPTIONS"] = "detect_leaks=0"
        trace = os.path.join(self.directory, "trace")
        command = self.traced(trace, KELVASICTL, "monitor", "--once", "--resources", str(RESOURCES))
        self.serving_daemon()
        run = subprocess.run(command, env=self.environment, capture_output=True, timeout=PATIENCE, check=False)
        self.assertEqual(run.returncode, 0, run.stderr)
        self.assert_unix_sockets_only(trace)

    def test_the_daemon_asks_the_system_for_unix_sockets_only(self):
        self.environment["ASAN_OPTIONS"] = "detect_leaks=0"
        trace = os.path.join(self.directory, "trace")
        world = pathlib.Path(self.directory) / "world.pcap"
        world.write_bytes(pcap(record(0x7131, bytes([0x13, 0x08, 0x02]))))
        command = self.traced(trace, TELVON_SIM, "--technology", "Orvane_GSM", "--replay", str(world), "--leave")
        daemon = self.start(*command)
        daemon.wait_for("telvon-sim: serving")
        monitor = self.monitor(stdout=subprocess.PIPE)
        monitor.wait_for_row('"MM State":"MM_IDLE"')
        self.assertEqual(daemon.status(), 0)
        self.assertEqual(monitor.end(), 0)
        self.assert_unix_sockets_only(trace)


if __name__ == "__main__":
    unittest.main()
