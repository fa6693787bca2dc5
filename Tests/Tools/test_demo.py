"""./demo, in a checkout of which everything but its own work has been done."""

import os
import pathlib
import shutil
import signal
import unittest

from live_support import DAEMON, PATIENCE, LiveTest
from support import PROGRAM

SOURCES = pathlib.Path(__file__).resolve().parent.parent.parent


class Demo(LiveTest):
    def setUp(self):
        super().setUp()
        checkout = pathlib.Path(self.path("checkout"))
        tools = checkout / "build" / "release" / "Tools"
        tools.mkdir(parents=True)
        for program in (PROGRAM, DAEMON):
            (tools / pathlib.Path(program).name).symlink_to(program)
        (tools.parent / "build.ninja").touch()
        self.demo = shutil.copy(SOURCES / "demo", checkout)
        self.write_script(checkout / "setup")
        self.write_script(checkout / "bin" / "cmake")
        self.temporary = pathlib.Path(self.path("temporary"))
        self.temporary.mkdir()
        self.environment |= {
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

    def check_ended(self, demo, status=0, errors=""):
        text = demo.communicate(timeout=PATIENCE)[1].decode()
        self.assertEqual((demo.returncode, text), (status, errors))
        self.assertEqual(self.rest(), [])
        self.assertEqual(list(self.temporary.iterdir()), [])

    def test_the_stated_time_ends_it_well(self):
        demo = self.start_demo("--seconds", "5")
        self.assertIn(b"/Registration/Process CS/MM State", demo.stdout.read())
        self.check_ended(demo)

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
        self.check_ended(demo, 1, "kelvasictl: standard output: Broken pipe\n")


if __name__ == "__main__":
    unittest.main()
