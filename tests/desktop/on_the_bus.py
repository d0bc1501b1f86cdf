"""Reads the window over the bus of the assistive technologies and says what is wrong with it.

Usage: on_the_bus.py ZELREMOTE PORT HOME
"""

import re
import subprocess
import sys
import time

import dbus

ACCESSIBLE = "org.a11y.atspi.Accessible"
ROOT = "/org/a11y/atspi/accessible/root"
REGISTRY = "org.a11y.atspi.Registry"
SHOWING = 25  # the number of the state

CONTROLS = {"push button", "toggle button", "check box", "radio button", "combo box", "text",
            "slider", "menu item", "check menu item", "menu", "tool bar", "page tab", "button"}
VALUES = {"slider": "org.a11y.atspi.Value", "text": "org.a11y.atspi.Text"}
# A name of the source is one word with a capital inside; units are not.
SOURCE = re.compile(r"^[A-Za-z0-9_]*[a-z][A-Z][A-Za-z0-9_]*(\(\d+\))?$")
UNITS = {"GHz", "MHz", "kHz", "dBm", "dBmV", "dBuV"}
WANTED = ["Soft key 1, CENTER FREQ", "Graph", "Toolbar", "Single", "Panel"]


class Node:
    def __init__(self, bus, owner, path):
        self.bus, self.owner, self.path = bus, owner, path
        self.object = bus.get_object(owner, path, introspect=False)

    def ask(self, method, *arguments, interface=ACCESSIBLE):
        return self.object.get_dbus_method(method, interface)(*arguments)

    def property(self, name, interface=ACCESSIBLE):
        return self.ask("Get", interface, name, interface="org.freedesktop.DBus.Properties")

    def children(self):
        return [Node(self.bus, owner, path) for owner, path in self.ask("GetChildren")]

    def role(self):
        return str(self.ask("GetRoleName"))

    def name(self):
        return str(self.property("Name"))

    def showing(self):
        low = self.ask("GetState")[0]
        return bool(low >> SHOWING & 1)

    def interfaces(self):
        return [str(one) for one in self.ask("GetInterfaces")]

    def text(self):
        return str(self.ask("GetText", 0, -1, interface="org.a11y.atspi.Text"))


def walk(node):
    yield node
    for child in node.children():
        yield from walk(child)


def accessibility_bus():
    launcher = dbus.SessionBus().get_object("org.a11y.Bus", "/org/a11y/bus")
    return dbus.bus.BusConnection(launcher.GetAddress(dbus_interface="org.a11y.Bus"))


def until(what, seconds, question):
    end = time.monotonic() + seconds
    while time.monotonic() < end:
        try:
            answer = question()
            if answer:
                return answer
        except dbus.DBusException:
            pass
        time.sleep(0.3)
    raise SystemExit(f"on_the_bus: {what} did not come within {seconds} s")


def words_of(node):
    """Name and text of a node, as a reader says them."""
    words = node.name()
    if "org.a11y.atspi.Text" in node.interfaces():
        words += " " + node.text()
    return words


def check_controls(nodes):
    wrong = []
    seen = 0
    for node in nodes:
        role, name = node.role(), node.name()
        if role not in CONTROLS or not node.showing():
            continue
        seen += 1
        if not name.strip():
            wrong.append(f"a {role} without a name at {node.path}")
        elif SOURCE.match(name) and name not in UNITS:
            wrong.append(f"a {role} with a name of the source: {name}")
        if role in VALUES and VALUES[role] not in node.interfaces():
            wrong.append(f"the {role} {name} has no value")
    print(f"{seen} controls")
    if seen < 60:
        wrong.append(f"only {seen} controls are on the bus")
    return wrong


def check_pointer(bus, nodes):
    graph = next(node for node in nodes if node.name() == "Graph")
    x, y, width, height = graph.ask("GetExtents", dbus.UInt32(0),
                                    interface="org.a11y.atspi.Component")
    readout = next((node for node in nodes if "Position of the pointer" in node.name()), None)
    before = {words_of(node) for node in nodes if node.role() == "label"}
    controller = bus.get_object(REGISTRY, "/org/a11y/atspi/registry/deviceeventcontroller",
                                introspect=False)
    move = controller.get_dbus_method("GenerateMouseEvent",
                                      "org.a11y.atspi.DeviceEventController")
    for part in (0.4, 0.45, 0.5):
        move(dbus.Int32(x + width * part), dbus.Int32(y + height // 2), "abs")
        time.sleep(0.3)
    after = {words_of(node) for node in nodes if node.role() == "label"} - before
    print("under the pointer:", sorted(after))
    if not any("Hz" in words for words in after):
        return ["the pointer's frequency is not on the bus"]
    if readout is None:
        return ["the pointer's readout has no name"]
    return []


def main():
    program, port, home = sys.argv[1:4]
    bus = accessibility_bus()
    process = subprocess.Popen([program, "--connect", f"serial:{port}@57600", "--home", home,
                                "--language", "en", "--size", "1280x760"])
    try:
        registry = Node(bus, REGISTRY, ROOT)
        application = until("the program", 30, lambda: next(
            (one for one in registry.children() if one.name() == "ZELRemote"), None))
        until("the first sweep", 60, lambda: any(
            "GHz" in words_of(node) for node in walk(application) if node.role() == "label"))
        nodes = list(walk(application))
        wrong = check_controls(nodes)
        names = [node.name() for node in nodes]
        wrong += [f"nothing is called {name}" for name in WANTED
                  if not any(one == name or one.startswith(name + ",") for one in names)]
        if not any("GHz" in words_of(node) for node in nodes if node.role() == "label"):
            wrong.append("the centre frequency is not on the bus")
        wrong += check_pointer(bus, nodes)
    finally:
        process.terminate()
        process.wait()
    for line in wrong:
        print("on_the_bus:", line)
    return 1 if wrong else 0


sys.exit(main())
