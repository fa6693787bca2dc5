# SPDX-License-Identifier: Apache-2.0
"""kelvasictl report: one file that needs nothing, with the drive's numbers and no markup from the air."""

import html.parser
import json
import pathlib
import subprocess
import unittest

from live_support import DAEMON
from support import KelvasictlTest, pcap, record


class Page(html.parser.HTMLParser):
    """Checks that elements are closed in their order; keeps them, and the texts of table cells."""

    def __init__(self, text):
        super().__init__()
        self.open, self.elements, self.cells, self.scripts = [], [], [], 0
        self.feed(text)
        self.close()

    def handle_starttag(self, tag, attributes):
        self.elements.append((tag, dict(attributes)))
        self.scripts += tag == "script"
        if tag == "td":
            self.cells.append("")
        if tag != "meta":
            self.open.append(tag)

    def handle_startendtag(self, tag, attributes):
        self.elements.append((tag, dict(attributes)))

    def handle_endtag(self, tag):
        assert self.open and self.open[-1] == tag, (tag, self.open)
        self.open.pop()

    def handle_data(self, data):
        if self.open and self.open[-1] == "td":
            self.cells[-1] += data


class ReportTest(KelvasictlTest):
    def drive(self, technology, messages, name="drive.pcap"):
        path = self.path(name)
        subprocess.run([DAEMON, "--technology", technology, "--messages", str(messages), "--write", path], check=True,
                       capture_output=True, timeout=120)
        return path

    def report(self, *captures):
        result = self.run_program("report", *captures, "-o", self.path("out.html"))
        self.assertEqual(result.returncode, 0, result.stderr)
        text = self.read("out.html").decode()
        return text, Page(text)

    def test_every_technology(self):
        for technology in ("IFX", "Orvane_GSM", "Orvane_CDMA", "Orvane_LTE", "Orvane_UTRAN2"):
            with self.subTest(technology):
                text, page = self.report(self.drive(technology, 3000, technology + ".pcap"))
                self.assertEqual(page.open, [])
                self.assertEqual(page.scripts, 1)
                self.assertIn(technology, text)
                for tag, attributes in page.elements:
                    self.assertFalse({"src", "href"} & set(attributes), (tag, attributes))

    def test_cells_and_changes_are_those_of_the_other_verbs(self):
        path = self.drive("Orvane_LTE", 30000)
        text, page = self.report(path)
        cells = [json.loads(line) for line in self.run_program("cells", "--format", "ndjson", path).stdout.splitlines()]
        events = [json.loads(line) for line in self.run_program("events", "--format", "ndjson", path).stdout.splitlines()]
        for cell in cells:
            self.assertIn(cell["cell"], page.cells)
        changes = [event for event in events if event["event"] == "cell_change"]
        self.assertGreater(len(changes), 0)
        self.assertIn(f"<dt>Cell changes</dt><dd>{len(changes)}</dd>", text)
        for change in changes:
            self.assertIn(change["time"][:19].replace("T", " "), page.cells)

    def test_same_input_gives_the_same_bytes(self):
        path = self.drive("Orvane_GSM", 2000)
        self.assertEqual(self.report(path)[0], self.report(path)[0])

    def test_a_network_may_be_named_script(self):
        configuration = pathlib.Path(self.directory.name) / "kelvasi"
        configuration.mkdir()
        (configuration / "operators.csv").write_text("999,01,<script>alert(1)</script>\n")
        self.environment["XDG_CONFIG_HOME"] = self.directory.name
        text, page = self.report(self.drive("Orvane_GSM", 3000, "<script>.pcap"))
        self.assertEqual(page.scripts, 1)
        self.assertIn("&lt;script&gt;.pcap", text)
        self.assertIn("<script>alert(1)</script>", " ".join(page.cells))

    def test_without_messages_and_with_one(self):
        for capture in (pcap(), pcap(record(0x7131, bytes([0x13, 0x08, 0x02])))):
            result = self.run_program("report", "--technology", "Orvane_GSM", self.write("in.pcap", capture), "-o", "-")
            self.assertEqual(result.returncode, 0, result.stderr)
            self.assertEqual(Page(result.stdout.decode()).open, [])


if __name__ == "__main__":
    unittest.main()
