# SPDX-License-Identifier: Apache-2.0
"""A daemon and applications of several users, who meet where TELVON_GROUP names a group on both sides."""

import os
import pathlib
import shutil
import socket
import subprocess
import unittest

from live_support import DAEMON, PATIENCE, LiveTest
from support import PROGRAM, TEMPLATES

SYSTEM, PHONE, STRANGER = 61001, 61002, 61003  # users; none needs a name
GROUP, OTHERS = 62001, 62002


def as_user(user, group, *supplementary):
    groups = [f"--groups={','.join(map(str, supplementary))}"] if supplementary else ["--clear-groups"]
    return ["setpriv", f"--reuid={user}", f"--regid={group}", *groups]


@unittest.skipUnless(os.geteuid() == 0 and shutil.which("setpriv"), "only root can be two users")
class TwoUsers(LiveTest):
    def setUp(self):
        super().setUp()
        for parent in (pathlib.Path(PROGRAM), pathlib.Path(TEMPLATES) / "LTE.plist"):
            if any(not folder.stat().st_mode & 1 for folder in parent.resolve().parents):
                self.skipTest(f"other users have no way to {parent}")
        home = pathlib.Path(self.directory.name)
        home.chmod(0o755)
        place = home / "place"  # which the daemon's user may write to, like /run by the hand of systemd
        place.mkdir()
        os.chown(place, SYSTEM, OTHERS)
        self.meeting = place / "run"
        self.environment |= {"TELVON_RUNTIME_DIR": str(self.meeting), "HOME": "/nonexistent", "TELVON_GROUP": str(GROUP)}
        self.private = {name: value for name, value in self.environment.items() if name != "TELVON_GROUP"}

    def serve(self, user=None, environment=None):
        daemon = self.start([*(user or as_user(SYSTEM, OTHERS, GROUP)), DAEMON, "--technology", "Orvane_GSM", "--start-at",
                             "242"], env=environment or self.environment)
        self.await_line(daemon, "serving")
        return daemon

    def monitor(self, user, *options, environment=None):
        return subprocess.run([*user, PROGRAM, "monitor", "--once", "--resources", TEMPLATES, "--log-stderr", *options],
                              env=environment or self.environment, capture_output=True, text=True, timeout=PATIENCE,
                              check=False)

    def mode(self, *names):
        return oct(self.meeting.joinpath(*names).stat().st_mode & 0o7777)

    def test_users_of_the_group_meet(self):
        daemon = self.serve()
        self.assertEqual((self.mode(), self.mode("applications"), self.mode("telvon")), ("0o2750", "0o3770", "0o660"))
        for user in (as_user(PHONE, OTHERS, GROUP), as_user(PHONE, GROUP), as_user(SYSTEM, GROUP)):
            with self.subTest(user):
                self.assertIn("/Process CS/MM State\t", self.monitor(user).stdout)
        self.assertEqual(self.end(daemon)[0], 0)
        self.assertEqual([path for path in self.meeting.rglob("*") if path.is_socket()], [])

    def test_sockets_that_applications_left_are_removed(self):
        self.end(self.serve())
        left = socket.socket(socket.AF_UNIX)
        left.bind(str(self.meeting / "applications/KelvasiApp.left"))
        os.chown(self.meeting / "applications/KelvasiApp.left", PHONE, GROUP)
        os.chmod(self.meeting / "applications/KelvasiApp.left", 0o660)
        left.close()
        self.serve()
        self.assertEqual(list((self.meeting / "applications").iterdir()), [])

    def refused(self, user, environment, why):
        result = self.monitor(user, "--seconds", "1", environment=environment)
        self.assertEqual(result.stdout, "")
        self.assertIn(why, result.stderr)

    def test_who_is_not_in_the_group_is_refused(self):
        self.serve()
        self.refused(as_user(STRANGER, OTHERS), None, "this process is not in the group of TELVON_GROUP")
        self.refused(as_user(STRANGER, OTHERS), self.environment | {"TELVON_GROUP": str(OTHERS)},
                     "its group is not that of TELVON_GROUP")

    def test_both_sides_have_to_opt_in(self):
        daemon = self.serve()
        self.refused(as_user(PHONE, GROUP), self.private, "belongs to another user")
        self.end(daemon)
        shutil.rmtree(self.meeting)
        self.serve(environment=self.private)
        self.assertEqual(self.mode(), "0o700")
        self.refused(as_user(PHONE, GROUP), None, "its group is not that of TELVON_GROUP")

    # Whom no directory stops: root outside the group.
    def test_a_stranger_who_got_in_is_closed_without_a_byte(self):
        daemon = self.serve()
        with socket.socket(socket.AF_UNIX) as stranger:
            stranger.settimeout(PATIENCE)
            stranger.connect(str(self.meeting / "telvon"))
            self.assertEqual(stranger.recv(1), b"")
        self.assertIn("is of another user (uid 0) and not in the group of TELVON_GROUP; connection closed",
                      self.end(daemon)[2])

    def test_the_group_can_put_nothing_beside_the_daemons_sockets(self):
        self.serve()
        result = subprocess.run([*as_user(PHONE, GROUP), "touch", str(self.meeting / "port")], capture_output=True, text=True,
                                check=False)
        self.assertIn("Permission denied", result.stderr)
        self.assertFalse((self.meeting / "port").exists())

    def test_an_application_waits_for_the_daemon_to_make_the_directory(self):
        self.refused(as_user(SYSTEM, GROUP), None, "No such file or directory")
        self.assertFalse(self.meeting.exists())


if __name__ == "__main__":
    unittest.main()
