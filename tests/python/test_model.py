"""The ready-made model."""

import pytest

import zandor
from zandor import TalvikZandorLib, errors
from zandor.TalvikZandorLib import CompareOperator, JoinType, SortOrder


def test_tables_have_the_columns_of_their_description(query):
    orders = query.Tables.Item(2)
    assert (orders.Name, orders.Key, orders.sourceName(), orders.schema()) == ("orders", "t2", "orders", "")
    assert [column.Name for column in orders.Columns] == ["*", "id", "customer", "total"]
    assert [column.Marker for column in orders.Columns] == [False, True, False, False]
    described = orders.Columns.Item(2).description()
    assert described == zandor.ColumnDescription("id", zandor.ColumnType.Integer, "INTEGER", True)


def test_collections_are_walked_and_asked_by_key(query):
    assert len(query.Tables) == query.Tables.Count == 2
    assert "t1" in query.Tables and "t9" not in query.Tables
    assert query.Tables["t1"] is query.Tables.Item(1) is query.Tables.Item("t1")
    assert [table.Key for table in query.Tables] == ["t1", "t2"]
    with pytest.raises(zandor.NumberedError) as raised:
        query.Tables.Item(3)
    assert raised.value.number == 9
    with pytest.raises(zandor.NumberedError) as raised:
        query.Joins.Remove("j9")
    assert (raised.value.number, raised.value.description) == (5, "Invalid procedure call or argument")
    assert str(raised.value) == "Invalid procedure call or argument (error 5)"
    with pytest.raises(zandor.NumberedError) as raised:
        query.Tables.Remove("t1")
    assert raised.value.number == 438
    with pytest.raises(TypeError):
        query.Tables.Item(None)


def test_places_are_twips(query):
    table = query.Tables.Item(1)
    assert (table.Left, table.Top, table.Width, table.Height) == (-1, -1, 0, 0)
    table.Left, table.Top, table.Width, table.Height = 150, 300.4, 2400, 1800.5
    assert (table.Left, table.Top, table.Width, table.Height) == (150, 300, 2400, 1800)
    with pytest.raises(zandor.NumberedError) as raised:
        table.Left = 1e20
    assert raised.value.number == 6
    with pytest.raises(AttributeError):
        table.Name = "other"


def test_joins_name_their_ends(query):
    join = query.Joins.Item(1)
    assert (join.Key, join.LeftTable.Name, join.LeftColumn.Name) == ("j1", "orders", "customer")
    assert (join.RightTable.Name, join.RightColumn.Name) == ("customers", "id")
    join.JoinType = JoinType.LeftOuter
    join.CompareOperator = CompareOperator.LessEquals
    assert join.JoinType == JoinType.LeftOuter and join.CompareOperator == CompareOperator.LessEquals
    for value in (4, -1):
        with pytest.raises(zandor.NumberedError) as raised:
            join.JoinType = value
        assert raised.value.number == 380
    with pytest.raises(zandor.NumberedError) as raised:
        join.LeftTable = None
    assert raised.value.number == 91
    query.DeleteTable(query.Tables["t2"])
    assert join.LeftTable is None and len(query.Joins) == 0


def test_definitions_keep_what_the_grid_shows(query):
    definition = query.ColumnDefinitions.Item(1)
    assert (definition.Key, definition.Column.Name) == ("x1", "orders.total")
    definition.Synonym, definition.SortOrder = "größer €𝄞", SortOrder.Descending
    definition.Visible, definition.Width = False, 1500
    assert definition.Synonym == "größer €𝄞" and definition.SortOrder == 2
    assert definition.Visible is False and definition.Width == 1500
    definition.AddCriterium("> 7", "4")
    assert definition.HasCriterium("4") and not definition.HasCriterium("5")
    assert definition.Criteria["4"].Criterium == "> 7"
    definition.Criteria.Item(1).Criterium = "> 8"
    assert definition.Criteria.Item("4").Criterium == "> 8"
    with pytest.raises(zandor.NumberedError) as raised:
        definition.AddCriterium("> 9", "4")
    assert raised.value.number == 457
    definition.Criteria.Remove("4")
    assert definition.Criteria.Count == 0


def test_half_characters_and_byte_order_marks_come_through(query):
    definition = query.ColumnDefinitions.Item(1)
    for text in ("\ud83d", "\ufeffbegins with a mark", "nul\0within", ""):
        definition.Synonym = text
        assert definition.Synonym == text


def test_definitions_have_an_order(query):
    second = zandor.ColumnDefinition()
    second.Column = query.Tables.Item(1).Columns.Item(3)
    second = query.AddColumnDefinition(second)
    query.StandsBehind(second, None)
    assert [each.Key for each in query.ColumnDefinitions] == ["x2", "x1"]
    with pytest.raises(zandor.NumberedError):
        query.StandsBehind(second, second)


def test_a_table_is_renamed_and_found(query):
    orders = query.tableNamed("ORDERS")
    query.renameTable(orders, "sales")
    assert orders.Name == "sales" and query.tableNamed("orders") is None
    with pytest.raises(zandor.NumberedError) as raised:
        query.renameTable(orders, "customers")
    assert raised.value.number == 457


def test_a_table_without_a_name_is_refused(query):
    with pytest.raises(zandor.NumberedError):
        query.addTable(zandor.TableDescription(""))
    with pytest.raises(TypeError, match="name must be a str, not int"):
        query.addTable(zandor.TableDescription(7))
    with pytest.raises(AttributeError):
        query.addTable("orders")
    assert len(query.Tables) == 2


def test_an_object_of_another_model_is_error_5(query):
    class Foreign(TalvikZandorLib.ZDTable):
        Name = Key = "t1"

    with pytest.raises(zandor.NumberedError) as raised:
        query.DeleteTable(Foreign())
    assert raised.value.number == 5


def test_the_library_makes_empty_objects():
    library = zandor.Library()
    assert isinstance(library.NewZandor(), zandor.Query)
    assert library.NewZDJoin().Key == ""
    assert library.NewZDColumnDefinition().Column is None


def test_an_object_is_initialized_once():
    query = zandor.Query()
    with pytest.raises(TypeError, match="initialized already"):
        query.__init__()


def test_a_class_that_forgets_to_initialize_its_base_is_told(widget):
    class Forgetful(zandor.Query):
        def __init__(self):
            pass

    with pytest.raises(RuntimeError, match="super-class __init__"):
        Forgetful().Tables


def test_errors_are_made_with_their_numbers():
    assert [
        (error.number, type(error))
        for error in (
            errors.invalidProcedureCall(),
            errors.subscriptOutOfRange(),
            errors.objectNotSet(),
            errors.invalidPropertyValue(),
            errors.duplicateKey(),
        )
    ] == [(number, zandor.NumberedError) for number in (5, 9, 91, 380, 457)]


def test_a_list_is_a_collection_by_key():
    class Thing:
        def __init__(self, key):
            self.Key = key

    things = [Thing("a"), Thing("b")]
    collection = TalvikZandorLib.KeyedCollection(things)
    assert collection.Item(2) is collection["b"] is things[1]
    collection.Remove("a")
    assert [each.Key for each in things] == ["b"]
    for call in (lambda: collection.Item(0), lambda: collection.Item("a"), lambda: collection.Remove("a")):
        with pytest.raises(zandor.NumberedError):
            call()


def test_output_columns_have_totals_and_expressions(query):
    definition = zandor.ColumnDefinition()
    definition.Column = query.Tables.Item(2).Columns.Item(4)
    query.AddColumnDefinition(definition)
    assert definition.total == zandor.Total.Nothing
    definition.total = zandor.Total.Sum
    definition.sortPriority = 2
    assert definition.Column.Name == "sum(orders.total)"
    assert isinstance(definition.Column, zandor.OutputName)
    copy = zandor.ColumnDefinition()
    copy.Column = definition.Column
    assert (copy.total, query.AddColumnDefinition(copy).Column.Name) == (zandor.Total.Sum, "sum(orders.total)")
    copy.expression = "orders.total * 2"
    assert (copy.expression, copy.Column.Name) == ("orders.total * 2", "sum(orders.total * 2)")
    text = zandor.statementText(query, zandor.Dialect.SQLite).text
    assert "SUM(orders.total * ?)" in text
    with pytest.raises(TypeError):
        definition.total = 9
    with pytest.raises(zandor.NumberedError) as raised:
        definition.sortPriority = 256
    assert (raised.value.number, definition.sortPriority) == (380, 2)


def test_output_columns_say_how_they_are_shown(query):
    definition = zandor.ColumnDefinition()
    definition.Column = query.Tables.Item(2).Columns.Item(4)
    query.AddColumnDefinition(definition)
    assert (definition.valueFormat, definition.decimals) == (zandor.Format.Nothing, -1)
    definition.valueFormat, definition.decimals = zandor.Format.Thousands, 2
    loaded = zandor.fromJson(zandor.toJson(zandor.QueryDocument(query))).query
    again = loaded.ColumnDefinitions.Item(loaded.ColumnDefinitions.Count)
    assert (again.valueFormat, again.decimals) == (zandor.Format.Thousands, 2)
    with pytest.raises(TypeError):
        definition.valueFormat = 9
    with pytest.raises(zandor.NumberedError) as raised:
        definition.decimals = 16
    assert (raised.value.number, definition.decimals) == (380, 2)


def test_a_query_says_what_it_asks_for_as_a_whole(query):
    assert (query.distinct, query.first, query.description) == (False, 0, "")
    query.distinct, query.first, query.description = True, 10, "Zehn gr\u00f6\u00dfte"
    assert (query.distinct, query.first, query.description) == (True, 10, "Zehn gr\u00f6\u00dfte")
    assert "SELECT DISTINCT" in zandor.statementText(query, zandor.Dialect.SQLite).text
    with pytest.raises(zandor.NumberedError) as raised:
        query.first = -1
    assert (raised.value.number, query.first) == (380, 10)
