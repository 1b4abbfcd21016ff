"""Many slips in one source, one of them chosen when the program runs.

Each block of statements with slips in it becomes a choice between as many copies of itself:

    { if (zandorSlip(7)) { with the slip } else { as it is } }

Outside of blocks it is a choice between two expressions, and a constant that loses its constexpr for
that. What does not compile so the compiler names by its line, and it is tried alone.
"""

import re

TOKEN = re.compile(
    r"""//[^\n]*|/\*.*?\*/|R"([^(]*)\(.*?\)\1"|"(?:\\.|[^"\\\n])*"|(?<![0-9A-Fa-f])'(?:\\.|[^'\\\n])+'|[{}]""",
    re.DOTALL)
COMMENT = re.compile(r"//[^\n]*|/\*.*?\*/", re.DOTALL)
CONSTANT = re.compile(r"\s*constexpr (?P<name>[^=]*) = (?P<value>[^;]*);\s*(//[^\n]*)?", re.DOTALL)
OBJECT = re.compile(r"\s*(?P<inline>inline )?constexpr (?P<type>\w+) (?P<name>\w+)(?P<value>\{[^;]*\});\s*")
SWITCH = re.compile(r"\bswitch \([^{}]*\)$")
RESULT = re.compile(r"\)[\w\s]*->[\w\s:<>,&*]+$")
LABEL = re.compile(r"\b(case [^;{}()]*|default):$")
WORDS = ("const", "noexcept", "override", "final", "mutable", "else", "do", "try")


def holds_statements(before):
    """Whether the brace after this text opens a block of statements."""
    before = COMMENT.sub("", before[-400:]).rstrip()
    if SWITCH.search(before):
        return False
    last_word = re.search(r"\w*$", before).group()
    return before.endswith((")", "]", ";", "}")) or last_word in WORDS \
        or bool(RESULT.search(before) or LABEL.search(before))


def blocks_of(source):
    """Blocks of statements, from behind their opening brace to their closing one, inner ones first."""
    blocks, open_ones = [], []
    for token in TOKEN.finditer(source):
        if token.group() == "{":
            open_ones.append((token.end(), holds_statements(source[:token.start()])))
        elif token.group() == "}" and open_ones:
            begin, statements = open_ones.pop()
            if statements:
                blocks.append((begin, token.start()))
    return blocks


def trimmed(source, begin, end, after):
    """A change without what is the same at its two ends."""
    while begin < end and after and source[begin] == after[0]:
        begin, after = begin + 1, after[1:]
    while begin < end and after and source[end - 1] == after[-1]:
        end, after = end - 1, after[:-1]
    return begin, end, after


def is_expression(text):
    """As far as its brackets and its ends tell."""
    return not re.match(r"\s*(\{|$)", text) and not text.rstrip().endswith((";", "}")) and \
        all(text.count(left) == text.count(right) for left, right in ("()", "{}", "[]"))


class Schemata:
    """A source with as many slips as fit into it."""

    def __init__(self, source, slips, header):
        self.source = source
        blocks = blocks_of(source)
        self.inside = {}  # of a block: its slips, each with its change
        self.outside = []
        for slip in slips:
            change = slip.change(source)
            if change is None:
                continue
            small = trimmed(source, *change)
            block = next((b for b in blocks if b[0] <= small[0] and small[1] <= b[1]), None)
            if block:
                self.inside.setdefault(block, []).append((slip, small))
            else:
                self.outside.append((slip, change))
        self.pieces = []  # text, and the slips that it is there for
        self.made = set()
        self.add(f'#include "{header}"\n', [])
        self.render(0, len(source), [])
        self.text = "".join(text for text, _ in self.pieces)

    def add(self, text, slips):
        self.pieces.append((text, slips))

    def render(self, begin, end, owners):
        """The source between two places with what stands in it to be chosen."""
        parts = [(*block, None, None) for block in self.inside]
        parts += [(*change[:2], slip, change[2]) for slip, change in self.outside]
        # The larger of two that begin in one place first; what stands in another is passed over.
        for first, last, slip, after in sorted(parts, key=lambda part: (part[0], -part[1])):
            if first < begin or end < last:
                continue
            self.add(self.source[begin:first], owners)
            if slip:
                self.expression(slip, self.source[first:last], after)
            else:
                self.block(first, last)
            begin = last
        self.add(self.source[begin:end], owners)

    def block(self, begin, end):
        slips = self.inside.pop((begin, end))
        for slip, (first, last, after) in slips:
            self.choose(slip, f" if (zandorSlip({slip.choice})) {{"
                        f"{self.source[begin:first]}{after}{self.source[last:end]}\n}} else")
        owners = [slip for slip, _ in slips]
        self.add(" {", owners)
        self.render(begin, end, owners)
        self.add("}\n", owners)

    def expression(self, slip, old, new):
        choice = f"zandorSlip({slip.choice}) ?"
        before, after = CONSTANT.fullmatch(old), CONSTANT.fullmatch(new)
        whole, other = OBJECT.fullmatch(old), OBJECT.fullmatch(new)
        tail = "," if old.endswith(",") and new.endswith(",") else ""
        if before and after and before["name"] == after["name"]:
            self.choose(slip, f"const {before['name']} = {choice} {after['value']} : {before['value']};")
        elif whole and other and whole["name"] == other["name"]:
            kind = whole["type"]
            self.choose(slip, f"{whole['inline'] or ''}const {kind} {whole['name']} = "
                        f"{choice} {kind}{other['value']} : {kind}{whole['value']};")
        elif is_expression(old.removesuffix(tail)) and is_expression(new.removesuffix(tail)):
            self.choose(slip, f"({choice} {new.removesuffix(tail)} : {old.removesuffix(tail)}){tail}")
        else:
            self.add(old, [])

    def choose(self, slip, text):
        self.add(text, [slip])
        self.made.add(slip.key)

    def at_line(self, number):
        """The slips that a line is there for; those of one alternative where it is one's."""
        line, found = 1, []
        for text, slips in self.pieces:
            last = line + text.count("\n")
            if line <= number <= last and slips:
                found.append(slips)
            line = last
        return min(found, key=len, default=[])
