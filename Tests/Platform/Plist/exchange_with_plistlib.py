# SPDX-License-Identifier: Apache-2.0
"""Python's plistlib reads what PlistExchange writes, and PlistExchange what plistlib writes."""

import datetime
import math
import pathlib
import plistlib
import struct
import subprocess
import sys
import tempfile

SEEDS = 150
EPOCH = datetime.datetime(1970, 1, 1)


def bits(number):
    return "nan" if math.isnan(number) else struct.pack(">d", number).hex()


def canonical(value):
    """The text PlistExchange prints for the same value."""
    if isinstance(value, str):
        return "s" + value.encode().hex()
    if isinstance(value, bool):
        return "true" if value else "false"
    if isinstance(value, int):
        return f"i{value}"
    if isinstance(value, float):
        return "r" + bits(value)
    if isinstance(value, datetime.datetime):
        return "t" + bits((value - EPOCH) / datetime.timedelta(seconds=1))
    if isinstance(value, bytes):
        return "d" + value.hex()
    if isinstance(value, list):
        return "[" + "".join(canonical(element) + "," for element in value) + "]"
    entries = "".join(f"{canonical(key)}={canonical(entry)}," for key, entry in value.items())
    return "{" + entries + "}"


def run(*arguments):
    return subprocess.run(arguments, check=True, capture_output=True, text=True).stdout.strip()


def exchange(program, seed, path):
    """The differences found with the sample of one seed."""
    forms = (("XML", plistlib.FMT_XML), ("binary", plistlib.FMT_BINARY))
    texts = {}
    for name, form in forms:
        ours = run(program, name.lower(), str(seed), str(path))
        value = plistlib.loads(path.read_bytes(), fmt=form)
        texts[f"plistlib reads of the {name}"] = canonical(value)
    for name, form in forms:
        # plistlib writes carriage returns bare and reads them back as line feeds.
        if name == "XML" and "0d" in canonical(value):
            continue
        path.write_bytes(plistlib.dumps(value, fmt=form, sort_keys=False))
        texts[f"read from plistlib's {name}"] = run(program, "read", str(path))
    return [f"seed {seed}, {how}:\n{text}\ninstead of\n{ours}" for how, text in texts.items() if text != ours]


def main():
    with tempfile.TemporaryDirectory() as directory:
        path = pathlib.Path(directory, "sample.plist")
        differences = [found for seed in range(SEEDS) for found in exchange(sys.argv[1], seed, path)]
    print("\n".join(differences) or f"{SEEDS} samples exchanged")
    return 1 if differences else 0


if __name__ == "__main__":
    sys.exit(main())
