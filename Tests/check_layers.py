#!/usr/bin/env python3
"""Checks the one rule of direction: a folder includes only what stands below it.

Also that headers other than the C++ standard library's are included only where the platform, captures or tools are,
and that every test is built.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
HOUSE = ["Plist", "Platform", "Radio", "Telvon", "Dlf", "LogGenerator", "Model", "Survey", "App", "Capture", "Simulator", "Tools"]
INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]')
STANDARD = re.compile(r"^[a-z_]+$")  # <vector>, <cstdint>; neither <syslog.h> nor <QTimer>


def may_use_libraries(path: pathlib.Path) -> bool:
    if path.parts[0] in ("Capture", "Tools"):
        return True
    # Platform/*.h are the interfaces, Platform/Qt/* and its like the implementations.
    return path.parts[0] == "Platform" and len(path.parts) > 2 and path.parts[1] != "UserInterface"


def faults(path: pathlib.Path):
    rank = HOUSE.index(path.parts[0])
    for number, line in enumerate((ROOT / path).read_text().splitlines(), start=1):
        match = INCLUDE.match(line)
        if not match:
            continue
        kind, name = match.groups()
        if kind == "<":
            if not STANDARD.match(name) and not may_use_libraries(path):
                yield f"{path}:{number}: <{name}> is no standard header"
        elif name.split("/")[0] in HOUSE:
            if HOUSE.index(name.split("/")[0]) > rank:
                yield f'{path}:{number}: "{name}" stands above {path.parts[0]}/'
        elif not may_use_libraries(path):
            yield f'{path}:{number}: "{name}" is not written from the root'


def tests_not_built():
    for path in sorted((ROOT / "Tests").rglob("*Test.cpp")):
        lists = [folder / "CMakeLists.txt" for folder in path.parents if ROOT in folder.parents]
        if not any(path.name in file.read_text() for file in lists if file.exists()):
            yield f"{path.relative_to(ROOT)}: is not built"


def main() -> int:
    sources = [
        path.relative_to(ROOT)
        for folder in HOUSE
        for path in sorted((ROOT / folder).rglob("*"))
        if path.suffix in (".h", ".cpp")
    ]
    found = [fault for path in sources for fault in faults(path)]
    found += tests_not_built()
    for fault in found:
        print(fault, file=sys.stderr)
    print(f"{len(sources)} files, {len(found)} faults of structure")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
