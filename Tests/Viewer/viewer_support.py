# SPDX-License-Identifier: Apache-2.0
"""The viewer as a process of a test, without a display, led by a script (Docs/viewer-script.md)."""

import json
import os
import signal
import subprocess
import time

from live_support import PATIENCE, LiveTest
from support import TEMPLATES

VIEWER = os.environ["KELVASI"]
COPY = os.environ["KELVASI_COPY"]  # its marker is a file in its working directory


class Viewer:
    """A running viewer. Commands are done one after the other; state() waits for those before it."""

    def __init__(self, test, environment, *arguments, program=VIEWER, **options):
        self.test = test
        self.errors = open(test.path("viewer-errors"), "wb")
        test.addCleanup(self.errors.close)
        self.process = test.start([program, "--script", "-", *arguments], env=environment, stdin=subprocess.PIPE,
                                  stderr=self.errors, **options)
        test.addCleanup(self.process.stdin.close)

    def do(self, *commands):
        for command in commands:
            self.process.stdin.write(command.encode() + b"\n")
        self.process.stdin.flush()

    def state(self):
        self.do("state")
        for line in self.process.stdout:
            if line.startswith(b"{"):  # not a trace of a generator that went
                return json.loads(line)
        return self.test.fail(f"the viewer ended: {self.said()}")

    def await_state(self, condition):
        deadline = time.monotonic() + PATIENCE
        while not condition(state := self.state()):
            self.test.assertLess(time.monotonic(), deadline, f"waited in vain: {state}")
            time.sleep(0.02)
        return state

    def await_updated(self):
        return self.await_state(lambda state: state["status"].startswith("Updated"))

    def said(self):
        return self.test.read("viewer-errors").decode()

    def close(self):
        """Ends the script and so the viewer; its status."""
        self.process.stdin.close()
        return self.process.wait(PATIENCE)

    def interrupt(self, number=signal.SIGTERM):
        self.process.send_signal(number)
        return self.process.wait(PATIENCE)


class ViewerTest(LiveTest):
    def setUp(self):
        super().setUp()
        os.mkdir(self.path("snapshots"))
        for unset in ("DISPLAY", "WAYLAND_DISPLAY", "DBUS_SESSION_BUS_ADDRESS", "QT_SCALE_FACTOR"):
            self.environment.pop(unset, None)
        self.environment |= {
            "HOME": self.directory.name,
            "KELVASI_LOG_DIRECTORY": self.path("snapshots"),
            "KELVASI_RESOURCES": str(TEMPLATES),
            "TZ": "UTC",
            "XDG_CONFIG_HOME": self.path("config"),
            "XDG_RUNTIME_DIR": self.directory.name,
        }
        self.use_screen(2560, 2048)

    def use_screen(self, width, height):
        screen = {"name": "screen", "x": 0, "y": 0, "width": width, "height": height}
        path = self.write("screen.json", json.dumps({"screens": [screen]}).encode())
        self.environment["QT_QPA_PLATFORM"] = "offscreen:configfile=" + path

    def start_viewer(self, *arguments, **options):
        return Viewer(self, self.environment, *arguments, **options)

    def preference_file(self, domain):
        return os.path.join(self.path("config"), "preferences", domain + ".ini")
