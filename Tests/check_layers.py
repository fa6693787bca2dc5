#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Checks the one rule of direction: a folder includes only what stands below it, and so does a room of a folder.

Also that no headers include each other in a circle, that one technology includes nothing of another, that headers
other than the C++ standard library's are included only where the platform, captures or tools are, that what is costly
to compile is included by few, that every test is built, and that every source names its licence.
"""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
HOUSE = ["Plist", "Platform", "Radio", "Telvon", "Dlf", "LogGenerator", "Model", "Survey", "Redaction", "Report", "Cockpit",
         "App", "Capture", "Modem", "Simulator", "Tools"]
# Rooms of LogGenerator/ and Simulator/, and beside them in Tests/ and Bench/.
TECHNOLOGIES = {"GSM", "LTE", "UTRAN", "C2K", "ObjectStream"}
MIRRORS = ["Tests", "Bench"]
# Rooms of one folder, from the bottom upwards: each includes only what stands below it, and nothing beside it. What
# lies in the folder itself serves all of them, or lists them.
ROOMS = {
    "Platform": [{"Posix", "Plist", "UserInterface", "QtDesktop"}, {"Qt"}, {"QtWidgets"}],
    "LogGenerator": [{"Daemon"}, TECHNOLOGIES],
    "Survey": [{"Series", "Cells"}, {"Events"}, {"Alarms"}],
    "Simulator": [{"Radio"}, {"Handset"}, {"Daemon"}, TECHNOLOGIES],
    "Tools": [{"Kelvasi", "Kelvasictl", "TelvonSim"}],
}
INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]')
# What opens a descriptor, by the header that declares it and by name.
OPENING_HEADERS = {"fcntl.h", "fstream", "sys/socket.h", "sys/eventfd.h", "sys/signalfd.h", "sys/timerfd.h", "sys/epoll.h",
                   "sys/inotify.h", "QFile", "QSaveFile", "QTemporaryFile", "QLocalSocket", "QLocalServer"}
OPENING = re.compile(r"\b(fopen|fdopen|freopen|tmpfile|mko?stemp|openat2?|popen|pipe2?|dup[23]?|opendir|gzd?open|"
                     r"pcap_(?:open_(?:offline|live)|create|dump_open)\w*)\s*\(")
# Headers that cost seconds in every source, and who alone may include them.
COSTLY = {"CLI/CLI.hpp": {"Tools/CommandLine.cpp", "Tools/OptionSet.cpp", "Tools/OptionTable.h"}}
LICENCE = "SPDX-License-Identifier: Apache-2.0"
STANDARD = re.compile(r"^[a-z_]+$")  # <vector>, <cstdint>; neither <syslog.h> nor <QTimer>


def may_use_libraries(path: pathlib.Path) -> bool:
    if path.parts[0] in ("Capture", "Tools"):
        return True
    # Platform/*.h are the interfaces, Platform/Qt/* and its like the implementations.
    return path.parts[0] == "Platform" and len(path.parts) > 2 and path.parts[1] != "UserInterface"


def technology(path: pathlib.Path):
    rooms = [part for part in path.parts[:-1] if part in TECHNOLOGIES]
    return rooms[0] if rooms else None


def includes(path: pathlib.Path):
    for number, line in enumerate((ROOT / path).read_text().splitlines(), start=1):
        match = INCLUDE.match(line)
        if match:
            yield f"{path}:{number}", *match.groups()


def faults_of_direction(path: pathlib.Path):
    rank = HOUSE.index(path.parts[0])
    for place, kind, name in includes(path):
        if kind == "<":
            if not STANDARD.match(name) and not may_use_libraries(path):
                yield f"{place}: <{name}> is no standard header"
        elif name.split("/")[0] in HOUSE:
            if HOUSE.index(name.split("/")[0]) > rank:
                yield f'{place}: "{name}" stands above {path.parts[0]}/'
        elif not may_use_libraries(path):
            yield f'{place}: "{name}" is not written from the root'


def faults_of_opening(path: pathlib.Path):
    if path.parts[0] not in ("Capture", "Tools"):
        return
    for place, _, name in includes(path):
        if name in OPENING_HEADERS:
            yield f"{place}: <{name}> opens descriptors, which is the platform's to do"
    for number, line in enumerate((ROOT / path).read_text().splitlines(), start=1):
        match = OPENING.search(line)
        if match:
            yield f"{path}:{number}: {match[1]}() opens a descriptor, which is the platform's to do"


def faults_of_cost(path: pathlib.Path):
    for place, _, name in includes(path):
        if str(path) not in COSTLY.get(name, {str(path)}):
            yield f"{place}: <{name}> takes seconds to compile; {', '.join(sorted(COSTLY[name]))} stand for it"


# What several technologies need lies in a room of its own, as Daemon/ does.
def faults_of_technology(path: pathlib.Path):
    own = technology(path)
    for place, _, name in includes(path):
        other = technology(pathlib.Path(name))
        if own and other and own != other:
            yield f'{place}: "{name}" is of another technology'


def room_rank(path: pathlib.PurePath):
    if len(path.parts) < 3:
        return None
    return next((rank for rank, rooms in enumerate(ROOMS.get(path.parts[0], [])) if path.parts[1] in rooms), None)


def faults_of_room(path: pathlib.Path):
    own = room_rank(path)
    for place, kind, name in includes(path) if own is not None else ():
        other = pathlib.PurePath(name)
        if kind == "<" or other.parts[0] != path.parts[0] or other.parts[1] == path.parts[1]:
            continue
        rank = room_rank(other)
        if rank is not None and rank >= own:
            yield f'{place}: "{name}" does not stand below {path.parts[0]}/{path.parts[1]}/'


# Each circle once, named by the header at which a walk from the top of the house met it again.
def faults_of_circle(paths):
    graph = {str(path): [name for _, kind, name in includes(path) if kind == '"'] for path in paths}
    done = set()

    def walk(name, above):
        if name in above:
            yield " includes ".join([*above[above.index(name):], name])
        elif name not in done:
            for included in graph.get(name, []):
                yield from walk(included, [*above, name])
            done.add(name)

    for name in graph:
        yield from walk(name, [])


def tests_not_built():
    for path in sorted((ROOT / "Tests").rglob("*Test.cpp")):
        lists = [folder / "CMakeLists.txt" for folder in path.parents if (folder / "CMakeLists.txt").exists()]
        if not builds(lists[0], path.name):
            yield f"{path.relative_to(ROOT)}: is not built"


# A test program names its sources, or takes all of its folder but those that it names.
def builds(targets: pathlib.Path, name: str) -> bool:
    calls = re.findall(r"kelvasi_test\(([^)]*)\)", targets.read_text())
    return any(("SOURCES" in call) == (name in call) for call in calls)


def faults_of_licence(path: pathlib.Path):
    if LICENCE not in (ROOT / path).read_text().split("\n", 1)[0]:
        yield f"{path}: its first line does not say {LICENCE}"


def sources(folders):
    for folder in folders:
        for path in sorted((ROOT / folder).rglob("*")):
            if path.suffix in (".h", ".cpp"):
                yield path.relative_to(ROOT)


def main() -> int:
    house = list(sources(HOUSE))
    found = [fault for path in house for check in (faults_of_direction, faults_of_room, faults_of_opening)
             for fault in check(path)]
    for path in [*house, *sources(MIRRORS)]:
        found += [*faults_of_technology(path), *faults_of_cost(path), *faults_of_licence(path)]
    found += faults_of_circle([*house, *sources(MIRRORS)])
    found += tests_not_built()
    for fault in found:
        print(fault, file=sys.stderr)
    print(f"{len(house)} files, {len(found)} faults of structure")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
