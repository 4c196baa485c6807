"""The workbook as its user sees it: what it shows, where its cells and buttons are, its messages."""

import itertools
import re
import subprocess
import time

from desktop import OUT_OF_THE_WAY, wait_until

GRID, HEADER, STATUS_BAR = "KV Grid Control", "korvane Header", "msctls_statusbar32"
DIALOG, MENU = "#32770", "#32768"
COLUMN_HEADER, ROW_HEADER, EQUATION, CANCEL, OK_AND_FX, CORNER = 2, 3, 6, 8, 7, 1


def windows_path(path):
    return "Z:" + str(path).replace("/", "\\")


def column_number(letters):
    number = 0
    for letter in letters:
        number = number * 26 + ord(letter) - ord("A") + 1
    return number - 1


def column_name(number):
    """0 is "A", 25 is "Z", 26 is "AA"."""
    letters = ""
    while number >= 0:
        letters = chr(ord("A") + number % 26) + letters
        number = number // 26 - 1
    return letters


def parse_address(address):
    """"B4" is (1, 3): column and row counted from 0."""
    letters, row = re.fullmatch(r"([A-Z]+)(\d+)", address).groups()
    return column_number(letters), int(row) - 1


class View:
    """What the workbook shows at one moment."""

    def __init__(self, main):
        self.main = main
        self.title = main.text
        self.grid = main.find(GRID)
        self.status, self.mode, self.zoom = main.find(STATUS_BAR).parts
        self.column_header = self.grid.find(HEADER, id=COLUMN_HEADER)
        self.row_header = self.grid.find(HEADER, id=ROW_HEADER)
        self.equation = self.grid.find("Edit", id=EQUATION)
        self.first_column = column_number(self.column_header.first_label)
        self.first_row = int(self.row_header.first_label) - 1

    def column_edges(self, column):
        """Left and right edge of a visible column on the screen, right exclusive."""
        sizes, at = self.column_header.sizes, column - self.first_column
        left = self.column_header.client[0] + sum(sizes[:at])
        return left, left + sizes[at]

    def row_edges(self, row):
        sizes, at = self.row_header.sizes, row - self.first_row
        top = self.row_header.client[1] + sum(sizes[:at])
        return top, top + sizes[at]

    def cell(self, address):
        """A visible cell's rectangle on the screen, its grid lines (left and top) included."""
        column, row = parse_address(address)
        (left, right), (top, bottom) = self.column_edges(column), self.row_edges(row)
        return left, top, right, bottom

    def block(self, first, last):
        left, top, _, _ = self.cell(first)
        _, _, right, bottom = self.cell(last)
        return left, top, right, bottom

    def centre(self, address):
        left, top, right, bottom = self.cell(address)
        return (left + right) // 2, (top + bottom) // 2

    def button(self, text):
        """The middle of an equation-bar button: "X", "OK" or "fx"."""
        return self.grid.find("Button", text=text).centre

    def last_whole_row(self):
        """The last row that is not cut off, counted from 0."""
        return self.first_row + self._whole(self.row_header, 1) - 1

    def last_whole_column(self):
        return self.first_column + self._whole(self.column_header, 0) - 1

    def _whole(self, header, axis):
        room = self.grid.client[axis + 2] - header.client[axis]
        ends = itertools.accumulate(header.sizes)
        return sum(1 for end in ends if end <= room)

    # ---- The scroll bars: what of the grid's window is not client area ----

    def vertical_bar(self):
        """x of its middle, then y of: up arrow, just below the thumb's top, just above the down arrow,
        down arrow. The arrows are as high as the bar is wide."""
        _, top, client_right, bottom = self.grid.client
        width = self.grid.rect[2] - client_right
        assert width > 8, "no vertical scroll bar"
        x = client_right + width // 2
        return x, top + width // 2, top + width + 3, bottom - width - 3, bottom - width // 2

    def horizontal_bar(self):
        """The same turned: y of its middle, then x of the four places."""
        left, _, right, client_bottom = self.grid.client
        height = self.grid.rect[3] - client_bottom
        assert height > 8, "no horizontal scroll bar"
        y = client_bottom + height // 2
        return y, left + height // 2, left + height + 3, right - height - 3, right - height // 2


class Workbook:
    def __init__(self, desktop, probe, program, *arguments, **options):
        self.desktop, self.probe = desktop, probe
        self.process = desktop.start(program, *arguments, **options)
        wait_until(self._main, "the workbook shows its window", 60)
        self.settle()

    # ---- Looking ----

    def _main(self):
        for window in self.probe.windows():
            if window.find(GRID):
                return window
        return None

    def view(self):
        main = self._main()
        assert main, "the workbook's window is gone"
        return View(main)

    def dialog(self):
        """The dialog or message box that is open, or None."""
        for window in self.probe.windows():
            if window.window_class == DIALOG:
                return window
        return None

    def wait_for_menu(self):
        """The popup menu that is open."""

        def menu():
            return next((w for w in self.probe.windows() if w.window_class == MENU), None)

        return wait_until(menu, "a menu opens")

    def wait_for_dialog(self):
        return wait_until(self.dialog, "a dialog opens")

    def settle(self, seconds=5):
        """Moves the pointer out of the way, waits until nothing changes any more (two pictures a
        moment apart are the same), and returns the picture."""
        self.desktop.move(*OUT_OF_THE_WAY)
        end = time.monotonic() + seconds
        before = self.desktop.picture()
        while time.monotonic() < end:
            time.sleep(0.1)
            now = self.desktop.picture()
            if now == before:
                break
            before = now
        return before

    # ---- Doing ----

    def click_cell(self, address):
        self.desktop.click(*self.view().centre(address))

    def drag_cells(self, first, last):
        view = self.view()
        self.desktop.drag(view.centre(first), view.centre(last))

    def click_button(self, text):
        self.desktop.click(*self.view().button(text))

    def press(self, button):
        """Clicks a button of the open dialog, named without its "&"."""
        dialog = self.wait_for_dialog()
        for child in dialog.all():
            if child.window_class == "Button" and child.text.replace("&", "") == button:
                self.desktop.click(*child.centre)
                return
        raise AssertionError(f"no button {button} in {list(dialog.all())}")

    def answer(self, button):
        """The same, and waits until the dialog is gone."""
        self.press(button)
        wait_until(lambda: not self.dialog(), f"the dialog closes on {button}")

    def wait_for_end(self):
        """The exit status, once the program has ended."""
        return self.process.wait(timeout=20)

    def end_without_saving(self):
        """Closes it, answers "No" should it ask, and checks that it ended well."""
        self.desktop.key("alt+F4")
        wait_until(lambda: self.process.poll() is not None or self.dialog(), "it closes or asks")
        if self.process.poll() is None:
            self.press("No")
        status = self.wait_for_end()
        assert status == 0, f"the workbook ended with status {status}"

    def kill(self):
        if self.process.poll() is None:
            self.process.kill()
        try:
            self.process.wait(timeout=20)
        except subprocess.TimeoutExpired:
            pass


def expect(look, wanted, seconds=10):
    """Waits until look() == wanted; otherwise the failure shows what it was instead."""
    end = time.monotonic() + seconds
    while (seen := look()) != wanted:
        assert time.monotonic() < end, f"expected {wanted!r}, still {seen!r}"
        time.sleep(0.02)
