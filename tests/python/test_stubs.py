"""Type hints: what a type checker says of programs."""

import os
import subprocess
import sys
from enum import EnumMeta

import pytest

import zandor

HEAD = """\
from typing import List, Optional
import zandor
from zandor import TalvikZandorLib as lib

widget = zandor.ZandorWidget(zandor.Library())
query = zandor.Query()
"""


def check(tmp_path, source):
    program = tmp_path / "program.py"
    program.write_text(source, encoding="utf-8")
    folder = os.path.dirname(os.path.dirname(zandor.__file__))
    checked = subprocess.run(
        [sys.executable, "-m", "mypy", "--strict", "--no-error-summary", "--cache-dir",
         os.path.join(os.path.dirname(tmp_path), "mypy"), program],
        capture_output=True, text=True, cwd=tmp_path, env={**os.environ, "MYPYPATH": folder},
    )  # fmt: skip
    return [line for line in checked.stdout.splitlines() if ": error:" in line], checked.stderr


def test_a_program_that_is_right_passes(tmp_path):
    errors, told = check(
        tmp_path,
        HEAD
        + """
widget.setModel(query)
widget.setLNGJoinOk("&Ok")
number: int = widget.DebugSwitch()
flag: bool = widget.OnlyJoin()
table = query.addTable(zandor.TableDescription("orders", [zandor.ColumnDescription("id")]))
table.Left = 300.0
names: List[str] = [column.Name for column in table.Columns]
join = zandor.Join()
join.LeftTable = table
found: Optional[zandor.Table] = query.tableNamed("orders")
statement = zandor.statementText(query, zandor.Dialect.SQLite, limit=5)
text: str = statement.text
widget.setFindings(statement.findings)
zandor.saveQuery("a.json", zandor.QueryDocument(query))
tables, left_out = zandor.openDatabase("a").addTables(query, ["orders"], 12000)
kind: lib.JoinType = lib.JoinType.LeftOuter
join.JoinType = kind


class Column(lib.ZDColumn):
    def __init__(self, name: str) -> None:
        self._name = name

    @property
    def Name(self) -> str:
        return self._name

    @property
    def Key(self) -> str:
        return self._name

    @property
    def Marker(self) -> bool:
        return False


class Rules(zandor.Questions):
    def MayJoin(self, left: zandor.JoinEnd, right: zandor.JoinEnd) -> bool:
        return left.Column.Marker != right.Column.Marker

    def MenuEntries(self, place: zandor.MenuPlace) -> List[zandor.HostEntry]:
        name: Optional[str] = place.Table.Name if place.Table else None
        return [zandor.HostEntry(f"Copy {name}", lambda: print(name))]


widget.setQuestions(Rules())
widget.setQuestions(None)
widget.setLibrary(zandor.Library())
other = zandor.ZandorWidget()
columns: lib.KeyedCollection[Column] = lib.KeyedCollection([Column("id")])
first: str = columns.Item(1).Name
""",
    )
    assert (errors, told) == ([], "")


@pytest.mark.parametrize(
    "line, complaint",
    [
        ("widget.setLNGJoinOk(7)", 'incompatible type "int"; expected "str"'),
        ("widget.setModel(7)", "incompatible type"),
        ("text: str = widget.DebugSwitch()", "Incompatible types in assignment"),
        ("query.Tables.Item(1).Nmae", 'has no attribute "Nmae"'),
        ("zandor.statementText(query, 7)", 'expected "Dialect"'),
        ("widget.setQuestions(query)", "incompatible type"),
        ("widget.setLibrary(None)", "incompatible type"),
        ("zandor.HostEntry('a', 7)", "incompatible type"),
        ("for table in query.Tables: table.Name = 'a'", "read-only"),
    ],
)
def test_a_program_that_is_wrong_is_told(tmp_path, line, complaint):
    errors, _ = check(tmp_path, HEAD + line + "\n")
    assert len(errors) == 1 and complaint in errors[0]


def test_every_class_and_function_has_a_docstring():
    for name in zandor.__all__:
        thing = getattr(zandor, name)
        if callable(thing) and not issubclass(type(thing), EnumMeta):
            assert thing.__doc__, name
