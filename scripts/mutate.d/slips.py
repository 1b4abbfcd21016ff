"""Slips as scripts/slips describes them."""

import hashlib
import json
import pathlib
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent.parent


class Slip:
    def __init__(self, area, number, suites, file, block):
        self.area, self.number, self.suites, self.file = area, number, suites, file
        self.anchor, self.old, self.new, self.notice, self.reason = "", [], [], "", ""
        kinds = {"-": self.old, "+": self.new}
        for line in block:
            kind, text = line[0], line[2:]
            if kind in kinds:
                kinds[kind].append(text)
            elif kind == "@":
                self.anchor = text
            elif kind == ">":
                self.notice = text
            elif kind == "=":
                self.reason = text
            else:
                sys.exit(f"{area}: no line begins so: {line}")
        if not self.old or not self.notice:
            sys.exit(f"{self.name}: needs an old text (-) and what is noticed (>)")

    @property
    def name(self):
        return f"{self.area}:{self.number}"

    @property
    def key(self):
        text = json.dumps([self.file, self.anchor, self.old, self.new])
        return hashlib.sha256(text.encode()).hexdigest()[:16]

    @property
    def choice(self):
        """By which it is chosen, whatever others there are, so that a source stays as it was."""
        return int(self.key[:7], 16) + 1

    @property
    def before(self):
        return "\n".join(self.old)

    def place(self, source):
        """Where its old text begins; nothing where that has no place, or several."""
        start = source.find(self.anchor) if self.anchor else 0
        at = source.find(self.before, start) if start >= 0 else -1
        if at < 0 or not self.anchor and source.find(self.before, at + 1) >= 0:
            return None
        return at

    def change(self, source):
        """What becomes another text, from where to where; nothing where the slip has no place."""
        at = self.place(source)
        if at is None:
            return None
        old, new = self.old, self.new
        first = 0
        while first < min(len(old), len(new)) - 1 and old[first] == new[first]:
            first += 1
        last = 0
        while last < min(len(old), len(new)) - first - 1 and old[-1 - last] == new[-1 - last]:
            last += 1
        begin = at + sum(len(line) + 1 for line in old[:first])
        return (begin, begin + len("\n".join(old[first:len(old) - last])),
                "\n".join(new[first:len(new) - last]))

    def applied(self, source):
        """The source with the slip in it; nothing where it has no place."""
        change = self.change(source)
        return change and source[:change[0]] + change[2] + source[change[1]:]


def slips_of(path):
    suites, file, slips = [], "", []
    for block in path.read_text().split("\n\n"):
        lines = [line for line in block.splitlines() if line and not line.startswith("#")]
        while lines and lines[0].startswith(("suites ", "in ")):
            word, _, rest = lines.pop(0).partition(" ")
            if word == "suites":
                suites = rest.split()
            else:
                file = rest
        if lines:
            slips.append(Slip(path.stem, len(slips) + 1, suites, file, lines))
    return slips


def chosen(arguments):
    areas = {path.stem: path for path in sorted((ROOT / "scripts" / "slips").glob("*.txt"))}
    result = []
    for argument in arguments or areas:
        area, _, numbers = argument.partition(":")
        if area not in areas:
            sys.exit(f"No area is called {area}; there are {', '.join(areas)}.")
        first, _, last = numbers.partition("-")
        low, high = int(first or 1), int(last or first or 10**6)
        result += [slip for slip in slips_of(areas[area]) if low <= slip.number <= high]
    return result
