"""A virtual X display with a Wine prefix of its own, and the hands and eyes to use it."""

import contextlib
import os
import pathlib
import shutil
import subprocess
import tempfile
import time

from picture import Picture

ROOT = pathlib.Path(__file__).resolve().parents[2]
WINE_RUN = ROOT / "scripts" / "wine-run"
WIDTH, HEIGHT = 1024, 768
OUT_OF_THE_WAY = WIDTH - 1, HEIGHT - 1
DOUBLE_CLICK_SECONDS = 0.6


def wait_until(condition, what, seconds=10):
    """Returns condition()'s first true value; a TimeoutError says `what` did not happen."""
    end = time.monotonic() + seconds
    while True:
        value = condition()
        if value:
            return value
        if time.monotonic() > end:
            raise TimeoutError(f"after {seconds} s still not: {what}")
        time.sleep(0.02)


class Desktop:
    """Xvfb without a window manager (Wine draws the frames). Use it as a context manager.

    The Wine prefix is a copy, so that several desktops at once do not share a Windows session.
    """

    def __init__(self, program):
        """`program`: any .exe of the machine (i686 or x86_64) that the desktop is for."""
        self._last_click = (0, 0), 0
        self._folder = pathlib.Path(tempfile.mkdtemp(prefix="korcontrols-desktop."))
        self._server = self._start_server()
        self._environment = dict(
            os.environ,
            DISPLAY=f":{self._read_display_number()}",
            KORCONTROLS_X11="bare",
        )
        self._environment["KORCONTROLS_CACHE"] = str(self._copy_prefix(program))

    def __enter__(self):
        return self

    def __exit__(self, *_):
        subprocess.run(
            ["wineserver", "-k"],
            env=dict(self._environment, WINEPREFIX=str(self._prefix)),
            stderr=subprocess.DEVNULL,
            check=False,
        )
        self._server.terminate()
        self._server.wait()
        shutil.rmtree(self._folder, ignore_errors=True)

    def _start_server(self):
        # -fbdir: the screen's pixels are a file, so a picture costs no request to the server.
        self._number_pipe, number_end = os.pipe()
        server = subprocess.Popen(
            ["Xvfb", "-displayfd", str(number_end), "-screen", "0", f"{WIDTH}x{HEIGHT}x24"]
            + ["-nolisten", "tcp", "-noreset", "-fbdir", str(self._folder)],
            pass_fds=[number_end],
            stdin=subprocess.DEVNULL,
            stdout=subprocess.DEVNULL,
            stderr=subprocess.DEVNULL,
        )
        os.close(number_end)
        return server

    def _read_display_number(self):
        with os.fdopen(self._number_pipe) as pipe:
            number = pipe.readline().strip()
        if not number:
            raise RuntimeError("Xvfb did not start")
        return number

    def _copy_prefix(self, program):
        """Has the prefix made if it is not there yet, and copies it. Returns the copy's parent."""
        script = f'. {ROOT}/scripts/wine-environment; wine_environment "$1" && echo "$WINEPREFIX"'
        made = subprocess.run(
            ["bash", "-c", script, "bash", str(program)],
            env=self._environment,
            capture_output=True,
            text=True,
            check=False,
        )
        if made.returncode != 0:
            raise RuntimeError(f"no Wine prefix: {made.stderr}")
        original = pathlib.Path(made.stdout.strip())
        self._prefix = self._folder / original.name
        shutil.copytree(original, self._prefix, symlinks=True)
        return self._folder

    # ---- Programs ----

    def start(self, program, *arguments, **options):
        """Starts a Windows program; `options` go to Popen, its output is thrown away by default."""
        options.setdefault("stdin", subprocess.DEVNULL)
        options.setdefault("stdout", subprocess.DEVNULL)
        return subprocess.Popen(
            [str(WINE_RUN), "--direct", str(program), *arguments],
            env=self._environment,
            stderr=subprocess.DEVNULL,
            **options,
        )

    # ---- Hands ----

    def _xdotool(self, *words):
        subprocess.run(["xdotool", *map(str, words)], env=self._environment, check=True)

    def move(self, x, y):
        self._xdotool("mousemove", x, y)

    def press_button(self):
        self._xdotool("mousedown", 1)

    def release_button(self):
        self._xdotool("mouseup", 1)

    def click(self, x, y):
        """A single click, never the second half of a double click."""
        place, when = self._last_click
        if abs(place[0] - x) < 8 and abs(place[1] - y) < 8:
            time.sleep(max(0, when + DOUBLE_CLICK_SECONDS - time.monotonic()))
        self._xdotool("mousemove", x, y, "click", 1)
        self._last_click = (x, y), time.monotonic()

    def right_click(self, x, y):
        self._xdotool("mousemove", x, y, "click", 3)

    def drag(self, *points, release=True):
        """Presses at the first point and moves to the others; each is an (x, y) pair."""
        (x, y), *rest = points
        words = ["mousemove", x, y, "mousedown", 1]
        for x, y in rest:
            words += ["sleep", "0.05", "mousemove", x, y]
        if release:
            words += ["sleep", "0.05", "mouseup", 1]
        self._xdotool(*words)

    def wheel(self, x, y, up=0, down=0):
        """Turns the wheel by some notches with the pointer at x, y."""
        self._xdotool("mousemove", x, y, *["click", 4] * up, *["click", 5] * down)

    @contextlib.contextmanager
    def holding(self, key):
        self._xdotool("keydown", key)
        yield
        self._xdotool("keyup", key)

    def key(self, *names):
        """Presses and lets go of keys, one after the other; "ctrl+s" is a combination."""
        self._xdotool("key", "--delay", 5, *names)

    def type(self, text):
        self._xdotool("type", "--delay", 5, "--", text)

    # ---- Eyes ----

    def picture(self):
        return Picture.from_xwd((self._folder / "Xvfb_screen0").read_bytes())
