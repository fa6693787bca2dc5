# SPDX-License-Identifier: Apache-2.0
"""From the lines of kelvasictl readings back to the display, as Docs/readings.md says."""

import json

SCALARS = ("integer", "real", "boolean")
NOT_JSON = ("nan", "inf", "-inf")
EMPTY = {"list": list, "group": dict}


def value_of(line):
    quantity, text = line["quantity"], line["text"]
    if quantity in EMPTY:
        return EMPTY[quantity]()
    if quantity in SCALARS and text not in NOT_JSON:
        return json.loads(text)
    if quantity in ("data", "date"):
        return {"$" + quantity: text}
    return text


class Fold:
    def __init__(self, display):
        self.display = display

    def take(self, line):
        steps = [step.replace("~1", "/").replace("~0", "~") for step in line["path"].split("/")[1:]]
        if not steps:
            self.display = None if line["text"] is None else value_of(line)
            return
        if self.display is None:
            self.display = {}
        place = self.display
        for step in steps[:-1]:
            place = self.down(place, step)
        if line["text"] is None:
            del place[int(steps[-1]) if isinstance(place, list) else steps[-1]]
        else:
            self.set(place, steps[-1], value_of(line))

    def down(self, place, step):
        if isinstance(place, list):
            if int(step) == len(place):
                place.append({})
            return place[int(step)]
        return place.setdefault(step, {})

    def set(self, place, step, value):
        if not isinstance(place, list):
            place[step] = value
        elif int(step) == len(place):
            place.append(value)
        else:
            place[int(step)] = value
