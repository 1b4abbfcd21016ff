"""Who makes the model's objects: at first, and later."""

import gc
import weakref

import pytest
from conftest import settle
from PyQt6 import uic
from PyQt6.QtWidgets import QWidget
from test_exceptions import open_widget, play

import zandor
from host import Calls, HostLibrary, Join


def test_a_widget_that_is_made_without_a_library_has_the_ready_made_one(application, boxes, query):
    parent = QWidget()
    for widget in (zandor.ZandorWidget(), zandor.ZandorWidget(None), zandor.ZandorWidget(parent)):
        widget.setDebugSwitch(0)
        assert isinstance(widget.model(), zandor.Query)
        widget.setModel(query)
        assert widget.model() is query
    assert widget.parent() is parent
    assert boxes.texts == []


def test_a_library_that_is_set_later_makes_what_is_new(application, boxes, model, library, calls):
    widget = open_widget(zandor.Library())
    widget.setLibrary(library)
    play(application, widget, model)
    assert calls.made.count("Library.NewZDJoin") == 1
    assert calls.made.count("Library.NewZDColumnDefinition") == 1
    assert boxes.texts == []


def test_the_model_that_is_there_stays(application, query, library):
    widget = zandor.ZandorWidget()
    widget.setDebugSwitch(0)
    widget.setModel(query)
    widget.setLibrary(library)
    assert widget.model() is query


@pytest.mark.parametrize("other", [None, 7, zandor.Query(), HostLibrary])
def test_only_a_library_is_taken(widget, other):
    with pytest.raises(TypeError):
        widget.setLibrary(other)


def test_the_widget_keeps_the_library_of_the_moment_and_no_other(application, boxes):
    first, second = HostLibrary(Calls()), HostLibrary(Calls())
    watched = [weakref.ref(first), weakref.ref(second)]
    widget = open_widget(first)
    del first
    widget.setLibrary(second)
    del second
    gc.collect()
    assert watched[0]() is None and watched[1]() is not None
    widget.showAnew()
    del widget
    gc.collect()
    assert watched[1]() is None
    assert boxes.texts == []


def test_a_circle_through_a_library_that_was_set_later_is_collected(application, boxes):
    library, widget = HostLibrary(Calls()), zandor.ZandorWidget()
    widget.setDebugSwitch(0)
    library.widget = widget
    widget.setLibrary(library)
    watched = [weakref.ref(library), weakref.ref(widget)]
    del library, widget
    gc.collect()
    assert [each() for each in watched] == [None, None]
    assert boxes.texts == []


def test_a_library_may_be_replaced_while_it_works(application, boxes, model, calls):
    class Retiring(HostLibrary):
        def NewZDJoin(self):
            widget.setLibrary(HostLibrary(calls))
            gc.collect()
            return Join(self.calls)

    widget = open_widget(zandor.Library())
    widget.setLibrary(Retiring(calls))
    play(application, widget, model)
    assert calls.made.count("Library.NewZDColumnDefinition") == 1
    assert boxes.texts == []


FORM = """<?xml version="1.0" encoding="UTF-8"?>
<ui version="4.0">
 <class>Form</class>
 <widget class="QWidget" name="Form">
  <layout class="QVBoxLayout" name="column">
   <item>
    <widget class="ZandorWidget" name="designer">
     <property name="DebugSwitch"><number>0</number></property>
     <property name="OnlyJoin"><bool>false</bool></property>
     <property name="LNGJoinOk"><string>Take it</string></property>
    </widget>
   </item>
  </layout>
 </widget>
 <customwidgets>
  <customwidget>
   <class>ZandorWidget</class>
   <extends>QWidget</extends>
   <header>zandor</header>
  </customwidget>
 </customwidgets>
</ui>
"""


def test_a_form_has_the_widget(application, boxes, tmp_path, model, library):
    path = tmp_path / "form.ui"
    path.write_text(FORM, encoding="utf-8")
    form = uic.loadUi(str(path))
    designer = form.designer
    assert isinstance(designer, zandor.ZandorWidget)
    assert designer.DebugSwitch() == 0 and not designer.OnlyJoin()
    assert designer.LNGJoinOk() == "Take it"
    designer.setLibrary(library)
    designer.setModel(model)
    form.show()
    settle()
    assert designer.model() is model
    assert boxes.texts == []
