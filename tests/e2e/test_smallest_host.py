"""The host that README.md shows is the one that is built, and it works."""

from desktop import ROOT, wait_until


def test_the_readme_shows_it_word_for_word():
    source = (ROOT / "examples" / "smallest_host" / "smallest_host.c").read_text()
    readme = (ROOT / "README.md").read_text()
    assert f"```c\n{source}```\n" in readme


def test_it_shows_a_grid_in_its_whole_window(desktop, probe, programs):
    host = desktop.start(programs / "smallest_host.exe")
    try:
        window = wait_until(
            lambda: next((w for w in probe.windows() if w.text == "Smallest host"), None),
            "the smallest host's window",
        )
        grid = window.find("KV Grid Control")
        assert grid.client[2] - grid.client[0] > 400
        assert [child.window_class for child in grid.children].count("korvane Header") == 2
        assert grid.find("korvane Header", id=2).first_label == "A"
    finally:
        host.kill()
        host.wait(timeout=20)
