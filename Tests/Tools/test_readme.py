# SPDX-License-Identifier: Apache-2.0
"""The commands that README gives for a first look, as they stand there."""

import os
import pathlib
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
    def test_the_first_capture_can_be_recorded_and_decoded(self):
        commands = "\n".join(block_after("A first look at a live link"))
        for name, program in (("kelvasictl", PROGRAM), ("telvon-sim", DAEMON)):
            self.assertIn(PREFIX + name, commands)
            commands = commands.replace(PREFIX + name, program)
        os.mkdir(self.path("run"), 0o700)
        result = subprocess.run(["bash", "-e", "-c", commands], cwd=self.directory.name, env=self.environment,
                                capture_output=True, timeout=60, check=False)
        error = result.stderr.decode()
        self.assertEqual(result.returncode, 0, error)
        self.assertRegex(error, r"[1-9]\d* messages recorded in drive.pcap\n")
        self.assertIn("drive.pcap: Orvane_GSM\n", error)
        self.assertIn("/GSM/", result.stdout.decode())


if __name__ == "__main__":
    unittest.main()
