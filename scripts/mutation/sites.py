"""Places in a C++ source that can be broken, found by rules over its words."""

import bisect
import re
from dataclasses import dataclass

WORD = re.compile(
    r"""(?P<blank>\s+)
      | (?P<comment>//[^\n]*|/\*.*?\*/)
      | (?P<directive>^[ \t]*\#(?:\\\n|[^\n])*)
      | (?P<text>(?:L|u8|u|U)?(?:"(?:\\.|[^"\\])*"|'(?:\\.|[^'\\])*'))
      | (?P<number>(?:0[xX][0-9a-fA-F']+|\d[\d']*(?:\.\d*)?(?:[eE][+-]?\d+)?)[uUlLfF]*)
      | (?P<name>[A-Za-z_]\w*)
      | (?P<sign><<=|>>=|->|::|\+\+|--|&&|\|\||[<>=!+*/%&|^-]=|<<|>>|.)""",
    re.VERBOSE | re.DOTALL | re.MULTILINE,
)
CONSTANT = re.compile(
    r"^(?:inline |static )?(?:constexpr|constinit|const) [^;(={]*?\b(?P<name>\w+)(?:\[\w*\])* *[={]", re.MULTILINE
)
FIELD = re.compile(r"[\w>*&] (?P<name>[A-Za-z_]\w*)(?:\[\w*\])* *[={]")
LABEL = re.compile(r"\s*(case\b.*|default):\s*")
OPENING = {")": "(", "]": "[", "}": "{"}

# What a comparison turns into: its bound moves, or its sense.
COMPARISONS = {
    "<": ("<=", ">="),
    "<=": ("<", ">"),
    ">": (">=", "<="),
    ">=": (">", "<"),
    "==": ("!=",),
    "!=": ("==",),
}
SWAPPED = {
    "&&": "||",
    "||": "&&",
    "+": "-",
    "-": "+",
    "*": "/",
    "/": "*",
    "<<": ">>",
    ">>": "<<",
    "&": "|",
    "|": "&",
    "+=": "-=",
    "-=": "+=",
}
STEPS = {"++": "--", "--": "++"}
NOT_CALLS = {"return", "static_assert", "delete", "throw", "using", "case", "goto", "KOR_ASSERT"}


@dataclass(frozen=True)
class Word:
    kind: str
    text: str
    begin: int
    end: int


@dataclass(frozen=True)
class Mutant:
    file: str  # relative to the root
    kind: str
    begin: int
    end: int
    replacement: str
    lines: tuple  # of the statement, the first and the last
    line: int
    before: str
    after: str


class Source:
    def __init__(self, name, text):
        self.name = name
        self.text = text
        self.starts = [0] + [found.end() for found in re.finditer("\n", text)]
        self.words = without_assertions(list(words_of(text)))
        self.partners = partners_of(self.words)
        self.constants = list(self.find_constants())

    def line_of(self, offset):
        return bisect.bisect_right(self.starts, offset)

    def lines_of_statement(self, index):
        """From the end of the statement before to that of this one."""
        first = last = index
        while first > 0 and self.words[first - 1].text not in ";{}":
            first -= 1
        while last + 1 < len(self.words) and self.words[last].text not in ";{}":
            last += 1
        return self.line_of(self.words[first].begin), self.line_of(self.words[last].begin)

    def constant_at(self, offset):
        """The constant of namespace scope whose definition holds this place, or None."""
        for name, begin, end in self.constants:
            if begin <= offset < end:
                return name
        return None

    def field_at(self, offset):
        """The field, or other thing, that the words before this place give a value to."""
        begin = max(self.text.rfind(sign, 0, offset) for sign in ";{}") + 1
        found = FIELD.search(self.text, begin, offset) or FIELD.search(self.text, self.text.rfind("\n", 0, offset), offset)
        return found["name"] if found else None

    def find_constants(self):
        # What stands at a line's beginning is of namespace scope.
        for found in CONSTANT.finditer(self.text):
            end = next((word.end for word in self.words if word.begin > found.start() and word.text == ";"), 0)
            yield found["name"], found.start(), end

    def places(self):
        """For each place the mutants of which it is one."""
        for index, word in enumerate(self.words):
            changes = list(self.changes(index, word))
            if changes:
                yield [self.mutant(index, *change) for change in changes]

    def mutant(self, index, kind, begin, end, replacement):
        lines = self.lines_of_statement(index)
        first, last = self.line_of(begin), self.line_of(end - 1)
        shown = self.starts[first - 1]
        shown_end = self.starts[last] - 1 if last < len(self.starts) else len(self.text)
        before = self.text[shown:shown_end]
        after = self.text[shown:begin] + replacement + self.text[end:shown_end]
        return Mutant(self.name, kind, begin, end, replacement, lines, first, one_line(before), one_line(after))

    def changes(self, index, word):
        if word.kind == "number":
            yield from self.number_changes(index, word)
        elif word.kind == "name":
            yield from self.name_changes(index, word)
        elif word.kind == "sign":
            yield from self.sign_changes(index, word)

    def number_changes(self, index, word):
        found = re.fullmatch(r"(?:(0[xX])([0-9a-fA-F']+)|(\d[\d']*))([uUlL]*)", word.text)
        if not found or self.is_array_length(index):
            return
        prefix, sixteens, tens, suffix = found.groups()
        value = int((sixteens or tens).replace("'", ""), 16 if prefix else 10)
        for other in (value + 1, value - 1):
            text = f"0x{other:x}" if prefix and other >= 0 else str(other)
            yield "constant", word.begin, word.end, f"({text}{suffix})" if other < 0 else text + suffix

    def is_array_length(self, index):
        """In `wchar_t text[16]`: more room changes nothing."""
        if index < 3 or self.words[index - 1].text != "[" or self.words[index - 2].kind != "name":
            return False
        before = self.words[index - 3]
        return before.kind == "name" and before.text != "return" or before.text in (">", "*", "&")

    def name_changes(self, index, word):
        following = self.words[index + 1].text if index + 1 < len(self.words) else ""
        if word.text in ("true", "false"):
            yield "truth", word.begin, word.end, "false" if word.text == "true" else "true"
        elif word.text in ("if", "while") and following == "(":
            yield from self.condition_changes(index + 1)
        elif word.text == "return" and following != ";":
            yield from self.result_changes(index)
        elif word.text in ("min", "max") and self.words[index - 1].text == "::":
            yield "extreme", word.begin, word.end, "max" if word.text == "min" else "min"
        elif self.begins_statement(index) and word.text not in NOT_CALLS:
            yield from self.call_changes(index)

    def condition_changes(self, opening):
        closing = self.partners[opening]
        separators = [i for i in self.own_words(opening, closing) if self.words[i].text == ";"]
        begin = self.words[(separators or [opening])[-1]].end
        end = self.words[closing].begin
        yield "condition", begin, end, f"{' ' if separators else ''}!({self.text[begin:end].strip()})"

    def own_words(self, opening, closing):
        """Those between two brackets that are in no other ones."""
        index = opening + 1
        while index < closing:
            yield index
            index = self.partners.get(index, index) + 1 if self.words[index].text in "([{" else index + 1

    def result_changes(self, index):
        end = index
        while self.words[end].text != ";":
            end = self.partners.get(end, end) + 1 if self.words[end].text in "([{" else end + 1
        begin = self.words[index + 1].begin
        result = self.text[begin : self.words[end].begin]
        if not re.fullmatch(r"(true|false|nullptr|\{\}|-?\d+)", result):
            yield "result", begin, self.words[end].begin, "{}"

    def begins_statement(self, index):
        before = self.words[index - 1].text if index else ""
        if before == ":":  # of a label; a conditional expression has one as well
            begin = self.words[index].begin
            return LABEL.fullmatch(self.text, self.starts[self.line_of(begin) - 1], begin) is not None
        return before in (";", "{", "}", ")", "else")

    def call_changes(self, index):
        """`name(...);` and the like of a member; what is assigned or declared is none."""
        end = index + 1
        while end < len(self.words) and self.words[end].text in ("::", ".", "->") or (
            self.words[end - 1].text in ("::", ".", "->") and self.words[end].kind == "name"
        ):
            end += 1
        if self.words[end].text != "(" or end not in self.partners:
            return
        end = self.partners[end] + 1
        if self.words[end].text == ";":
            yield "call", self.words[index].begin, self.words[end].begin, ""

    def sign_changes(self, index, word):
        if word.text in STEPS:
            yield "step", word.begin, word.end, STEPS[word.text]
        elif word.text == "!":
            yield "condition", word.begin, word.end, ""
        elif self.stands_apart(word):
            for other in COMPARISONS.get(word.text, ()):
                yield "comparison", word.begin, word.end, other
            if word.text in SWAPPED:
                yield "operator", word.begin, word.end, SWAPPED[word.text]

    def stands_apart(self, word):
        """An operator has blanks on both sides; brackets of templates and pointers have not."""
        return self.text[word.begin - 1].isspace() and self.text[word.end : word.end + 1].isspace()


def words_of(text):
    for found in WORD.finditer(text):
        if found.lastgroup not in ("blank", "comment", "directive"):
            yield Word(found.lastgroup, found.group(), found.start(), found.end())


def without_assertions(words):
    """What the compiler alone evaluates is left out."""
    kept, skips = [], False
    for word in words:
        skips = skips or word.text == "static_assert"
        if not skips:
            kept.append(word)
        elif word.text == ";":
            skips = False
    return kept


def partners_of(words):
    partners, opened = {}, []
    for index, word in enumerate(words):
        if word.text in OPENING.values():
            opened.append(index)
        elif word.text in OPENING and opened and words[opened[-1]].text == OPENING[word.text]:
            partners[opened[-1]] = index
            opened.pop()
    return partners


def one_line(text):
    return " ".join(text.split())
