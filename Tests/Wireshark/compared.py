# SPDX-License-Identifier: Apache-2.0
"""Readings and dissected rows of one capture, side by side."""

import collections
import datetime
import json
import math
import re
import struct
import subprocess

import dissected

# Containers that come into being, and what asks for a list to be shown sorted, are no rows.
NO_ROWS = {"list", "group", "none"}


def unescaped(step):
    return step.replace("~1", "/").replace("~0", "~")


def path_in_section(line):
    steps = [unescaped(step) for step in line["path"].split("/")[1:]]
    plain = [re.sub(r"^\d+;", "", step) for step in steps]
    return tuple(steps[plain.index(line["section"]) + 1:])


def rows_of_readings(kelvasictl, technology, capture):
    """By time and code: (section, path within it, text, number, quantity)."""
    run = subprocess.run([kelvasictl, "readings", "--technology", technology, capture], capture_output=True, text=True,
                         check=False, timeout=300)
    rows = collections.defaultdict(list)
    for line in map(json.loads, run.stdout.splitlines()):
        if line["text"] is not None and line["quantity"] not in NO_ROWS:
            rows[line["time"], line["code"]].append(
                (line["section"], path_in_section(line), line["text"], line["value"], line["quantity"]))
    return rows


def rfc3339(epoch):
    seconds, fraction = epoch.split(".")
    moment = datetime.datetime.fromtimestamp(int(seconds), datetime.timezone.utc)
    return moment.strftime("%Y-%m-%dT%H:%M:%S.") + fraction[:6] + "Z"


def time_of(packet):
    return rfc3339(dissected.value_of(dissected.layer(packet, "frame"), "frame.time_epoch"))


def code_of(packet):
    code = dissected.value_of(dissected.layer(packet, "kelvasi"), "kelvasi.code")
    return None if code is None else "0x%04X" % int(code, 16 if code.startswith("0x") else 10)


def rows_of_tshark(dissector, capture, environment=None):
    reader = dissected.Rows(dissected.titles(dissector))
    rows = collections.defaultdict(list)
    packets = 0
    for packet in dissected.packets(dissector, capture, environment):
        packets += 1
        rows[time_of(packet), code_of(packet)] += reader.of(packet)
    return rows, packets


def messages_of(data):
    """Of a pcap file as the simulated daemon writes it."""
    at = 24
    while at < len(data):
        (size,) = struct.unpack_from("<I", data, at + 8)
        yield data[at + 16:at + 16 + size]
        at += 16 + size


def collapsed(value):
    """As the display has it: a dictionary of one entry is that."""
    if isinstance(value, list):
        return [only_entry(collapsed(element)) for element in value]
    if isinstance(value, dict):
        return {key: only_entry(collapsed(element)) for key, element in value.items()}
    return value


def without_kinds_of_nothing(value):
    """Of an empty container tshark does not say which one it is."""
    if isinstance(value, list):
        return [without_kinds_of_nothing(element) for element in value] or None
    if isinstance(value, dict):
        return {key: without_kinds_of_nothing(element) for key, element in value.items()} or None
    return value


def only_entry(value):
    return next(iter(value.values())) if isinstance(value, dict) and len(value) == 1 else value


def agree(reading, row):
    (section, path, text, number, quantity), (own_section, own_path, own_text, own_number, own_quantity) = reading, row
    if (section, path) != (own_section, own_path):
        return False
    if own_text is not None and own_text != text:
        return False
    if (number is None) != (own_number is None):
        return False
    return number is None or (quantity == own_quantity and math.isclose(number, own_number, rel_tol=1e-12))


def differences(readings, rows):
    """Pairs that differ, None where one side lacks its own."""
    begin = min((time for time, code in rows if code and int(code, 16) <= 0xFFFF), default="")
    found = []
    for key in readings.keys() | rows.keys():
        mine, others = (sorted(side.get(key, []), key=lambda row: (row[0], row[1])) for side in (readings, rows))
        if key[0] <= begin and others:  # of no technology yet, so all that could show a cell do
            others = [row for row in others if row[0] in {own[0] for own in mine}]
        for at in range(max(len(mine), len(others))):
            pair = mine[at] if at < len(mine) else None, others[at] if at < len(others) else None
            if None in pair or not agree(*pair):
                found.append((key, *pair))
    return found
