"""How scripts/mutate puts many slips into one source."""

import pathlib
import subprocess
import sys
import tempfile
import unittest

PLACE = pathlib.Path(__file__).resolve().parent.parent.parent / "scripts" / "mutate.d"
sys.path.insert(0, str(PLACE))
COMPILER = sys.argv.pop() if len(sys.argv) > 1 and not sys.argv[-1].startswith("-") else "c++"

from schemata import Schemata, blocks_of
from slips import ROOT, Slip, chosen

SOURCE = """#include <cstdio>
#include <initializer_list>
namespace {
constexpr int greatest = 3;
const char* const texts[] = {"{", "a}", R"(")})"};
int sum(int n) {
    int result = 0;
    for (int i = 1; i <= n; ++i) {
        for (const int more : {i, i}) result += more - i;
        if (i == 2) continue;
        result += i; // not {
    }
    return result;
}
struct Pair {
    int first, second;
    int product() const { return first * second; }
};
} // namespace
int main() {
    switch (sum(greatest)) {
    case 4: std::printf("four "); break;
    default: std::printf("other ");
    }
    const auto twice = [](int n) { return 2 * n; };
    std::printf("%d %c %d", Pair{2, 3}.product(), texts[0][0], twice('z' - 'x'));
}
"""


def slip(*lines):
    return Slip("area", 1, [], "source.cpp", [*lines, "> something"])


def schemata(*slips):
    return Schemata(SOURCE, slips, PLACE / "slip.h")


def compiled(text, folder):
    source, program = pathlib.Path(folder, "source.cpp"), pathlib.Path(folder, "program")
    source.write_text(text)
    made = subprocess.run([COMPILER, "-std=c++20", "-o", program, source],
                          capture_output=True, text=True)
    return program if made.returncode == 0 else made.stderr


class ASlip(unittest.TestCase):
    def test_changes_only_the_lines_that_differ(self):
        change = slip("- int result = 0;", "-     for (int i = 1; i <= n; ++i) {",
                      "+ int result = 0;", "+     for (int i = 0; i <= n; ++i) {").change(SOURCE)
        self.assertEqual(SOURCE[change[0]:change[1]], "    for (int i = 1; i <= n; ++i) {")
        self.assertEqual(change[2], "    for (int i = 0; i <= n; ++i) {")

    def test_has_no_place_where_its_text_stands_twice(self):
        self.assertIsNone(slip("- result", "+ x").change(SOURCE))
        self.assertIsNone(slip("- nowhere", "+ x").change(SOURCE))
        self.assertIsNotNone(slip("@ return", "- result", "+ x").change(SOURCE))


class Blocks(unittest.TestCase):
    def test_are_those_of_statements(self):
        begins = [SOURCE[begin:end].strip().splitlines()[0].strip()
                  for begin, end in blocks_of(SOURCE)]
        self.assertEqual(begins, ["for (const int more : {i, i}) result += more - i;", "int result = 0;",
                                  "return first * second;", "return 2 * n;",
                                  "switch (sum(greatest)) {"])


class ManySlips(unittest.TestCase):
    def test_are_chosen_when_the_program_runs(self):
        slips = [slip("- constexpr int greatest = 3;", "+ constexpr int greatest = 2;"),
                 slip("- if (i == 2) continue;", "+"),
                 slip("- return result;", "+ return result + 1;"),
                 slip("- return first * second;", "+ return first + second;"),
                 slip("- return 2 * n;", "+ return 3 * n;"),
                 slip('- case 4: std::printf("four "); break;', '+ case 4: break;')]
        made = schemata(*slips)
        self.assertEqual(made.made, {each.key for each in slips})
        said = []
        with tempfile.TemporaryDirectory() as folder:
            program = compiled(made.text, folder)
            for number in [0] + [each.choice for each in slips]:
                said.append(subprocess.run([program], env={"ZANDOR_SLIP": str(number)},
                                           capture_output=True, text=True, check=True).stdout)
            reached = pathlib.Path(folder, "reached")
            subprocess.run([program], env={"ZANDOR_SLIP": "-1", "ZANDOR_REACHED": str(reached)},
                           capture_output=True, check=True)
            self.assertEqual(set(reached.read_text().split()),
                             {str(each.choice) for each in slips})
        self.assertEqual(said, ["four 6 { 4", "other 6 { 4", "other 6 { 4", "other 6 { 4",
                                "four 5 { 4", "four 6 { 6", "6 { 4"])

    def test_are_named_by_the_line_that_the_compiler_refuses(self):
        good, bad = slip("- return 2 * n;", "+ return 3 * n;"), slip("- result += i; // not {",
                                                                   "+ result += nothing;")
        made = schemata(good, bad)
        with tempfile.TemporaryDirectory() as folder:
            errors = compiled(made.text, folder)
        lines = [int(line.split(":")[1]) for line in errors.splitlines() if ": error: " in line]
        self.assertEqual([made.at_line(line) for line in lines], [[bad]])


class TheSlips(unittest.TestCase):
    def test_have_their_places_in_the_sources(self):
        lost = [each.name for each in chosen([])
                if each.place((ROOT / each.file).read_text()) is None]
        self.assertEqual(lost, [], "a line that a slip names has changed: write it there, too")


if __name__ == "__main__":
    unittest.main()
