# SPDX-License-Identifier: Apache-2.0
"""systemd's user units, judged by systemd itself."""

import os
import tempfile
import unittest

from packaging_support import InstalledTest, needs

UNITS = ("telvon-sim", "kelvasi-record", "kelvasi-kiosk")
EXPOSURE = 25  # of 100, as --threshold counts it: 2.5


@needs("systemd-analyze")
class Units(InstalledTest):
    def setUp(self):
        runtime = tempfile.TemporaryDirectory()
        self.addCleanup(runtime.cleanup)
        self.environment = os.environ | {"XDG_RUNTIME_DIR": runtime.name}

    def analyzed(self, unit, *arguments):
        path = self.prefix / f"lib/systemd/user/{unit}.service"
        return self.passes("systemd-analyze", "--user", "--man=no", *arguments, path, env=self.environment)

    def test_they_are_sound(self):
        for unit in UNITS:
            self.assertEqual(self.analyzed(unit, "verify"), "")

    def test_they_are_exposed_little(self):
        for unit in UNITS:
            self.analyzed(unit, "security", "--offline=true", f"--threshold={EXPOSURE}")

    def test_they_start_the_programs_of_their_installation(self):
        for unit in UNITS:
            text = (self.prefix / f"lib/systemd/user/{unit}.service").read_text()
            self.assertIn(f"{self.prefix}/bin/", text)
            self.assertNotIn("@", text.split("[Service]")[0])


if __name__ == "__main__":
    unittest.main()
