# SPDX-License-Identifier: Apache-2.0
"""The panes on a terminal are those of the window, in every technology."""

import subprocess
import unittest

from live_support import DAEMON
from support import PROGRAM
from terminal_support import KIND, Terminal
from viewer_support import VIEWER, ViewerTest

COLUMNS = 99  # the widest screen with everything below each other
ROWS = 100


def shown_rows(lines, columns=COLUMNS):
    """The rows of the pane: each as its name, and its value where it has one; a sign at the edge marks a branch."""
    begin = max(at for at, line in enumerate(lines) if line.startswith("── "))
    return [line for line in lines[begin + 1:-1] if line]


def is_row(line, texts):
    """A row of the window as a line: the value at the right edge, or cut there."""
    if len(texts) == 1 or not texts[1]:
        return line.startswith(texts[0]) and line[len(texts[0]):].strip() in ("›", "")
    name, value = texts
    if not line.startswith(name):
        return False
    rest = line[len(name):].strip()
    return rest == value.strip() or (rest.endswith("…") and value.startswith(rest[:-1]))


class Panes(ViewerTest):
    def compare(self, technology):
        self.environment |= {"TERM": KIND, "LC_ALL": "C.UTF-8"}
        drive = self.path("drive.pcap")
        subprocess.run([DAEMON, "--technology", technology, "--seed", "3", "--write", drive, "--messages", "1500"],
                       env=self.environment, check=True, capture_output=True)
        # A daemon for each, as rows stand in the order in which messages brought them to whoever was there.
        self.start_daemon("--replay", drive, "--speed", "1000", technology=technology)
        self.write("window.ini", b"[Window]\nSize=@Size(600 1900)\n")
        viewer = self.start_viewer("--memory", self.path("window.ini"))
        self.environment["TELVON_RUNTIME_DIR"] = self.path("run2")
        self.start_daemon("--replay", drive, "--speed", "1000", technology=technology)
        terminal = Terminal(self, [PROGRAM, "top"], self.environment, COLUMNS, ROWS)
        viewer.await_updated()
        terminal.await_text("Updated 20")
        self.assert_same(viewer, terminal)
        for place, row in enumerate(viewer.state()["rows"][:4]):
            viewer.do(f"open {row[0]}")
            terminal.press("home", *["down"] * place, "enter")
            self.assert_same(viewer, terminal)
            first = next(iter(viewer.state()["rows"]), ["", ""])
            if len(first) == 1:
                viewer.do(f"open {first[0]}")
                terminal.press("home", "enter")
                self.assert_same(viewer, terminal)
                viewer.do("back")
                terminal.press("escape")
            viewer.do("back")
            terminal.press("escape")

    def assert_same(self, viewer, terminal):
        """At the end of the drive, which both have come to when they agree."""
        def agree(lines):
            self.rows = viewer.state()["rows"]
            shown = shown_rows(lines)
            if not self.rows:
                return shown == ["Nothing received yet"]
            return len(shown) == len(self.rows) and all(map(is_row, shown, self.rows))

        terminal.await_text("── ")
        try:
            terminal.await_screen(agree)
        except AssertionError:
            self.fail(f"the window has {self.rows}, the terminal\n{terminal}")

    def test_gsm(self):
        self.compare("Orvane_GSM")

    def test_cdma(self):
        self.compare("Orvane_CDMA")

    def test_lte(self):
        self.compare("Orvane_LTE")

    def test_utran(self):
        self.compare("Orvane_UTRAN2")

    def test_ifx(self):
        self.compare("IFX")


class Program(ViewerTest):
    def test_it_runs_in_the_terminal_where_that_is_asked_for_or_there_is_no_display(self):
        self.environment |= {"TERM": KIND, "LC_ALL": "C.UTF-8"}
        for arguments in (["--terminal"], []):
            if not arguments:
                del self.environment["QT_QPA_PLATFORM"]
            terminal = Terminal(self, [VIEWER, *arguments], self.environment)
            terminal.await_text("Connecting...", "q quit")
            terminal.press("q")
            self.assertEqual(terminal.wait(), 0)


if __name__ == "__main__":
    unittest.main()
