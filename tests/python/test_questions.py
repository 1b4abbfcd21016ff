"""A host in Python is asked before the user's acts are done, and has entries in the menu."""

import gc
import itertools
import os
import re
import subprocess
import sys
import weakref
from pathlib import Path

import pytest
from conftest import settle
from PyQt6 import sip
from PyQt6.QtCore import Qt
from PyQt6.QtWidgets import QWidget
from test_exceptions import open_widget, play, reported
from user import STEPS, User

import zandor
from host import Calls, HostLibrary, Model
from zandor import HostEntry, MenuSource, NumberedError


class Answers(zandor.Questions):
    """Remembers what it was asked, and says the same to everything."""

    def __init__(self, says=True):
        self.says = says
        self.asked = []
        self.places = []
        self.entries = []

    def answer(self, question):
        self.asked.append(question)
        if isinstance(self.says, BaseException):
            raise self.says
        return self.says

    def MayJoin(self, left, right):
        ends = (f"{end.Table.Name}.{end.Column.Name}" for end in (left, right))
        return self.answer("join " + " to ".join(ends))

    def MayRemoveJoin(self, join):
        return self.answer("remove join " + join.Key)

    def MayCloseTable(self, table):
        return self.answer("close " + table.Name)

    def MayComeOut(self, column):
        return self.answer("come out " + column.Name)

    def MayRemoveColumn(self, definition):
        return self.answer("remove column " + definition.Key)

    def MenuEntries(self, place):
        self.places.append(place)
        return self.entries


#: What the script of transcript.txt asks a host that has nothing against it, in its order.
ASKED = [
    "join ORDERS.ID to CUSTOMERS.ID",
    "come out ID",
    "remove join j1",
    "close CUSTOMERS",
    "remove column x1",
]


def numbers(model):
    return [len(each.items) for each in (model.tables, model.joins, model.definitions)]


@pytest.fixture
def widget(application, library):
    widget = open_widget(library)
    yield widget
    del widget
    gc.collect()


def test_each_act_is_asked_about_and_done(application, boxes, widget, model):
    answers = Answers()
    widget.setQuestions(answers)
    play(application, widget, model)
    assert answers.asked == ASKED
    assert boxes.texts == []


def test_what_is_refused_does_not_happen(application, boxes, widget, model):
    heard = []
    for name in ("JoinCreated", "ColumnCreated", "JoinRemoved", "TableDeleted", "ColumnRemoved"):
        getattr(widget, name).connect(lambda *_, name=name: heard.append(name))
    answers = Answers(False)
    widget.setQuestions(answers)
    play(application, widget, model)
    assert answers.asked == ["join ORDERS.ID to CUSTOMERS.ID", "come out ID", "close CUSTOMERS"]
    assert heard == [] and numbers(model) == [2, 0, 0]
    assert boxes.texts == []


def test_who_gives_no_answers_has_nothing_against_anything(application, boxes, widget, model, calls):
    play(application, widget, model)
    without = list(calls.made)
    again, bare = Calls(), zandor.Questions()
    other = open_widget(HostLibrary(again))
    other.setQuestions(bare)
    copy = Model(again)
    copy.table("ORDERS", ["*", "ID", "CUSTOMER", "TOTAL"], (300, 300, 2400, 2400))
    copy.table("CUSTOMERS", ["*", "ID", "NAME"], (6000, 300, 2400, 2400))
    play(application, other, copy)
    assert numbers(copy) == numbers(model) == [1, 0, 0]
    assert set(without) <= set(again.made)
    assert boxes.texts == []


@pytest.mark.parametrize("nobody", [None, "somebody else"])
def test_only_the_one_who_was_set_last_is_asked(application, boxes, widget, model, nobody):
    answers = Answers(False)
    widget.setQuestions(answers)
    last = None if nobody is None else Answers()
    widget.setQuestions(last)
    play(application, widget, model)
    assert answers.asked == [] and (last is None or last.asked == ASKED)
    assert numbers(model) == [1, 0, 0]


def test_the_objects_in_a_question_are_the_very_ones(application, widget, model, boxes):
    class Same(zandor.Questions):
        def MayCloseTable(self, table):
            closed.append(table)
            return False

    closed = []
    widget.setQuestions(Same())
    user = User(application, widget, model)
    for step in ("bind", "tab to lstTable(2)", "key Delete"):
        user.play(step)
    assert closed == [model.tables.items["tCUSTOMERS"]]
    assert closed[0] is model.tables.items["tCUSTOMERS"]


@pytest.mark.parametrize(
    "failure, arguments, number, text",
    [
        (ValueError, ["The host refuses."], 440, "The host refuses."),
        (NumberedError, [1234, "The host refuses."], 1234, "The host refuses."),
        (KeyboardInterrupt, [], 440, "KeyboardInterrupt"),
        (SystemExit, [3], 440, "3"),
        (MemoryError, [], 7, "Out of memory"),
    ],
)
def test_an_exception_in_an_answer_is_reported_and_refuses(
    application, boxes, widget, model, capfd, failure, arguments, number, text
):
    answers = Answers(failure(*arguments))
    widget.setQuestions(answers)
    play(application, widget, model)
    assert answers.asked == ["join ORDERS.ID to CUSTOMERS.ID", "come out ID", "close CUSTOMERS"]
    assert [each.endswith(reported(number, text)) for each in boxes.texts] == [True] * 3
    assert numbers(model) == [2, 0, 0]
    assert "Traceback" not in capfd.readouterr().err


def test_an_answer_that_was_forgotten_is_named(application, boxes, widget, model):
    widget.setQuestions(Answers(None))
    play(application, widget, model)
    assert boxes.texts[0].endswith(
        reported(440, "Answers.MayJoin must be True or False, not NoneType")
    )
    assert numbers(model) == [2, 0, 0]


@pytest.mark.parametrize("somebody", [7, "Answers", object(), Answers])
def test_only_questions_are_asked(widget, somebody):
    with pytest.raises(TypeError):
        widget.setQuestions(somebody)


def test_who_binds_another_model_before_the_answer_has_refused(
    application, boxes, widget, model, calls
):
    class Elsewhere(zandor.Questions):
        def MayCloseTable(self, table):
            widget.setModel(Model(calls))
            return True

    widget.setQuestions(Elsewhere())
    user = User(application, widget, model)
    for step in ("bind", "tab to lstTable(2)", "key Delete"):
        user.play(step)
    assert numbers(model) == [2, 0, 0]
    assert boxes.texts == []


# The menu


def menu_over_orders(application, widget, model, choice=""):
    user = User(application, widget, model)
    for step in ("bind", "tab to lstTable(1)", "key Down", f"menu {choice}"):
        assert user.play(step)
    return user


def test_the_menu_says_what_it_opens_over(application, boxes, widget, model):
    answers = Answers()
    widget.setQuestions(answers)
    user = menu_over_orders(application, widget, model)
    [place] = answers.places
    orders = model.tables.items["tORDERS"]
    assert place.Source is MenuSource.Table
    assert place.Table is orders and place.Column is orders.columns.items["kID"]
    assert place.Join is None and place.Definition is None and place.Row == -1

    user.play("tab to sprColumn")
    user.play("menu ")
    assert answers.places[1].Source is MenuSource.Grid
    assert answers.places[1].Table is None and answers.places[1].Row >= 0
    assert boxes.texts == []


def test_an_entry_that_is_chosen_is_called(application, boxes, widget, model):
    chosen = []
    answers = Answers()
    answers.entries = (
        HostEntry(text, lambda text=text: chosen.append(text)) for text in ("&First", "&Second")
    )
    widget.setQuestions(answers)
    menu_over_orders(application, widget, model, "mnuHost2")
    assert chosen == ["&Second"] and boxes.texts == []


def test_an_entry_may_be_without_effect(application, boxes, widget, model):
    answers = Answers()
    answers.entries = [HostEntry("Nothing"), HostEntry("-"), HostEntry("Not now", print, False)]
    widget.setQuestions(answers)
    user = menu_over_orders(application, widget, model, "mnuHost1")
    user.play("menu mnuHost3")
    assert len(answers.places) == 2 and boxes.texts == []


def test_an_exception_in_an_entry_is_reported(application, boxes, widget, model):
    def fail():
        raise ValueError("It cannot be copied.")

    answers = Answers()
    answers.entries = [HostEntry("&Copy", fail)]
    widget.setQuestions(answers)
    menu_over_orders(application, widget, model, "mnuHost1")
    assert [each.endswith(reported(440, "It cannot be copied.")) for each in boxes.texts] == [True]


@pytest.mark.parametrize(
    "entries, text",
    [
        (None, "'NoneType' object is not iterable"),
        ([("&Copy", print)], "'tuple' object has no attribute 'Chosen'"),
        ([HostEntry("&Copy", "copy")], "Chosen must be None or something to be called, not str"),
        ([HostEntry(7)], "Caption must be a str, not int"),
    ],
)
def test_entries_of_another_kind_are_named_and_the_menu_opens(
    application, boxes, widget, model, entries, text
):
    answers = Answers()
    answers.entries = entries
    widget.setQuestions(answers)
    menu_over_orders(application, widget, model, "mnuTableDefinitionCopy")
    assert [each.endswith(reported(440, text)) for each in boxes.texts] == [True]


def test_an_entry_may_end_the_widget(application, boxes, widget, model):
    answers = Answers()
    answers.entries = [HostEntry("&End", lambda: sip.delete(widget))]
    widget.setQuestions(answers)
    menu_over_orders(application, widget, model, "mnuHost1")
    assert sip.isdeleted(widget) and boxes.texts == []


def test_an_answer_may_end_the_widget(application, boxes, widget, model):
    class Deadly(zandor.Questions):
        def MayCloseTable(self, table):
            sip.delete(widget)
            return True

    widget.setQuestions(Deadly())
    user = User(application, widget, model)
    user.play("bind")
    widget.findChild(QWidget, "lstTable(2)").setFocus()
    user.press(Qt.Key.Key_Delete)
    assert sip.isdeleted(widget) and numbers(model) == [2, 0, 0]
    assert boxes.texts == []


def test_an_answer_may_ask_somebody_else_from_then_on(application, boxes, widget, model):
    class Retiring(zandor.Questions):
        def MayJoin(self, left, right):
            widget.setQuestions(None)
            gc.collect()
            return False

    widget.setQuestions(Retiring())
    play(application, widget, model)
    assert numbers(model) == [1, 0, 0] and boxes.texts == []


# Who owns what


def an_asked_host(application):
    """A widget that has opened its menu, and whoever has a say in it, by name."""
    calls = Calls()
    model = Model(calls)
    model.table("ORDERS", ["*", "ID"], (300, 300, 2400, 2400))
    widget = open_widget(HostLibrary(calls))
    answers = Answers()

    class Chosen:
        def __call__(self):
            pass

    chosen = Chosen()
    answers.entries = [HostEntry("&Copy", chosen)]
    widget.setQuestions(answers)
    user = menu_over_orders(application, widget, model)
    answers.entries = []
    answers.places.clear()
    # Out of the window, which would keep the widget.
    widget.setParent(None)
    application.removeEventFilter(user)
    user.widget = user.model = None
    sip.delete(user.window)
    return {"widget": widget, "answers": answers, "chosen": chosen, "model": model}


def gone(watched):
    settle()
    gc.collect()
    return [name for name, thing in watched.items() if thing() is not None] == []


@pytest.mark.parametrize("order", itertools.permutations(range(4)))
def test_things_are_let_go_in_any_order(application, boxes, order):
    things = an_asked_host(application)
    names = [list(things)[at] for at in order]
    watched = {name: weakref.ref(thing) for name, thing in things.items()}
    for name in names:
        del things[name]
        gc.collect()
        if "widget" in things:
            assert watched["answers"]() is not None and watched["chosen"]() is not None
            things["widget"].showAnew()
    assert gone(watched)
    assert boxes.texts == []


@pytest.mark.parametrize("part", ["answers", "chosen", "model"])
@pytest.mark.parametrize("back", ["widget", "answers"])
def test_a_circle_is_collected_without_a_word(application, boxes, part, back):
    things = an_asked_host(application)
    things[part].back = things[back]
    watched = {name: weakref.ref(thing) for name, thing in things.items()}
    del things
    assert gone(watched)
    assert boxes.texts == []


def test_whom_two_widgets_ask_is_kept_by_both(application, boxes):
    first, second = an_asked_host(application), an_asked_host(application)
    answers = first.pop("answers")
    second["widget"].setQuestions(answers)
    watched = weakref.ref(answers)
    del answers
    gc.collect()
    first.clear()
    gc.collect()
    assert watched() is not None
    second["widget"].setQuestions(None)
    gc.collect()
    assert watched() is None and boxes.texts == []


def test_an_entry_outlives_nothing_that_it_was_offered_by(application, boxes):
    things = an_asked_host(application)
    chosen = weakref.ref(things.pop("chosen"))
    gc.collect()
    assert chosen() is not None
    things["widget"].setQuestions(None)
    gc.collect()
    assert chosen() is None


def test_a_widget_that_qt_owns_lets_them_go_with_it(application):
    things = an_asked_host(application)
    things["answers"].widget = things["widget"]
    parent = QWidget()
    things["widget"].setParent(parent)
    watched = {name: weakref.ref(thing) for name, thing in things.items()}
    del things
    sip.delete(parent)
    assert gone(watched)


def test_questions_that_are_there_when_python_ends_do_no_harm(tmp_path):
    program = tmp_path / "ending.py"
    program.write_text(
        "from PyQt6.QtWidgets import QApplication\n"
        "import test_questions\n"
        "application = QApplication([])\n"
        "things = test_questions.an_asked_host(application)\n"
        "things['answers'].widget = things['chosen'].widget = things['widget']\n"
        "things['widget'].show()\n"
        "application.processEvents()\n"
        "print(test_questions.zandor.Questions.__name__)\n",
        encoding="utf-8",
    )
    searched = os.pathsep.join([str(Path(__file__).parent), *filter(None, sys.path)])
    ended = subprocess.run(
        [sys.executable, program], capture_output=True, text=True,
        cwd=tmp_path, env={**os.environ, "PYTHONPATH": searched},
    )  # fmt: skip
    assert (ended.returncode, ended.stdout) == (0, "Questions\n")
    assert "Traceback" not in ended.stderr


def test_the_page_shows_questions_that_work(application, boxes, widget, model, capsys):
    page = (Path(__file__).parents[2] / "docs" / "python.md").read_text(encoding="utf-8")
    [source] = re.findall(r"```python\n(import zandor\n\n\nclass Rules.*?)```", page, re.DOTALL)
    shown = {}
    exec(source, shown)
    widget.setQuestions(shown["Rules"]())
    user = menu_over_orders(application, widget, model, "mnuHost1")
    assert capsys.readouterr().out == "a table: ORDERS\n"
    orders, customers = model.tables.items.values()
    orders.columns.items["kID"].marker = customers.columns.items["kID"].marker = True
    for step in STEPS:
        user.play(step)
    assert numbers(model) == [2, 0, 0] and boxes.texts == []
