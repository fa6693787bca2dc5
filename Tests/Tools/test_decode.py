# SPDX-License-Identifier: Apache-2.0
"""kelvasictl decode: what it prints."""

import gzip
import json
import os
import plistlib
import pty
import signal
import stat
import struct
import subprocess
import sys
import time
import unittest

from support import CAPTURES, GMM_DEREGISTERED, GMM_REGISTERED, MM_IDLE, PROGRAM, START, TEMPLATES, KelvasictlTest
from support import packet, pcap, pcapng, record


class Decode(KelvasictlTest):
    def shown(self, *arguments, **options):
        result = self.decode(*arguments, **options)
        self.assertEqual(result.returncode, 0, result.stderr)
        return json.loads(result.stdout)

    def test_the_last_display_is_printed_as_indented_json(self):
        capture = self.write("a.pcap", pcap(MM_IDLE, GMM_REGISTERED))
        result = self.decode(capture)
        self.assertEqual(result.stderr, b"")
        self.assertIn(b'\n "Process CS": {\n  "MM State": "MM_IDLE",\n', result.stdout)
        self.assertEqual(json.loads(result.stdout)["Process PS"]["MM State"], "GMM_REGISTERED")

    def test_the_full_name_of_a_technology_will_do(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        display = self.shown(capture, technology="kTelvonLogChannelTechnology_Orvane_GSM")
        self.assertEqual(display["Process CS"]["MM State"], "MM_IDLE")

    def test_captures_follow_one_another(self):
        first = self.write("a.pcap", pcap(MM_IDLE, GMM_REGISTERED))
        second = self.write("b.pcap", pcap(GMM_DEREGISTERED))
        later = self.shown(first, second)
        self.assertEqual(later["Process CS"]["MM State"], "MM_IDLE")
        self.assertNotEqual(later["Process PS"]["MM State"], "GMM_REGISTERED")
        self.assertEqual(self.shown(second, first)["Process PS"]["MM State"], "GMM_REGISTERED")

    def test_pcapng_nanoseconds_and_the_standard_input_are_read_alike(self):
        expected = self.shown(self.write("a.pcap", pcap(MM_IDLE)))
        self.assertEqual(self.shown(self.write("b.pcapng", pcapng(MM_IDLE))), expected)
        self.assertEqual(self.shown(self.write("c.pcap", pcap(MM_IDLE, magic=0xA1B23C4D))), expected)
        self.assertEqual(self.shown("-", input=pcap(MM_IDLE)), expected)

    def test_a_capture_without_messages_has_no_display(self):
        capture = self.write("a.pcap", pcap())
        said = f"kelvasictl: {capture}: holds no messages\n"
        result = self.decode(capture)
        self.assertEqual((result.returncode, result.stdout, result.stderr.decode()), (0, b"null\n", said))
        self.assertEqual(self.decode(capture, "--every-tick").stdout, b"")
        self.assertEqual(self.decode(capture, "--format", "tree").stdout, b"/\t(unknown)\n")
        result = self.decode(capture, "--format", "plist")
        self.assertEqual((result.returncode, result.stderr.decode()), (
            1, said + "kelvasictl: there is no display to write as a property list\n"))

    def test_without_templates_there_is_no_display(self):
        empty = self.write("a.pcap", pcap(MM_IDLE))
        result = self.run_program("decode", "--technology", "Orvane_GSM", "--resources", self.directory.name, empty)
        self.assertEqual((result.returncode, result.stdout), (0, b"null\n"))

    def test_the_environment_names_the_templates_and_the_option_goes_first(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        self.environment["KELVASI_RESOURCES"] = str(TEMPLATES)
        with_variable = self.run_program("decode", "--technology", "Orvane_GSM", capture)
        self.assertIn("Static Text", json.loads(with_variable.stdout))
        self.environment["KELVASI_RESOURCES"] = self.directory.name
        self.assertIn("Static Text", self.shown(capture))

    def test_tree(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        lines = self.decode(capture, "--format", "tree").stdout.decode().splitlines()
        self.assertEqual(lines[0], "/\t")
        self.assertIn("/Process CS\t", lines)
        self.assertIn("/Process CS/MM State\tMM_IDLE", lines)
        self.assertTrue(all(line.count("\t") == 1 for line in lines))

    def test_plist(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        result = self.decode(capture, "--format", "plist")
        self.assertTrue(result.stdout.startswith(b"<?xml"))
        self.assertEqual(plistlib.loads(result.stdout), self.shown(capture))

    def test_start_command_needs_no_capture(self):
        result = self.decode("--start-command")
        self.assertEqual((result.returncode, result.stderr), (0, b""))
        command = plistlib.loads(result.stdout)
        self.assertEqual(list(command), ["SetState", "SetOrvaneLogCodes", "SetTelvonExtraCodes"])
        self.assertEqual(command["SetState"], "Streaming")
        self.assertIn(0x7130, command["SetOrvaneLogCodes"])

    def test_log_lines_go_to_the_standard_error_on_request(self):
        capture = self.write("a.pcap", pcap(MM_IDLE, record(0x7130, b"", log_type=7)))
        result = self.decode(capture, "--log-stderr")
        lines = result.stderr.decode().splitlines()
        self.assertIn("<3>Creating Orvane_GSMLogGenerator object", lines)
        self.assertIn("<3>Invalid log type: 7. Dropping.", lines)
        self.assertIn("Deallocing ClassIndex", lines)
        self.assertEqual(result.stdout, self.decode(capture).stdout)

    def test_a_decoders_exception_is_the_end(self):
        crash = CAPTURES / "Orvane_GSM" / "sim_crash_garbage.pcap"
        result = self.decode("--log-stderr", crash)
        if b"<3>SIM File" not in result.stderr:
            self.skipTest("the SIM decoder does not exist yet")
        self.assertEqual((result.returncode, result.stdout), (-signal.SIGABRT, b""))
        self.assertIn(b"<2>Terminating: uncaught kelvasi::LogCode_0xFF000020::UnknownDataException\n", result.stderr)

    def test_an_assertion_is_told_once_wherever_the_log_goes(self):
        crash = CAPTURES / "IFX" / "ifx_crash_garbage.pcap"
        logged = self.decode("--log-stderr", crash, technology="IFX")
        self.assertEqual(logged.returncode, -signal.SIGABRT)
        lines = [line for line in logged.stderr.decode().splitlines() if "Terminating" in line]
        self.assertEqual(len(lines), 1)
        self.assertTrue(lines[0].startswith("<2>Terminating: uncaught "), lines)
        silent = self.decode(crash, technology="IFX")
        self.assert_fault(silent, status=-signal.SIGABRT)
        self.assertEqual(silent.stderr.decode(), "kelvasictl: " + lines[0].removeprefix("<2>") + "\n")
        self.assertEqual(silent.stdout, b"")


class Files(KelvasictlTest):
    OPTIONS = ("--dlf", "--snapshot")

    def setUp(self):
        super().setUp()
        self.capture = self.write("a.pcap", pcap(MM_IDLE))

    def plain_output(self, option):
        self.assertEqual(self.decode(self.capture, option, self.path("plain")).returncode, 0)
        return self.read("plain")

    def test_a_symbolic_link_is_followed(self):
        for option in self.OPTIONS:
            with self.subTest(option):
                target = self.write("target" + option, b"old")
                os.symlink(os.path.basename(target), self.path("link" + option))
                result = self.decode(self.capture, option, self.path("link" + option))
                self.assertEqual((result.returncode, result.stderr), (0, b""))
                self.assertTrue(os.path.islink(self.path("link" + option)))
                self.assertEqual(len(self.read("target" + option)), len(self.plain_output(option)))

    def test_an_output_that_is_an_input_is_refused_before_anything_is_written(self):
        os.link(self.capture, self.path("hard"))
        os.symlink("a.pcap", self.path("soft"))
        for option in self.OPTIONS:
            for name in ("a.pcap", "hard", "soft"):
                with self.subTest((option, name)):
                    other = self.write("b.pcap", pcap())
                    result = self.decode(other, self.capture, option, self.path(name))
                    self.assert_fault(result, f"{option}: {self.path(name)} is an input", status=2)
                    self.assertEqual((result.stdout, self.read("a.pcap")), (b"", pcap(MM_IDLE)))
            with open(self.capture, "rb") as file:
                result = self.decode("-", option, self.capture, stdin=file)
            self.assert_fault(result, f"{option}: {self.capture} is an input", status=2)
            self.assertEqual(self.read("a.pcap"), pcap(MM_IDLE))

    def test_a_pipe_is_written_into(self):
        for option in self.OPTIONS:
            with self.subTest(option):
                pipe = self.path("pipe" + option)
                os.mkfifo(pipe)
                reader = os.open(pipe, os.O_RDONLY | os.O_NONBLOCK)
                self.addCleanup(os.close, reader)
                self.assertEqual(self.decode(self.capture, option, pipe).returncode, 0)
                self.assertTrue(stat.S_ISFIFO(os.stat(pipe).st_mode))
                self.assertEqual(len(os.read(reader, 65536)), len(self.plain_output(option)))


class EveryTick(KelvasictlTest):
    def ticks(self, *messages):
        capture = self.write("a.pcap", pcap(*messages))
        result = self.decode("--every-tick", capture)
        self.assertEqual(result.returncode, 0, result.stderr)
        lines = [json.loads(line) for line in result.stdout.splitlines()]
        self.assertTrue(all(list(line) == ["time", "display"] for line in lines))
        return [(line["time"] - START, (line["display"] or {}).get("Process PS", {}).get("MM State")) for line in lines]

    def test_ticks_fall_every_two_seconds_in_which_messages_arrived_and_after_the_last(self):
        registered, other = (0.0, GMM_REGISTERED), (2.5, GMM_DEREGISTERED)
        first, second, last = self.ticks(registered, (0.5, MM_IDLE), other, (9.0, GMM_REGISTERED))
        self.assertEqual(first, (2.0, "GMM_REGISTERED"))
        self.assertEqual(second[0], 4.0)
        self.assertNotEqual(second[1], "GMM_REGISTERED")
        self.assertEqual(last, (9.0, "GMM_REGISTERED"))

    def test_json_may_be_asked_for_and_nothing_else(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        self.assertEqual(self.decode("--every-tick", "--format", "json", capture).returncode, 0)
        self.assert_fault(self.decode("--every-tick", "--format", "tree", capture), status=2)

    def test_what_was_ticked_before_a_fault_is_printed(self):
        contents = pcap((0.0, MM_IDLE), (3.0, MM_IDLE))
        result = self.decode("--every-tick", self.write("a.pcap", contents[:-1]))
        self.assertEqual(len(result.stdout.splitlines()), 1)
        self.assert_fault(result, "a.pcap: byte 56: ")


class Packed(KelvasictlTest):
    def test_files_and_the_standard_input_are_unpacked(self):
        capture = pcap(MM_IDLE, GMM_REGISTERED)
        plain = self.decode(self.write("a.pcap", capture))
        packed = gzip.compress(capture)
        for result in (self.decode(self.write("a.pcap.gz", packed)), self.decode("-", input=packed)):
            self.assertEqual((result.returncode, result.stderr), (0, b""))
            self.assertEqual(result.stdout, plain.stdout)

    def test_a_cut_one_is_named_with_its_end(self):
        packed = gzip.compress(pcap(MM_IDLE, GMM_REGISTERED))[:-9]
        result = self.decode(self.write("a.pcap.gz", packed))
        self.assert_fault(result, f"a.pcap.gz: byte {len(packed)}: the gzip data end too early")
        self.assertIn(b"MM_IDLE", result.stdout)


class ProgressLine(KelvasictlTest):
    """Beside a capture that comes slowly, on a terminal and elsewhere."""

    def decode_slowly(self, error):
        program = subprocess.Popen(
            [PROGRAM, "decode", "--technology", "Orvane_GSM", "--resources", TEMPLATES, "-"], env=self.environment,
            stdin=subprocess.PIPE, stdout=subprocess.PIPE, stderr=error)
        self.addCleanup(program.stdout.close)
        program.stdin.write(pcap(*[MM_IDLE] * 100))
        program.stdin.flush()
        time.sleep(0.5)
        program.stdin.write(b"".join([packet(MM_IDLE)] * 100) + b"rest")
        program.stdin.close()
        self.assertIn(b"MM_IDLE", program.stdout.read())
        self.assertEqual(program.wait(60), 1)

    def test_is_shown_on_a_terminal_and_taken_away(self):
        ours, terminal = pty.openpty()
        self.decode_slowly(terminal)
        os.close(terminal)
        written = b""
        try:
            while piece := os.read(ours, 65536):
                written += piece
        except OSError:  # how a terminal ends
            pass
        os.close(ours)
        self.assertRegex(written, rb"\A(\r\x1b\[K\d+ messages, 0.0 MB, \d+/s)+"
                                  rb"\r\x1b\[Kkelvasictl: standard input: byte \d+: truncated.*\r\n\r\x1b\[K\Z")

    def test_is_not_shown_in_a_pipe(self):
        reading, writing = os.pipe()
        self.decode_slowly(writing)
        os.close(writing)
        with os.fdopen(reading, "rb") as pipe:
            self.assertRegex(pipe.read(), rb"\Akelvasictl: standard input: byte \d+: truncated.*\n\Z")


@unittest.skipIf(os.environ.get("KELVASI_SANITIZE"), "sanitizers keep memory back")
class Memory(KelvasictlTest):
    """Does not grow with the capture."""

    PAYLOAD = bytes(range(256))

    def messages(self, count):
        """A hundred a second, for what came in one interval is kept."""
        for number in range(count):
            stamp = (1_393_682_829 * 800 + number * 8) << 16  # units of 1.25 ms since 1980
            yield number / 100, record(0x7199, self.PAYLOAD, stamp=struct.pack("<Q", stamp))

    # A process begins with the size of the one that it was forked from, so that has to be a small one.
    MEASURE = ("import resource, subprocess, sys; subprocess.run(sys.argv[1:], check=True, stdout=subprocess.DEVNULL); "
               "print(resource.getrusage(resource.RUSAGE_CHILDREN).ru_maxrss)")

    def decode_kilobytes(self, path):
        decode = [PROGRAM, "decode", "--technology", "Orvane_GSM", "--resources", TEMPLATES, path]
        result = subprocess.run([sys.executable, "-c", self.MEASURE, *decode], env=self.environment,
                                stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, timeout=60, check=True)
        return int(result.stdout)

    def assert_steady(self, name, contents):
        sizes = []
        for count in (40_000, 120_000):
            sizes.append(self.decode_kilobytes(self.write(name, contents(self.messages(count)))))
        self.assertLess(sizes[1] - sizes[0], 6_000, sizes)  # of more than 20 MB more to read

    def test_of_pcap(self):
        self.assert_steady("a.pcap", lambda messages: pcap(*messages))

    def test_of_gzip(self):
        self.assert_steady("a.pcap.gz", lambda messages: gzip.compress(pcap(*messages), 1))

    def test_of_dlf_without_log_types(self):
        self.assert_steady("plain.dlf", lambda messages: b"".join(message[1:] for _, message in messages))

    def test_of_dlf_with_log_types(self):
        self.assert_steady("typed.dlf", lambda messages: b"".join(message for _, message in messages))


class Technology(KelvasictlTest):
    """Found from the messages where it is not given."""

    LTE = record(0xB179, bytes(8))

    def find(self, *captures, **options):
        return self.run_program("decode", "--resources", TEMPLATES, *captures, **options)

    def test_is_named_on_the_standard_error(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        found = self.find(capture)
        self.assertEqual((found.returncode, found.stderr.decode()), (0, f"kelvasictl: {capture}: Orvane_GSM\n"))
        self.assertEqual(found.stdout, self.decode(capture).stdout)

    def test_is_found_in_a_pipe(self):
        found = self.find("-", input=pcap(MM_IDLE))
        self.assertEqual((found.returncode, found.stderr), (0, b"kelvasictl: standard input: Orvane_GSM\n"))
        self.assertIn(b"MM_IDLE", found.stdout)

    def test_of_the_first_capture_is_that_of_the_display(self):
        first, second = self.write("a.pcap", pcap(MM_IDLE)), self.write("b.pcap", pcap(self.LTE, self.LTE))
        found = self.find(first, second)
        self.assertEqual(found.stderr.decode().splitlines(), [
            f"kelvasictl: {first}: Orvane_GSM",
            f"kelvasictl: {second}: fits Orvane_LTE (2 of 2 messages) and Orvane_GSM (0); taken for Orvane_GSM",
            "kelvasictl: 67 % of 3 messages were not shown"])
        self.assertEqual(found.returncode, 0)
        self.assertEqual(found.stdout, self.decode(first).stdout)

    def test_another_than_the_one_that_was_given_is_told(self):
        capture = self.write("a.pcap", pcap(self.LTE))
        given = self.decode(capture)
        self.assertEqual(given.stderr.decode(),
                         f"kelvasictl: {capture}: fits Orvane_LTE (1 of 1 messages) and Orvane_GSM (0); taken for Orvane_GSM\n"
                         "kelvasictl: 100 % of 1 message was not shown\n")
        self.assertEqual(given.returncode, 0)

    def test_that_cannot_be_found_is_a_fault(self):
        capture = self.write("a.pcap", pcap(record(0x1234, bytes(8))))
        found = self.find(capture)
        self.assert_fault(found, "fits no technology: none asks for any of its messages (1); --technology says which it is")
        self.assertEqual(found.stdout, b"")


if __name__ == "__main__":
    unittest.main()
