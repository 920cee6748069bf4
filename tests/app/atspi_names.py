# Walks the editor's accessible tree through the AT-SPI registry, as a screen reader does, and
# fails when a control a user reaches has no name, or when the window is not found at all.
import sys
import time

import pyatspi

NAMED_ROLES = {"push button", "toggle button", "radio button", "check box", "text", "menu item",
               "tree", "tree table"}
EXPECTED = {"Bindings", "Filter", "Find key", "Assign Key:", "Clear Key", "Clear the key", "Save",
            "Apply", "New file", "Undo", "Handbook"}


def find_application(name, seconds):
    deadline = time.time() + seconds
    while time.time() < deadline:
        desktop = pyatspi.Registry.getDesktop(0)
        for i in range(desktop.childCount):
            application = desktop.getChildAtIndex(i)
            if application is not None and application.name == name:
                return application
        time.sleep(0.3)
    return None


def walk(node):
    yield node
    for i in range(node.childCount):
        child = node.getChildAtIndex(i)
        if child is not None:
            yield from walk(child)


application = find_application("zem-admin-hotkeys", 30)
if application is None:
    print("accessibility: the editor never appeared on the AT-SPI bus")
    sys.exit(1)
names = set()
unnamed = []
for node in walk(application):
    role = node.getRoleName()
    if role not in NAMED_ROLES:
        continue
    # Menu items are reached by opening their menu; anything else only while it is shown.
    if role != "menu item" and not node.getState().contains(pyatspi.STATE_SHOWING):
        continue
    name = node.name.strip()
    if name:
        names.add(name)
    else:
        unnamed.append(f"{role} in {node.parent.getRoleName()} '{node.parent.name}'")
missing = sorted(EXPECTED - names)
for problem in unnamed:
    print(f"accessibility: a {problem} has no name")
for name in missing:
    print(f"accessibility: nothing is named '{name}'")
print(f"accessibility: {len(names)} names, {len(unnamed)} unnamed, {len(missing)} missing")
sys.exit(1 if unnamed or missing else 0)
