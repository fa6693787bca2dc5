# SPDX-License-Identifier: Apache-2.0
"""An installation to look at, and the tools to look with."""

import os
import pathlib
import shutil
import subprocess
import tempfile
import unittest

SOURCES = pathlib.Path(os.environ["SOURCES"])
BUILD = pathlib.Path(os.environ["BUILD"])
PROGRAMS = {path.name: path for path in (pathlib.Path(os.environ[name]) for name in
                                         ("KELVASI", "KELVASICTL", "TELVON_SIM"))}
PATIENCE = 60


def needs(tool):
    return unittest.skipUnless(shutil.which(tool), f"{tool} is missing; ./setup installs it")


def run(*command, **options):
    options = {"capture_output": True, "text": True, "timeout": PATIENCE, "check": False} | options
    return subprocess.run([*map(str, command)], **options)


class InstalledTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        directory = tempfile.TemporaryDirectory()
        cls.addClassCleanup(directory.cleanup)
        cls.prefix = pathlib.Path(directory.name, "usr")
        run(os.environ["CMAKE"], "--install", BUILD, "--prefix", cls.prefix, check=True)

    def passes(self, *command, **options):
        result = run(*command, **options)
        self.assertEqual(result.returncode, 0, result.stdout + result.stderr)
        return result.stdout + result.stderr
