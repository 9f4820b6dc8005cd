"""Reads the picker's tree from the real accessibility bus and uses it as a screen reader would.

usage: accessibletree.py HOST    where HOST --host presents a picker, with white selected, and prints what it hears
"""
import os
import signal
import subprocess
import sys
import tempfile
import time

import gi

gi.require_version("Atspi", "2.0")
from gi.repository import Atspi, GLib  # noqa: E402

SERVICE = "favrin-color-picker-service"
PATIENCE_SECONDS = 20
LAUNCHERS = ("/usr/libexec/at-spi-bus-launcher", "/usr/lib/at-spi2-core/at-spi-bus-launcher")


def wait_for(what, ask):
    """The first answer that is one; the other processes need some time."""
    end = time.monotonic() + PATIENCE_SECONDS
    while time.monotonic() < end:
        answer = ask()
        if answer:
            return answer
        time.sleep(0.05)
    sys.exit(f"FAIL: {what}")


def walk(node):
    yield node
    for index in range(node.get_child_count()):
        child = node.get_child_at_index(index)
        if child is not None:
            yield from walk(child)


def service():
    desktop = Atspi.get_desktop(0)
    for index in range(desktop.get_child_count()):
        application = desktop.get_child_at_index(index)
        if application is not None and application.get_name() == SERVICE:
            return application
    return None


def nodes(application, role, name=None):
    return [node for node in walk(application) if node.get_role() == role and name in (None, node.get_name())]


def has_state(node, state):
    return node.get_state_set().contains(state)


def press(node):
    for index in range(node.get_n_actions()):
        if node.get_action_name(index).lower() == "press":
            node.do_action(index)
            return
    sys.exit(f"FAIL: {node.get_name()} cannot be pressed")


def check(holds, what):
    if not holds:
        sys.exit(f"FAIL: {what}")
    print(f"PASS: {what}")


class Host:
    """The host's lines, collected without blocking."""

    def __init__(self, program):
        self.process = subprocess.Popen([program, "--host"], stdout=subprocess.PIPE)
        os.set_blocking(self.process.stdout.fileno(), False)
        self.text = ""

    def said(self, line):
        self.text += (self.process.stdout.read() or b"").decode()
        return line in self.text.splitlines()


def main():
    # In a group of its own, with the bus daemon that it starts: both must go at the end.
    launcher = subprocess.Popen([next(filter(os.path.exists, LAUNCHERS)), "--launch-immediately"],
                                start_new_session=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
    os.environ["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"] = "1"
    with tempfile.TemporaryDirectory() as data:
        os.environ["FAVRIN_DEFAULTS_FILE"] = os.path.join(data, "defaults.sqlite")
        host = Host(sys.argv[1])
        try:
            read_and_use(host)
        finally:
            host.process.kill()
            host.process.wait()
            os.killpg(launcher.pid, signal.SIGKILL)


def shown(application, role, name=None):
    return [node for node in nodes(application, role, name) if has_state(node, Atspi.StateType.SHOWING)]


def check_names(application, where):
    nameless = [node.get_role_name() for node in walk(application)
                if has_state(node, Atspi.StateType.FOCUSABLE) and not node.get_name()]
    check(not nameless, f"{where}: everything that takes the focus has a name {nameless}")
    sliders = shown(application, Atspi.Role.SLIDER)
    wrong = [node.get_name() for node in sliders
             if not node.get_minimum_value() <= node.get_current_value() <= node.get_maximum_value()]
    check(sliders and not wrong, f"{where}: {len(sliders)} sliders have values within their bounds {wrong}")


def walk_through_the_tabs(application, host):
    """Every tab by its name; black is selected and opaque."""
    landmarks = {
        "Spectrum": (Atspi.Role.COLOR_CHOOSER, "Color Spectrum"),
        "Sliders": (Atspi.Role.SLIDER, "Green"),
        "Grid": (Atspi.Role.LIST, "Grid"),
    }
    for name, landmark in landmarks.items():
        tabs = shown(application, Atspi.Role.PAGE_TAB, name)
        check(len(tabs) == 1, f"there is one tab {name}")
        press(tabs[0])
        found = wait_for(f"{name}: {landmark[1]} is shown", lambda landmark=landmark: shown(application, *landmark))
        wait_for(f"{name} is the checked tab", lambda tab=tabs[0]: has_state(tab, Atspi.StateType.CHECKED))
        check_names(application, name)
        if name == "Sliders":
            found[0].set_current_value(255)
            wait_for("the host hears of a changed slider", lambda: host.said("pick 0 1 0 1 kTQColorSpaceSRGB final"))
            print("PASS: a slider that is set is a final pick")

    wells = shown(application, Atspi.Role.IMAGE, "Selected Color")
    check(len(wells) == 1, "there is one well")
    wait_for("the well says which color it shows", lambda: "green" in wells[0].get_description())
    favorites = shown(application, Atspi.Role.LIST, "Favorites")
    check(len(favorites) == 1 and all(node.get_name() for node in walk(favorites[0])), "the favorites have names")


def read_and_use(host):
    wait_for("the host shows the picker", lambda: host.said("ready"))
    application = wait_for("the picker is on the accessibility bus", service)

    def named_swatches():
        items = nodes(application, Atspi.Role.LIST_ITEM)
        return items if len(items) == 120 and all(item.get_name() for item in items) else None

    swatches = wait_for("120 swatches, each with a name", named_swatches)
    print("PASS: 120 swatches, each with a name, such as", swatches[0].get_name(), "and", swatches[61].get_name())
    check(nodes(application, Atspi.Role.HEADING, "Colors"), "the title is a heading")
    selected = [index for index, item in enumerate(swatches) if has_state(item, Atspi.StateType.SELECTED)]
    check(selected == [0], f"exactly the swatch of the host's color is selected: {selected}")
    press(swatches[11])
    wait_for("the host hears of a pressed swatch", lambda: host.said("pick 0 0 0 1 kTQColorSpaceSRGB final"))
    print("PASS: a pressed swatch is a final pick")
    wait_for("the pressed swatch is selected", lambda: has_state(swatches[11], Atspi.StateType.SELECTED))
    check(not has_state(swatches[0], Atspi.StateType.SELECTED), "the swatch before is not selected any more")

    walk_through_the_tabs(application, host)

    close = nodes(application, Atspi.Role.PUSH_BUTTON, "Close")
    check(len(close) == 1, "there is one close button")
    try:
        press(close[0])
    except GLib.Error:
        # The picker may be gone before it can answer; the host's word below is what counts.
        pass
    wait_for("the close button ends the presentation", lambda: host.said("finished"))
    print("PASS: the close button ends the presentation")


main()
