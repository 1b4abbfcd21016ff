"""The widget: properties, methods and signals."""

import gc

import pytest
from conftest import settle
from PyQt6.QtCore import QEvent, QPoint, QPointF, Qt
from PyQt6.QtGui import QMouseEvent
from PyQt6.QtWidgets import QAbstractItemView, QApplication, QWidget

import zandor

OBJECTS = {"Zandor", "lastjoin", "activetable", "ActiveColumn"}


def properties(widget):
    meta = widget.metaObject()
    return [meta.property(at) for at in range(meta.propertyOffset(), meta.propertyCount())]


def names(widget):
    return {each.name() for each in properties(widget)}


def test_every_property_of_the_widget_is_there_as_methods(widget):
    assert len(properties(widget)) == 62
    for each in properties(widget):
        name = "model" if each.name() == "Zandor" else each.name()
        assert callable(getattr(widget, name))
        if each.isWritable():
            setter = "setModel" if name == "model" else "set" + name
            assert callable(getattr(widget, setter))


def another(value):
    if isinstance(value, bool):
        return not value
    return value + 1 if isinstance(value, int) else value + " and more"


def test_every_plain_property_is_read_and_written_by_its_methods(widget):
    for name in sorted(names(widget) - OBJECTS):
        before = getattr(widget, name)()
        assert widget.property(name) == before, name
        wanted = another(before)
        getattr(widget, "set" + name)(wanted)
        assert getattr(widget, name)() == wanted, name
        assert widget.setProperty(name, before), name
        assert getattr(widget, name)() == before, name


def test_a_number_beyond_16_bits_is_refused_in_a_box_and_the_property_stays(widget, boxes):
    before = widget.VisibleFrameLeft()
    widget.setVisibleFrameLeft(40000)
    assert widget.VisibleFrameLeft() == before
    assert len(boxes.texts) == 1 and "Error No:\t6" in boxes.texts[0]


def test_a_value_of_another_type_is_a_TypeError(widget):
    with pytest.raises(TypeError):
        widget.setLNGJoinOk(7)
    with pytest.raises(TypeError):
        widget.setModel("a query")


def test_the_model_is_the_very_object_that_was_set(widget, query):
    widget.setModel(query)
    assert widget.model() is query
    assert widget.property("Zandor") is query
    other = zandor.Query()
    assert widget.setProperty("Zandor", other)
    assert widget.model() is other


def test_the_objects_of_the_last_event_are_none(widget, query):
    widget.setModel(query)
    assert widget.lastjoin() is None
    assert widget.activetable() is None
    assert widget.ActiveColumn() is None
    assert widget.property("lastjoin") is None


@pytest.mark.parametrize("name", ["ColumnCreated", "ColumnModified", "ColumnRemoved"])
def test_a_signal_of_a_column_carries_its_definition(widget, query, name):
    definition = query.ColumnDefinitions.Item(1)
    heard = []
    getattr(widget, name).connect(heard.append)
    getattr(widget, name).emit(definition)
    assert heard == [definition] and heard[0] is definition


@pytest.mark.parametrize("name", ["JoinCreated", "JoinModified", "JoinRemoved"])
def test_a_signal_of_a_join_carries_the_join(widget, query, name):
    join = query.Joins.Item(1)
    heard = []
    getattr(widget, name).connect(heard.append)
    getattr(widget, name).emit(join)
    assert heard == [join] and heard[0] is join


@pytest.mark.parametrize(
    "name, arguments",
    [
        ("TableDeleted", ()),
        ("TableMoved", ()),
        ("Activate", ()),
        ("Error", ("It went wrong.", 5)),
        ("upperPaneShareChanged", (0.25,)),
        ("renameRequested", ("t1",)),
    ],
)
def test_a_signal_comes_with_its_arguments(widget, name, arguments):
    heard = []
    getattr(widget, name).connect(lambda *given: heard.append(given))
    getattr(widget, name).emit(*arguments)
    assert heard == [arguments]


def test_every_signal_of_the_widget_is_tried_above(widget):
    meta = widget.metaObject()
    signals = {
        bytes(meta.method(at).name()).decode()
        for at in range(meta.methodOffset(), meta.methodCount())
        if meta.method(at).methodType() == meta.method(at).MethodType.Signal
    }
    assert signals == {
        "TableDeleted", "TableMoved", "Activate", "Error", "upperPaneShareChanged",
        "renameRequested", "ColumnCreated", "ColumnModified", "ColumnRemoved",
        "JoinCreated", "JoinModified", "JoinRemoved",
    }  # fmt: skip


def test_words_are_read_and_set_by_name(widget):
    words = widget.words()
    assert words["None"] == "(None)"
    widget.setWords({"None": "(keine)"})
    assert widget.words() == {**words, "None": "(keine)"}
    with pytest.raises(ValueError, match="there is no word 'Nothing'"):
        widget.setWords({"Nothing": "nichts"})
    with pytest.raises(TypeError):
        widget.setWords({"None": 7})
    assert widget.words()["None"] == "(keine)"
    widget.resetWords()
    assert widget.words() == words


def test_comforts_are_flags(widget):
    flags = widget.comforts()
    assert flags == zandor.Flags()
    flags.ReadsJoins = True
    assert not widget.comforts().ReadsJoins
    widget.setComforts(flags)
    assert widget.comforts().ReadsJoins and not widget.comforts().FitsColumns
    widget.setComforts(zandor.Flags.all())
    assert widget.comforts() == zandor.Flags.all()


def test_notes_and_findings_are_taken(widget, query):
    widget.setModel(query)
    widget.setTableNotes({"customers": "The database has it no more."})
    widget.setFindings([zandor.CellFinding("x1", 4, "This is no number.")])
    query.ColumnDefinitions.Item(1).AddCriterium("> (", "4")
    findings = zandor.validate(query, zandor.Dialect.SQLite)
    assert any(each.row == 4 for each in findings)
    widget.setFindings(findings)
    with pytest.raises(AttributeError):
        widget.setTableNotes(["customers"])
    with pytest.raises(AttributeError):
        widget.setFindings(["x1"])


def test_a_model_that_was_changed_is_shown_anew(widget, query):
    widget.setModel(query)
    widget.show()
    settle()
    definition = zandor.ColumnDefinition()
    definition.Column = query.Tables.Item(1).Columns.Item(3)
    query.AddColumnDefinition(definition)
    assert not widget.showCell("x2", 1)
    widget.showAnew()
    assert widget.showCell("x2", 1)


def test_the_pane_of_the_canvas_has_a_share(widget):
    widget.setUpperPaneShare(0.7)
    assert widget.upperPaneShare() == pytest.approx(0.7, abs=0.01)
    widget.setUpperPaneShare(7)
    assert widget.upperPaneShare() == pytest.approx(0.95)


def test_a_widget_that_is_only_looked_at_says_so(widget):
    assert not widget.isReadOnly()
    widget.setReadOnly(True)
    assert widget.isReadOnly()


def test_a_silent_widget_shows_no_box(widget, boxes):
    widget.setSilent(True)
    widget.setVisibleFrameLeft(40000)
    assert boxes.texts == []


def test_places_of_the_widget_are_places_on_the_canvas(widget):
    twips = widget.toCanvas(QPointF(100, 50))
    assert widget.fromCanvas(twips) == QPoint(100, 50)
    further = widget.toCanvas(QPointF(110, 50)) - twips
    assert (further.x(), further.y()) == (150, 0)


def test_tables_and_columns_are_chosen_by_name(widget, query):
    widget.setModel(query)
    widget.SetCurrentTable("customers")
    widget.SelectColumnNames("customers", "name")
    customers = query.tableNamed("customers")
    assert customers.Columns.Item(3).Selected or customers.Columns.Item(3).activated


def test_what_is_overridden_in_python_is_called(application):
    class Own(zandor.ZandorWidget):
        def showEvent(self, event):
            shown.append(event.type())
            super().showEvent(event)

    shown = []
    own = Own(zandor.Library())
    own.setDebugSwitch(0)
    own.show()
    settle()
    assert len(shown) == 1
    del own
    gc.collect()


def test_columns_of_a_model_in_python_are_marked_as_coming_out(application, boxes, model, library):
    """The control knows the column of a definition by its address among those of the tables."""
    table = model.tables.items["tORDERS"]
    definition = library.NewZDColumnDefinition()
    definition.column = table.columns.items["kTOTAL"]
    model.AddColumnDefinition(definition)
    widget = zandor.ZandorWidget(library)
    widget.setDebugSwitch(0)
    widget.setOnlyJoin(False)
    widget.setComforts(zandor.Flags.all())
    widget.setModel(model)
    settle()
    table = widget.findChild(QWidget, "lstTable(1)")
    at = QPointF(5, 5)
    nothing = Qt.MouseButton.NoButton, Qt.MouseButton.NoButton, Qt.KeyboardModifier.NoModifier
    # The list is there as soon as the mouse is.
    QApplication.sendEvent(table, QMouseEvent(QEvent.Type.MouseMove, at, at, *nothing))
    entries = table.findChild(QAbstractItemView).model()
    role = Qt.ItemDataRole.AccessibleDescriptionRole
    marked = [entries.index(row, 0).data(role) == "comes out" for row in range(4)]
    assert marked == [False, False, False, True]
    assert boxes.texts == []
