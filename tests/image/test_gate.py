"""The build lets nothing through that the device does not have."""

from build_commands import compile_command, link_command, run


def build_extra(build, folder, code):
    """Compiles a source as one of the library's; the result is the failed step, or None."""
    source, output = folder / "extra.cpp", folder / "extra.obj"
    source.write_text(code)
    compiled = run(compile_command(build, source, output), build)
    if compiled.returncode:
        return compiled
    # Before the libraries, which are searched in order; and nothing left out that nobody asks for.
    linker, *arguments = link_command(build, folder / "korcontrols.dll")
    linked = run([linker, str(output), *arguments, "--no-gc-sections"], build)
    return linked if linked.returncode else None


def test_a_function_of_the_list_can_be_called(build, tmp_path):
    assert build_extra(build, tmp_path, """
        #include "platform/platform.h"
        extern void Extra(HWND hwnd);
        void Extra(HWND hwnd) { UpdateWindow(hwnd); }""") is None


def test_a_function_that_windows_ce_lacks_cannot(build, tmp_path):
    failed = build_extra(build, tmp_path, """
        #include "platform/platform.h"
        extern void Extra(HDC dc);
        void Extra(HDC dc) { LineTo(dc, 1, 2); }""")
    assert failed and "undefined reference to `LineTo'" in failed.stderr


def test_code_that_would_run_at_load_cannot_be_compiled(build, tmp_path):
    failed = build_extra(build, tmp_path, """
        extern int Number();
        extern int number;
        int number = Number();""")
    assert failed and "section .ctors has no place" in failed.stderr


def test_a_warning_is_an_error(build, tmp_path):
    failed = build_extra(build, tmp_path, """
        extern int Shorten(double value);
        int Shorten(double value) { return value; }""")
    assert failed and "-Werror" in failed.stderr


def test_an_instruction_of_later_processors_cannot_be_assembled(build, tmp_path):
    failed = build_extra(build, tmp_path, """
        extern int Zeros(int value);
        int Zeros(int value) { asm("clz %0, %0" : "+r"(value)); return value; }""")
    assert failed and "does not support" in failed.stderr
