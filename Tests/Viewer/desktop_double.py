# SPDX-License-Identifier: Apache-2.0
"""Stands for a desktop's notifications and a phone's feedback on the session bus, and prints each call as a line of JSON."""

import json
import sys

from gi.repository import Gio, GLib

SERVICES = {
    "notifications": ("org.freedesktop.Notifications", "/org/freedesktop/Notifications", """
      <node><interface name="org.freedesktop.Notifications">
        <method name="Notify">
          <arg type="s" direction="in"/><arg type="u" direction="in"/><arg type="s" direction="in"/>
          <arg type="s" direction="in"/><arg type="s" direction="in"/><arg type="as" direction="in"/>
          <arg type="a{sv}" direction="in"/><arg type="i" direction="in"/><arg type="u" direction="out"/>
        </method>
        <method name="GetCapabilities"><arg type="as" direction="out"/></method>
      </interface></node>"""),
    "feedback": ("org.sigxcpu.Feedback", "/org/sigxcpu/Feedback", """
      <node><interface name="org.sigxcpu.Feedback">
        <method name="TriggerFeedback">
          <arg type="s" direction="in"/><arg type="s" direction="in"/><arg type="a{sv}" direction="in"/>
          <arg type="i" direction="in"/><arg type="u" direction="out"/>
        </method>
      </interface></node>"""),
}
REPLIES = {
    "Notify": GLib.Variant("(u)", (7,)),
    "GetCapabilities": GLib.Variant("(as)", (["body", "sound"],)),
    "TriggerFeedback": GLib.Variant("(u)", (1,)),
}


def called(_connection, _sender, _path, _interface, method, arguments, invocation):
    print(json.dumps({"method": method, "arguments": arguments.unpack()}), flush=True)
    invocation.return_value(REPLIES[method])


def main():
    bus = Gio.bus_get_sync(Gio.BusType.SESSION)
    for service in sys.argv[1:]:
        name, path, description = SERVICES[service]
        bus.register_object(path, Gio.DBusNodeInfo.new_for_xml(description).interfaces[0], called, None, None)
        bus.call_sync("org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus", "RequestName",
                      GLib.Variant("(su)", (name, 0)), None, Gio.DBusCallFlags.NONE, -1)
    print("ready", flush=True)
    GLib.MainLoop().run()


if __name__ == "__main__":
    main()
