"""Asks window_probe.exe what windows are on the screen."""

import json
import subprocess


class Window:
    """One visible window as the probe described it: a snapshot."""

    def __init__(self, description):
        self.window_class = description["class"]
        self.id = description["id"]
        self.text = description["text"]
        self.rect = tuple(description["rect"])
        self.client = tuple(description["client"])
        self.enabled = description["enabled"]
        self.focus = description["focus"]
        self.parts = description.get("parts")
        self.sizes = description.get("sizes")
        self.first_label = description.get("firstLabel")
        self.rows = description.get("rows")
        self.items = description.get("items")
        self.children = [Window(child) for child in description["children"]]

    def all(self):
        """This window and all below it."""
        yield self
        for child in self.children:
            yield from child.all()

    def find(self, window_class, **properties):
        """The first window below with this class and these properties, or None."""
        for window in self.all():
            if window.window_class == window_class and all(
                getattr(window, name) == value for name, value in properties.items()
            ):
                return window
        return None

    @property
    def centre(self):
        left, top, right, bottom = self.rect
        return (left + right) // 2, (top + bottom) // 2

    def __repr__(self):
        return f"<{self.window_class} {self.id} {self.text!r} at {self.rect}>"


class Probe:
    """A window_probe.exe that stays running, as starting one takes a tenth of a second."""

    def __init__(self, desktop, program):
        self._process = desktop.start(
            program, "--serve", stdin=subprocess.PIPE, stdout=subprocess.PIPE
        )

    def windows(self):
        """The visible top-level windows, the topmost first."""
        self._process.stdin.write(b"\n")
        self._process.stdin.flush()
        answer = self._process.stdout.readline()
        if not answer:
            raise RuntimeError("window_probe.exe has ended")
        return [Window(description) for description in json.loads(answer)]

    def close(self):
        self._process.stdin.close()
        self._process.wait(timeout=20)
