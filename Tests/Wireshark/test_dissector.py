# SPDX-License-Identifier: Apache-2.0
"""The dissector that kelvasictl makes: tshark shows with it what kelvasictl reads."""

import json
import os
import random
import subprocess
import xml.etree.ElementTree

import compared
import dissected
from support import KelvasictlTest, PROGRAM, pcap, record

TELVON_SIM = os.environ["TELVON_SIM"]
# Of each technology. For a proof over more: KELVASI_DISSECTED=25000 ctest -R Wireshark
RECORDS = int(os.environ.get("KELVASI_DISSECTED", "6000"))
TECHNOLOGIES = ("Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2")


class DissectorTest(KelvasictlTest):
    def setUp(self):
        super().setUp()
        result = self.run_program("dissector")
        self.assertEqual((result.returncode, result.stderr), (0, b""))
        self.dissector = self.write("kelvasi.lua", result.stdout)

    def drive(self, technology, messages, *more):
        capture = self.path(technology + ".pcap")
        subprocess.run([TELVON_SIM, "--technology", technology, "--write", capture, "--messages", str(messages), *more],
                       env=self.environment, check=True, timeout=300)
        return capture

    def tshark(self, *arguments):
        result = dissected.tshark("-X", "lua_script:" + self.dissector, *arguments)
        self.assertEqual(result.returncode, 0, result.stderr)
        self.assertNotIn("Lua", result.stderr)
        return result.stdout

    def selected(self, capture, display_filter):
        """The numbers of the packets that the filter selects, from 1."""
        shown = self.tshark("-r", capture, "-Y", display_filter, "-T", "fields", "-e", "frame.number")
        return [int(line) for line in shown.split()]

    def rows_of(self, *messages):
        reader = dissected.Rows(dissected.titles(self.dissector))
        capture = self.write("hand.pcap", pcap(*messages))
        return [reader.of(packet) for packet in dissected.packets(self.dissector, capture)]


class Equal(DissectorTest):
    def compare(self, technology, *faults, messages=RECORDS):
        capture = self.drive(technology, messages, *faults)
        readings = compared.rows_of_readings(PROGRAM, technology, capture)
        rows, packets = compared.rows_of_tshark(self.dissector, capture)
        self.assertEqual(packets, messages)
        self.assertGreater(sum(map(len, readings.values())), messages)
        self.assertEqual(compared.differences(readings, rows)[:5], [])

    def test_gsm(self):
        self.compare("Orvane_GSM")

    def test_lte(self):
        self.compare("Orvane_LTE")

    def test_utran(self):
        self.compare("Orvane_UTRAN2")

    def test_cdma(self):
        self.compare("Orvane_CDMA")

    def test_records_that_are_cut_and_those_behind_a_prefix(self):
        for technology in TECHNOLOGIES:
            self.compare(technology, "--fault", "short=3", "--fault", "prefix=2", "--seed", "5", messages=RECORDS // 4)
            os.remove(self.path(technology + ".pcap"))


class Shown(DissectorTest):
    def labels(self, capture):
        """What stands in the tree of the details, with its filter name."""
        details = self.tshark("-r", capture, "-T", "pdml", "-J", "kelvasi")
        return [(field.get("name"), field.get("showname") or field.get("show"))
                for field in xml.etree.ElementTree.fromstring(details).iter("field")]

    def test_texts_are_those_of_the_display(self):
        for technology in TECHNOLOGIES:
            capture = self.drive(technology, 500)
            shown = sorted(label for name, label in self.labels(capture) if dissected.ROW.match(name))
            readings = compared.rows_of_readings(PROGRAM, technology, capture)
            titles = set(dissected.titles(self.dissector).values())
            wanted = []
            for section, path, text, *_ in sum(readings.values(), []):
                if section != "PDP Context Info":
                    wanted.append(next(step for step in reversed(path) if step in titles) + ": " + text)
            if technology == "Orvane_LTE":  # cells before the first record of the baseband are shown to all
                shown = [label for label in shown if label in set(wanted)]
            self.assertEqual(shown, sorted(wanted))

    def test_bytes_typed_by_hand(self):
        # Version 1, E-ARFCN 1300, identity 233 in 9 bits, RSRP 167 quarters over -140 dBm.
        served = record(0xB17F, bytes.fromhex("01 00 00 00 14 05 E9 00 A7 4E 61 8C 00 00 00 00 00 00 00 00"))
        rows = dict(((section, *path), (text, number, quantity))
                    for section, path, text, number, quantity in self.rows_of(served)[0])
        section = "Serving Cell Measurements"
        self.assertEqual(rows[section, "E-ARFCN"], (None, 1300, "earfcn"))
        self.assertEqual(rows[section, "Physical Cell ID"], (None, 233, "pci"))
        self.assertEqual(rows[section, "Measured RSRP"], (None, -98.25, "rsrp"))
        self.assertEqual(rows[section, "Measurement Rules Updated"], ("False", 0, "flag"))

    def test_a_filter_by_a_quantity_selects_what_has_such_a_reading(self):
        capture = self.drive("Orvane_LTE", 1500)
        readings = self.run_program("readings", "--technology", "Orvane_LTE", capture).stdout.splitlines()
        wanted = {line["time"] for line in map(json.loads, readings)
                  if line["quantity"] == "rsrp" and line["value"] is not None and line["value"] < -100}
        times = self.tshark("-r", capture, "-Y", "kelvasi.rsrp < -100", "-T", "fields", "-e", "frame.time_epoch").split()
        self.assertTrue(0 < len(wanted) < len(readings))
        self.assertEqual({compared.rfc3339(time) for time in times}, wanted)

    def test_filters_by_code_section_row_state_and_bits(self):
        idle = record(0x7131, bytes([19, 8, 2]))
        camped = record(0x7131, bytes([3, 8, 0]))
        capture = self.write("states.pcap", pcap(idle, camped, record(0x7130, bytes([3, 9, 1]))))
        for display_filter, numbers in (
                ("kelvasi.code == 0x7131", [1, 2]), ('kelvasi.section == "Process PS"', [3]),
                ('kelvasi.gsm.process_cs.mm_state == "MM_IDLE"', [1]), ("kelvasi.mm_state == 3", [2]),
                ("kelvasi.7131.sub_state == 8", [1, 2]), ("kelvasi.gmm_state", [3])):
            self.assertEqual(self.selected(capture, display_filter), numbers, display_filter)

    def test_property_lists_of_the_object_stream(self):
        capture = self.drive("IFX", 40)
        objects = [dissected.layer(packet, "kelvasi") for packet in dissected.packets(self.dissector, capture)]
        lists = [next(below for name, _, below in dissected.children(items) if name == "kelvasi.plist")
                 for items in objects]
        result = self.run_program("decode", "--technology", "IFX", capture)
        self.assertEqual(compared.without_kinds_of_nothing(compared.collapsed(dissected.plain(lists[-1]))),
                         compared.without_kinds_of_nothing(json.loads(result.stdout)))
        readings = self.run_program("readings", "--technology", "IFX", capture).stdout.splitlines()
        numbers = [(line["quantity"], line["value"]) for line in map(json.loads, readings) if line["value"] is not None]
        self.assertTrue(numbers)
        self.assertEqual(sorted(number for items in lists for number in dissected.quantities(items, [])),
                         sorted(numbers))

    def test_entries_of_a_property_list_in_every_kind(self):
        values = ("<true/>", "<integer>-9223372036854775808</integer>", "<integer>18446744073709551615</integer>",
                  "<real>-0.5</real>", "<data>AAEC</data>", "<date>2024-03-05T14:07:09Z</date>",
                  "<string>a &lt;b&gt; &#228;</string>", "<array/>")
        xml_list = "<plist><dict>" + "".join(f"<key>k</key><dict><key>v</key>{value}</dict>".replace("k<", f"{at}<")
                                             for at, value in enumerate(values)) + "</dict></plist>"
        capture = self.write("kinds.pcap", pcap(record(9, xml_list.encode(), log_type=0xFF)))
        labels = dict(self.labels(capture))
        for name, label in (("boolean", "Boolean: True"), ("integer", "Integer: -9223372036854775808"),
                            ("unsigned", "Integer: 18446744073709551615"), ("real", "Real: -0.5"),
                            ("data", "Data: 000102"), ("date", "Date: 2024-03-05T14:07:09Z"),
                            ("string", "String: a <b> ä")):
            self.assertEqual(labels["kelvasi.plist." + name], label)

    def test_the_dissector_names_its_licence_and_what_made_it(self):
        with open(self.dissector, encoding="utf-8") as file:
            self.assertEqual(file.readline(), "-- SPDX-License-Identifier: GPL-2.0-or-later\n")
        self.assertNotIn("nil", dissected.titles(self.dissector))

    def test_every_row_of_the_tables_has_a_filter(self):
        fields = json.loads(self.run_program("fields").stdout)
        names = set(dissected.titles(self.dissector).values())
        rows = {row["row"] for row in fields["rows"] if row["section"] and row["row"] not in ("*", "_sorted")}
        self.assertEqual(rows - names, set())


class Malformed(DissectorTest):
    def experts(self, *messages):
        capture = self.write("hand.pcap", pcap(*messages))
        shown = self.tshark("-r", capture, "-T", "fields", "-e", "_ws.expert.message", "-E", "occurrence=a",
                            "-E", "aggregator=;")
        return shown.split("\n")[:-1]

    def test_what_is_no_known_record_says_so(self):
        said = self.experts(record(0x7131, b"\x13\x08"), record(0x6666, b""), record(0xD0E0, b"\x02\x01"),
                            record(0x7131, bytes([19, 8, 2]), log_type=7), b"\x01\x02\x03",
                            record(1, b"none", log_type=0xFF), record(0x134F, bytes([1]) + bytes(180)),
                            record(0x119C, bytes(40)), record(0x51F8, b"\x01\x02"))
        for line, pieces in zip(said, (
                ["Process CS wants 16 bytes, the record has 15", "Process CO"], ["Unknown log code 0x6666"],
                ["Unknown version 2"], ["Unknown log type 7"], ["Shorter than the header of a record"],
                ["Not a property list"], ["Unknown version 1"], ["A sub-packet is missing"],
                ["Entry past the end of the record"])):
            for piece in pieces:
                self.assertIn(piece, line)

    def test_a_good_record_says_nothing(self):
        self.assertEqual(self.experts(record(0x7131, bytes([19, 8, 2]))), [""])

    def assert_no_fault_of_the_dissector(self, messages):
        capture = self.write("fuzz.pcap", pcap(*messages))
        self.assertEqual(self.tshark("-r", capture, "-V").count("Lua Error"), 0)
        self.assertEqual(self.selected(capture, "_ws.lua.error"), [])

    def test_every_record_cut_at_every_length(self):
        codes = {int(row["code"], 16) for row in json.loads(self.run_program("fields").stdout)["rows"] if row["code"]}
        messages = [record(code & 0xFFFF, bytes([0xFF] * length), log_type=0xFF if code > 0xFFFF else 1)
                    for code in sorted(codes) for length in (*range(0, 24), 37, 171, 1750)]
        self.assert_no_fault_of_the_dissector(messages)

    def test_drives_with_bytes_that_are_wrong(self):
        chance = random.Random(17)
        for technology in (*TECHNOLOGIES, "IFX"):
            with open(self.drive(technology, 400), "rb") as file:
                data = file.read()
            messages = []
            for message in compared.messages_of(data):
                damaged = bytearray(message)
                for _ in range(chance.randrange(1, 6)):
                    damaged[chance.randrange(0, len(damaged))] = chance.randrange(256)
                messages.append(bytes(damaged[:chance.randrange(len(damaged) + 1)] if chance.random() < 0.3 else damaged))
            self.assert_no_fault_of_the_dissector(messages)
            os.remove(self.path(technology + ".pcap"))
