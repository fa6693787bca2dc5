# SPDX-License-Identifier: Apache-2.0
"""kelvasictl: captures that are none, wrong usage, and places that cannot be read or written."""

import json
import os
import struct
import subprocess
import unittest

from support import GMM_REGISTERED, MM_IDLE, OUTPUT_CLOSED, PROGRAM, START, TEMPLATES, KelvasictlTest, pcap


class BadCaptures(KelvasictlTest):
    def test_what_is_no_capture_is_named_with_the_place_and_the_reason(self):
        for name, contents in {"empty.pcap": b"", "text.pcap": b"this is no capture at all", "short.dlf": b"abc"}.items():
            with self.subTest(name):
                result = self.decode(self.write(name, contents))
                self.assert_fault(result, f"{self.path(name)}: byte 0: ")
                self.assertEqual(result.stdout, b"")

    def test_an_unknown_format_is_told_with_those_that_are_read(self):
        result = self.decode(self.write("text.pcap", b"this is no capture at all"))
        self.assert_fault(result, "byte 0: unknown file format; pcap, pcapng and DLF files and snapshots are read")

    def test_a_cut_capture_is_decoded_up_to_the_cut(self):
        contents = pcap(MM_IDLE, GMM_REGISTERED)
        result = self.decode(self.write("a.pcap", contents[:-1]))
        self.assert_fault(result, "a.pcap: byte 56: ", "truncated")
        display = json.loads(result.stdout)
        self.assertEqual(display["Process CS"]["MM State"], "MM_IDLE")
        self.assertEqual(display["Process PS"], {})

    def test_the_captures_fault_is_named_even_where_a_later_step_fails_too(self):
        empty = self.write("empty.pcap", b"")
        for result, pieces in ((self.decode(empty, "--format", "plist"), ("empty.pcap: byte 0: ",)),
                               (self.decode(empty, "--dlf", self.path("missing/x")), ("empty.pcap: byte 0: ", "missing/x"))):
            said = result.stderr.decode().splitlines()
            self.assertEqual((len(said), result.returncode), (len(pieces), 1), said)
            for line, piece in zip(said, pieces):
                self.assertIn(piece, line)

    def test_the_captures_after_a_bad_one_are_read_all_the_same(self):
        broken = self.write("a.pcap", pcap(MM_IDLE)[:-1])
        good = self.write("b.pcap", pcap(GMM_REGISTERED))
        result = self.decode(broken, good)
        self.assert_fault(result, "a.pcap: byte 24: ")
        self.assertEqual(json.loads(result.stdout)["Process PS"]["MM State"], "GMM_REGISTERED")
        result = self.decode(self.path("missing.pcap"), broken, good)
        said = result.stderr.decode().splitlines()
        self.assertEqual(len(said), 2)
        self.assertTrue(said[0].endswith("missing.pcap: No such file or directory"), said[0])
        self.assertEqual(result.returncode, 1)
        self.assertEqual(json.loads(result.stdout)["Process PS"]["MM State"], "GMM_REGISTERED")

    def test_a_message_that_is_not_whole_is_named_and_skipped(self):
        contents = bytearray(pcap(MM_IDLE, GMM_REGISTERED))
        contents[24 + 12] += 1  # the length that it had before it was captured
        result = self.decode(self.write("a.pcap", bytes(contents)))
        self.assert_fault(result, f"a.pcap: byte 24: message 1 is cut, {len(MM_IDLE)} of {len(MM_IDLE) + 1} bytes are there")
        display = json.loads(result.stdout)
        self.assertEqual(display["Process CS"], {})
        self.assertEqual(display["Process PS"]["MM State"], "GMM_REGISTERED")

    def test_the_beginning_of_a_message_ends_no_decoder(self):
        display = b"<plist><dict><key>A</key><string>" + bytes(300_000).replace(b"\0", b"x") + b"</string></dict></plist>"
        contents = pcap(b"<plist><string>whole</string></plist>")
        contents += struct.pack("<IIII", START, 0, 262144, len(display)) + display[:262144]
        result = self.decode(self.write("a.pcap", contents), technology="IFX")
        self.assert_fault(result, f"message 2 is cut, 262144 of {len(display)} bytes are there; it is skipped")
        self.assertEqual(json.loads(result.stdout), "whole")

    def test_a_cut_snapshot_is_named_with_its_end(self):
        contents = b"<?xml version=\"1.0\"?><plist><dict><key>Data</key><array>"
        result = self.decode(self.write("a.kelvasi", contents))
        self.assert_fault(result, f"a.kelvasi: byte {len(contents)}: the property list ends too early")

    def test_another_link_type_is_refused(self):
        result = self.decode(self.write("a.pcap", pcap(MM_IDLE, link_type=1)))
        self.assert_fault(result, "a.pcap: byte 0: link type 1 (EN10MB) instead of 147")

    def test_what_cannot_be_opened_is_named(self):
        self.assert_fault(self.decode(self.path("missing.pcap")), "missing.pcap: No such file or directory")
        self.assert_fault(self.decode(self.directory.name), "Is a directory")

    @unittest.skipIf(os.geteuid() == 0, "root may read everything")
    def test_a_file_that_may_not_be_read_is_named(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        os.chmod(capture, 0)
        self.assert_fault(self.decode(capture), "a.pcap: Permission denied")

    def test_a_cut_standard_input_is_named(self):
        result = self.decode("-", input=pcap(MM_IDLE)[:-1])
        self.assert_fault(result, "standard input: byte 24: ")


class WrongUsage(KelvasictlTest):
    def test_has_a_status_of_its_own_and_one_line(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        gsm = ["decode", "--technology", "Orvane_GSM"]
        for arguments in ([], ["unknown"], ["decode"], ["decode", "--start-command"], gsm, [*gsm, "--unknown", capture],
                          [*gsm, "--format", "yaml", capture], ["decode", "--technology", "GSM", capture],
                          [*gsm, "--snapshot", "", capture],
                          [*gsm, "--dlf", "", capture], ["monitor", "--format", "plist"], ["monitor", "--seconds", "x"], ["record"]):
            with self.subTest(arguments):
                result = self.run_program(*arguments)
                self.assert_fault(result, "(try --help)", status=2)
                self.assertEqual(result.stdout, b"")

    def test_is_told_in_plain_words(self):
        for arguments, words in (([], "a subcommand is missing: decode, monitor, top, readings, record"),
                                 (["unknown"], "The following argument was not expected: unknown"),
                                 (["monitor", "--seconds", "x"], '--seconds: "x" is no number from 0 to 1000000000'),
                                 (["monitor", "--seconds", "nan"], '--seconds: "nan" is no number'),
                                 (["monitor", "--seconds", "-1"], '--seconds: "-1" is no number'),
                                 (["monitor", "--seconds", "1s"], '--seconds: "1s" is no number')):
            with self.subTest(arguments):
                self.assert_fault(self.run_program(*arguments), words, status=2)

    def test_help_is_no_error(self):
        for arguments in (["--help"], ["decode", "--help"], ["monitor", "--help"], ["record", "--help"], ["--version"]):
            with self.subTest(arguments):
                result = self.run_program(*arguments)
                self.assertEqual((result.returncode, result.stderr), (0, b""))
                self.assertNotEqual(result.stdout, b"")


class BadSurroundings(KelvasictlTest):
    def test_resources_must_be_a_directory(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        gsm = ["decode", "--technology", "Orvane_GSM"]
        missing = self.run_program(*gsm, "--resources", self.path("missing"), capture)
        self.assert_fault(missing, "missing: No such file or directory")
        self.assert_fault(self.run_program(*gsm, "--resources", capture, capture), "a.pcap: Not a directory")
        self.environment["KELVASI_RESOURCES"] = self.path("missing")
        self.assert_fault(self.run_program(*gsm, capture), "missing: No such file or directory")

    def test_a_full_or_closed_standard_output_is_a_fault(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        with open("/dev/full", "wb") as full:
            self.assert_fault(self.decode(capture, capture_output=False, stdout=full, stderr=subprocess.PIPE),
                              "standard output: No space left on device")
        closed = self.decode(capture, capture_output=False, stderr=subprocess.PIPE, preexec_fn=lambda: os.close(1))
        self.assert_fault(closed, "standard output: Bad file descriptor")

    def test_a_reader_that_leaves_ends_it_without_a_word(self):
        for more in ([], ["--every-tick"], ["--start-command"]):
            with self.subTest(more):
                reading, writing = os.pipe()
                os.close(reading)
                with os.fdopen(writing, "wb") as pipe:
                    result = self.decode(*more, self.write("a.pcap", pcap(MM_IDLE)), capture_output=False,
                                         stdout=pipe, stderr=subprocess.PIPE)
                self.assertEqual((result.returncode, result.stderr), (OUTPUT_CLOSED, b""))

    def test_with_several_jobs_too(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        for verb in (["readings"], ["cells"], ["events"], ["coverage"], ["alarms", "--rule", "rsrp < -100"]):
            with self.subTest(verb):
                reading, writing = os.pipe()
                os.close(reading)
                with os.fdopen(writing, "wb") as pipe:
                    result = self.run_program(*verb, "--format", "csv", "--technology", "Orvane_GSM", "--jobs", "2",
                                              capture, capture, capture_output=False, stdout=pipe,
                                              stderr=subprocess.PIPE)
                self.assertEqual((result.returncode, result.stderr), (OUTPUT_CLOSED, b""))

    def test_without_any_standard_stream_files_stay_whole(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        command = [PROGRAM, "decode", "--technology", "Orvane_GSM", "--resources", str(TEMPLATES), "--log-stderr",
                   "--dlf", self.path("a.dlf"), "--every-tick", capture]
        result = subprocess.run(command, env=self.environment, timeout=60, check=False,
                                preexec_fn=lambda: [os.close(stream) for stream in (0, 1, 2)])
        self.assertEqual(result.returncode, 1)
        self.assertEqual(self.read("a.pcap"), pcap(MM_IDLE))
        self.assertFalse(os.path.exists(self.path("a.dlf")))


if __name__ == "__main__":
    unittest.main()
