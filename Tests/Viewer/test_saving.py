# SPDX-License-Identifier: Apache-2.0
"""Snapshots: saved, not saved and not to be saved."""

import calendar
import glob
import os
import plistlib
import re
import resource
import stat
import struct
import time
import unittest

from support import GMM_REGISTERED, MM_IDLE, pcap
from viewer_support import COPY, ViewerTest

ALERT = {"title": "File Error", "message": "Unable to write file to disk", "button": "Close"}
BUILD_TEXT = re.compile(rb"[A-Z][a-z]{2} [ \d]\d \d{4} \d\d:\d\d")


def version_report(build_text, created):
    """The first record of a DLF made in UTC."""
    report = struct.pack("<HH8xHH", 161, 0x1FFD, 1, 1)
    report += struct.pack("7s16s24x18s", b"Kelvas", b"EXECUTABLE_NAME", build_text)
    return report + struct.pack("<IhH72x", created, 0, 0)


class Saving(ViewerTest):
    def start_world(self, *arguments):
        self.start_daemon(*arguments)
        viewer = self.start_viewer()
        viewer.await_updated()
        return viewer

    def replay(self, *messages):
        return self.start_world("--replay", self.write("world.pcap", pcap(*messages)))

    def snapshots(self):
        return sorted(glob.glob(os.path.join(self.path("snapshots"), "*")))

    def saved(self):
        """The one snapshot, as another program reads it."""
        (path,) = self.snapshots()
        self.assertRegex(os.path.basename(path), r"^KelvasiSnapshot-\d+\.kelvasi$")
        with open(path, "rb") as file:
            contents = file.read()
        self.assertTrue(contents.startswith(b"<?xml"))
        return plistlib.loads(contents)

    def save(self, viewer, description=""):
        viewer.do("press Ctrl+S", *([f"type {description}"] if description else []), "click Save")
        viewer.await_state(lambda state: state["saveView"] is None)

    def assert_dlf(self, dlf, records, before, after):
        build_text = dlf[63:81].rstrip(b"\0")
        (created,) = struct.unpack_from("<I", dlf, 81)
        self.assertRegex(build_text, BUILD_TEXT)
        self.assertTrue(int(before) <= created <= after)
        self.assertEqual(dlf, version_report(build_text, created) + records)

    def test_the_save_view_lists_what_will_be_saved(self):
        viewer = self.replay(MM_IDLE)
        viewer.do("click Save")
        shown = viewer.state()
        self.assertEqual(shown["saveView"]["description"], "")
        texts = [row[0] for row in shown["saveView"]["rows"]]
        self.assertRegex(texts[0], r"^Snapshot \(.+\)$")
        self.assertEqual(texts[1:], [f"DLF binary ({161 + len(MM_IDLE) - 1} bytes)"])
        self.assertEqual(sorted(shown["buttons"]), ["Cancel", "Save"])

    def test_a_snapshot_holds_the_messages_that_were_sent_byte_for_byte(self):
        # What came in one interval loses the first byte of all, not of each message.
        capture = self.write("world.pcap", pcap(MM_IDLE, GMM_REGISTERED, (3.0, MM_IDLE)))
        self.start_daemon("--replay", capture)
        viewer = self.start_viewer()
        viewer.do("await-status Updated", "await-update")
        viewer.state()
        before = time.time()
        self.save(viewer, "at the bench")
        snapshot = self.saved()
        self.assertEqual(list(snapshot), ["Timestamp", "Data", "Description"])
        self.assertEqual(snapshot["Description"], "at the bench")
        stamp = calendar.timegm(time.strptime(snapshot["Timestamp"], "%Y-%m-%d %H:%M:%S +0000"))
        self.assertTrue(int(before) <= stamp <= time.time())
        first, second, dlf = snapshot["Data"]
        self.assertEqual(first["DisplayState"], MM_IDLE + GMM_REGISTERED)
        self.assertEqual(second["DisplayState"], MM_IDLE)
        self.assertEqual(second["Display"]["Process PS"]["MM State"], "GMM_REGISTERED")
        self.assertEqual(dlf["Description"], f"DLF binary ({len(dlf['DLF'])} bytes)")
        self.assert_dlf(dlf["DLF"], MM_IDLE[1:] + GMM_REGISTERED + MM_IDLE[1:], before, time.time())

    def test_a_save_says_where_the_file_is_until_its_path_is_copied(self):
        viewer = self.replay(MM_IDLE)
        self.save(viewer)
        [path] = self.snapshots()
        state = viewer.state()
        self.assertEqual(state["notice"], {"message": "Snapshot saved", "path": path})
        self.assertIn("Copy path", state["buttons"])
        viewer.do("click Copy path")
        self.assertIsNone(viewer.state()["notice"])

    def test_a_failed_save_keeps_the_description_for_the_next(self):
        self.environment["KELVASI_LOG_DIRECTORY"] = self.path("later")
        viewer = self.replay(MM_IDLE)
        self.save(viewer, "call dropped")
        self.assertIsNone(viewer.state()["notice"])
        viewer.do("click Close", "press Ctrl+S")
        self.assertEqual(viewer.state()["saveView"]["description"], "call dropped")
        os.mkdir(self.path("later"))
        viewer.do("click Save")
        viewer.await_state(lambda state: state["saveView"] is None and state["notice"])
        viewer.do("press Ctrl+S")
        self.assertEqual(viewer.state()["saveView"]["description"], "")

    def test_no_more_than_the_last_five_updates_are_saved(self):
        viewer = self.start_world("--scenario", "drive")
        viewer.do(*["await-update"] * 5, "click Save")  # the sixth interval
        texts = [row[0] for row in viewer.state()["saveView"]["rows"]]
        self.assertEqual([text.partition(" (")[0] for text in texts], ["Snapshot"] * 5 + ["DLF binary"])
        self.assertEqual(texts[:5], sorted(set(texts[:5])))
        viewer.do("click Save")
        viewer.await_state(lambda state: state["saveView"] is None)
        self.assertEqual([entry["Description"] for entry in self.saved()["Data"]], texts)

    def test_an_untouched_field_is_saved_as_an_empty_description(self):
        self.save(self.replay(MM_IDLE))
        self.assertEqual(self.saved()["Description"], "")

    def test_without_a_daemon_only_the_time_is_saved(self):
        self.save(self.start_viewer(), "never connected")
        self.assertEqual(list(self.saved()), ["Timestamp"])

    def test_what_arrives_while_the_view_is_open_is_not_saved(self):
        viewer = self.start_world("--scenario", "drive")
        viewer.do("click Save")
        rows = viewer.state()["saveView"]["rows"]
        viewer.do("await-update", "await-update")
        self.assertEqual(viewer.state()["saveView"]["rows"], rows)
        viewer.do("click Save")
        viewer.await_state(lambda state: state["saveView"] is None)
        self.assertEqual([[entry["Description"]] for entry in self.saved()["Data"]], rows)

    def test_two_presses_of_save_present_one_view(self):
        viewer = self.replay(MM_IDLE)
        viewer.do("click-twice Save")
        self.assertIsNotNone(viewer.state()["saveView"])
        viewer.do("click Cancel")
        self.assertIsNone(viewer.state()["saveView"])
        self.assertEqual(self.snapshots(), [])

    def test_two_presses_in_the_view_save_and_close_it_once(self):
        viewer = self.replay(MM_IDLE)
        viewer.do("click Save", "click-twice Save")
        state = viewer.await_state(lambda state: state["saveView"] is None)
        self.assertEqual((state["title"], state["alert"]), ("Kelvasi", None))
        self.assertIn(len(self.snapshots()), (1, 2))  # named after the second in which Save was pressed

    def test_cancel_writes_nothing(self):
        viewer = self.replay(MM_IDLE)
        viewer.do("press Ctrl+S", "type discarded", "click Cancel")
        viewer.await_state(lambda state: state["saveView"] is None)
        self.assertEqual(self.snapshots(), [])

    def test_it_may_end_with_the_view_open(self):
        viewer = self.replay(MM_IDLE)
        viewer.do("click Save")
        self.assertEqual((viewer.close(), viewer.said()), (0, ""))

    def test_it_may_end_with_an_alert_over_the_panes(self):
        self.environment["KELVASI_LOG_DIRECTORY"] = self.path("missing")
        viewer = self.replay(MM_IDLE)
        viewer.do("click Save", "click Save")
        viewer.await_state(lambda state: state["alert"] is not None and state["saveView"] is None)
        self.assertEqual((viewer.close(), viewer.said()), (0, ""))

    def assert_alert_and_life_after_it(self, viewer):
        """One alert over the panes, which go on."""
        viewer.do("press Ctrl+S", "click Save")
        state = viewer.await_state(lambda state: state["alert"] is not None)
        self.assertEqual(state["alert"], ALERT)
        state = viewer.await_state(lambda state: state["saveView"] is None)
        self.assertEqual((state["alert"], state["buttons"]), (ALERT, ["Close"]))
        viewer.do("await-update", "click Close")
        self.assertIsNone(viewer.await_state(lambda state: state["alert"] is None)["saveView"])
        viewer.do("await-update")
        self.assertIn(["Process CS"], viewer.state()["rows"])

    def test_a_missing_directory_gives_one_alert(self):
        self.environment["KELVASI_LOG_DIRECTORY"] = self.path("missing")
        self.assert_alert_and_life_after_it(self.start_world("--scenario", "drive"))
        self.assertFalse(os.path.exists(self.path("missing")))

    def start_copy(self):
        return self.start_viewer("--log-stderr", program=COPY, cwd=self.directory.name)

    def test_a_directory_that_cannot_be_written_gives_one_line_and_one_alert(self):
        self.environment |= {"KELVASI_LOG_DIRECTORY": "/proc/self", "KELVASI_LOG_LEVEL": "err"}  # not even root can
        self.write("internal-install", b"")
        self.start_daemon("--scenario", "drive")
        viewer = self.start_copy()
        viewer.await_updated()
        self.assert_alert_and_life_after_it(viewer)
        viewer.close()
        lines = [line for line in viewer.said().splitlines() if "snapshot" in line.lower()]
        self.assertEqual(len(lines), 1, lines)
        self.assertRegex(lines[0], r"^<3>Unable to write snapshot to /proc/self/KelvasiSnapshot-\d+\.kelvasi$")

    def test_without_the_marker_there_is_nothing_to_save_with(self):
        self.start_daemon("--scenario", "drive")
        viewer = self.start_copy()
        self.assertEqual(viewer.await_updated()["buttons"], [])
        viewer.do("press Ctrl+S")
        self.assertIsNone(viewer.state()["saveView"])

    def test_with_the_marker_there_is_a_save_button(self):
        self.write("internal-install", b"")
        self.assertEqual(self.start_copy().state()["buttons"], ["Save"])

    def test_a_full_disk_gives_one_alert(self):
        self.start_daemon("--scenario", "drive")
        # Files of 512 bytes and no more; the signal that would tell of it stays ignored.
        viewer = self.start_viewer(
            restore_signals=False, preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_FSIZE, (512, 512)))
        viewer.await_updated()
        self.assert_alert_and_life_after_it(viewer)

    def test_the_directory_is_made_where_none_is_configured(self):
        del self.environment["KELVASI_LOG_DIRECTORY"]
        self.environment["XDG_STATE_HOME"] = self.path("state")
        self.save(self.replay(MM_IDLE))
        directory = os.path.join(self.path("state"), "kelvasi")
        (name,) = os.listdir(directory)
        modes = [stat.S_IMODE(os.stat(path).st_mode) for path in (directory, os.path.join(directory, name))]
        self.assertEqual(modes, [0o700, 0o600])


if __name__ == "__main__":
    unittest.main()
