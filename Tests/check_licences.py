#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Checks that every file has a licence, and that what others wrote is named.

A file names the licence in its first lines or, where it has no room for a comment, in .reuse/dep5. Every library and
data file that CMake looks for stands in Notices/README.md. Where the reuse tool is installed, it has its say too.
"""

import fnmatch
import pathlib
import re
import shutil
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
LINE = "SPDX-License-Identifier: "
NAMES_IT_ITSELF = "Each names the licence itself."
TOOLS = {"PkgConfig", "Python3"}  # of the build, in none of its results


def tracked():
    listed = subprocess.run(["git", "ls-files", "-z"], cwd=ROOT, capture_output=True, text=True, check=True).stdout
    return [name for name in listed.split("\0") if name and not (ROOT / name).is_symlink() and (ROOT / name).exists()]


def is_licence(name):
    return name.startswith("LICENSES/") or pathlib.Path(name).name.startswith("LICENSE")


def stanzas():
    """The patterns of each stanza, and whether its files name the licence themselves."""
    for stanza in (ROOT / ".reuse/dep5").read_text().split("\n\n"):
        files = re.search(r"^Files:((?:.|\n )*)", stanza, re.MULTILINE)
        if files:
            yield files[1].split(), NAMES_IT_ITSELF in stanza


def matches(name, patterns):
    return any(fnmatch.fnmatchcase(name, pattern) for pattern in patterns)


def names_licence(name):
    with open(ROOT / name, "rb") as file:
        return LINE.encode() in file.read(200)


def faults_of_files():
    rules = list(stanzas())
    for name in tracked():
        found = [own for patterns, own in rules if matches(name, patterns)]
        if is_licence(name):
            continue
        if not found:
            yield f"{name}: .reuse/dep5 has no stanza for it"
        elif found[-1] and not names_licence(name):
            yield f'{name}: its first lines do not say "{LINE}..."'


def what_is_looked_for(text):
    text = re.sub(r"(?m)^#.*", "", text)
    for packages in re.findall(r"(?:find_package|pkg_check_modules)\(([^)]*)\)", text):
        words = packages.split()
        yield words[-1] if "IMPORTED_TARGET" in words else words[0]
    yield from re.findall(r"kelvasi_data_file\(\w+ \S+\s+([\w-]+)\)", text)


def faults_of_notices():
    notices = (ROOT / "Notices/README.md").read_text()
    for name in tracked():
        if not name.endswith(("CMakeLists.txt", ".cmake")):
            continue
        for package in what_is_looked_for((ROOT / name).read_text()):
            if package not in TOOLS and not re.search(rf"\b{re.escape(package)}\b", notices):
                yield f"{name}: {package} is not in Notices/README.md"


def reuse_says():
    if not shutil.which("reuse"):
        print("check_licences: the reuse tool is missing, its own check is left out")
        return
    result = subprocess.run(["reuse", "lint"], cwd=ROOT, capture_output=True, text=True, check=False)
    if result.returncode:
        yield result.stdout.strip()


def main() -> int:
    found = [*faults_of_files(), *faults_of_notices(), *reuse_says()]
    for fault in found:
        print(fault, file=sys.stderr)
    print(f"{len(tracked())} files, {len(found)} faults of licence")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
