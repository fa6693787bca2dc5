# SPDX-License-Identifier: Apache-2.0
"""The viewer with a daemon that comes, goes and comes back."""

import plistlib
import signal
import unittest

from live_support import DAEMON
from support import CAPTURES, MM_IDLE, pcap, record
from viewer_support import ViewerTest

UPDATED = r"^Updated \d{4}-\d\d-\d\d at \d\d:\d\d:\d\d$"


def contexts(*names):
    """The daemon's list of packet-data contexts, shown as an array of as many branches."""
    contents = [{"Name": name} for name in names]
    return record(0x0002, plistlib.dumps(contents), log_type=0xFF)


class Connection(ViewerTest):
    def replay(self, *messages):
        return self.start_daemon("--replay", self.write("world.pcap", pcap(*messages)))

    def test_without_a_daemon_it_goes_on_connecting(self):
        state = self.start_viewer().state()
        self.assertEqual((state["title"], state["status"], state["busy"]), ("Kelvasi", "Connecting...", True))
        self.assertEqual((state["rows"], state["back"]), ([], ""))

    def test_connected_it_shows_rows_and_the_time_of_the_update(self):
        self.replay(MM_IDLE)
        viewer = self.start_viewer()
        state = viewer.await_updated()
        self.assertRegex(state["status"], UPDATED)
        self.assertFalse(state["busy"])
        self.assertIn(["Process CS"], state["rows"])
        viewer.do("open Process CS")
        state = viewer.state()
        self.assertEqual((state["title"], state["back"]), ("Process CS", "Kelvasi"))
        self.assertIn(["MM State", "MM_IDLE"], state["rows"])
        self.assertRegex(state["status"], UPDATED)

    def test_the_daemon_may_come_later(self):
        viewer = self.start_viewer()
        self.assertEqual(viewer.state()["status"], "Connecting...")
        self.replay(MM_IDLE)
        viewer.await_updated()

    def test_a_lost_daemon_is_told_by_the_next_pane_and_its_return_by_the_next_update(self):
        daemon = self.replay(MM_IDLE)
        viewer = self.start_viewer()
        viewer.await_updated()
        daemon.kill()
        daemon.wait()
        viewer.await_state(lambda _: self.goes_connecting(viewer))
        self.assertTrue(viewer.state()["busy"])
        self.assertIn(["Process CS"], viewer.state()["rows"])
        self.replay(MM_IDLE)
        self.assertFalse(viewer.await_updated()["busy"])

    def goes_connecting(self, viewer):
        viewer.do("open Process CS", "back")
        return viewer.state()["status"] == "Connecting..."

    def test_a_pane_whose_branch_vanishes_gives_way_to_the_one_below(self):
        daemon = self.replay((0.0, contexts("first", "second")), (8.0, contexts("first")))
        viewer = self.start_viewer()
        viewer.await_updated()
        daemon.send_signal(signal.SIGSTOP)
        viewer.do("open PDP Context Info", "open 1")
        self.assertEqual((viewer.state()["title"], viewer.state()["rows"]), ("1", [["Name", "second"]]))
        daemon.send_signal(signal.SIGCONT)
        state = viewer.await_state(lambda state: state["title"] != "1")
        self.assertEqual((state["title"], state["rows"]), ("PDP Context Info", [["0"]]))
        self.assertRegex(state["status"], UPDATED)
        viewer.do("back")
        self.assertEqual(viewer.state()["title"], "Kelvasi")

    def test_every_technology_is_shown(self):
        for technology in ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2"):
            with self.subTest(technology):
                name = "ifx_collapse_to_array" if technology == "IFX" else "random_1"
                capture = CAPTURES / technology / f"{name}.pcap"
                daemon = self.start([DAEMON, "--technology", technology, "--replay", capture,
                                     "--speed", "max"])
                self.await_line(daemon, "serving")
                viewer = self.start_viewer()
                self.assertNotEqual(viewer.await_updated()["rows"], [])
                self.assertEqual(viewer.close(), 0)
                daemon.kill()
                daemon.wait()


if __name__ == "__main__":
    unittest.main()
