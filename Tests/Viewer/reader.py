# SPDX-License-Identifier: Apache-2.0
"""Goes through the viewer by AT-SPI as a screen reader does, and prints what it meets as lines of JSON.

    reader.py walk            every object in sight that has a name: role, name, value and states
    reader.py listen SECONDS  every change of a value that the viewer tells of: role, name and value
"""

import json
import sys

import gi

gi.require_version("Atspi", "2.0")
from gi.repository import Atspi, GLib  # noqa: E402

APPLICATION = "Kelvasi"
TRIES = 100
STATES = {"selected": Atspi.StateType.SELECTED, "focused": Atspi.StateType.FOCUSED, "modal": Atspi.StateType.MODAL}


def application():
    desktop = Atspi.get_desktop(0)
    for place in range(desktop.get_child_count()):
        child = desktop.get_child_at_index(place)
        if child and child.get_name() == APPLICATION:
            return child
    return None


def told(accessible):
    states = accessible.get_state_set()
    return {"role": accessible.get_role_name(), "name": accessible.get_name(),
            "value": accessible.get_description(),
            "states": [name for name, state in STATES.items() if states.contains(state)]}


def walk(accessible):
    if not accessible or not accessible.get_state_set().contains(Atspi.StateType.VISIBLE):
        return
    if accessible.get_name():
        print(json.dumps(told(accessible)), flush=True)
    for place in range(accessible.get_child_count()):
        walk(accessible.get_child_at_index(place))


def listen(seconds):
    def changed(event):
        if event.type.split(":")[-1] in ("accessible-value", "accessible-description"):
            print(json.dumps(told(event.source)), flush=True)

    listener = Atspi.EventListener.new(changed)
    listener.register("object:property-change")
    print(json.dumps("listening"), flush=True)
    GLib.timeout_add_seconds(seconds, Atspi.event_quit)
    Atspi.event_main()


def await_application():
    for _ in range(TRIES):
        found = application()
        if found:
            return found
        GLib.usleep(100000)
    sys.exit("the viewer is not on the bus")


def main():
    found = await_application()
    if sys.argv[1] == "walk":
        walk(found)
    else:
        listen(int(sys.argv[2]))


if __name__ == "__main__":
    main()
