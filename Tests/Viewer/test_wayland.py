# SPDX-License-Identifier: Apache-2.0
"""The viewer on a Wayland compositor that draws to nowhere and has neither keyboard nor pointer."""

import os
import plistlib
import subprocess
import unittest

from viewer_support import ViewerTest


class Wayland(ViewerTest):
    def setUp(self):
        super().setUp()
        del self.environment["QT_QPA_PLATFORM"]
        self.environment["WAYLAND_DISPLAY"] = "screen"
        # Qt's part for Wayland leaves leaks in code that is unloaded by the end, which no suppression can name.
        self.environment["ASAN_OPTIONS"] = os.environ.get("ASAN_OPTIONS", "") + ":detect_leaks=0"
        compositor = self.start(
            ["weston", "--backend=headless-backend.so", "--socket=screen", "--idle-time=0", "--no-config"],
            stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        self.wait_until(lambda: os.path.exists(self.path("screen")) or compositor.poll() is not None)
        self.assertIsNone(compositor.poll())

    def test_it_connects_draws_and_is_led_by_keys(self):
        self.start_daemon()
        viewer = self.start_viewer()
        viewer.await_updated()
        viewer.do("open Process CS", f"picture {self.path('pane.png')}")
        self.assertEqual(viewer.state()["title"], "Process CS")
        self.assertEqual(self.read("pane.png")[:8], b"\x89PNG\r\n\x1a\n")
        viewer.do("back")
        self.assertEqual(viewer.state()["title"], "Kelvasi")
        self.assertEqual((viewer.close(), viewer.said()), (0, ""))

    def test_a_described_snapshot_is_saved(self):
        viewer = self.start_viewer()
        viewer.do("press Ctrl+S", "type a b", "press Left", "type c")
        self.assertEqual(viewer.state()["saveView"]["description"], "a cb")
        viewer.do("click Save")
        viewer.await_state(lambda state: state["saveView"] is None)
        [name] = os.listdir(self.path("snapshots"))
        self.assertEqual(plistlib.loads(self.read(os.path.join("snapshots", name))).keys(), {"Timestamp"})

    def test_a_signal_ends_it_well_every_time(self):
        for _ in range(40):  # a race among Qt's threads is lost once in fifteen times or so
            viewer = self.start_viewer()
            viewer.state()
            self.assertEqual((viewer.interrupt(), viewer.said()), (0, ""))


if __name__ == "__main__":
    unittest.main()
