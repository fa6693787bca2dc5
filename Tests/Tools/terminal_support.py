# SPDX-License-Identifier: Apache-2.0
"""A program in a pseudo-terminal of a test, and what a user sees of it."""

import fcntl
import os
import pty
import select
import signal
import struct
import termios
import time

from live_support import PATIENCE
from screen_model import Screen

# What the model of a screen understands.
KIND = "screen-256color"
KEYS = {"up": "\x1bOA", "down": "\x1bOB", "right": "\x1bOC", "left": "\x1bOD", "enter": "\r", "escape": "\x1b",
        "tab": "\t", "page down": "\x1b[6~", "page up": "\x1b[5~", "home": "\x1b[1~", "end": "\x1b[4~"}


class Terminal:
    """Its lines, its colours, and all bytes that came."""

    def __init__(self, test, command, environment, columns=80, rows=24, leader=None):
        self.test = test
        self.screen = Screen(columns, rows)
        self.received = b""
        self.status = None
        self.process, self.side = pty.fork()
        if self.process == 0:
            fcntl.ioctl(0, termios.TIOCSWINSZ, struct.pack("HHHH", rows, columns, 0, 0))
            if leader:
                leader()
            os.execvpe(str(command[0]), [str(word) for word in command], environment)
        self.modes = termios.tcgetattr(self.side)
        test.addCleanup(self.end)

    def end(self):
        if self.status is None:
            os.kill(self.process, signal.SIGKILL)
            self.wait()
        self.hang_up()

    def hang_up(self):
        if self.side is not None:
            os.close(self.side)
        self.side = None

    def wait(self):
        """Its status as a shell says it; what it still writes is read."""
        deadline = time.monotonic() + PATIENCE
        while self.status is None:
            self.read(0.02)
            ended, status = os.waitpid(self.process, os.WNOHANG)
            if ended:
                self.status = os.waitstatus_to_exitcode(status)
            self.test.assertLess(time.monotonic(), deadline, f"waited in vain for its end: {self}")
        self.read(0.1)
        return self.status

    def read(self, seconds):
        """What comes within a time; whether something did."""
        if self.side is None or not select.select([self.side], [], [], seconds)[0]:
            return False
        try:
            part = os.read(self.side, 65536)
        except OSError:  # the last one has closed the other side
            return False
        self.received += part
        self.screen.feed(part)
        return bool(part)

    def read_for(self, seconds):
        deadline = time.monotonic() + seconds
        while (left := deadline - time.monotonic()) > 0:
            self.read(left)

    def press(self, *keys):
        for key in keys:
            os.write(self.side, KEYS.get(key, key).encode())
            if key == "escape":
                self.read_for(0.1)  # not the beginning of another key

    def lines(self):
        return self.screen.lines()

    def line(self, row):
        return self.lines()[row]

    def await_screen(self, condition):
        deadline = time.monotonic() + PATIENCE
        while not condition(self.lines()):
            self.read(0.05)
            self.test.assertLess(time.monotonic(), deadline, f"waited in vain:\n{self}")
        return self.lines()

    def await_text(self, *texts):
        return self.await_screen(lambda lines: all(any(text in line for line in lines) for text in texts))

    def await_gone(self, text):
        return self.await_screen(lambda lines: not any(text in line for line in lines))

    def resize(self, columns, rows):
        self.screen.resize(columns, rows)
        fcntl.ioctl(self.side, termios.TIOCSWINSZ, struct.pack("HHHH", rows, columns, 0, 0))

    def __str__(self):
        return "\n".join(self.lines())
