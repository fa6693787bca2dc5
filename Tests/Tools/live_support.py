# SPDX-License-Identifier: Apache-2.0
"""telvon-sim and live verbs of kelvasictl as processes of a test."""

import os
import signal
import struct
import subprocess
import time

from support import PROGRAM, TEMPLATES, KelvasictlTest

DAEMON = os.environ["TELVON_SIM"]
PATIENCE = 60  # seconds; long enough for a loaded machine, and reached only by a failure


def packets(contents):
    """The messages of a pcap file and their times; raises where the file does not end with a whole packet."""
    found = []
    at = 24
    while at < len(contents):
        second, microsecond, size, _ = struct.unpack_from("<IIII", contents, at)
        message = contents[at + 16:at + 16 + size]
        if len(message) < size:
            raise ValueError(f"the packet at byte {at} is cut")
        found.append((second + microsecond / 1e6, message))
        at += 16 + size
    return found


class LiveTest(KelvasictlTest):
    def setUp(self):
        super().setUp()
        self.environment["TELVON_RUNTIME_DIR"] = self.path("run")

    def start(self, command, **options):
        options = {"stdout": subprocess.PIPE, "stderr": subprocess.PIPE, "env": self.environment} | options
        process = subprocess.Popen([str(piece) for piece in command], **options)
        self.addCleanup(self.stop, process)
        return process

    def stop(self, process):
        process.kill()
        process.wait()
        for stream in (process.stdout, process.stderr):
            if stream:
                stream.close()

    def start_daemon(self, *arguments, technology="Orvane_GSM"):
        """Returns when the daemon can be reached."""
        daemon = self.start([DAEMON, "--technology", technology, *arguments])
        self.await_line(daemon, "serving")
        return daemon

    def await_line(self, daemon, text):
        for line in daemon.stderr:
            if text in line.decode():
                return
        self.fail(f"the daemon ended before it said {text!r}")

    def start_live(self, verb, *arguments, resources=TEMPLATES, **options):
        return self.start([PROGRAM, verb, "--resources", resources, *arguments], **options)

    def end(self, process, number=signal.SIGINT):
        """Ends a process with a signal; its status and what it wrote since it was last read."""
        process.send_signal(number)
        out, error = process.communicate(timeout=PATIENCE)
        return process.returncode, out, error.decode()

    def wait_until(self, condition):
        deadline = time.monotonic() + PATIENCE
        while not condition():
            self.assertLess(time.monotonic(), deadline, "waited in vain")
            time.sleep(0.01)
