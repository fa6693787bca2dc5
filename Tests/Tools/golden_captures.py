#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Decodes every capture of one technology and compares the display and the error lines with what is expected.

A capture TECH/NAME.pcap comes with NAME.expected.json, the display after its last message or {"crash": reason}, where
the reason is part of a log line, and NAME.log, the system-log lines of priority 3 in order ("<ptr>" stands for any
address, "<n>" for any number). Captures in TECH/no-templates/ are decoded with an empty resource directory.
Dictionaries must have their keys in the order of the expectation.
"""

import argparse
import json
import os
import pathlib
import re
import resource
import signal
import subprocess
import sys
import tempfile

WILD = {"<ptr>": r"(0x[0-9a-f]+|\(nil\))", "<n>": r"-?\d+"}


class Decoder:
    def __init__(self, program, captures, empty):
        self.program = program
        self.templates = captures / "templates"
        self.empty = empty
        surroundings = {"KELVASI_LOG_LEVEL", "KELVASI_RESOURCES"}
        self.environment = {key: value for key, value in os.environ.items() if key not in surroundings}

    def decode(self, technology, capture):
        resources = self.empty if capture.parent.name == "no-templates" else self.templates
        command = [self.program, "decode", "--technology", technology, "--resources", resources, "--format", "json",
                   "--log-stderr", capture]
        return subprocess.run(command, env=self.environment, capture_output=True, timeout=60, check=False)


def comparable(text):
    """JSON with keys in order, integers and reals apart, and one text, whatever its sign, for not a number."""
    value = json.loads(text, object_pairs_hook=lambda pairs: {"pairs": pairs})
    return re.sub(r"[-+ ]?nan\b", "nan", json.dumps(value, indent=1, ensure_ascii=False))


def error_lines(text):
    return [line for line in text.splitlines() if line.startswith("<3>")]


def matches(expected, actual):
    pattern = "".join(WILD.get(piece, re.escape(piece)) for piece in re.split("(<ptr>|<n>)", expected))
    return re.fullmatch(pattern, actual) is not None


def first_difference(expected, actual):
    for number, (wanted, got) in enumerate(zip(expected, actual), start=1):
        if wanted != got:
            return f"line {number}: expected {wanted.strip()!r}, got {got.strip()!r}"
    return f"expected {len(expected)} lines, got {len(actual)}"


def crash_fault(reason, result):
    if result.returncode != -signal.SIGABRT:
        return f"expected SIGABRT, got status {result.returncode}"
    log = result.stderr.decode(errors="replace")
    return None if reason in log else f"expected {reason!r}, got {log.strip()!r}"


def display_fault(capture, result):
    expected = capture.with_suffix(".expected.json").read_text()
    if "crash" in (json.loads(expected) or {}):
        return crash_fault(json.loads(expected)["crash"], result)
    if result.returncode != 0:
        return f"status {result.returncode}"
    wanted, got = comparable(expected), comparable(result.stdout)
    return None if wanted == got else "display: " + first_difference(wanted.splitlines(), got.splitlines())


def log_fault(capture, result):
    expected = error_lines(capture.with_suffix(".log").read_text())
    actual = error_lines(result.stderr.decode(errors="replace"))
    if len(expected) == len(actual) and all(map(matches, expected, actual)):
        return None
    for number, (wanted, got) in enumerate(zip(expected, actual), start=1):
        if not matches(wanted, got):
            return f"error line {number}: expected {wanted!r}, got {got!r}"
    return f"expected {len(expected)} error lines, got {len(actual)}"


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--kelvasictl", required=True)
    parser.add_argument("--captures", required=True, type=pathlib.Path)
    parser.add_argument("technology")
    options = parser.parse_args()
    resource.setrlimit(resource.RLIMIT_CORE, (0, 0))

    faults = {}
    with tempfile.TemporaryDirectory() as empty:
        decoder = Decoder(options.kelvasictl, options.captures, empty)
        for capture in sorted((options.captures / options.technology).rglob("*.pcap")):
            result = decoder.decode(options.technology, capture)
            name = str(capture.relative_to(options.captures).with_suffix(""))
            faults[name] = display_fault(capture, result) or log_fault(capture, result)

    wrong = {name: fault for name, fault in faults.items() if fault}
    for name, fault in wrong.items():
        print(f"{name}: {fault}")
    print(f"{options.technology}: {len(faults)} captures, {len(faults) - len(wrong)} as expected, {len(wrong)} not")
    return 1 if wrong or not faults else 0


if __name__ == "__main__":
    sys.exit(main())
