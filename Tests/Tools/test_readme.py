# SPDX-License-Identifier: Apache-2.0
"""The commands that README gives for a first look, as they stand there."""

import os
import pathlib
import re
import subprocess
import unittest

from live_support import DAEMON, LiveTest
from support import PROGRAM

README = pathlib.Path(__file__).resolve().parents[2] / "README.md"
PREFIX = "build/release/Tools/"


def block_after(text):
    """The indented lines of the block that follows a line with this text."""
    lines = README.read_text().split(text, 1)[1].splitlines()[1:]
    begin = next(place for place, line in enumerate(lines) if line.startswith("    "))
    end = next(place for place in range(begin, len(lines)) if not lines[place].startswith("    "))
    return [line.strip() for line in lines[begin:end]]


class Readme(LiveTest):
    def run_block(self, text):
        """Runs the commands that follow, with the programs under test; their standard error and output."""
        programs = {"kelvasictl": PROGRAM, "telvon-sim": DAEMON}
        commands = "\n".join(block_after(text))
        self.assertIn(PREFIX, commands)
        commands = re.sub(PREFIX + r"(\S+)", lambda program: programs[program[1]], commands)
        commands = commands.replace(" Docs/", f" {README.parent}/Docs/")
        result = subprocess.run(["bash", "-e", "-c", commands], cwd=self.directory.name, env=self.environment,
                                capture_output=True, timeout=60, check=False)
        self.assertEqual(result.returncode, 0, result.stderr.decode())
        return result.stderr.decode(), result.stdout.decode()

    def test_a_drive_becomes_a_plot(self):
        self.run_block("Without an application and without waiting")
        error, _ = self.run_block("RSRP over time")
        self.assertEqual(error, "kelvasictl: lte.pcap: Orvane_LTE\n")
        self.assertRegex(self.read("rsrp.csv").decode(), r"lte:\d+/\d+,-\d+\.\d\d dBm,")
        self.assertTrue(self.read("rsrp.png").startswith(b"\x89PNG"))

    def test_the_first_capture_can_be_recorded_and_decoded(self):
        os.mkdir(self.path("run"), 0o700)
        error, out = self.run_block("A first look at a live link")
        self.assertRegex(error, r"[1-9]\d* messages recorded in drive.pcap\n")
        self.assertIn("drive.pcap: Orvane_GSM\n", error)
        self.assertIn("/GSM/", out)


if __name__ == "__main__":
    unittest.main()
