# SPDX-License-Identifier: Apache-2.0
"""The program around the viewer: options, ending, preferences."""

import os
import signal
import subprocess
import unittest

from live_support import DAEMON, PATIENCE
from support import PROGRAM
from viewer_support import VIEWER, ViewerTest

HOME_SCREEN = "[General]\nHomerailShowGSMRSSI=true\n"


class Program(ViewerTest):
    def run_viewer(self, *arguments, **options):
        return subprocess.run([VIEWER, *arguments], env=self.environment, capture_output=True, text=True,
                              timeout=PATIENCE, check=False, **options)

    def test_without_a_display_it_says_so(self):
        del self.environment["QT_QPA_PLATFORM"]
        result = self.run_viewer()
        self.assertEqual(
            (result.returncode, result.stdout, result.stderr),
            (1, "", "kelvasi: there is no display (neither WAYLAND_DISPLAY nor DISPLAY is set)\n"))

    def test_wrong_usage_has_status_2(self):
        for arguments in (["--wrong"], ["file"], ["--appearance", "blue"]):
            with self.subTest(arguments):
                result = self.run_viewer(*arguments)
                self.assertEqual(result.returncode, 2)
                self.assertRegex(result.stderr, r"\Akelvasi: .*\(try --help\)\n\Z")

    def test_help_names_the_options(self):
        result = self.run_viewer("--help")
        self.assertEqual((result.returncode, result.stderr), (0, ""))
        for option in ("--fullscreen", "--appearance", "--script"):
            self.assertIn(option, result.stdout)

    def test_help_and_faults_name_the_looks_as_a_user_gives_them(self):
        self.assertIn("SCHEME:{dark,light,desktop}", self.run_viewer("--help").stdout)
        self.assertEqual(self.run_viewer("--appearance", "blue").stderr,
                         "kelvasi: --appearance: blue not in {dark,light,desktop} (try --help)\n")

    def test_looks_are_named_in_either_case(self):
        for look in ("dark", "Light", "DARK"):
            result = self.run_viewer("--appearance", look, "--script", "-", input="")
            self.assertEqual((result.returncode, result.stderr), (0, ""))

    def test_all_programs_tell_one_version(self):
        told = {subprocess.run([program, "--version"], capture_output=True, check=True).stdout
                for program in (VIEWER, PROGRAM, DAEMON)}
        self.assertEqual(len(told), 1)
        self.assertRegex(told.pop(), rb"\A\d+\.\d+\.\d+\n\Z")

    def test_signals_end_it_well(self):
        for number in (signal.SIGINT, signal.SIGTERM, signal.SIGHUP):
            with self.subTest(number):
                viewer = self.start_viewer()
                viewer.state()
                self.assertEqual(viewer.interrupt(number), 0)
                self.assertEqual(viewer.said(), "")

    def test_the_end_of_a_script_ends_it_well(self):
        viewer = self.start_viewer()
        viewer.do("# nothing to be done", "")
        self.assertEqual(viewer.close(), 0)

    def test_a_script_with_a_fault_ends_it_with_status_1(self):
        for line, why in (("dance", "there is no such command"), ("click Dance", "there is no button Dance"),
                          ("press Dance", "there is no key Dance"),
                          ("picture /nowhere/a.png", "cannot write /nowhere/a.png")):
            with self.subTest(line):
                result = self.run_viewer("--script", "-", input=f"state\n{line}\nstate\n")
                self.assertEqual(result.stderr, f"kelvasi: line 2 of the script: {why}\n")
                self.assertEqual((result.returncode, result.stdout.count("\n")), (1, 1))

    def test_the_last_line_of_a_script_counts_without_a_line_feed_too(self):
        result = self.run_viewer("--script", "-", input="state\nstate")
        self.assertEqual((result.returncode, result.stdout.count("\n")), (0, 2))

    def test_a_script_that_is_not_there_is_a_fault(self):
        result = self.run_viewer("--script", "/nowhere/script")
        self.assertEqual((result.returncode, result.stderr),
                         (1, "kelvasi: /nowhere/script: No such file or directory\n"))

    def test_without_a_place_for_snapshots_it_says_so(self):
        for unset in ("HOME", "KELVASI_LOG_DIRECTORY", "XDG_STATE_HOME"):
            self.environment.pop(unset, None)
        result = self.run_viewer("--script", "-", input="state\n")
        self.assertEqual((result.returncode, result.stderr),
                         (1, "kelvasi: nowhere to save snapshots: none of KELVASI_LOG_DIRECTORY, XDG_STATE_HOME and "
                             "HOME is set\n"))

    def picture_size(self, *options):
        self.run_viewer(*options, "--script", "-", input=f"picture {self.path('window.png')}\n")
        picture = self.read("window.png")
        self.assertEqual(picture[:8], b"\x89PNG\r\n\x1a\n")
        return [int.from_bytes(picture[at:at + 4], "big") for at in (16, 20)]

    def test_a_picture_is_as_large_as_the_window_in_pixels(self):
        self.environment["QT_SCALE_FACTOR"] = "2"
        self.assertEqual(self.picture_size(), [2 * 390, 2 * 844])

    def test_the_window_fills_a_screen_where_it_is_told_to_and_a_phones_anyway(self):
        for screen, options, size in (((1000, 900), [], [390, 844]), ((1000, 900), ["--fullscreen"], [1000, 900]),
                                      ((480, 1000), [], [480, 1000]), ((900, 360), [], [900, 360])):
            with self.subTest(screen=screen, options=options):
                self.use_screen(*screen)
                self.assertEqual(self.picture_size(*options), size)


class Memory(ViewerTest):
    def start_remembering(self, *arguments):
        return self.start_viewer("--memory", self.path("window.ini"), *arguments)

    def test_open_panes_are_opened_again_with_the_first_rows(self):
        self.start_daemon("--scenario", "drive")
        viewer = self.start_remembering()
        viewer.do("open Process CS")
        self.assertEqual((viewer.state()["title"], viewer.close()), ("Process CS", 0))
        viewer = self.start_remembering()
        state = viewer.await_updated()
        self.assertEqual((state["title"], state["back"]), ("Process CS", "Kelvasi"))
        viewer.do("root")
        viewer.state()
        self.assertEqual(viewer.interrupt(), 0)  # a signal's end is one too
        self.assertEqual(self.start_remembering().await_updated()["title"], "Kelvasi")

    def test_a_script_remembers_nothing_by_itself(self):
        self.start_daemon("--scenario", "drive")
        viewer = self.start_viewer()
        viewer.do("open Process CS")
        viewer.close()
        self.assertEqual(self.start_viewer().await_updated()["title"], "Kelvasi")

    def test_the_appearance_is_remembered_until_the_desktops_is_wanted(self):
        ground = {}
        for name, arguments in (("first", []), ("asked", ["--appearance", "dark"]), ("again", []),
                                ("desktop", ["--appearance", "desktop"]), ("last", [])):
            viewer = self.start_remembering(*arguments)
            viewer.do(f"picture {self.path(name + '.png')}")
            self.assertEqual(viewer.close(), 0)
            ground[name] = self.read(name + ".png")
        self.assertEqual(ground["asked"], ground["again"])
        self.assertNotEqual(ground["first"], ground["asked"])
        self.assertEqual((ground["desktop"], ground["last"]), (ground["first"], ground["first"]))

    def test_a_file_that_makes_no_sense_is_no_harm(self):
        for text in (b"[Window]\nSize=@Size(-4 9)\nFillsScreen=perhaps\n", b"\0\xff" * 50,
                     b"[Window]\nSize=@Size(999999999 2)\n[Panes]\nOpen=@Invalid()\n"):
            self.write("window.ini", text)
            viewer = self.start_remembering()
            self.assertEqual(viewer.state()["title"], "Kelvasi")
            self.assertEqual((viewer.close(), viewer.said()), (0, ""))

    def test_the_windows_keys_close_it_and_fill_the_screen(self):
        for keys in ("Ctrl+W", "Ctrl+Q"):
            viewer = self.start_remembering()
            viewer.do("press F11", f"press {keys}")
            self.assertEqual(viewer.process.wait(PATIENCE), 0)
            self.assertIn(b"FillsScreen=true", self.read("window.ini"))
            os.remove(self.path("window.ini"))


class Preferences(ViewerTest):
    def read_home_screen(self):
        with open(self.preference_file("org.kelvasi.Homerail"), encoding="utf-8") as file:
            return file.read()

    def prefer(self, text):
        os.makedirs(os.path.dirname(self.preference_file("")))
        with open(self.preference_file("org.kelvasi.Kelvasi"), "w", encoding="utf-8") as file:
            file.write(f"[General]\nHomerailShowGSMRSSI={text}\n")

    def test_the_signal_strength_is_switched_on_and_stays_so_after_the_end(self):
        viewer = self.start_viewer()
        viewer.state()
        self.assertEqual(self.read_home_screen(), HOME_SCREEN)
        self.assertEqual(viewer.interrupt(), 0)
        self.assertEqual(self.read_home_screen(), HOME_SCREEN)

    def test_a_preference_that_is_not_true_counts_as_absent(self):
        self.prefer("perhaps")
        self.start_viewer().state()
        self.assertEqual(self.read_home_screen(), HOME_SCREEN)

    def test_a_preference_that_is_true_leaves_the_home_screen_alone(self):
        self.prefer("true")
        self.start_viewer().state()
        self.assertFalse(os.path.exists(self.preference_file("org.kelvasi.Homerail")))


if __name__ == "__main__":
    unittest.main()
