# SPDX-License-Identifier: Apache-2.0
"""What tshark makes of a capture with the generated dissector, as rows that can be compared with readings."""

import json
import os
import re
import subprocess

TSHARK = os.environ.get("TSHARK", "tshark")
ROW = re.compile(r"kelvasi\.(?:gsm|lte|utran2|cdma|sim)\.")


# Wireshark looks into folders that the environment names for no root.
AS_A_USER = ["unshare", "--user", "--map-user=1000", "--map-group=1000"] if os.geteuid() == 0 else []


def tshark(*arguments, environment=None, before=(), **options):
    """With nobody's settings. `before` is a command to run it by."""
    surroundings = os.environ | {"WIRESHARK_CONFIG_DIR": "/nonexistent"} | (environment or {})
    return subprocess.run([*before, TSHARK, *map(str, arguments)], env=surroundings, capture_output=True, text=True,
                          errors="replace", timeout=300, check=False, **options)


def titles(dissector):
    """What each filter name is called."""
    listed = tshark("-G", "fields", "-X", f"lua_script:{dissector}").stdout  # in this order
    fields = (line.split("\t") for line in listed.splitlines() if line.startswith("F\t"))
    return {field[2]: field[1] for field in fields if field[2].startswith("kelvasi.")}


def packets(dissector, capture, environment=None, protocols="frame kelvasi"):
    """The packets one by one, objects as lists of pairs: names may stand there several times."""
    command = [TSHARK, "-X", f"lua_script:{dissector}", "-r", str(capture), "-T", "json", "-J", protocols]
    surroundings = os.environ | {"WIRESHARK_CONFIG_DIR": "/nonexistent"} | (environment or {})
    with subprocess.Popen(command, stdout=subprocess.PIPE, stderr=subprocess.PIPE, text=True, errors="replace",
                          env=surroundings) as run:
        lines = []
        for line in run.stdout:
            if line == "  {\n":
                lines = []
            lines.append(line)
            if line in ("  }\n", "  },\n"):
                text = "".join(lines).rstrip().rstrip(",")
                yield dict(dict(json.loads(text, object_pairs_hook=list))["_source"])["layers"]
        said = run.stderr.read()
        assert run.wait() == 0, said
        assert "Lua" not in said, said


def layer(packet, name):
    return next((value for key, value in packet if key == name), [])


def children(pairs):
    """Name, value and what is below it, of each item."""
    for place, (name, value) in enumerate(pairs):
        if name.endswith("_tree") and isinstance(value, list):
            continue
        below = pairs[place + 1][1] if place + 1 < len(pairs) and pairs[place + 1][0] == name + "_tree" else []
        if isinstance(value, list):  # an item without a value of its own
            below = value
        yield name, value, below


def value_of(items, name):
    return next((value for each, value, _ in children(items) if each == name), None)


def is_text(name, value, number):
    """A number that a row shows stands below it as well."""
    if name.endswith(".text") or number is None:
        return True
    try:
        return float(value) != number
    except ValueError:
        return True


def row_of(section, path, name, value, below):
    numbers = [(each, number) for each, number, _ in children(below)]
    assert len(numbers) < 2, numbers
    quantity = numbers[0][0].removeprefix("kelvasi.") if numbers else None
    number = float(numbers[0][1]) if numbers else None
    return section, path, value if is_text(name, value, number) else None, number, quantity


class Rows:
    """Rows as (section, path within it, text, number, quantity); the text of numbers is None."""

    def __init__(self, names):
        self.names = names
        self.found = []

    def of(self, packet):
        self.found = []
        for name, value, below in children(layer(packet, "kelvasi")):
            if name == "kelvasi.section":
                self.walk(value, (), below)
        return self.found

    def walk(self, section, path, items):
        elements = 0
        for name, value, below in children(items):
            if name == "kelvasi.list":
                self.walk(section, (*path, value), below)
            elif name == "kelvasi.entry":
                pilot = value_of(below, "kelvasi.pilot")
                self.walk(section, (*path, value if pilot is None else f"{value};{pilot}"), below)
            elif name == "kelvasi.plist.key":
                self.found.append((section, (*path, value), value_of(below, "kelvasi.plist.string"), None, None))
            elif ROW.match(name):
                own = (*path, *self.last_step(path, self.names[name], elements))
                self.found.append(row_of(section, own, name, value, below))
                elements += 1

    @staticmethod
    def last_step(path, key, elements):
        """A list of one row's values has no names in it: an entry is its place."""
        if key not in path[-2:]:
            return (key,)
        return (str(elements),) if path[-1] == key else ()


def plain(items):
    """A property list below this item."""
    for name, value, _ in children(items):
        if name in ("kelvasi.plist.string", "kelvasi.plist.date"):
            return value
    named = [(name, value, below) for name, value, below in children(items) if name.startswith("kelvasi.plist.")]
    if all(name == "kelvasi.plist.index" for name, _, _ in named):
        return [plain(below) for _, _, below in named]
    return {value: plain(below) for _, value, below in named}


def quantities(items, found):
    """Numbers below texts, by quantity."""
    for name, value, below in children(items):
        if not name.startswith("kelvasi.plist"):
            found.append((name.removeprefix("kelvasi."), float(value)))
        quantities(below, found)
    return found
