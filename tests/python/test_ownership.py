"""An object lives as long as Python or C++ needs it, whatever is collected when."""

import gc
import itertools
import weakref

import pytest
from conftest import settle
from PyQt6 import sip
from PyQt6.QtWidgets import QWidget

import zandor
from host import Calls, HostLibrary, Model


@pytest.fixture(autouse=True, scope="module")
def collecting_is_quick():
    """What is there before is not looked at by each collection."""
    gc.collect()
    gc.freeze()
    yield
    gc.unfreeze()


def a_host():
    """A widget with a model in Python and all that belongs to it, by name."""
    calls = Calls()
    model = Model(calls)
    table = model.table("ORDERS", ["*", "ID"], (300, 300, 2400, 2400))
    library = HostLibrary(calls)
    widget = zandor.ZandorWidget(library)
    widget.setDebugSwitch(0)
    widget.setModel(model)
    column = table.columns.items["kID"]
    return {
        "widget": widget,
        "library": library,
        "model": model,
        "table": table,
        "column": column,
    }


def a_ready_made_query():
    query = zandor.Query()
    table = query.addTable(zandor.TableDescription("orders", [zandor.ColumnDescription("id")]))
    definition = zandor.ColumnDefinition()
    definition.Column = table.Columns.Item(2)
    definition = query.AddColumnDefinition(definition)
    widget = zandor.ZandorWidget(zandor.Library())
    widget.setDebugSwitch(0)
    widget.setModel(query)
    return {
        "widget": widget,
        "query": query,
        "tables": query.Tables,
        "column": table.Columns.Item(2),
        "definition": definition,
    }


def use(name, thing):
    """Everything that is still held answers."""
    if name == "widget":
        thing.showAnew()
        assert thing.model() is not None
    elif name in ("model", "query"):
        assert thing.Tables.Count == 1
    elif name == "tables":
        assert thing.Item(1).Name == "orders"
    elif name == "definition":
        assert thing.Key == "x1"
    elif name in ("table", "column"):
        assert thing.Name
    elif name == "library":
        assert thing.NewZDJoin() is not None


@pytest.mark.parametrize("make", [a_host, a_ready_made_query])
@pytest.mark.parametrize("order", itertools.permutations(range(5)))
def test_things_are_let_go_in_any_order(application, boxes, make, order):
    things = make()
    names = [list(things)[at] for at in order]
    watched = {name: weakref.ref(thing) for name, thing in things.items()}
    for name in names:
        del things[name]
        gc.collect()
        for other in things:
            use(other, things[other])
    settle()
    gc.collect()
    assert [name for name, thing in watched.items() if thing() is not None] == []
    assert boxes.texts == []


def test_a_widget_keeps_its_model_and_its_library(application, boxes):
    things = a_host()
    widget = things["widget"]
    model, library = weakref.ref(things["model"]), weakref.ref(things["library"])
    del things
    gc.collect()
    assert widget.model() is model() and library() is not None
    widget.showAnew()
    widget.setModel(zandor.Query())
    gc.collect()
    assert model() is None and library() is not None
    del widget
    gc.collect()
    assert library() is None
    assert boxes.texts == []


def test_a_widget_that_qt_owns_keeps_them_too(application, boxes):
    parent = QWidget()
    things = a_host()
    things["widget"].setParent(parent)
    model, library = weakref.ref(things["model"]), weakref.ref(things["library"])
    del things
    gc.collect()
    [widget] = parent.findChildren(zandor.ZandorWidget)
    assert widget.model() is model()
    sip.delete(parent)
    gc.collect()
    assert sip.isdeleted(widget)
    del widget
    gc.collect()
    assert model() is None and library() is None


def test_a_deleted_widget_says_so(application):
    widget = a_host()["widget"]
    sip.delete(widget)
    with pytest.raises(RuntimeError, match="has been deleted"):
        widget.model()


def test_a_widget_may_go_in_a_slot_of_its_own_signal(application, boxes):
    things = a_host()
    widget = things.pop("widget")
    widget.setOnlyJoin(False)
    widget.show()
    heard = []
    widget.TableDeleted.connect(lambda: (heard.append(1), sip.delete(widget)))
    settle()
    from PyQt6.QtCore import Qt
    from PyQt6.QtTest import QTest

    table = widget.findChild(QWidget, "lstTable(1)")
    table.setFocus()
    QTest.keyClick(widget.focusWidget(), Qt.Key.Key_Delete)
    settle()
    assert heard == [1] and sip.isdeleted(widget)
    assert boxes.texts == []


def test_a_widget_may_go_in_a_call_of_its_model(application, boxes):
    things = a_host()
    widget, model = things.pop("widget"), things["model"]

    class Deadly(Model):
        @property
        def Tables(self):
            sip.delete(widget)
            return self.tables

    deadly = Deadly(model.calls)
    widget.setModel(deadly)
    assert sip.isdeleted(widget)
    assert boxes.texts == []


def test_a_circle_through_the_widget_is_collected(application, boxes):
    things = a_host()
    model = things["model"]
    model.widget = things["widget"]
    watched = [weakref.ref(things["widget"]), weakref.ref(model)]
    del things, model
    gc.collect()
    assert [each() for each in watched] == [None, None]
    assert boxes.texts == []


@pytest.mark.parametrize("parts", [["model"], ["library"], ["model", "library"]])
def test_a_circle_is_collected_without_a_word(application, boxes, parts):
    """The control takes its leave of a model and a library that are whole."""
    things = a_host()
    parent = QWidget()
    things["widget"].setParent(parent)
    for part in parts:
        things[part].parent = parent
        things[part].widget = things["widget"]
    watched = [weakref.ref(thing) for thing in things.values()]
    del things, parent
    gc.collect()
    assert [each() for each in watched if each() is not None] == []
    assert boxes.texts == []


def test_a_part_of_a_query_outlives_it(application):
    query = zandor.Query()
    table = query.addTable(zandor.TableDescription("orders", [zandor.ColumnDescription("id")]))
    tables, column = query.Tables, table.Columns.Item(2)
    del query, table
    gc.collect()
    assert tables.Item(1).Name == "orders" and column.Name == "id"


def test_a_wrapper_is_the_same_as_long_as_it_is_held():
    query = zandor.Query()
    query.addTable(zandor.TableDescription("orders"))
    table = query.Tables.Item(1)
    assert query.Tables.Item(1) is table and {table: 1}[query.Tables["t1"]] == 1


def test_the_query_goes_when_nobody_holds_it(application):
    def memory():
        with open("/proc/self/statm", encoding="ascii") as file:
            return int(file.read().split()[1])

    columns = [zandor.ColumnDescription("column %d" % at) for at in range(1000)]

    def come_and_go(times):
        for _ in range(times):
            zandor.Query().addTable(zandor.TableDescription("wide", columns))
        gc.collect()

    come_and_go(3)
    before = memory()
    come_and_go(20)
    assert memory() - before < 500  # pages
