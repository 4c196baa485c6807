"""The clipboard as another program sees it."""

import json
import subprocess


class Clipboard:
    def __init__(self, desktop, program):
        self._desktop, self._program = desktop, program

    def _run(self, option, given=b""):
        process = self._desktop.start(
            self._program, option, stdin=subprocess.PIPE, stdout=subprocess.PIPE
        )
        return process.communicate(given, timeout=30)[0]

    def _contents(self):
        answer = self._run("--clipboard")
        return json.loads(answer) if answer else {"text": None, "picture": None}

    def text(self):
        return self._contents()["text"]

    def picture(self):
        """(width, height) of a picture there, or None."""
        size = self._contents()["picture"]
        return tuple(size) if size else None

    def put(self, text):
        self._run("--put", text.encode())
