# SPDX-License-Identifier: Apache-2.0
"""The viewer beside the world of the simulated drive: the cell that serves is the one shown, and every level is its cell's."""

import json
import math
import time
import unittest

from viewer_support import ViewerTest

# Levels of now: what has this age was measured in one of the world's steps of this time.
FRESH = 0.3
STEPS = 1.0  # seconds before the look; a message is on its way for a while

# By the level's id: of what in the world, how far off a report may be, and the ends of its scale. The daemon counts a GSM
# level in steps of 2 dB, and one record of UMTS goes through a ladder that bends far down.
LEVELS = {
    "rsrp": ("level", 0.6, -140, -44),
    "rsrq": ("quality", 0.6, -19.5, -3),
    "rscp": ("level", 1.2, -121, -25),
    "ecno": ("quality", 0.7, -24, 0),
    "gsm_level": ("level", 2.2, -111, -47),
    "ecio": ("quality", 0.7, -31.5, 0),
}
LADDER = {"rscp", "ecno"}


class Truth(ViewerTest):
    LOOKS = 25

    def drive(self, technology, *, start_at):
        self.start_daemon("--seed", "7", "--start-at", str(start_at), "--speed", "3", "--world-log", self.path("world"),
                          technology=technology)
        viewer = self.start_viewer()
        viewer.await_updated()
        looks = []
        for _ in range(self.LOOKS):
            time.sleep(0.2)
            looks.append(viewer.state()["cockpit"])
        self.assertEqual(viewer.close(), 0)
        world = [json.loads(line) for line in self.read("world").splitlines() if line.endswith(b"}")]
        return [(look, self.steps_before(world, look["time"])) for look in looks]

    def steps_before(self, world, moment):
        steps = [step for step in world if moment - STEPS <= step["time"] <= moment]
        self.assertTrue(steps, "the world stood still")
        return steps

    def check_serving(self, shown, steps):
        """Whether there was one to be compared."""
        if "cell" not in shown:
            return 0
        serving = {cell for step in steps for cell in step["serving"]}
        if serving:
            self.assertTrue(any(can_be_same(shown["cell"], cell) for cell in serving), (shown["cell"], serving))
        return 1

    def check_levels(self, cell, levels, steps):
        """How many were compared."""
        compared = 0
        for level in levels:
            if level["id"] not in LEVELS or "value" not in level or level["age"]["seconds"] > FRESH:
                continue
            truths = true_values(cell, level["id"], steps)
            self.assertTrue(truths, f"the world has no {cell}")
            least, most = min(truths), max(truths)
            self.assertTrue(least <= level["value"] <= most, (cell, level["id"], level["value"], least, most))
            compared += 1
        return compared

    def check(self, technology, start_at=90):
        servings = compared = 0
        for look, steps in self.drive(technology, start_at=start_at):
            for shown in (look["serving"], look.get("second", {})):
                servings += self.check_serving(shown, steps)
                compared += self.check_levels(shown.get("cell"), shown.get("levels", []), steps)
            for cell in look["cells"]:
                compared += self.check_levels(cell["cell"], [cell["level"]], steps)
        return servings, compared

    def test_lte(self):
        self.check_all("Orvane_LTE")

    def test_gsm(self):
        self.check_all("Orvane_GSM")

    def test_utran(self):
        self.check_all("Orvane_UTRAN2")

    def test_cdma(self):
        self.check_all("Orvane_CDMA")

    def test_object_stream(self):
        _, compared = self.check("IFX")
        self.assertGreater(compared, self.LOOKS)

    def check_all(self, technology):
        servings, compared = self.check(technology)
        self.assertGreater(servings, self.LOOKS // 2)
        self.assertGreater(compared, self.LOOKS)


def parts(identity):
    family, _, rest = identity.partition(":")
    channel, _, code = rest.partition("/")
    return family, channel, code


def can_be_same(shown, true):
    one, other = parts(shown), parts(true)
    return one[0] == other[0] and all(first in ("", "?") or first == second for first, second in zip(one[1:], other[1:]))


def strengths(cell, ratio):
    """What records of 1x and EV-DO may hold of a pilot's ratio: parts of the whole, in dB."""
    linear = 10 ** (max(min(ratio, 0), -31.5) / 10)
    if cell.startswith("evdo:"):
        return [10 * math.log10(max(round(512 * linear), 1) / 512)]
    return [10 * math.log10(max(linear + step, 1e-5)) for step in (-1.5e-5, 1.5e-5)]


def true_values(cell, level, steps):
    """The ends of what reports of these steps may say."""
    kind, tolerance, least, most = LEVELS[level]
    values = []
    for step in steps:
        for name, true in step["cells"].items():
            if can_be_same(cell, name):
                values += [true[key] for key in (kind, "average_" + kind) if key in true]
    if level in LADDER and values:
        values.append(min(values) - 3)
    if level == "ecio":
        values = [strength for value in values for strength in strengths(cell, value)]
    clamped = [min(max(value, least), most) for value in values]
    return [value + sign * tolerance for value in clamped for sign in (-1, 1)]


if __name__ == "__main__":
    unittest.main()
