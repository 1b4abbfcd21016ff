"""SQL of a query, in the five dialects."""

import sqlite3

import pytest

import zandor
from zandor import Dialect, ValueForm


@pytest.fixture
def asking(query):
    """What customers ordered for more than 7.5, of those whose id is 3."""
    query.ColumnDefinitions.Item(1).AddCriterium("> 7.5", "4")
    definition = zandor.ColumnDefinition()
    definition.Column = query.tableNamed("customers").Columns.Item(2)
    query.AddColumnDefinition(definition).AddCriterium("3", "4")
    return query


def test_the_five_dialects_have_names():
    assert [zandor.dialectName(dialect) for dialect in Dialect] == [
        "SQLite", "PostgreSQL", "MySQL/MariaDB", "SQL Server", "Standard SQL",
    ]  # fmt: skip


@pytest.mark.parametrize(
    "dialect, total",
    [
        (Dialect.SQLite, 7.5),
        (Dialect.PostgreSQL, "7.5"),
        (Dialect.MySQL, "7.5"),
        (Dialect.SqlServer, "7.5"),
        (Dialect.Standard, "7.5"),
    ],
)
def test_bindings_are_values_as_the_engine_takes_them(asking, dialect, total):
    statement = zandor.statementText(asking, dialect)
    assert statement.runnable and not statement.findings
    assert statement.bindings == [total, 3]
    assert [type(value) for value in statement.bindings] == [type(total), int]
    assert statement.text.startswith("SELECT")


def test_values_stand_within_the_statement_when_they_are_asked_for(asking):
    statement = zandor.statementText(asking, Dialect.SQLite, ValueForm.literal, limit=5)
    assert statement.bindings == []
    assert "orders.total > 7.5" in statement.text and "LIMIT 5" in statement.text
    assert "LIMIT" not in zandor.statementText(asking, Dialect.SQLite, limit=None).text
    with pytest.raises(TypeError):
        zandor.statementText(asking, Dialect.SQLite, limit="five")


def test_the_statement_runs_with_its_bindings(asking):
    database = sqlite3.connect(":memory:")
    database.executescript(
        "CREATE TABLE customers (id INTEGER PRIMARY KEY, name);"
        "CREATE TABLE orders (id INTEGER PRIMARY KEY, customer, total);"
        "INSERT INTO customers VALUES (3, 'Ada'), (4, 'Bo');"
        "INSERT INTO orders VALUES (1, 3, 9.0), (2, 3, 7.0), (3, 4, 9.0);"
    )
    statement = zandor.statementText(asking, Dialect.SQLite)
    assert database.execute(statement.text, statement.bindings).fetchall() == [(9.0, 3)]


def test_what_is_to_be_asked_is_a_parameter(query):
    query.ColumnDefinitions.Item(1).AddCriterium("> [least total]", "4")
    [parameter] = zandor.statementText(query, Dialect.SQLite).bindings
    assert parameter == zandor.Parameter("least total", zandor.ColumnType.Decimal, False)


def test_findings_say_what_is_wrong_and_where(query):
    definition = query.ColumnDefinitions.Item(1)
    definition.AddCriterium("> (", "4")
    statement = zandor.statementText(query, Dialect.SQLite)
    assert not statement.runnable
    [finding] = statement.findings
    assert finding.kind == zandor.FindingKind.badCriterion and finding.isError
    assert (finding.definition, finding.row) == ("x1", 4)
    assert finding.text and finding.code
    assert finding in zandor.validate(query, Dialect.SQLite)


def test_an_empty_query_has_no_statement():
    statement = zandor.statementText(zandor.Query(), Dialect.Standard)
    assert statement.text == "" and not statement.runnable
    assert [finding.kind for finding in statement.findings] == [zandor.FindingKind.noTables]


def test_a_model_of_ones_own_has_no_sql(model):
    with pytest.raises(TypeError):
        zandor.statementText(model, Dialect.SQLite)
