# SPDX-License-Identifier: Apache-2.0
"""kelvasictl cells, events, coverage and alarms, over captures and over a live link."""

import csv
import io
import json
import os
import re
import signal
import subprocess
import time
import unittest

from live_support import DAEMON, PATIENCE, LiveTest
from support import CAPTURES, PROGRAM, pcap, record

RESOURCES = CAPTURES.parent.parent / "Resources"
UNKNOWN = record(0xB193, b"unknown")


def serving(channel=3350, code=404, cell=0x1A4D001, area=4517):
    """Names the serving cell of LTE."""
    payload = bytes([0]) + code.to_bytes(2, "little") + channel.to_bytes(2, "little") + (channel + 18000).to_bytes(2, "little")
    payload += bytes([100, 100]) + cell.to_bytes(4, "little") + area.to_bytes(2, "little") + (7).to_bytes(4, "little")
    return record(0xB0C2, payload + bytes(12))


def measured(rsrp, channel=3350, code=404, neighbours=()):
    """Connected mode: the serving cell's RSRP in dBm, and other cells of its channel with theirs."""
    def raw(level):
        return round((level + 140) * 4).to_bytes(2, "little")

    payload = bytes(4) + channel.to_bytes(2, "little") + code.to_bytes(2, "little") + bytes(2) + raw(rsrp)
    payload += (80).to_bytes(2, "little") + bytes([len(neighbours), 0])
    for other, level in neighbours:
        payload += other.to_bytes(2, "little") + raw(level) + (80).to_bytes(2, "little")
    return record(0xB179, payload)


class Survey(LiveTest):
    def run_verb(self, verb, *arguments, status=0, **options):
        result = self.run_program(verb, "--resources", RESOURCES, *arguments, **options)
        self.assertEqual(result.returncode, status, result.stderr.decode())
        return result.stdout.decode()

    def records(self, verb, *arguments, status=0):
        return [json.loads(line) for line in self.run_verb(verb, *arguments, status=status).splitlines()]

    def drive(self, technology="Orvane_LTE", messages=3000, seed=7):
        path = self.path(f"{technology}-{seed}.pcap")
        subprocess.run([DAEMON, "--technology", technology, "--seed", str(seed), "--write", path,
                        "--messages", str(messages)], check=True, capture_output=True)
        return path

    def lte(self, *messages, name="lte.pcap"):
        return self.write(name, pcap(*messages))


class Cells(Survey):
    def test_a_cell_with_its_names_and_levels(self):
        path = self.lte((0.0, serving()), (1.0, measured(-95, neighbours=[(362, -101.5)])),
                        (2.0, measured(-97, neighbours=[(362, -100.5)])))
        here, there = self.records("cells", path)
        self.assertEqual(
            {key: here[key] for key in ("cell", "rat", "channel", "code", "bands", "mhz", "area", "cell_id", "roles",
                                        "first", "last", "messages")},
            {"cell": "lte:3350/404", "rat": "lte", "channel": 3350, "code": 404, "bands": ["B7"], "mhz": [2680.0],
             "area": 4517, "cell_id": 0x1A4D001, "roles": ["serving"], "first": "2024-03-05T14:07:09.000000Z",
             "last": "2024-03-05T14:07:11.000000Z", "messages": 3})
        self.assertEqual(here["levels"]["rsrp"], {
            "unit": "dBm", "count": 2, "min": -97.0, "mean": -96.0, "max": -95.0, "latest": -97.0,
            "latest_time": "2024-03-05T14:07:11.000000Z"})
        self.assertEqual((there["cell"], there["roles"], there["cell_id"]), ("lte:3350/362", ["neighbour"], None))
        self.assertEqual(there["levels"]["rsrp"]["max"], -100.5)

    def test_what_has_no_unit_has_null(self):
        cells = self.records("cells", self.drive("Orvane_GSM"))
        units = {quantity: level["unit"] for cell in cells for quantity, level in cell["levels"].items()}
        self.assertEqual({"rxlev": None, "rscp": "dBm"}, {key: units[key] for key in ("rxlev", "rscp")})

    def test_a_name_found_later_stays(self):
        path = self.lte((0.0, serving()), (1.0, measured(-95, neighbours=[(362, -90)])),
                        (2.0, serving(code=362, cell=77)), (3.0, serving()), (4.0, measured(-95, neighbours=[(362, -99)])))
        there = next(each for each in self.records("cells", path) if each["code"] == 362)
        self.assertEqual((there["cell_id"], there["roles"]), (77, ["serving", "neighbour"]))

    def test_csv_has_a_line_for_each_level(self):
        path = self.lte((0.0, serving()), (1.0, measured(-95)))
        lines = list(csv.DictReader(io.StringIO(self.run_verb("cells", "--format", "csv", path))))
        self.assertEqual([(line["cell"], line["quantity"], line["unit"], line["mean"]) for line in lines],
                         [("lte:3350/404", "rsrp", "dBm", "-95.0"), ("lte:3350/404", "rsrq", "dB", "-10.0")])

    def test_a_table_for_people(self):
        path = self.lte((0.0, serving()), (1.0, measured(-95)))
        heading, first, second = self.run_verb("cells", "--format", "table", path).splitlines()
        self.assertEqual(heading.split()[:4], ["cell", "bands", "mhz", "network"])
        self.assertEqual(first.split(), ["lte:3350/404", "B7", "2680.0", "4517", "27578369", "serving", "14:07:09",
                                         "14:07:10", "rsrp", "dBm", "1", "-95.0", "-95.0", "-95.0"])
        self.assertEqual(second.split()[0], "rsrq")

    def test_a_table_stands_straight(self):
        for technology in ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2"):
            with self.subTest(technology):
                heading, *lines = self.run_verb("cells", "--format", "table", self.drive(technology)).splitlines()
                begins = [match.start() for match in re.finditer(r"(?<=  )(bands|network|roles|first|last|quantity|unit)\b",
                                                                 heading)]
                self.assertEqual(len(begins), 7)
                self.assertGreater(len(lines), 5)
                for line in lines:
                    self.assertEqual([line[begin - 2:begin].strip() for begin in begins], [""] * 7, line)

    def test_the_band_class_that_a_record_says_is_the_band(self):
        cells = self.records("cells", self.drive("Orvane_CDMA"))
        self.assertEqual({tuple(cell["bands"]) for cell in cells}, {("BC0",)})
        self.assertEqual({cell["mhz"][0] for cell in cells}, {878.49, 877.26})

    def test_the_object_stream_has_cells_that_serve_and_their_names(self):
        path = self.drive("IFX")
        cells = self.records("cells", path)
        self.assertEqual({role for cell in cells for role in cell["roles"]}, {"serving", "neighbour"})
        serving = [cell for cell in cells if "serving" in cell["roles"]]
        self.assertGreater(len(serving), 5)
        for cell in serving:
            self.assertRegex(cell["network"], "^999-0[12]")
            self.assertIsNotNone(cell["cell_id"])
        self.assertEqual({cell["cell_id"] for cell in cells if cell["roles"] == ["neighbour"]}, {None})
        kinds = {event["event"] for event in self.records("events", path)}
        self.assertTrue({"cell_change", "rat_change"} <= kinds, kinds)

    def test_captures_are_merged_over_technologies(self):
        lte = self.lte((0.0, serving()), (1.0, measured(-95)))
        again = self.lte((100.0, serving()), (101.0, measured(-105)), name="again.pcap")
        cells = self.records("cells", lte, self.drive("Orvane_GSM"), again)
        here = next(each for each in cells if each["cell"] == "lte:3350/404")
        self.assertEqual((here["levels"]["rsrp"]["count"], here["levels"]["rsrp"]["mean"]), (2, -100.0))
        self.assertTrue({"lte", "umts"} <= {each["rat"] for each in cells})

    def test_jobs_change_nothing(self):
        captures = [self.drive(technology, 1500, seed) for technology in ("Orvane_LTE", "Orvane_GSM", "Orvane_CDMA")
                    for seed in (1, 2)]
        for verb, status in (("cells",), 0), (("events",), 0), (("coverage",), 0), (("alarms", "--rule", "event cell_change"), 3):
            with self.subTest(verb):
                alone = self.run_program(*verb, *captures)
                together = self.run_program(*verb, "--jobs", "3", *captures)
                self.assertEqual(alone.returncode, status)
                self.assertGreater(len(alone.stdout), 1000)
                self.assertEqual((together.returncode, together.stdout, together.stderr),
                                 (status, alone.stdout, alone.stderr))

    def test_a_bad_capture_is_said_and_the_others_are_read(self):
        bad = self.write("bad.pcap", b"no capture")
        good = self.lte((0.0, serving()))
        for jobs in ("1", "2"):
            result = self.run_program("cells", "--jobs", jobs, bad, good)
            self.assertEqual(result.returncode, 1)
            self.assertIn(bad, result.stderr.decode())
            self.assertEqual(len(result.stdout.splitlines()), 1)

    def test_nothing_is_a_heading_at_most(self):
        empty = self.write("empty.pcap", pcap())
        self.assertEqual(self.run_verb("cells", "--technology", "Orvane_LTE", empty), "")
        self.assertEqual(self.run_verb("cells", "--technology", "Orvane_LTE", "--format", "csv", empty).count("\n"), 1)

    def test_wrong_usage(self):
        for arguments, words in ((("cells",), "CAPTURE or --live is required"),
                                 (("cells", "--live", "a.pcap"), "--live: takes no CAPTURE"),
                                 (("cells", "--seconds", "3", "a.pcap"), "--seconds: needs --live"),
                                 (("cells", "--jobs", "0", "a.pcap"), '"0" is no number of jobs'),
                                 (("events", "--format", "xml", "a.pcap"), "--format"),
                                 (("cells", "--technology", "5G", "a.pcap"), 'there is no technology "5G"')):
            with self.subTest(arguments):
                self.assert_fault(self.run_program(*arguments), words, status=2)


class Events(Survey):
    def test_a_change_of_cell(self):
        path = self.lte((0.0, serving()), (1.0, serving(code=362, cell=77)))
        self.assertEqual(self.records("events", path), [{
            "time": "2024-03-05T14:07:10.000000Z", "technology": "Orvane_LTE", "event": "cell_change",
            "cell": "lte:3350/362", "quantity": None, "from": "lte:3350/404", "to": "lte:3350/362", "reason": None,
            "text": "cell change lte:3350/404 to lte:3350/362"}])

    def test_an_unknown_record_and_a_silent_link(self):
        path = self.lte((0.0, serving()), (1.0, UNKNOWN), (2.0, UNKNOWN), (60.0, serving()))
        self.assertEqual([(each["time"][17:26], each["text"]) for each in self.records("events", path)], [
            ("10.000000", "unknown record 0xB193 first seen: not asked for, 20 bytes"),
            ("26.000000", "link lost: no message for 15 s"),
            ("09.000000", "link back: after 58 s")])

    def test_an_unknown_record_has_its_code_and_what_became_of_it(self):
        event, = self.records("events", self.lte(UNKNOWN, serving()))
        self.assertEqual({key: event[key] for key in ("event", "from", "to", "reason")}, {
            "event": "unknown_record", "from": None, "to": "0xB193", "reason": "not asked for, 20 bytes"})

    def test_a_table_comes_line_by_line(self):
        path = self.lte((0.0, serving()), (1.0, serving(code=362, cell=77)))
        lines = self.run_verb("events", "--format", "table", path).splitlines()
        self.assertEqual(lines[0].split(), ["time", "event", "cell", "text"])
        self.assertEqual(lines[1].split(maxsplit=4),
                         ["2024-03-05", "14:07:10", "cell_change", "lte:3350/362", "cell change lte:3350/404 to lte:3350/362"])

    def test_live_events_come_at_once(self):
        self.start_daemon("--seed", "7", "--speed", "60", technology="Orvane_LTE")
        events = self.start_live("events", "--live", resources=RESOURCES)
        first = json.loads(events.stdout.readline())
        self.assertEqual(first["technology"], "Orvane_LTE")
        status, _, _ = self.end(events)
        self.assertEqual(status, 0)


class Coverage(Survey):
    def test_each_code_with_its_outcome(self):
        short = record(0xB0C2, b"short")
        path = self.lte(serving(), serving(), serving(), UNKNOWN, UNKNOWN, short, record(1, b"", log_type=7))
        records = self.records("coverage", path)
        self.assertEqual([(each["code"], each["outcome"], each["messages"], each["nearest"]) for each in records], [
            ("0xB0C2", "shown", 3, None), ("0xB193", "not asked for", 2, "0xB186"), ("0x0001", "unknown log type", 1, None),
            ("0xB0C2", "too short", 1, None)])
        self.assertEqual(records[1]["sample"], UNKNOWN.hex())
        self.assertEqual(records[3]["length"], len(short))

    def test_every_verb_ends_with_what_was_not_shown(self):
        path = self.lte(serving(), UNKNOWN, serving(), UNKNOWN)
        for verb in (["decode"], ["cells"], ["events"], ["coverage"], ["alarms", "--rule", "rsrp < -100"]):
            with self.subTest(verb):
                result = self.run_program(*verb, path)
                self.assertEqual(result.returncode, 0)
                self.assertEqual(result.stderr.decode().splitlines()[-1],
                                 "kelvasictl: 50 % of 4 messages were not shown")
                shown = self.run_program(*verb, self.lte(serving(), name="shown.pcap"))
                self.assertNotIn("not shown", shown.stderr.decode())

    def test_it_is_the_last_line_after_a_fault_too(self):
        path = self.write("cut.pcap", pcap(serving(), UNKNOWN) + b"cut")
        result = self.run_program("coverage", path)
        self.assertEqual(result.returncode, 1)
        self.assertEqual(result.stderr.decode().splitlines()[-1], "kelvasictl: 50 % of 2 messages were not shown")

    def test_a_live_link_has_its_coverage(self):
        world = self.write("world.pcap", pcap(serving(), record(0xB0C2, b"short")))
        daemon = self.start_daemon("--replay", world, "--leave", technology="Orvane_LTE")
        coverage = self.start_live("coverage", "--live", resources=RESOURCES)
        self.assertEqual(daemon.wait(PATIENCE), 0)
        status, out, error = self.end(coverage)
        self.assertEqual(status, 0)
        self.assertEqual([json.loads(line)["outcome"] for line in out.splitlines()], ["shown", "too short"])
        self.assertEqual(error.splitlines()[-1], "kelvasictl: 50 % of 2 messages were not shown")

    def test_monitor_says_it_too(self):
        world = self.write("world.pcap", pcap(serving(), record(0xB0C2, b"short")))
        daemon = self.start_daemon("--replay", world, "--leave", technology="Orvane_LTE")
        monitor = self.start_live("monitor", resources=RESOURCES)
        self.assertEqual(daemon.wait(PATIENCE), 0)
        status, _, error = self.end(monitor)
        self.assertEqual(status, 0)
        self.assertEqual(error.splitlines()[-1], "kelvasictl: 50 % of 2 messages were not shown")


class Alarms(Survey):
    def levels(self, *levels):
        return self.lte((0.0, serving()), *((1.0 + at, measured(level)) for at, level in enumerate(levels)))

    def script(self, text):
        path = self.write("notify", b"#!/bin/sh\n" + text.encode())
        os.chmod(path, 0o700)
        return path

    def test_an_alarm_is_a_record_and_a_status(self):
        path = self.levels(-100, -120, -121, -90)
        records = self.records("alarms", "--rule", "rsrp < -115 for 1s", path, status=3)
        self.assertEqual(records, [{
            "time": "2024-03-05T14:07:12.000000Z", "technology": "Orvane_LTE", "rule": "rsrp < -115 for 1s",
            "since": "2024-03-05T14:07:11.000000Z", "cell": "lte:3350/404", "quantity": "rsrp", "value": -121.0,
            "unit": "dBm", "event": None, "held_back": 0, "text": "rsrp < -115 for 1s: -121 dBm, lte:3350/404"}])

    def test_without_an_alarm_all_is_well(self):
        self.assertEqual(self.run_verb("alarms", "--rule", "rsrp < -130", self.levels(-100)), "")

    def test_several_rules_and_events(self):
        path = self.lte((0.0, serving()), (1.0, measured(-120)), (2.0, serving(code=362, cell=77)))
        records = self.records("alarms", "--rule", "rsrp < -115", "--rule", "event cell_change", path, status=3)
        self.assertEqual([each["text"] for each in records], [
            "rsrp < -115: -120 dBm, lte:3350/404",
            "event cell_change: cell change lte:3350/404 to lte:3350/362"])

    def test_a_wrong_rule_is_wrong_usage(self):
        self.assert_fault(self.run_program("alarms", "--rule", "rsrp = -115", self.levels(-100)),
                          'at 6: expected <, <=, >, >=, "leaves" or "absent", found "="', status=2)

    def test_the_command_gets_the_alarm_in_its_environment(self):
        told = self.path("told")
        notify = self.script(f'printf "%s|" "$KELVASI_ALARM_TEXT" "$KELVASI_ALARM_VALUE" "$KELVASI_ALARM_EVENT" "$1" >> {told}\n')
        self.run_verb("alarms", "--rule", "rsrp < -115", "--run", notify, "--argument", "a b; $HOME", self.levels(-120), status=3)
        self.assertEqual(self.read("told").decode(), "rsrp < -115: -120 dBm, lte:3350/404|-120.0||a b; $HOME|")

    def test_no_shell_sees_the_command(self):
        result = self.run_program("alarms", "--rule", "rsrp < -115", "--run", "echo oops", self.levels(-120))
        self.assertEqual(result.returncode, 1)
        self.assertIn("echo oops: No such file or directory", result.stderr.decode())

    def test_a_command_has_one_run_at_a_time(self):
        self.assert_fault(self.run_program("alarms", "--rule", "rsrp < -115", "--run", "true", "--jobs", "2", "a.pcap"),
                          "--run excludes --jobs", status=2)

    def test_what_the_command_prints_is_no_record(self):
        result = self.run_program("alarms", "--rule", "rsrp < -115", "--run", self.script("echo heard\n"), self.levels(-120))
        self.assertEqual((result.returncode, len(result.stdout.splitlines())), (3, 1))
        self.assertIn(b"heard\n", result.stderr)

    def test_at_most_so_often(self):
        told = self.path("told")
        notify = self.script(f'echo "$KELVASI_ALARM_TIME" >> {told}\n')
        levels = [-120 if at % 2 == 0 else -90 for at in range(30)]
        path = self.levels(*levels)
        result = self.run_program("alarms", "--rule", "rsrp < -115", "--run", notify, path)
        self.assertEqual((result.returncode, len(result.stdout.splitlines())), (3, 15))
        self.assertEqual(len(self.read("told").splitlines()), 3)
        self.assertIn("12 alarms came while the command ran or too soon after it", result.stderr.decode())
        os.remove(told)
        self.run_verb("alarms", "--rule", "rsrp < -115", "--run", notify, "--run-every", "0", path, status=3)
        self.assertEqual(len(self.read("told").splitlines()), 15)

    def test_a_command_that_fails_is_a_fault(self):
        result = self.run_program("alarms", "--rule", "rsrp < -115", "--run", self.script("exit 4\n"), self.levels(-120))
        self.assertEqual(result.returncode, 1)
        self.assertIn("the command failed in 1 run", result.stderr.decode())

    def test_a_live_alarm_runs_its_command_and_a_signal_ends_all(self):
        told = self.path("told")
        notify = self.script(f'echo "$KELVASI_ALARM_CELL" >> {told}\nexec sleep 1000\n')
        world = self.write("world.pcap", pcap((0.0, serving()), (0.1, measured(-120)), (0.2, measured(-90)),
                                              (0.3, measured(-120))))
        self.start_daemon("--replay", world, technology="Orvane_LTE")
        alarms = self.start_live("alarms", "--live", "--rule", "rsrp < -115", "--run", notify, "--run-every", "0",
                                 resources=RESOURCES)
        self.wait_until(lambda: os.path.exists(told))
        lines = [json.loads(alarms.stdout.readline()) for _ in range(2)]
        self.assertEqual([line["value"] for line in lines], [-120.0, -120.0])
        began = time.monotonic()
        alarms.send_signal(signal.SIGINT)
        _, error = alarms.communicate(timeout=PATIENCE)
        self.assertLess(time.monotonic() - began, 20)
        self.assertEqual(alarms.returncode, 1)  # its command was ended
        self.assertIn("1 alarm came while the command ran", error.decode())
        self.assertEqual(self.read("told").decode(), "lte:3350/404\n")

    def test_an_absent_value_is_an_alarm_while_nothing_comes(self):
        world = self.write("world.pcap", pcap(serving(), measured(-80)))
        self.start_daemon("--replay", world, technology="Orvane_LTE")
        alarms = self.start_live("alarms", "--live", "--rule", "rsrp absent for 1s", resources=RESOURCES)
        self.assertIn("rsrp absent for 1s: no value since ", json.loads(alarms.stdout.readline())["text"])
        self.assertEqual(self.end(alarms)[0], 3)


@unittest.skipIf(os.environ.get("KELVASI_SANITIZE"), "sanitizers keep memory back")
class Memory(Survey):
    def test_it_does_not_grow_with_the_capture(self):
        def peak(path):
            script = ("import resource, subprocess, sys; subprocess.run(sys.argv[1:], stdout=subprocess.DEVNULL, "
                      "stderr=subprocess.DEVNULL, check=True); "
                      "print(resource.getrusage(resource.RUSAGE_CHILDREN).ru_maxrss)")
            return int(subprocess.run(["python3", "-c", script, PROGRAM, "events", path], check=True,
                                      capture_output=True, text=True).stdout)

        short, long = peak(self.drive(messages=4000)), peak(self.drive(messages=60000, seed=8))
        self.assertLess(long, short + 4000)  # kB


if __name__ == "__main__":
    unittest.main()
