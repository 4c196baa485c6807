"""The chart viewer as its user sees it: its command bar, its chart, its property sheet."""

from desktop import wait_until

CHART, GRID = "KORVANE Corporation GraphControl", "KV Grid Control"
BAR, COMBO, TOOLTIP = "ToolbarWindow32", "ComboBox", "tooltips_class32"
ZOOM, TYPE = 103, 104
SHEET = "Graph Properties"
GREEN = (0, 255, 0)  # the first series
TITLE, X_MIN, X_MAX = 1002, 1007, 1008


class Viewer:
    """A running chart_viewer.exe. Use it as a context manager."""

    def __init__(self, desktop, probe, program):
        self.desktop, self.probe = desktop, probe
        self._process = desktop.start(program)

    def __enter__(self):
        wait_until(lambda: self.main() and self.main().find(CHART), "the viewer shows its chart")
        wait_until(lambda: GREEN in self.picture_of_chart().colours(), "the chart is painted")
        return self

    def __exit__(self, *_):
        self._process.kill()
        self._process.wait(timeout=20)

    def _window(self, text):
        return next((w for w in self.probe.windows() if w.text == text), None)

    def main(self):
        return self._window("Chart viewer")

    def sheet(self):
        return self._window(SHEET)

    def combo(self, number):
        return self.main().find(COMBO, id=number)

    def tooltip(self):
        """The text of the visible tooltip, or None."""
        return next((w.text for w in self.probe.windows() if w.window_class == TOOLTIP), None)

    def point_at_button(self, number):
        """`number`: 0 or 1, counted from the left."""
        left, _, _, _ = self.main().find(BAR).client
        _, top, _, bottom = self.combo(ZOOM).rect
        self.desktop.move(left + 11 + 21 * number, (top + bottom) // 2)

    def click_button(self, number):
        self.point_at_button(number)
        self.desktop.press_button()
        self.desktop.release_button()

    def choose(self, combo, *keys):
        """Opens a combo box by the mouse and chooses by keys."""
        self.desktop.click(*self.combo(combo).centre)
        self.desktop.key(*keys, "Return")

    def open_sheet(self):
        self.click_button(1)
        return wait_until(self.sheet, "the property sheet appears")

    def show_data_page(self):
        tabs = self.sheet().find("SysTabControl32").rect
        self.desktop.click(tabs[0] + 75, tabs[1] + 10)
        wait_until(lambda: self.sheet().find("Edit", id=X_MAX), "the data page appears")

    def type_into(self, edit, text):
        """Replaces the text of one of the sheet's edits."""
        self.desktop.click(*self.sheet().find("Edit", id=edit).centre)
        self.desktop.key("Home", "shift+End")
        self.desktop.type(text)
        wait_until(
            lambda: self.sheet().find("Edit", id=edit).text == text, f"the edit shows {text}"
        )

    def press_ok(self):
        self.desktop.click(*self.sheet().find("Button", text="OK").centre)
        wait_until(lambda: not self.sheet(), "the sheet closes")

    def picture_of_chart(self):
        return self.desktop.picture().crop(self.main().find(CHART).rect)

    def picture_of_lower_half(self):
        """Of the chart: where no open list of a combo box reaches."""
        left, top, right, bottom = self.main().find(CHART).rect
        return self.desktop.picture().crop((left, (top + bottom) // 2, right, bottom))
