# SPDX-License-Identifier: Apache-2.0
"""kelvasictl top in a pseudo-terminal, as a user sees it."""

import base64
import os
import signal
import termios
import unittest

from live_support import LiveTest
from support import PROGRAM
from terminal_support import KIND, Terminal


class TopTest(LiveTest):
    def setUp(self):
        super().setUp()
        self.has_daemon = False
        os.mkdir(self.path("snapshots"))
        self.environment |= {"TERM": KIND, "LC_ALL": "C.UTF-8", "TZ": "UTC", "HOME": self.directory.name,
                             "KELVASI_LOG_DIRECTORY": self.path("snapshots")}
        for unset in ("NO_COLOR", "COLORTERM", "COLORFGBG", "LINES", "COLUMNS", "XDG_CONFIG_HOME"):
            self.environment.pop(unset, None)

    def top(self, *arguments, columns=80, rows=24, **changes):
        return Terminal(self, [PROGRAM, "top", *arguments], self.environment | changes, columns, rows)

    def live_top(self, *arguments, columns=80, rows=24, technology="Orvane_LTE", begin=370, **changes):
        if not self.has_daemon:
            self.start_daemon("--start-at", str(begin), technology=technology)
        self.has_daemon = True
        terminal = self.top(*arguments, columns=columns, rows=rows, **changes)
        terminal.await_text("Updated 20")
        return terminal


class Screen(TopTest):
    def test_cockpit_and_panes_are_there_without_a_key(self):
        lines = self.live_top().await_text("RSRP", "dBm", "Cells", "Events", "q quit")
        self.assertRegex(lines[0], r"^LTE.*● live \d\.\d s$")
        self.assertRegex(lines[1], r"^B7 2680 MHz  PCI \d+  TAC \d+")
        self.assertIn("── Kelvasi ──", "\n".join(lines))

    def test_every_size_has_its_screen(self):
        terminal = self.live_top()
        for columns, rows in ((40, 12), (99, 30), (120, 40), (200, 60), (300, 100), (2, 2), (1, 1), (80, 24)):
            terminal.resize(columns, rows)
            if columns >= 40:
                terminal.await_screen(lambda lines: lines[-1].startswith("Updated") and "dBm" in "\n".join(lines))
            else:
                terminal.read_for(0.3)
        terminal.press("q")
        self.assertEqual(terminal.wait(), 0)

    def test_panes_open_and_close(self):
        terminal = self.live_top()
        terminal.press("enter")
        terminal.await_text("── Serving Cell ──", "Serving Cell Info")
        terminal.press("down", "right")
        terminal.await_text("── Serving Cell / Serving Cell Measurements ──", " of 18 ──", "E-ARFCN")
        terminal.press("end")
        terminal.await_text("-18 of 18")
        terminal.press("escape")
        terminal.await_text("── Serving Cell ──")
        terminal.press("left")
        terminal.await_text("── Kelvasi ──")

    def test_search_leads_to_a_row(self):
        terminal = self.live_top()
        terminal.press("/", *"measured rsrp")
        terminal.await_text("Measured RSRP  LTE")
        terminal.press("enter")
        terminal.await_text("── Serving Cell / Serving Cell Measurements ──")
        terminal.press("y")
        terminal.await_text("── Measured RSRP ──", "3GPP TS 36.214")
        terminal.press("escape", "*")
        terminal.await_text("── Pins ──", "Pinned to the cockpit")
        terminal.press("*")
        terminal.await_gone("── Pins ──")

    def test_a_value_is_copied(self):
        terminal = self.live_top()
        terminal.press("/", *"e-arfcn", "enter")
        terminal.await_text("E-ARFCN", "── Serving Cell / ")
        terminal.press("c")
        terminal.await_text("Copied")
        self.assertIn(b"\x1b]52;c;" + base64.b64encode(b"3350") + b"\a", terminal.received)

    def test_the_display_can_be_held(self):
        terminal = self.live_top()
        terminal.press("P")
        terminal.await_text("PAUSED at ", "0 newer", "□ held at ")
        terminal.await_text("2 newer")
        terminal.press("[")
        terminal.await_text("3 newer")
        terminal.press("S")
        terminal.await_text("Go on first (P)")
        terminal.press("P")
        terminal.await_text("● live", "Updated")

    def test_a_snapshot_is_saved_with_its_description(self):
        terminal = self.live_top()
        terminal.press("S")
        terminal.await_text("── Save a snapshot ──", "DLF binary (")
        terminal.press(*"at the junction", "enter")
        terminal.await_text("Snapshot saved: ")
        (name,) = os.listdir(self.path("snapshots"))
        self.assertRegex(name, r"^KelvasiSnapshot-\d+\.kelvasi$")
        path = os.path.join("snapshots", name)
        self.assertIn(b"<string>at the junction</string>", self.read(path))
        self.assertEqual(os.stat(self.path(path)).st_mode & 0o777, 0o600)

    def test_chart_help_events_cells_and_a_mark(self):
        terminal = self.live_top()
        terminal.press("G")
        terminal.await_text("── Chart, 5 min ──", "serving")
        terminal.press("+")
        terminal.await_text("── Chart, 2 min ──")
        terminal.press("escape", "?")
        terminal.await_text("── Keys ──", "quit")
        terminal.press("escape", "L")
        terminal.await_text("── Cells and carriers ──")
        terminal.press("escape", "M")
        terminal.await_text("── Marked ──", "Note:")
        terminal.press(*"bridge", "enter")
        terminal.await_text("── Kelvasi ──")
        terminal.press("E")
        terminal.await_text("── Events ──")

    def test_the_mouse_opens_a_row(self):
        terminal = self.live_top()
        row = next(at for at, line in enumerate(terminal.lines()) if line.startswith("Serving Cell"))
        terminal.press(f"\x1b[M {chr(33 + 5)}{chr(33 + row)}")
        terminal.await_text("── Serving Cell ──")


class Looks(TopTest):
    def test_colours(self):
        self.assertGreater(len(self.live_top().screen.colours()), 3)

    def test_no_colours_where_none_are_wanted(self):
        self.assertEqual(self.live_top(NO_COLOR="1").screen.colours(), {"default"})

    def test_a_theme_file(self):
        theme = self.write("my.theme", b"# mine\nsecondary #ff0000\n")
        terminal = self.live_top("--theme", theme)
        self.assertIn("196", terminal.screen.colours())

    def test_a_bad_theme_file_is_told(self):
        theme = self.write("my.theme", b"# mine\nlamp #ff0000\n")
        terminal = self.top("--theme", theme)
        self.assertEqual(terminal.wait(), 1)
        self.assertIn(f"{theme}: line 2: there is no role \"lamp\"", str(terminal).replace("\n", ""))

    def test_ascii(self):
        terminal = self.live_top(LC_ALL="C")
        lines = terminal.await_text("-- Kelvasi --", "* live")
        self.assertTrue(all(line.isascii() for line in lines))
        self.assertTrue(terminal.received.isascii())


class Ends(TopTest):
    def assert_left_as_it_was(self, terminal):
        self.assertEqual(termios.tcgetattr(terminal.side), terminal.modes)
        self.assertTrue(terminal.received.rstrip(b"\r\n").count(b"\x1b[?1049h") <= terminal.received.count(b"\x1b[?1049l"))

    def test_q_quits(self):
        terminal = self.live_top()
        terminal.press("q")
        self.assertEqual(terminal.wait(), 0)
        self.assert_left_as_it_was(terminal)

    def test_signals_end_it_well(self):
        for number in (signal.SIGINT, signal.SIGTERM, signal.SIGHUP):
            terminal = self.live_top()
            os.kill(terminal.process, number)
            self.assertEqual(terminal.wait(), 0)
            self.assert_left_as_it_was(terminal)

    def test_a_fault_leaves_the_terminal_as_it_was(self):
        for number in (signal.SIGABRT, signal.SIGSEGV):
            terminal = self.live_top()
            os.kill(terminal.process, number)
            self.assertEqual(terminal.wait(), -number)
            self.assert_left_as_it_was(terminal)

    def test_the_terminal_goes_away(self):
        terminal = self.live_top()
        terminal.hang_up()
        self.assertIn(terminal.wait(), (0, -signal.SIGHUP))

    def test_it_stops_and_goes_on(self):
        self.start_daemon("--start-at", "370", technology="Orvane_LTE")
        shell = f"{PROGRAM} top; echo STOPPED; read x; fg >/dev/null; echo ENDED $?"
        terminal = Terminal(self, ["bash", "-m", "-c", shell], self.environment)
        terminal.await_text("Updated 20")
        modes = termios.tcgetattr(terminal.side)
        terminal.press("\x1a")
        terminal.await_text("STOPPED")
        self.assert_left_as_it_was(terminal)
        terminal.screen.reset()
        terminal.press("enter")
        terminal.await_text("RSRP", "── Kelvasi ──")
        self.assertEqual(termios.tcgetattr(terminal.side), modes)
        self.assertGreater(terminal.received.rindex(b"\x1b[?1h"), terminal.received.rindex(b"\x1b[?1l"))  # arrows' keys
        terminal.press("q")
        terminal.await_text("ENDED 0")

    def test_an_output_that_is_no_terminal(self):
        result = self.run_program("top")
        self.assert_fault(result, "the standard output is no terminal")

    def test_terminals_that_cannot(self):
        for kind, words in (("", "TERM is not set"), ("nonesuch", "nonesuch"), ("dumb", "cannot move its cursor")):
            terminal = self.top(TERM=kind)
            self.assertEqual(terminal.wait(), 1)
            self.assertIn(words, str(terminal))

    def test_what_is_said_meanwhile_comes_behind(self):
        terminal = self.top()
        terminal.await_text("Connecting...")
        terminal.press("q")
        self.assertEqual(terminal.wait(), 0)
        self.assertIn("waiting for a telephony daemon", str(terminal).replace("\n", ""))
        self.assertLess(terminal.received.index(b"\x1b[?1049l"), terminal.received.index(b"waiting"))


if __name__ == "__main__":
    unittest.main()
