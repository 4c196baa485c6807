"""Which places of a source scripts/mutants breaks, and how."""

import pathlib
import sys

sys.path.insert(0, str(pathlib.Path(__file__).parents[2] / "scripts"))

from mutation import sites


def changes(text):
    """"before => after" of each mutant of a text."""
    places = sites.Source("x.cpp", text + "\n").places()
    return [f"{mutant.before} => {mutant.after}" for place in places for mutant in place]


def test_comparison_moves_its_bound_and_turns():
    assert changes("a < b;") == ["a < b; => a <= b;", "a < b; => a >= b;"]
    assert changes("a == b;") == ["a == b; => a != b;"]


def test_brackets_of_templates_pointers_and_references_are_no_operators():
    assert changes("Array<int>* array = Cast<Array<int>*>(block);\nconst T& a = *b;\nT&& c = d;") == []


def test_operators_steps_and_extremes():
    assert changes("a = b + c;") == ["a = b + c; => a = b - c;"]
    assert changes("a = b &&\n    c;") == ["a = b && => a = b ||"]
    assert changes("++i;") == ["++i; => --i;"]
    assert changes("a = std::min<int>(b, c);") == ["a = std::min<int>(b, c); => a = std::max<int>(b, c);"]


def test_conditions_are_negated():
    assert changes("if (IsEmpty(a)) return;") == ["if (IsEmpty(a)) return; => if (!(IsEmpty(a))) return;"]
    assert changes("if (HWND a = Find(); a) return;") == [
        "if (HWND a = Find(); a) return; => if (HWND a = Find(); !(a)) return;"
    ]
    assert changes("a = !b;") == ["a = !b; => a = b;"]


def test_integers_are_off_by_one():
    assert changes("a = 5u;") == ["a = 5u; => a = 6u;", "a = 5u; => a = 4u;"]
    assert changes("a = 0x10;") == ["a = 0x10; => a = 0x11;", "a = 0x10; => a = 0xf;"]
    assert changes("a = 0;") == ["a = 0; => a = 1;", "a = 0; => a = (-1);"]
    assert changes("wchar_t text[16];\na = 1.5;") == []


def test_truth_turns():
    assert changes("a = true;") == ["a = true; => a = false;"]


def test_results_become_empty():
    assert changes("return Find(a, b);") == ["return Find(a, b); => return {};"]
    assert changes("return nullptr;") == []


def test_calls_are_left_out():
    assert changes("{ Draw(a); }") == ["{ Draw(a); } => { ; }"]
    assert changes("{ a->b.Draw<int>(c); }") == []
    assert changes("{ a->b.Draw(c); }") == ["{ a->b.Draw(c); } => { ; }"]
    assert changes("{ a = Draw(b); }") == []
    assert changes("{\ncase A: Draw(b);\n}") == ["case A: Draw(b); => case A: ;"]
    assert changes("{ a = b ? c : Draw(d); }") == []


def test_comments_texts_directives_and_assertions_stay():
    assert changes('// a < b\n/* a < b */\n#if A < 5\n#endif\nstatic_assert(a < 5);\na = L"1 < 2";') == []


def test_a_statement_knows_its_lines():
    mutant = sites.Source("x.cpp", "a();\nb = c(d,\n      e - f);\ng();\n")
    assert [each[0].lines for each in mutant.places() if each[0].kind == "operator"] == [(2, 3)]


def test_a_constant_and_a_field_are_known_by_name():
    text = "constexpr int kWide = 5;\nstruct A {\n    int wide = 5;\n};\n"
    source = sites.Source("x.h", text)
    first, second = [each[0].begin for each in source.places()]
    assert source.constant_at(first) == "kWide"
    assert source.constant_at(second) is None
    assert source.field_at(second) == "wide"
