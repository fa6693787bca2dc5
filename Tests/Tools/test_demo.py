# SPDX-License-Identifier: Apache-2.0
"""./demo, in a checkout of which everything but its own work has been done."""

import functools
import os
import pathlib
import shutil
import signal
import unittest

from live_support import DAEMON, PATIENCE, LiveTest
from support import OUTPUT_CLOSED, PROGRAM

VIEWER = os.environ["KELVASI"]
SOURCES = pathlib.Path(__file__).resolve().parent.parent.parent


# What the first display of each technology shows: lines that are there, and sections that have rows.
FIRST_DISPLAY = {
    "IFX": (
        {"/Power\tOn", "/Network/Packet Switched/State\tGMM_REGISTERED"},
        {"/Network/PLMN", "/Network/Packet Switched/Contexts", "/Serving Cell", "/Neighbor Cells/GSM",
         "/Neighbor Cells/UMTS"}),
    "Orvane_GSM": (
        {"/Registration/Serving PLMN/Service Type\tCS_PS_SERVICE",
         "/Registration/Process CO/MM Service State\tREG_STATE_IDLE"},
        {"/Registration/Process CS", "/Registration/Process PS", "/Registration/Equivalent PLMN List",
         "/GSM/GSM Serving Cell", "/GSM/Neighboring Cells", "/GSM/GSM RR Info", "/GSM/GPRS Information",
         "/GSM/Mobile Allocation", "/UMTS/UMTS RR Info", "/UMTS/UMTS Set", "/UMTS/GSM Set",
         "/Packet Data/PDP Context Info", "/SIM/SIM Info"}),
    "Orvane_CDMA": (
        {"/EV-DO/Device State\tConnected [5]", "/EV-DO/Session State\tOpen [4]"},
        {"/1x/Device State", "/1x/Active Set Ec/Io/", "/1x/Finger C/I/", "/1x System/SID", "/EV-DO/UATI24",
         "/EV-DO/Active Set Pilots/", "/EV-DO Data Rates/Forward Link", "/EV-DO Data Rates/Reverse Link"}),
    "Orvane_LTE": (
        set(),
        {"/Serving Cell/Serving Cell Info", "/Serving Cell/Serving Cell Measurements",
         "/Idle Mode Neighbors/Neighbor Measurements", "/Idle Mode Neighbors/Neighbor Cells List",
         "/Reselection/Reselection Candidates/Serving EARFCN",
         "/Connected Mode/Connected mode LTE Intra-frequency Measurement"}),
    "Orvane_UTRAN2": (
        {"/Serving Cell/RRC Info/State\tCell DCH"},
        {"/Serving Cell/Serving Cell Info", "/Neighbor Cells/Neighbor Cell List", "/Channel Quality/TRCH BLER",
         "/Channel Quality/CCTRCH SIR"}),
}


class Demo(LiveTest):
    def setUp(self):
        super().setUp()
        checkout = pathlib.Path(self.path("checkout"))
        tools = checkout / "build" / "release" / "Tools"
        tools.mkdir(parents=True)
        for program in (PROGRAM, DAEMON, VIEWER):
            (tools / pathlib.Path(program).name).symlink_to(program)
        (tools.parent / "build.ninja").touch()
        self.demo = shutil.copy(SOURCES / "demo", checkout)
        self.write_script(checkout / "setup")
        self.write_script(checkout / "bin" / "cmake")
        self.temporary = pathlib.Path(self.path("temporary"))
        self.temporary.mkdir()
        for unset in ("DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM", "DBUS_SESSION_BUS_ADDRESS"):
            self.environment.pop(unset, None)
        self.pictures = checkout / "build" / "demo"
        self.no_display = f"demo: there is no display; pictures of the viewer go to {self.pictures}\n"
        self.environment |= {
            "HOME": self.path("home"),
            "XDG_RUNTIME_DIR": self.directory.name,
            "PATH": f"{checkout / 'bin'}:{os.environ['PATH']}",
            "TMPDIR": str(self.temporary),
            "KELVASI_RESOURCES": str(SOURCES / "Resources"),
        }

    def write_script(self, path):
        path.parent.mkdir(exist_ok=True)
        path.write_text("#!/bin/sh\n")
        path.chmod(0o755)

    def start_demo(self, *arguments):
        """As from a shell: in a process group of its own."""
        demo = self.start(
            [self.demo, *arguments],
            start_new_session=True,
            preexec_fn=lambda: signal.signal(signal.SIGINT, signal.SIG_DFL),
        )
        self.addCleanup(self.kill_rest)
        return demo

    def rest(self):
        """The processes that were started here and have not ended."""
        mark = f"TMPDIR={self.temporary}".encode()
        found = []
        for process in pathlib.Path("/proc").glob("[0-9]*"):
            try:
                if mark in (process / "environ").read_bytes().split(b"\0"):
                    found.append(int(process.name))
            except OSError:
                pass  # it has ended, or is somebody else's
        return found

    def kill_rest(self):
        for process in self.rest():
            os.kill(process, signal.SIGKILL)

    def check_ended(self, demo, status=0, errors=None):
        text = demo.communicate(timeout=PATIENCE)[1].decode()
        self.assertEqual((demo.returncode, text), (status, self.no_display if errors is None else errors))
        self.assertEqual(self.rest(), [])
        self.assertEqual(list(self.temporary.iterdir()), [])

    def test_the_stated_time_ends_it_well(self):
        demo = self.start_demo("--seconds", "5")
        self.assertIn(b"/Registration/Process CS/MM State", demo.stdout.read())
        self.check_ended(demo)

    def check_first_display(self, technology):
        """A newcomer sees a registered handset and most sections at once."""
        demo = self.start_demo("--technology", technology, "--seconds", "5")
        display = demo.communicate(timeout=PATIENCE)[0].decode().split("\n---\n")[0]
        shown = {line for line in display.splitlines() if line.split("\t")[1] not in ("", "N/A", "(none)")}
        lines, sections = FIRST_DISPLAY[technology]
        self.assertEqual(lines - shown, set())
        empty = {name for name in sections if not any(line.startswith(name) for line in shown)}
        self.assertEqual(empty, set())

    def test_without_a_display_it_leaves_pictures(self):
        self.check_ended(self.start_demo("--seconds", "1"))
        for name in ("root", "deep", "long-value", "save-view"):
            self.assertEqual((self.pictures / f"{name}.png").read_bytes()[:8], b"\x89PNG\r\n\x1a\n")

    def test_the_pictures_are_the_users_own_whatever_was_there(self):
        self.pictures.mkdir(mode=0o755, parents=True)
        (self.pictures / "root.png").touch(mode=0o644)
        self.check_ended(self.start_demo("--seconds", "1"))
        for path in (self.pictures, self.pictures / "snapshots"):
            self.assertEqual(path.stat().st_mode & 0o777, 0o700, path)
        for path in self.pictures.glob("*.png"):
            self.assertEqual(path.stat().st_mode & 0o777, 0o600, path)

    def test_a_display_that_cannot_be_reached_is_none(self):
        self.environment["DISPLAY"] = ":nowhere"
        demo = self.start_demo("--seconds", "1")
        text = demo.communicate(timeout=PATIENCE)[1].decode()
        self.assertIn(self.no_display, text)
        self.assertEqual(demo.returncode, 0)
        self.assertTrue((self.pictures / "save-view.png").exists())

    def test_the_end_of_the_window_ends_it(self):
        # A display for the demo; Qt is told to do without it.
        self.environment |= {"DISPLAY": ":nowhere", "QT_QPA_PLATFORM": "offscreen"}
        demo = self.start_demo("--seconds", "1000")
        for _ in range(3):
            demo.stdout.readline()
        os.kill(self.viewer(), signal.SIGTERM)
        self.check_ended(demo, errors="")

    def test_full_screen_is_handed_on_to_the_window(self):
        self.environment |= {"DISPLAY": ":nowhere", "QT_QPA_PLATFORM": "offscreen"}
        demo = self.start_demo("--seconds", "1000", "--fullscreen")
        for _ in range(3):
            demo.stdout.readline()
        arguments = pathlib.Path(f"/proc/{self.viewer()}/cmdline").read_bytes().split(b"\0")
        self.assertEqual(arguments[1:-1], [b"--fullscreen"])
        demo.terminate()
        self.check_ended(demo, errors="")

    def test_help_names_the_options(self):
        help = self.start_demo("--help").communicate(timeout=PATIENCE)[0].decode()
        self.assertTrue(help.startswith("Sets up, builds"), help)
        for option in ("--technology", "Orvane_GSM", "--seconds", "--fullscreen"):
            self.assertIn(option, help)
        self.assertNotIn("set -euo", help)

    def test_wrong_usage_has_status_2_before_anything_is_set_up(self):
        pathlib.Path(self.demo).with_name("setup").unlink()
        for arguments in (["--wrong"], ["file"], ["--technology"], ["--technology", "LTE"], ["--technology", ""],
                          ["--seconds"], ["--seconds", "soon"], ["--seconds", "-1"], ["--seconds", "."]):
            with self.subTest(arguments):
                demo = self.start_demo(*arguments)
                error = demo.communicate(timeout=PATIENCE)[1].decode()
                self.assertEqual(demo.returncode, 2)
                self.assertRegex(error, r"\Ademo: .*\(try --help\)\n\Z")

    def viewer(self):
        """The process of the viewer that the demo started."""
        for process in self.rest():
            if pathlib.Path(f"/proc/{process}/comm").read_text() == "kelvasi\n":
                return process
        return self.fail("there is no viewer")

    def test_an_interrupt_ends_it_and_all_that_it_started(self):
        demo = self.start_demo("--seconds", "1000")
        demo.stdout.readline()
        os.killpg(demo.pid, signal.SIGINT)
        self.check_ended(demo)

    def test_a_termination_ends_it_and_all_that_it_started(self):
        demo = self.start_demo("--seconds", "1000")
        demo.stdout.readline()
        demo.terminate()
        self.check_ended(demo)

    def test_a_reader_that_leaves_ends_it_and_all_that_it_started(self):
        demo = self.start_demo("--seconds", "1000")
        for _ in range(3):
            demo.stdout.readline()
        demo.stdout.close()
        self.check_ended(demo, OUTPUT_CLOSED, self.no_display)


for name in FIRST_DISPLAY:
    setattr(Demo, f"test_the_first_display_of_{name}", functools.partialmethod(Demo.check_first_display, name))

if __name__ == "__main__":
    unittest.main()
