# SPDX-License-Identifier: Apache-2.0
"""kelvasictl redact: what identifies somebody is gone, and everything else is as it was."""

import gzip
import json
import plistlib
import re
import struct
import subprocess
import unittest

from live_support import DAEMON
from support import CAPTURES, KelvasictlTest, pcap, pcapng, record

ROOT = CAPTURES.parent.parent
TECHNOLOGIES = ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2")
PLACES = {"cell_id", "base_id", "lac", "rac", "tac", "ura_id", "sid", "nid", "packet_zone", "color_code"}
ICCID = "8999901000000000013"
SIM = {"kSimFile_ICCID": ICCID, "kSimFile_MSISDN": "+99901555010", "kSimFile_PNN": "Test Network"}
SUBSCRIBER_ROWS = re.compile(r"ICCID|MSISDN|DIALING|LOCI|ACCESS CONTROL|FPLMN|Address|Access Point")


def sim(files=None, form=plistlib.FMT_XML):
    return record(0x0000, plistlib.dumps(files or SIM, fmt=form), log_type=0xFF)


CELL_TAIL = bytes(7)
SERVING_GSM = record(0x5134, struct.pack("<HHH", 80, 17, 21018) + CELL_TAIL)


class RedactTest(KelvasictlTest):
    def redact(self, path, *arguments, name="out"):
        result = self.run_program("redact", *arguments, path, self.path(name))
        self.assertEqual(result.returncode, 0, result.stderr)
        return self.read(name)

    def readings(self, path, technology):
        result = self.run_program("readings", "--technology", technology, path, timeout=300)
        self.assertEqual(result.returncode, 0, result.stderr)
        return [json.loads(line) for line in result.stdout.splitlines()]


class Drives(RedactTest):
    def test_only_marked_rows_change(self):
        for technology in TECHNOLOGIES:
            with self.subTest(technology):
                drive = self.path(technology + ".pcap")
                subprocess.run([DAEMON, "--technology", technology, "--messages", "1500", "--start-at", "30",
                                "--write", drive], check=True, capture_output=True, timeout=120)
                redacted = self.redact(drive, name=technology)
                with open(drive, "rb") as file:
                    self.assertEqual(len(file.read()), len(redacted))
                before = self.readings(drive, technology)
                after = self.readings(self.path(technology), technology)
                self.assertEqual(len(before), len(after))
                changed = 0
                for one, other in zip(before, after):
                    if one == other:
                        continue
                    changed += 1
                    texts = one["text"], other["text"]
                    self.assertEqual(one | {"text": "", "value": 0}, other | {"text": "", "value": 0})
                    self.assertTrue(one["quantity"] in PLACES | {"uati24"} or SUBSCRIBER_ROWS.search(one["path"]), one)
                    self.assertFalse(other["value"], one)
                    if one["quantity"] == "text":
                        self.assertEqual(re.sub("[0-9]", "0", re.sub("[A-Za-z]", "x", texts[0])), texts[1])
                self.assertGreater(changed, 0)
                marked = [each for each in after if each["quantity"] in PLACES and each["value"]]
                self.assertEqual(marked, [])

    def test_pseudonyms_are_the_same_in_every_form(self):
        key = self.write("key", bytes(range(32)))
        other_key = self.write("other", bytes(32))
        one = self.redact(self.write("a.pcap", pcap(sim(), SERVING_GSM)), "--pseudonyms", key, name="1")
        two = self.redact(self.write("b.pcap", pcap(sim(form=plistlib.FMT_BINARY))), "--pseudonyms", key, name="2")
        three = self.redact(self.path("a.pcap"), "--pseudonyms", other_key, name="3")
        iccid = re.search(rb"ICCID</key>\s*<string>(\d{19})<", one)[1]
        self.assertNotEqual(iccid, ICCID.encode())
        self.assertIn(iccid, two)
        self.assertNotIn(iccid, three)
        cell = struct.unpack("<H", one[-2 - len(CELL_TAIL):-len(CELL_TAIL)])[0]
        self.assertNotEqual(cell, 21018)
        self.assertEqual(len(str(cell)), 5)


class Formats(RedactTest):
    def test_pcapng_comments_and_blocks(self):
        def block(kind, body):
            body += bytes(-len(body) % 4)
            return struct.pack("<II", kind, 12 + len(body)) + body + struct.pack("<I", 12 + len(body))

        plain = pcapng(SERVING_GSM)
        names = block(4, struct.pack("<HH", 1, 14) + b"\x0a\x00\x00\x01phone.lan\x00" + bytes(6))
        comment = struct.pack("<HH", 1, 16) + b"call +9990155501" + bytes(4)
        time = struct.pack("<IIIII", 0, 0, 0, len(SERVING_GSM), len(SERVING_GSM))
        packet = block(6, time + SERVING_GSM + bytes(-len(SERVING_GSM) % 4) + comment)
        redacted = self.redact(self.write("in.pcapng", plain + names + packet))
        self.assertEqual(len(redacted), len(plain + names + packet))
        self.assertNotIn(b"phone", redacted)
        self.assertIn(b"xxxx +0000000000", redacted)
        lines = self.readings(self.path("out"), "Orvane_GSM")
        self.assertEqual({line["value"] for line in lines if line["quantity"] == "cell_id"}, {0})
        self.assertEqual({line["value"] for line in lines if line["quantity"] == "arfcn"}, {80})

    def test_packed_file_comes_out_plain(self):
        capture = pcap(SERVING_GSM)
        redacted = self.redact(self.write("in.pcap.gz", gzip.compress(capture)))
        self.assertEqual(redacted, capture.replace(struct.pack("<H", 21018), b"\0\0"))

    def test_dlf_and_snapshot(self):
        capture = self.write("in.pcap", pcap(sim(), SERVING_GSM))
        self.decode(capture, "--dlf", self.path("in.dlf"), "--snapshot", self.path("in.kelvasi"))
        for name in ("in.dlf", "in.kelvasi"):
            with self.subTest(name):
                before = self.read(name)
                redacted = self.redact(self.path(name), name="out-" + name)
                self.assertEqual(len(redacted), len(before))
                self.assertNotIn(ICCID.encode(), redacted)
                lines = self.readings(self.path("out-" + name), "Orvane_GSM")
                self.assertEqual({line["value"] for line in lines if line["quantity"] == "cell_id"}, {0})
                self.assertEqual({line["value"] for line in lines if line["quantity"] == "arfcn"}, {80})

    def test_display_and_messages_of_a_snapshot(self):
        capture = self.write("in.pcap", pcap(sim(), SERVING_GSM))
        self.decode(capture, "--snapshot", self.path("in.kelvasi"))
        before = plistlib.loads(self.read("in.kelvasi"))
        after = plistlib.loads(self.redact(self.path("in.kelvasi")))
        self.assertEqual(before["Timestamp"], after["Timestamp"])
        entry = after["Data"][0]
        self.assertEqual(before["Data"][0]["Date"], entry["Date"])
        self.assertNotIn(ICCID, json.dumps(entry["Display"]))
        self.assertIn("0" * len(ICCID), json.dumps(entry["Display"]))
        self.assertNotIn(ICCID.encode(), entry["DisplayState"])
        self.assertNotIn(ICCID.encode(), after["Data"][-1]["DLF"])
        self.assertIn("Test Network", json.dumps(entry["Display"]))


class Refusals(RedactTest):
    def refused(self, *arguments, **options):
        result = self.run_program("redact", *arguments)
        self.assert_fault(result, *options.get("pieces", ()), status=options.get("status", 1))

    def test_identity_elsewhere_leaves_no_file(self):
        forms = {
            "text": ICCID.encode(),
            "swapped": bytes.fromhex("989909010000000010F3"),
            "BCD, three bits on": ((int.from_bytes(bytes.fromhex("8999901000000000013F"), "big")) << 5).to_bytes(11, "big"),
        }
        for name, form in forms.items():
            with self.subTest(name):
                # "SI13 Position" is byte 14 of 0x51F4; nothing shows what follows.
                leak = record(0x51F4, b"\0\0" + form)
                capture = self.write("in.pcap", pcap(sim(), leak))
                self.refused(capture, self.path("out"), pieces=("an identity is still in it; no file is left",))
                self.assertRaises(FileNotFoundError, self.read, "out")

    def test_identity_in_the_messages_of_a_snapshot(self):
        files = SIM | {"kSimFile_PNN": "Card " + ICCID}
        capture = self.write("in.pcap", pcap(sim(files)))
        self.decode(capture, "--snapshot", self.path("in.kelvasi"))
        self.refused(self.path("in.kelvasi"), self.path("out"), pieces=("no file is left",))

    def test_a_file_that_is_there_stays(self):
        capture = self.write("in.pcap", pcap(SERVING_GSM))
        there = self.write("there", b"mine")
        self.refused(capture, there, pieces=("there", "File exists"))
        self.assertEqual(self.read("there"), b"mine")
        self.refused(capture, "-", pieces=("cannot be a stream",))

    def test_short_key(self):
        key = self.write("key", bytes(15))
        self.refused("--pseudonyms", key, self.write("in.pcap", pcap()), self.path("out"), pieces=("16 bytes",))

    def test_cut_file_keeps_what_is_whole(self):
        whole = pcap(SERVING_GSM, SERVING_GSM)
        capture = self.write("in.pcap", whole[:-3])
        result = self.run_program("redact", capture, self.path("out"))
        self.assertEqual(result.returncode, 1)
        self.assertIn(b"in.pcap: byte 82: the file ends too early", result.stderr)
        self.assertEqual(len(self.read("out")), len(pcap(SERVING_GSM)))

    def test_other_link_type(self):
        self.refused(self.write("in.pcap", pcap(link_type=1)), self.path("out"), pieces=("USER0",))


class Document(unittest.TestCase):
    def test_names_and_quantities_are_explained(self):
        page = (ROOT / "Docs" / "redaction.md").read_text()
        names = re.findall(r'NamedIdentity\{"(\w+)"', (ROOT / "Redaction" / "NamedIdentities.h").read_text())
        self.assertGreater(len(names), 50)
        for name in [*names, *PLACES, "uati24"]:
            self.assertIn(f"`{name}`", page)


if __name__ == "__main__":
    unittest.main()
