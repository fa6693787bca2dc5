# SPDX-License-Identifier: Apache-2.0
"""kelvasictl readings: the lines make the display, and their numbers are those of the texts."""

import csv
import io
import json
import pathlib
import re
import signal
import subprocess
import unittest

import jsonschema
from live_support import DAEMON, PATIENCE, LiveTest
from readings_fold import Fold
from support import CAPTURES, GMM_REGISTERED, OUTPUT_CLOSED, START, TEMPLATES, KelvasictlTest, pcap, record

TECHNOLOGIES = ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2")
SCHEMA = json.loads((CAPTURES.parent.parent / "Docs" / "readings.schema.json").read_text())
KEYS = list(SCHEMA["properties"])

# Where the value is not the number in the text: by quantity, or by section and row.
EXCEPTIONS = {
    "uati24": "shown in hexadecimal",
    "text": "a text is no number, also where it begins with one",
    "data": "base 64",
    "date": "a date",
    "GSM Serving Cell/C1 Value": "the low half of a signed word, shown without its sign",
    "GSM Serving Cell/C2 Value": "the low half of a signed word, shown without its sign",
}
# Texts that are no measurement any more, or no identity.
NO_VALUE = re.compile(r".*% \(old\)|\(unknown system type .*\)")
NUMBER = re.compile(r"(?:\(ref pilot\) )?([-+]?\d+(?:\.(\d+))?)(?![\d;])")


def ordered(text):
    return json.loads(text, object_pairs_hook=lambda pairs: ("object", pairs))


def in_order(value):
    if isinstance(value, dict):
        return ("object", [(key, in_order(each)) for key, each in value.items()])
    return [in_order(each) for each in value] if isinstance(value, list) else value


def same(one, other):
    """JSON values that are not told apart by 1 and 1.0, but by True and 1."""
    return json.dumps(one) == json.dumps(other)


class ReadingsTest(KelvasictlTest):
    def readings(self, capture, *arguments, technology, resources=TEMPLATES, **options):
        return self.run_program("readings", "--technology", technology, "--resources", resources, *arguments, capture,
                                **options)

    def lines(self, capture, *arguments, technology, resources=TEMPLATES):
        result = self.readings(capture, *arguments, technology=technology, resources=resources)
        self.assertEqual(result.returncode, 0, result.stderr)
        return [json.loads(line) for line in result.stdout.splitlines()]

    def template(self, technology, resources):
        """The display before any message: an unknown code shows nothing."""
        if technology == "IFX":
            return None
        capture = self.write("nothing.pcap", pcap(record(0xEEEE, b"")))
        return json.loads(self.display(capture, technology, resources).stdout)

    def display(self, capture, technology, resources):
        return self.run_program("decode", "--technology", technology, "--resources", resources, capture)

    def fold(self, lines, technology, resources):
        fold = Fold(self.template(technology, resources))
        for line in lines:
            fold.take(line)
        return fold.display

    def assert_folds(self, capture, technology, resources=TEMPLATES):
        decoded = self.display(capture, technology, resources)
        if decoded.returncode == -signal.SIGABRT:
            self.assertEqual(self.readings(capture, technology=technology, resources=resources).returncode,
                             -signal.SIGABRT)
            return []
        lines = self.lines(capture, technology=technology, resources=resources)
        expected = ordered(decoded.stdout)
        self.assertTrue(same(in_order(self.fold(lines, technology, resources)), expected), capture)
        changes = self.lines(capture, "--changes", technology=technology, resources=resources)
        self.assertLessEqual(len(changes), len(lines))
        self.assertTrue(same(in_order(self.fold(changes, technology, resources)), expected), capture)
        return lines

    def write_drive(self, technology, messages):
        path = self.path(technology + ".pcap")
        subprocess.run([DAEMON, "--technology", technology, "--write", path, "--messages", str(messages)], check=True,
                       env=self.environment, timeout=60)
        return path


class Captures(ReadingsTest):
    def test_lines_make_the_display_of_every_capture(self):
        empty = pathlib.Path(self.path("empty"))
        empty.mkdir()
        validator = jsonschema.Draft202012Validator(SCHEMA)
        for technology in TECHNOLOGIES:
            captures = sorted((CAPTURES / technology).rglob("*.pcap"))
            self.assertTrue(captures)
            for capture in captures:
                with self.subTest(capture=capture.name, technology=technology):
                    resources = empty if capture.parent.name == "no-templates" else TEMPLATES
                    for line in self.assert_folds(capture, technology, resources)[:200]:
                        validator.validate(line)


class Numbers(ReadingsTest):
    """What stands in each text is the value, or the name of its state, or the row is an exception."""

    def setUp(self):
        super().setUp()
        self.excused = set()
        self.states = {}
        fields = self.run_program("fields", "--format", "json", "--resources", TEMPLATES)
        for row in json.loads(fields.stdout)["rows"]:
            names = self.states.setdefault((row["technology"], row["section"], row["row"], row["code"]), {})
            for state in row["states"]:
                names.setdefault(state["value"], set()).add(state["text"])

    def is_state(self, line):
        """Whether the text is the name of the value, or a row with names has none for it."""
        names = self.states.get((line["technology"], line["section"], line["row"], line["code"]), {})
        return bool(names) and line["text"] in names.get(line["value"], {line["text"]})

    def is_number(self, line):
        text = line["text"].replace(" ", "") if line["quantity"] in ("mcc", "mnc") else line["text"]
        found = NUMBER.match(text)
        if not found:
            return line["value"] is None
        if line["value"] is None:
            return False
        precision = 0.5 * 10 ** -len(found.group(2) or "")
        return abs(line["value"] - float(found.group(1))) <= precision + 1e-9 + 1e-12 * abs(line["value"])

    def check(self, lines):
        for line in lines:
            if line["text"] is None or self.is_number(line) or self.is_state(line):
                continue
            if line["value"] is None and NO_VALUE.fullmatch(line["text"]):
                continue
            names = {line["quantity"], f'{line["section"]}/{line["row"]}'} & EXCEPTIONS.keys()
            self.assertTrue(names, line)
            self.excused |= names

    def test_of_every_capture_and_drive_are_in_the_texts_and_no_exception_is_stale(self):
        for technology in TECHNOLOGIES:
            captures = sorted((CAPTURES / technology).rglob("*.pcap"))
            for capture in [*captures, self.write_drive(technology, 3000)]:
                with self.subTest(capture=str(capture)):
                    result = self.readings(capture, technology=technology)
                    self.check(json.loads(line) for line in result.stdout.splitlines())
        self.assertEqual(EXCEPTIONS.keys() - self.excused, set())


class Drives(ReadingsTest):
    def test_lines_make_the_display_of_a_drive_of_every_technology(self):
        validator = jsonschema.Draft202012Validator(SCHEMA)
        resources = CAPTURES.parent.parent / "Resources"
        for technology in TECHNOLOGIES:
            with self.subTest(technology):
                lines = self.assert_folds(self.write_drive(technology, 3000), technology, resources)
                self.assertGreater(len(lines), 3000)
                for line in lines[::50]:
                    self.assertEqual(list(line), KEYS)
                    validator.validate(line)

    def test_levels_of_a_drive_stand_beside_their_cells(self):
        for technology, quantities in (("Orvane_LTE", {"rsrp", "rsrq"}), ("Orvane_GSM", {"rxlev", "rscp", "ecno"}),
                                       ("Orvane_CDMA", {"ecio", "c_to_i"}), ("Orvane_UTRAN2", {"rscp_level"})):
            with self.subTest(technology):
                lines = self.lines(self.write_drive(technology, 5000), technology=technology,
                                   resources=CAPTURES.parent.parent / "Resources")
                levels = [line for line in lines if line["quantity"] in quantities and line["value"] is not None]
                named = [line for line in levels if line["cell"]]
                self.assertGreater(len(levels), 100)
                self.assertGreater(len(named), 0.95 * len(levels))


class Lines(ReadingsTest):
    MEASURED = record(0xB17F, bytes([1, 0, 0, 0, 0x16, 0x0D, 0x94, 0x01, 0xA1]) + bytes(11))

    def test_a_line_has_every_key_in_order(self):
        line = self.lines(self.write("one.pcap", pcap((0.25, self.MEASURED))), technology="Orvane_LTE")[4]
        self.assertEqual(list(line), KEYS)
        self.assertEqual(line, {
            "time": "2024-03-05T14:07:09.250000Z", "technology": "Orvane_LTE", "code": "0xB17F",
            "path": "/Serving Cell Measurements/Measured RSRP", "section": "Serving Cell Measurements",
            "row": "Measured RSRP", "cell": "lte:3350/404", "text": "-99.75 dBm", "value": -99.75, "unit": "dBm",
            "quantity": "rsrp"})

    def test_csv_has_the_same_columns(self):
        capture = self.write("one.pcap", pcap((0.25, self.MEASURED)))
        lines = self.lines(capture, technology="Orvane_LTE")
        result = self.readings(capture, "--format", "csv", technology="Orvane_LTE")
        rows = list(csv.DictReader(io.StringIO(result.stdout.decode(), newline="")))
        self.assertEqual(list(rows[0]), KEYS)
        for line, row in zip(lines, rows, strict=True):
            row["value"] = json.loads(row["value"] or "null")
            self.assertEqual({key: value or None for key, value in row.items() if key != "value"},
                             {key: value for key, value in line.items() if key != "value"})
            self.assertEqual(row["value"], line["value"])

    def test_select_takes_paths_rows_and_quantities(self):
        capture = self.write("one.pcap", pcap(self.MEASURED))
        rows = lambda *globs: [line["row"] for line in self.lines(
            capture, *[word for glob in globs for word in ("--select", glob)], technology="Orvane_LTE")]
        self.assertEqual(rows("rsrp"), ["Measured RSRP", "Average RSRP"])
        self.assertEqual(rows("*/Average RSR?"), ["Average RSRP", "Average RSRQ"])
        self.assertEqual(rows("Serving Cell Measurements/Version", "pci"), ["Version", "Physical Cell ID"])
        self.assertEqual(rows("nothing"), [])

    def test_from_and_to_choose_messages(self):
        capture = self.write("three.pcap", pcap((0, self.MEASURED), (1, self.MEASURED), (2, self.MEASURED)))
        seconds = lambda *arguments: sorted({line["time"][17:19] for line in self.lines(
            capture, *arguments, technology="Orvane_LTE")})
        self.assertEqual(seconds("--from", "2024-03-05T14:07:10Z"), ["10", "11"])
        self.assertEqual(seconds("--to", "2024-03-05T15:07:10+01:00"), ["09", "10"])
        self.assertEqual(seconds("--from", START + 0.5, "--to", START + 1.5), ["10"])

    def test_a_time_that_is_none_is_wrong_usage(self):
        result = self.readings(self.write("one.pcap", pcap(self.MEASURED)), "--from", "noon", technology="Orvane_LTE")
        self.assert_fault(result, "--from", '"noon" is no time', status=2)

    def test_changes_leave_out_what_is_written_again(self):
        capture = self.write("same.pcap", pcap(self.MEASURED, self.MEASURED))
        once = self.lines(self.write("one.pcap", pcap(self.MEASURED)), technology="Orvane_LTE")
        self.assertEqual(self.lines(capture, "--changes", technology="Orvane_LTE"), once)
        self.assertEqual(len(self.lines(capture, technology="Orvane_LTE")), 2 * len(once))

    def test_a_list_is_removed_from_its_end(self):
        cells = lambda *codes: record(0xB179, bytes(4) + bytes([0x16, 0x0D, 0x94, 0x01]) + bytes(6) +
                                      bytes([0, len(codes)]) + b"".join(bytes([code, 0]) for code in codes))
        capture = self.write("cells.pcap", pcap(cells(7, 8), cells(9)))
        lines = self.lines(capture, "--select", "/Detected Cells/*", technology="Orvane_LTE")
        self.assertEqual([(line["path"], line["text"], line["cell"]) for line in lines], [
            ("/Detected Cells/0/Physical Cell ID", "7", "lte:3350/7"),
            ("/Detected Cells/1/Physical Cell ID", "8", "lte:3350/8"),
            ("/Detected Cells/1", None, None), ("/Detected Cells/0", None, None),
            ("/Detected Cells/0/Physical Cell ID", "9", "lte:3350/9")])
        self.assertEqual({line["row"] for line in lines if line["text"] is None}, {None})


class SeveralCaptures(ReadingsTest):
    def drives(self):
        return [self.write_drive(technology, 1500) for technology in ("Orvane_LTE", "Orvane_GSM", "Orvane_CDMA")]

    def test_without_jobs_they_are_one_run(self):
        whole = pathlib.Path(self.write_drive("Orvane_GSM", 1500))
        subprocess.run([DAEMON, "--technology", "Orvane_GSM", "--seed", "5", "--write", self.path("other.pcap"),
                        "--messages", "1500"], check=True, capture_output=True, env=self.environment, timeout=60)
        resources = CAPTURES.parent.parent / "Resources"
        result = self.run_program("readings", "--resources", resources, whole, self.path("other.pcap"))
        decoded = self.run_program("decode", "--resources", resources, whole, self.path("other.pcap"))
        self.assertEqual((result.returncode, decoded.returncode), (0, 0))
        lines = [json.loads(line) for line in result.stdout.splitlines()]
        folded = self.fold(lines, "Orvane_GSM", resources)
        self.assertTrue(same(in_order(folded), ordered(decoded.stdout)))

    def test_with_jobs_each_is_a_run_of_its_own(self):
        captures = self.drives()
        for format in ("ndjson", "csv"):
            alone = [self.run_program("readings", "--format", format, capture) for capture in captures]
            heading = alone[0].stdout.splitlines(keepends=True)[0] if format == "csv" else b""
            for jobs in (1, 2, 3, 999):
                together = self.run_program("readings", "--format", format, "--jobs", jobs, *captures)
                self.assertEqual(together.returncode, 0)
                self.assertEqual(together.stdout, heading + b"".join(each.stdout[len(heading):] for each in alone))
                for capture in captures:
                    self.assertIn(capture.encode() + b": Orvane_", together.stderr)

    def test_with_jobs_a_bad_one_is_said_and_the_others_are_read(self):
        first, second, _ = self.drives()
        bad = self.write("bad.pcap", b"no capture")
        expected = self.run_program("readings", first).stdout + self.run_program("readings", second).stdout
        result = self.run_program("readings", "--jobs", 2, first, bad, self.path("missing.pcap"), second)
        self.assertEqual((result.returncode, result.stdout), (1, expected))
        self.assertIn(bad, result.stderr.decode())
        self.assertIn("missing.pcap", result.stderr.decode())

    def test_with_jobs_what_was_not_shown_is_said_once(self):
        capture = self.write("unknown.pcap", pcap(Lines.MEASURED, record(0xB193, b"")))
        result = self.run_program("readings", "--jobs", 2, capture, capture)
        self.assertEqual(result.stderr.decode().splitlines()[-1], "kelvasictl: 50 % of 4 messages were not shown")

    def test_wrong_usage(self):
        capture = self.write("one.pcap", pcap(Lines.MEASURED))
        for arguments, words in (((), "CAPTURE or --live is required"), (("--jobs", "0", capture), '"0" is no number of jobs'),
                                 (("--live", capture), "--live: takes no CAPTURE"),
                                 (("--live", "--jobs", "2"), "--jobs: is for captures"),
                                 (("--live", "--technology", "IFX"), "--technology: is told by the daemon"),
                                 (("--seconds", "3", capture), "--seconds: needs --live")):
            with self.subTest(arguments):
                self.assert_fault(self.run_program("readings", *arguments), words, status=2)


class Live(LiveTest, ReadingsTest):
    def test_lines_of_a_live_link_are_those_of_its_capture(self):
        world = self.write("world.pcap", pcap((0.0, Lines.MEASURED), (0.2, Lines.MEASURED), (0.4, record(0xB0C2, b"short"))))
        daemon = self.start_daemon("--replay", world, "--leave", technology="Orvane_LTE")
        readings = self.start_live("readings", "--live")
        self.assertEqual(daemon.wait(PATIENCE), 0)
        status, out, error = self.end(readings)
        self.assertEqual(status, 0)
        self.assertEqual(error.splitlines()[-1], "kelvasictl: 33 % of 3 messages were not shown")
        without_time = lambda lines: [line | {"time": None} for line in lines]
        lines = [json.loads(line) for line in out.splitlines()]
        self.assertGreater(len(lines), 10)
        self.assertEqual(without_time(lines), without_time(self.lines(world, technology="Orvane_LTE")))

    def test_lines_come_while_the_link_goes_on(self):
        self.start_daemon("--seed", "7", technology="Orvane_GSM")
        readings = self.start_live("readings", "--live", "--format", "csv", "--changes",
                                   resources=CAPTURES.parent.parent / "Resources")
        self.assertEqual(readings.stdout.readline().decode().strip().split(","), KEYS)
        self.assertIn(",Orvane_GSM,", readings.stdout.readline().decode())
        self.assertEqual(self.end(readings)[0], 0)

    def test_messages_of_another_technology_find_no_section_and_that_is_said(self):
        daemon = self.start_daemon("--replay", self.write("lte.pcap", pcap(Lines.MEASURED)), technology="Orvane_LTE")
        readings = self.start_live("readings", "--live", "--select", "rsrp")
        self.assertEqual(json.loads(readings.stdout.readline())["technology"], "Orvane_LTE")
        daemon.kill()
        daemon.wait()
        self.start_daemon("--replay", self.write("gsm.pcap", pcap(GMM_REGISTERED)), technology="Orvane_GSM")
        said = readings.stderr.readline().decode()
        self.assertEqual(said, "kelvasictl: the daemon's technology has changed; its messages find no section until "
                               "kelvasictl is started anew\n")
        self.assertEqual(self.end(readings)[0], 0)

    def test_it_ends_after_the_seconds(self):
        self.start_daemon("--seed", "7", "--speed", "20", technology="Orvane_UTRAN2")
        result = self.run_program("readings", "--live", "--seconds", "2", "--select", "rscp_level")
        self.assertEqual(result.returncode, 0, result.stderr)
        lines = [json.loads(line) for line in result.stdout.splitlines()]
        self.assertEqual({line["quantity"] for line in lines}, {"rscp_level"})

    def test_a_reader_that_goes_away_ends_it(self):
        self.start_daemon("--seed", "7", "--speed", "20", technology="Orvane_GSM")
        readings = self.start_live("readings", "--live", resources=CAPTURES.parent.parent / "Resources")
        readings.stdout.readline()
        readings.stdout.close()
        self.assertEqual((readings.wait(PATIENCE), readings.stderr.read()), (OUTPUT_CLOSED, b""))


if __name__ == "__main__":
    unittest.main()
