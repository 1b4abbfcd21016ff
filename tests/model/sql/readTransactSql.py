"""Reads statements of SQL Server, a zero byte behind each, and prints one line for each that no
parser takes: sqlfluff's, which is strict, and where that knows too little sqlglot's. The last line
says how many there were, and how many the strict one took. Ends with 77 where the packages are not
installed."""

import re
import sys

try:
    import sqlglot
    from sqlfluff.core import FluffConfig, Linter
except ImportError:
    sys.exit(77)

# What sqlfluff's grammar lacks: bytes, pages, and groups of joins but for the simplest.
lacking = re.compile(r"\b0x[0-9A-F]*|\n *OFFSET \d+ ROWS|JOIN \(")
linter = Linter(config=FluffConfig(overrides={"dialect": "tsql"}))


def strict(statement):
    parsed = linter.parse_string(statement + "\n")
    return " ".join(str(parsed.violations[0]).split()) if parsed.violations else None


def lenient(statement):
    try:
        sqlglot.parse(statement, read="tsql", error_level=sqlglot.ErrorLevel.RAISE)
    except sqlglot.errors.SqlglotError as error:
        return " ".join(str(error).split())
    return None


statements = sys.stdin.buffer.read().decode("utf-8").split("\0")[:-1]
by_strict = 0
for number, statement in enumerate(statements):
    refusal = strict(statement)
    by_strict += refusal is None
    if refusal and lacking.search(statement):
        refusal = lenient(statement)
    if refusal:
        print(number, refusal)
print("read", len(statements), by_strict)
