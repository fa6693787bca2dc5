# SPDX-License-Identifier: Apache-2.0
"""Adds the decoders of CONTRIBUTING.md to a copy of the tree, as they stand there, and runs what it says to run."""

import os
import pathlib
import re
import shutil
import subprocess
import sys
import unittest

ROOT = pathlib.Path(__file__).resolve().parents[2]
COPY = pathlib.Path(os.environ["COPY"])
CHAPTER = "## Adding a decoder in five minutes"
# A file of the tree, the line of it at which the block goes in, if it is there already, and the block.
EDIT = re.compile(r"^`([^`]+)`(?:, (above|below) the line of `([^`]+)`)?:\n\n```\w+\n(.*?)^```$", re.M | re.S)
COMMANDS = re.compile(r"^```sh\n(.*?)^```$", re.M | re.S)


def copy_tree():
    shutil.rmtree(COPY, ignore_errors=True)
    listed = subprocess.run(["git", "ls-files", "-co", "--exclude-standard"], cwd=ROOT, capture_output=True, text=True,
                            check=True).stdout
    for name in filter(lambda each: (ROOT / each).is_file(), listed.splitlines()):
        (COPY / name).parent.mkdir(parents=True, exist_ok=True)
        shutil.copy2(ROOT / name, COPY / name)


def edit(name, where, line, block):
    path = COPY / name
    if not line:
        if path.exists():
            raise AssertionError(f"{name} is there already")
        path.write_text(block)
        return
    lines = path.read_text().splitlines(keepends=True)
    places = [place for place, each in enumerate(lines) if line in each]
    if len(places) != 1:
        raise AssertionError(f"{name}: {len(places)} lines have {line!r}")
    lines.insert(places[0] + (where == "below"), block)
    path.write_text("".join(lines))


def run(command):
    # The copy's objects are the tree's own, but for what the new decoder changes.
    environment = {**os.environ, "CCACHE_NOHASHDIR": "1"}
    environment.setdefault("CCACHE_BASEDIR", str(ROOT))
    # Behind the tests that wait for ticks beside it.
    return subprocess.run(["nice", "-n", "19", "bash", "-e", "-c", command], cwd=COPY, env=environment,
                          capture_output=True, text=True, check=False)


class Contributing(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        copy_tree()
        cls.chapters = (ROOT / "CONTRIBUTING.md").read_text().split(CHAPTER, 1)[1].split("\n## ", 1)[0].split("\n### ")

    @classmethod
    def tearDownClass(cls):
        shutil.rmtree(COPY, ignore_errors=True)

    # The second recipe is followed in what the first one left.
    def test_1_a_decoder_takes_what_the_recipe_says_and_nothing_else(self):
        self.follow(self.chapters[0], 4, (
            "PagingInfo.ShowsPeriodModeAndPages", "Templates.EachHoldsWhatItsDecodersShowOnceAndNothingElse",
            "RecordSweep.RecordsShorterThanTheirMinimumChangeNothing<RecordSweep/Orvane_GSM",
            "Allocations.RecordsInTurnCostNone<Allocations/Orvane_GSM", "RecordFuzz.Seeds", "Kelvasictl.fields",
            "Drive.SendsEveryRequiredCodeAndNoneThatTheViewerDoesNotSubscribeTo",
            "Drives/EveryRecord.CostsNoAllocationOnceTheRowsExist/kTelvonLogChannelTechnology_Orvane_GSM"))
        self.expect_fault_without_the_line_in_the_template()

    def test_2_a_cdma_record_takes_as_little(self):
        (chapter,) = [each for each in self.chapters if each.startswith("A record of CDMA")]
        self.follow(chapter, 5, (
            "AccessAttempt.ShowsProbesAndResult", "Templates.EachHoldsWhatItsDecodersShowOnceAndNothingElse",
            "EveryC2KRecord.OneShorterThanItsMinimumIsReportedAndChangesNothing", "RecordFuzz.Seeds",
            "EveryC2KRecord.RecordsInTurnCostNoAllocation", "Kelvasictl.fields",
            "Drives/EveryRecord.CostsNoAllocationOnceTheRowsExist/kTelvonLogChannelTechnology_Orvane_CDMA"))

    def follow(self, chapter, files, tests):
        edits = EDIT.findall(chapter)
        for each in edits:
            edit(*each)
        self.assertEqual(len({name for name, *_ in edits}), files)
        (commands,) = COMMANDS.findall(chapter)
        result = run(commands)
        print(result.stdout[-4000:], result.stderr[-4000:], file=sys.stderr)
        self.assertEqual(result.returncode, 0)
        for test in tests:
            self.assertRegex(result.stdout, re.escape(test) + ".*Passed")

    def expect_fault_without_the_line_in_the_template(self):
        template = COPY / "Resources" / "Orvane_GSM.plist"
        whole = template.read_text()
        template.write_text(whole.replace("<key>Paging Info</key>\n\t\t<dict/>", ""))
        self.assertNotEqual(run("ctest --test-dir build/release -R '^Templates'").returncode, 0)
        template.write_text(whole)


if __name__ == "__main__":
    unittest.main()
