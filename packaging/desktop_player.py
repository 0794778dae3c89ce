"""Plays an installed Quorle as a person would: looks through the desktop's
accessibility interface, acts by mouse and keyboard. Needs an X display, a window
manager and a session bus; packaging/on_a_desktop gives all three."""

import os
import subprocess
import tempfile
import time

import pyatspi
from gi.repository import GLib

WORD_LISTS = [f"/usr/share/dict/scowl/{spelling}-words.{size}"
              for spelling in ("english", "american", "british")
              for size in (10, 20, 35, 40, 50, 55, 60, 70)]


def wait_for(what, condition, seconds=20):
    """The condition's first true value; an error naming `what` after `seconds`."""
    end = time.monotonic() + seconds
    while time.monotonic() < end:
        try:
            if value := condition():
                return value
        except Exception:  # a window that goes away while it is looked at
            pass
        time.sleep(0.1)
    raise AssertionError(f"waited {seconds} s in vain for {what}")


def xdotool(*arguments):
    subprocess.run(["xdotool", *map(str, arguments)], check=True)


def everything_in(node):
    yield node
    for child in node:
        if child:
            yield from everything_in(child)


class News:
    """What the programs have had said by a screen reader."""

    def __init__(self):
        self.said = []
        pyatspi.Registry.registerEventListener(
            self.note, "object:state-changed:showing", "object:announcement")

    def note(self, event):
        try:
            if event.type.startswith("object:announcement"):
                self.said.append(event.any_data)
            elif event.source.getRole() == pyatspi.ROLE_NOTIFICATION:
                self.said.append(event.source.name)
        except GLib.GError:  # a program that has gone meanwhile
            pass

    def has(self, text):
        while GLib.MainContext.default().iteration(False):
            pass
        return text in self.said


def type_text(text):
    xdotool("type", "--delay", 20, text)


def press(key):
    xdotool("key", key)


def traced_words(letters, length):
    """Every text of `length` cubes that lies on the board (16 letters), without Qu."""
    def extend(path):
        if len(path) == length:
            yield "".join(letters[k] for k in path).lower()
            return
        row, column = divmod(path[-1], 4)
        for k in range(16):
            near = abs(k // 4 - row) <= 1 and abs(k % 4 - column) <= 1
            if near and k not in path and letters[k] != "Qu":
                yield from extend(path + [k])

    for start in range(16):
        if letters[start] != "Qu":
            yield from extend([start])


def listed_words():
    return {line.strip() for path in WORD_LISTS for line in open(path, encoding="latin-1")}


class Program:
    """A running Quorle, its windows enlarged by `scale`."""

    def __init__(self, executable, scale=1, always_on=True):
        environment = {"QT_SCALE_FACTOR": str(scale)}
        if always_on:
            environment["QT_LINUX_ACCESSIBILITY_ALWAYS_ON"] = "1"
        self.scale = scale
        self.output = tempfile.TemporaryFile("w+")
        self.process = subprocess.Popen([executable], env={**os.environ, **environment},
                                        stdout=self.output, stderr=subprocess.STDOUT)
        self.window("Quorle")

    def application(self):
        for application in pyatspi.Registry.getDesktop(0):
            if application and application.get_process_id() == self.process.pid:
                return application
        return None

    def windows(self, title):
        return [window for window in self.application() if window and window.name == title]

    def window(self, title):
        """The window of that title, once it shows."""
        def shown():
            return [window for window in self.windows(title)
                    if window.getState().contains(pyatspi.STATE_SHOWING)]
        return wait_for(f"window {title}", shown)[0]

    def control(self, title, name):
        """The control of that accessible name in the window of that title."""
        window = self.window(title)
        def named():
            return [node for node in everything_in(window) if node != window and node.name == name]
        return wait_for(f"{name} in {title}", named)[0]

    def click(self, node):
        box = node.queryComponent().getExtents(pyatspi.DESKTOP_COORDS)  # unscaled pixels
        xdotool("mousemove", (box.x + box.width // 2) * self.scale,
                (box.y + box.height // 2) * self.scale, "click", 1)

    def press(self, title, name):
        self.click(self.control(title, name))

    def words(self, title, name):
        """The words listed in the list of that name."""
        return [entry.name for entry in self.control(title, name)]

    def board(self):
        """The sixteen letters shown on the board."""
        for node in everything_in(self.window("Quorle")):
            if node.childCount == 16:
                letters = [tile.name for tile in node]
                return letters if all(letters) else None
        return None

    def browse(self, prefix):
        """Opens the dictionary editor at a two-letter prefix; the words listed there."""
        self.press("Quorle", "Dictionary editor")
        editor = self.window("Dictionary Editor")
        letters = next(node for node in everything_in(editor) if node.getRoleName() == "combo box")

        def chosen():
            self.click(letters)
            type_text(prefix)
            press("Return")
            time.sleep(0.5)
            return letters.name.lower() == prefix
        wait_for(f"prefix {prefix}", chosen)
        return self.words("Dictionary Editor", "Words")

    def leave(self, answer=None):
        """Presses Exit, answers the question, and waits for a clean end without a word said."""
        self.press("Quorle", "Exit game")
        if answer:
            self.press("Save dictionary?", answer)
        wait_for("the end of the program", lambda: self.process.poll() is not None)
        assert self.process.returncode == 0, f"exit status {self.process.returncode}"
        self.output.seek(0)
        said = self.output.read()
        assert not said, f"the program printed: {said}"
