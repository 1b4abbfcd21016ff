"""Queries as files."""

import pytest

import zandor


def test_a_query_is_saved_and_loaded(query, tmp_path):
    document = zandor.QueryDocument(query)
    document.database = "trading.sqlite"
    assert document.query is query
    path = tmp_path / "Größe 𝄞.json"
    zandor.saveQuery(path, document)
    loaded = zandor.loadQuery(str(path))
    assert loaded.database == "trading.sqlite"
    assert zandor.toJson(loaded) == zandor.toJson(document) == path.read_text(encoding="utf-8")
    assert [table.Name for table in loaded.query.Tables] == ["customers", "orders"]


def test_what_a_file_says_beyond_this_version_is_kept(query):
    text = zandor.toJson(zandor.QueryDocument(query)).replace("{", '{"later": [1, 2],', 1)
    assert '"later"' in zandor.toJson(zandor.fromJson(text))
    assert '"later"' in zandor.toJson(zandor.fromJson(text.encode()))


def test_a_text_that_is_no_query_says_where(query):
    with pytest.raises(zandor.FileError) as raised:
        zandor.fromJson("{")
    assert str(raised.value).startswith("Line 1, column 2") and raised.value.code
    assert isinstance(raised.value, zandor.Error)


def test_a_file_that_is_missing_says_so_in_words(tmp_path):
    with pytest.raises(zandor.FileError) as raised:
        zandor.loadQuery(tmp_path / "none.json")
    assert "none.json" in str(raised.value) and "\n" not in str(raised.value)
    assert raised.value.reason == "No such file or directory"


def test_a_folder_that_is_missing_leaves_nothing(query, tmp_path):
    with pytest.raises(zandor.FileError):
        zandor.saveQuery(tmp_path / "none" / "a.json", zandor.QueryDocument(query))
    assert list(tmp_path.iterdir()) == []


def test_half_a_character_is_refused(query):
    query.ColumnDefinitions.Item(1).Synonym = "\ud83d"
    with pytest.raises(zandor.FileError):
        zandor.toJson(zandor.QueryDocument(query))


def test_only_the_ready_made_query_goes_into_a_file(model):
    with pytest.raises(TypeError):
        zandor.QueryDocument(model)
    with pytest.raises(TypeError):
        zandor.saveQuery(7, zandor.QueryDocument())


def test_a_query_of_a_derived_class_goes_into_a_file():
    class Own(zandor.Query):
        pass

    own = Own()
    own.addTable(zandor.TableDescription("orders"))
    assert "orders" in zandor.toJson(zandor.QueryDocument(own))
