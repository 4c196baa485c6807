"""The function bar of its example host, used with the pointer and with keys."""

import contextlib

from desktop import wait_until

BAR = "FunkyBarControl"
MENU = "#32768"
COLOURS = [(70, 120, 200), (90, 160, 80), (210, 140, 40), (160, 90, 160)]


@contextlib.contextmanager
def running_host(desktop, probe, programs):
    """The host's window, painted."""
    host = desktop.start(programs / "function_bar.exe")
    try:
        yield wait_until(lambda: shown(desktop, probe, 0), "the host shows its first view")
    finally:
        host.kill()
        host.wait(timeout=20)


def shown(desktop, probe, view):
    """The host's window if it is laid out and shows a view: its colour fills it below the bar."""
    window = next((w for w in probe.windows() if w.text == "Function bar"), None)
    bar = window and window.find(BAR)
    if not bar or bar.rect[1] == bar.rect[3]:
        return None
    _, _, right, bottom = window.client
    return window if desktop.picture().pixel(right - 5, bottom - 5) == COLOURS[view] else None


def menu(probe):
    return next((w for w in probe.windows() if w.window_class == MENU), None)


def open_menu(desktop, probe, window):
    desktop.click(*window.find(BAR).centre)
    return wait_until(lambda: menu(probe), "the menu opens")


def test_an_entry_is_chosen_with_the_pointer(desktop, probe, programs):
    with running_host(desktop, probe, programs) as window:
        opened = open_menu(desktop, probe, window)
        left, top, _, bottom = opened.rect
        assert (left, top) == (3, window.find(BAR).rect[3])
        desktop.click(left + 20, top + (bottom - top) * 5 // 8)  # in the third of four entries
        wait_until(lambda: shown(desktop, probe, 2), "the third view is shown")
        assert not menu(probe)


def test_an_entry_is_chosen_with_keys(desktop, probe, programs):
    with running_host(desktop, probe, programs) as window:
        open_menu(desktop, probe, window)
        desktop.key("Down", "Down", "Return")
        wait_until(lambda: shown(desktop, probe, 1), "the second view is shown")


def test_a_tap_elsewhere_closes_the_menu(desktop, probe, programs):
    with running_host(desktop, probe, programs) as window:
        open_menu(desktop, probe, window)
        _, _, right, bottom = window.client
        desktop.click(right - 20, bottom - 20)
        wait_until(lambda: not menu(probe), "the menu closes")
        assert shown(desktop, probe, 0)
