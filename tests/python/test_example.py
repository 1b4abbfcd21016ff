"""The example, and the page that shows it."""

import os
import re
import sqlite3
import subprocess
import sys
from pathlib import Path

import zandor

ROOT = Path(__file__).resolve().parents[2]
EXAMPLE = ROOT / "examples" / "python" / "designer.py"
PAGE = (ROOT / "docs" / "python.md").read_text(encoding="utf-8")


def run(source, *arguments):
    searched = os.pathsep.join(filter(None, sys.path))
    return subprocess.run(
        [sys.executable, "-c", source, *map(str, arguments)],
        capture_output=True,
        text=True,
        env={**os.environ, "PYTHONPATH": searched},
    )


def test_the_page_shows_the_example():
    assert "```python\n" + EXAMPLE.read_text(encoding="utf-8") + "```" in PAGE


def test_the_example_shows_a_database_and_prints_its_sql(tmp_path):
    path = tmp_path / "trade.sqlite"
    database = sqlite3.connect(path)
    database.executescript(
        "CREATE TABLE customers (id INTEGER PRIMARY KEY, name);"
        "CREATE TABLE orders (id INTEGER PRIMARY KEY, customer REFERENCES customers (id));"
    )
    database.close()
    # The window closes as soon as it is shown.
    closing = "from PyQt6.QtCore import QTimer\nQTimer.singleShot(0, designer.close)\n"
    source = EXAMPLE.read_text(encoding="utf-8").replace("sys.exit(app", closing + "sys.exit(app")
    ended = run(source, path)
    assert ended.returncode == 0, ended.stderr
    assert re.fullmatch(r"SELECT\n.*\nFROM .*JOIN.*", ended.stdout.strip(), re.DOTALL)


def test_a_database_without_tables_is_said_in_one_line(tmp_path):
    path = tmp_path / "empty.sqlite"
    database = sqlite3.connect(path)
    database.execute("PRAGMA user_version = 1")
    database.close()
    ended = run(EXAMPLE.read_text(encoding="utf-8"), path)
    assert ended.returncode == 1 and ended.stdout == ""
    assert f"designer.py: {path} has no tables; name another database.\n" in ended.stderr


def test_a_database_that_is_missing_is_said_in_one_line(tmp_path):
    ended = run(EXAMPLE.read_text(encoding="utf-8"), tmp_path / "none.sqlite")
    assert ended.returncode == 1 and ended.stdout == ""
    lines = [line for line in ended.stderr.splitlines() if "XDG_RUNTIME_DIR" not in line]
    [line] = lines
    assert line.startswith("designer.py: There is no file") and line.endswith("check the path.")


def test_the_model_on_the_page_is_one(boxes, widget):
    [source] = re.findall(r"```python\n(from dataclasses.*?)```", PAGE, re.DOTALL)
    names = {}
    exec(source, names)
    model = names["Report"]()
    widget.setModel(model)
    assert boxes.texts == [] and widget.model() is model
    assert [table.Name for table in model.Tables] == ["orders", "customers"]
    join = names["Link"]()
    join.LeftTable, join.RightTable = model.Tables
    assert model.AddJoin(join).Key == "j1"
    model.DeleteTable(model.Tables.Item("customers"))
    assert len(model.Tables) == 1 and len(model.Joins) == 0
    assert zandor.ZandorWidget(names["ReportLibrary"]()).model() is not None
