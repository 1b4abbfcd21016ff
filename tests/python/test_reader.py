"""Readers of databases."""

import sqlite3

import pytest

import zandor


@pytest.fixture
def path(tmp_path):
    path = tmp_path / "trade.sqlite"
    database = sqlite3.connect(path)
    database.executescript(
        "CREATE TABLE customers (id INTEGER PRIMARY KEY, name TEXT NOT NULL);"
        "CREATE TABLE orders (id INTEGER PRIMARY KEY, billed REFERENCES customers (id),"
        " delivered REFERENCES customers (id), total DECIMAL(9, 2), ordered DATE);"
        "CREATE VIEW totals AS SELECT total FROM orders;"
    )
    database.close()
    return path


@pytest.fixture
def database(application, path):
    return zandor.openDatabase(str(path))


def test_tables_are_listed(database):
    assert [(entry.id.name, entry.isView) for entry in database.tables()] == [
        ("customers", False),
        ("orders", False),
        ("totals", True),
    ]
    assert database.dialect() == zandor.Dialect.SQLite
    assert database.answers()


def test_columns_have_their_types(database):
    table = database.table("orders")
    kinds = zandor.ColumnType
    assert table.name == "orders" and [column.name for column in table.columns] == [
        "id", "billed", "delivered", "total", "ordered",
    ]  # fmt: skip
    assert table.columns[0] == zandor.ColumnDescription("id", kinds.Integer, "INTEGER", True)
    assert [column.type for column in table.columns[3:]] == [kinds.Decimal, kinds.Date]
    assert database.table(zandor.TableId("orders")) == table


def test_foreign_keys_are_read(database):
    keys = database.foreignKeys("orders")
    assert {key.columns[0] for key in keys} == {("billed", "id"), ("delivered", "id")}
    assert {key.parent.name for key in keys} == {"customers"}


def test_tables_are_put_into_a_query_with_their_joins(database):
    query = zandor.Query()
    tables, leftOut = database.addTables(query, ["customers", zandor.TableId("orders")], 12000)
    assert [table.Name for table in tables] == ["customers", "orders"]
    assert tables[0] is query.Tables.Item(1) and tables[0].Left >= 0
    assert query.Joins.Item(1).LeftColumn.Name == "billed"
    assert [each.other.columns for each in leftOut] == [[("delivered", "id")]]


def test_on_an_error_the_query_is_as_it_was(database):
    query = zandor.Query()
    with pytest.raises(zandor.DatabaseError) as raised:
        database.addTables(query, ["customers", "nothing"], 12000)
    assert "nothing" in str(raised.value) and len(query.Tables) == 0
    with pytest.raises(TypeError, match="must be a list"):
        database.addTables(query, "customers", 12000)


def test_statements_run_on_the_connection(database):
    from PyQt6.QtSql import QSqlQuery

    rows = QSqlQuery(database.database())
    assert rows.exec("SELECT count(*) FROM orders") and rows.next() and rows.value(0) == 0


def test_a_database_is_only_read(database):
    from PyQt6.QtSql import QSqlQuery

    assert not QSqlQuery(database.database()).exec("DELETE FROM orders")


def test_what_cannot_be_opened_says_what_to_do(application, tmp_path):
    with pytest.raises(zandor.DatabaseError) as raised:
        zandor.openDatabase(str(tmp_path / "none.sqlite"))
    assert str(raised.value).endswith("check the path.") and raised.value.code == "noDatabaseFile"
    with pytest.raises(zandor.DatabaseError):
        zandor.openDatabase("postgresql://nobody@localhost:1/none")


def test_a_database_is_made_by_opening_one():
    with pytest.raises(TypeError):
        zandor.Database()
