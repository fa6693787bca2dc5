# SPDX-License-Identifier: Apache-2.0
"""Runs kelvasictl, and writes captures by hand."""

import os
import pathlib
import re
import resource
import struct
import subprocess
import tempfile
import unittest

PROGRAM = os.environ["KELVASICTL"]
CAPTURES = pathlib.Path(__file__).resolve().parent.parent / "Captures"
TEMPLATES = CAPTURES / "templates"

USER0 = 147
OUTPUT_CLOSED = 141  # the status where nobody reads the output any more
START = 1709647629  # 2024-03-05 14:07:09 UTC


def record(code, payload, log_type=1, stamp=bytes(8)):
    """A log-channel message with a true length field."""
    header = struct.pack("<HH", 12 + len(payload), code) + stamp
    return bytes([log_type]) + header + payload


# Process PS shows "MM State" GMM_REGISTERED and others; Process CS shows MM_IDLE, MM_NORMAL_SERVICE.
GMM_REGISTERED = record(0x7130, bytes([0x03, 0x09, 0x01]))
GMM_DEREGISTERED = record(0x7130, bytes([0x01, 0x09, 0x01]))
MM_IDLE = record(0x7131, bytes([0x13, 0x08, 0x02]))


def packet(message, time=0.0, fraction=1_000_000):
    second = int(time)
    return struct.pack("<IIII", START + second, round((time - second) * fraction), len(message), len(message)) + message


def pcap(*messages, link_type=USER0, magic=0xA1B2C3D4):
    """Messages, or pairs of a time in seconds and a message."""
    fraction = 1_000_000_000 if magic == 0xA1B23C4D else 1_000_000
    timed = [message if isinstance(message, tuple) else (0.0, message) for message in messages]
    header = struct.pack("<IHHiIII", magic, 2, 4, 0, 0, 262144, link_type)
    return header + b"".join(packet(message, time, fraction) for time, message in timed)


def pcapng(*messages):
    def block(kind, body):
        size = 12 + len(body)
        return struct.pack("<II", kind, size) + body + struct.pack("<I", size)

    def enhanced(message):
        padding = bytes(-len(message) % 4)
        time = START * 1_000_000
        return struct.pack("<IIIII", 0, time >> 32, time & 0xFFFFFFFF, len(message), len(message)) + message + padding

    section = block(0x0A0D0D0A, struct.pack("<IHHq", 0x1A2B3C4D, 1, 0, -1))
    interface = block(1, struct.pack("<HHI", USER0, 0, 262144))
    return section + interface + b"".join(block(6, enhanced(message)) for message in messages)


def without_count(error):
    """The standard error less its last line, where that says how many messages were not shown."""
    return re.sub(rb"kelvasictl: \S+ % of [\d,]+ messages? (was|were) not shown\n$", b"", error)


class KelvasictlTest(unittest.TestCase):
    def setUp(self):
        resource.setrlimit(resource.RLIMIT_CORE, (0, 0))
        self.directory = tempfile.TemporaryDirectory()
        self.addCleanup(self.directory.cleanup)
        unwanted = {"KELVASI_LOG_LEVEL", "KELVASI_RESOURCES", "TELVON_RUNTIME_DIR"}
        self.environment = {key: value for key, value in os.environ.items() if key not in unwanted}

    def path(self, name):
        return os.path.join(self.directory.name, name)

    def write(self, name, contents):
        with open(self.path(name), "wb") as file:
            file.write(contents)
        return self.path(name)

    def read(self, name):
        with open(self.path(name), "rb") as file:
            return file.read()

    def run_program(self, *arguments, **options):
        options = {"capture_output": True, "env": self.environment, "timeout": 60, "check": False} | options
        return subprocess.run([PROGRAM, *map(str, arguments)], **options)

    def decode(self, *arguments, technology="Orvane_GSM", **options):
        """Decodes with the flat templates of the captures."""
        return self.run_program("decode", "--technology", technology, "--resources", TEMPLATES, *arguments, **options)

    def assert_fault(self, result, *pieces, status=1):
        """One line on the standard error that begins with the program's name and holds these pieces."""
        text = result.stderr.decode()
        self.assertEqual(result.returncode, status, text)
        self.assertTrue(text.startswith("kelvasictl: "), text)
        self.assertEqual(text.count("\n"), 1, text)
        for piece in pieces:
            self.assertIn(piece, text)
