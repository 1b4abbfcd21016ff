"""Saved queries as tables of other ones."""

import pytest

import zandor


@pytest.fixture
def inner():
    """The ids of orders."""
    query = zandor.Query()
    query.addTable(
        zandor.TableDescription(
            "orders",
            [zandor.ColumnDescription("id", zandor.ColumnType.Integer), zandor.ColumnDescription("name")],
        )
    )
    outputs(query, "orders.id")
    return query


def outputs(query, *names):
    for table, column in (name.split(".") for name in names):
        definition = zandor.ColumnDefinition()
        columns = {each.Name: each for each in query.tableNamed(table).Columns}
        definition.Column = columns[column]
        query.AddColumnDefinition(definition)


def saved(query, tmp_path, name):
    path = tmp_path / name
    zandor.saveQuery(path, zandor.QueryDocument(query))
    return path


def test_a_saved_query_stands_as_a_table(inner, tmp_path):
    path = saved(inner, tmp_path, "ids.json")
    outer = zandor.Query()
    table = outer.addQuery("ids", zandor.readSavedQuery(path))
    assert [column.Name for column in table.Columns] == ["*", "id"]
    assert table.savedQuery().file == str(path)
    assert [each.Name for each in table.savedQuery().query.Tables] == ["orders"]
    assert inner.tableNamed("orders").savedQuery() is None
    assert "AS ids" in zandor.statementText(outer, zandor.Dialect.SQLite).text


def test_a_saved_query_is_made_of_a_query_too(inner):
    kept = zandor.SavedQuery(inner)
    outer = zandor.Query()
    outer.addQuery("ids", kept)
    with pytest.raises(zandor.NumberedError) as raised:
        outer.addQuery("", kept)
    assert raised.value.number == 5
    assert kept.file == ""


def test_a_saved_query_is_read_again(inner, tmp_path):
    path = saved(inner, tmp_path, "ids.json")
    outer = zandor.Query()
    table = outer.addQuery("ids", zandor.readSavedQuery(path))
    outputs(inner, "orders.name")
    saved(inner, tmp_path, "ids.json")
    assert zandor.readSavedAgain(outer) == (["ids"], [])
    assert [column.Name for column in table.Columns] == ["*", "id", "name"]
    path.unlink()
    changed, kept = zandor.readSavedAgain(outer)
    assert changed == [] and "ids.json" in kept[0]
    outer.refreshQuery(table, zandor.SavedQuery(inner))


def test_a_saved_query_never_reads_from_itself(inner, tmp_path):
    path = saved(inner, tmp_path, "ids.json")
    with pytest.raises(zandor.FileError, match="would read from itself"):
        zandor.readSavedQuery(path, path)
