#!/usr/bin/python3
"""A screen reader in small: looks at what an application shows, and presses what it names.

usage: reader.py APPLICATION tree|press NAME|find NAME|listen|keep KEY

"tree" prints a line for each thing: its role, its name and its states. "press" does the first
action of the thing of that name, "find" succeeds when there is one. A name that ends with a star is
the beginning of one. "listen" prints what is announced and where the focus goes, until it is ended.
"keep" takes a key for itself, and prints it each time it is pressed, until it is ended.
"""

import sys
import time

import pyatspi

STATES = (
    (pyatspi.STATE_CHECKED, "checked"),
    (pyatspi.STATE_SELECTED, "selected"),
    (pyatspi.STATE_FOCUSED, "focused"),
)
SECONDS = 20


def application(name):
    for candidate in pyatspi.Registry.getDesktop(0):
        if candidate and name in (candidate.name or ""):
            return candidate
    return None


def things(node, depth=0):
    yield node, depth
    for index in range(node.childCount):
        child = node.getChildAtIndex(index)
        if child:
            yield from things(child, depth + 1)


def is_shown(node):
    return node.getState().contains(pyatspi.STATE_SHOWING)


def line(node, depth):
    states = node.getState()
    words = [word for state, word in STATES if states.contains(state)]
    if not states.contains(pyatspi.STATE_SENSITIVE):
        words.append("disabled")
    return "  " * depth + " | ".join([node.getRoleName(), node.name or "", *words])


def is_called(name, wanted):
    return name.startswith(wanted[:-1]) if wanted.endswith("*") else name == wanted


def tell(event):
    node = event.source
    if not event.detail1 and "state" in event.type:
        return
    try:
        print(event.type, "|", node.getRoleName(), "|", node.name or "", flush=True)
    except Exception as gone:  # what has gone meanwhile says nothing any more
        print(event.type, "|", gone, flush=True)


def listen():
    for event in ("state-changed:showing", "state-changed:focused", "property-change:accessible-name"):
        pyatspi.Registry.registerEventListener(tell, "object:" + event)
    print("listening", flush=True)
    pyatspi.Registry.start()


def keep(wanted):
    def take(event):
        if event.event_string != wanted:
            return False
        print("kept", event.event_string, flush=True)
        return True

    pyatspi.Registry.registerKeystrokeListener(
        take, kind=(pyatspi.KEY_PRESSED_EVENT,), synchronous=True, preemptive=True
    )
    print("keeping", flush=True)
    pyatspi.Registry.start()


def find(name, wanted):
    """The thing that is called so, once the application shows one."""
    end = time.monotonic() + SECONDS
    while time.monotonic() < end:
        top = application(name)
        for node, _ in things(top) if top else ():
            if is_called(node.name or "", wanted):
                return node
        time.sleep(0.2)
    return None


def main():
    name, verb = sys.argv[1:3]
    if verb == "listen":
        listen()
        return
    if verb == "keep":
        keep(sys.argv[3])
        return
    if verb == "tree":
        top = application(name)
        if not top:
            sys.exit(f"{name} is not there")
        for node, depth in things(top):
            print(line(node, depth))
        return
    node = find(name, sys.argv[3])
    if not node:
        sys.exit(f"nothing is called {sys.argv[3]!r}")
    if verb == "press" and not node.queryAction().doAction(0):
        sys.exit(f"{sys.argv[3]!r} cannot be pressed")


if __name__ == "__main__":
    main()
