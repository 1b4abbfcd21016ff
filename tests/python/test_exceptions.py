"""What a model in Python raises is an error of the control's, and never more than that."""

import os
import subprocess
import sys
from pathlib import Path

import pytest
from conftest import settle
from user import LINES, STEPS, User

import zandor
from zandor import TalvikZandorLib

#: Every call of a model that the transcript has.
CALLS = sorted({line.strip() for line in LINES if line.startswith("  ")})


def reported(number, text):
    return f"Error No:\t{number}\nError:\t{text}"


def open_widget(library):
    widget = zandor.ZandorWidget(library)
    widget.setDebugSwitch(0)
    widget.setOnlyJoin(False)
    return widget


def play(application, widget, model):
    """The whole script, as far as a failure leaves its steps to be done."""
    user = User(application, widget, model)
    for step in STEPS:
        user.play(step)
    return user


@pytest.mark.parametrize("call", CALLS)
def test_an_exception_in_a_call_is_error_440_with_its_text(
    application, boxes, library, model, calls, call, capfd
):
    widget = open_widget(library)
    calls.failures[call] = ValueError(f"{call} is not to be had")
    user = play(application, widget, model)
    assert call not in calls.failures, "the call was never made"
    expected = reported(440, f"{call} is not to be had")
    assert boxes.texts and boxes.texts[0].endswith(expected)
    printed = capfd.readouterr()
    assert "Traceback" not in printed.err and call not in printed.out + printed.err
    # The control goes on with a model that works.
    shown = len(boxes.texts)
    widget.setModel(zandor.Query())
    settle()
    assert len(boxes.texts) == shown
    user.window.close()


@pytest.mark.parametrize("call", ["Library.NewZandor", "Library.NewZDJoin"])
def test_an_exception_of_the_library_is_reported(application, boxes, library, model, calls, call):
    calls.failures[call] = ValueError("The library is closed.")
    play(application, open_widget(library), model)
    assert boxes.texts[0].endswith(reported(440, "The library is closed."))


@pytest.mark.parametrize(
    "failure, number, text",
    [
        (zandor.NumberedError(1234, "The host refuses."), 1234, "The host refuses."),
        (zandor.errors.invalidProcedureCall(), 5, "Invalid procedure call or argument"),
        (MemoryError(), 7, "Out of memory"),
        (KeyError("nothing"), 440, "'nothing'"),
        (ValueError(), 440, "ValueError"),
        (KeyboardInterrupt(), 440, "KeyboardInterrupt"),
        (ValueError("größer €𝄞"), 440, "größer €𝄞"),
    ],
)
def test_a_numbered_error_keeps_its_number_and_others_their_text(
    boxes, library, model, calls, failure, number, text
):
    calls.failures["ZDTable.Name"] = failure
    widget = open_widget(library)
    widget.setModel(model)
    assert boxes.texts[0].endswith(reported(number, text))


def test_an_exception_that_cannot_say_what_it_is_goes_by_its_name(boxes, library, model, calls):
    class Mute(Exception):
        def __str__(self):
            raise ValueError("no words")

    calls.failures["ZDTable.Name"] = Mute()
    open_widget(library).setModel(model)
    assert boxes.texts[0].endswith(reported(440, "Mute"))


@pytest.mark.parametrize(
    "attribute, value, number, text",
    [
        ("name", 7, 440, "Table.Name must be a str, not int"),
        ("name", None, 440, "Table.Name must be a str, not NoneType"),
        ("left", "left", 440, "Table.Left must be a number, not str"),
        ("left", 1e20, 6, "Overflow"),
        ("left", float("nan"), 6, "Overflow"),
        ("selected", 40000, 6, "Overflow"),
        ("columns", [], 440, "'list' object has no attribute 'Count'"),
        ("columns", None, 440, "'NoneType' object has no attribute 'Count'"),
    ],
)
def test_a_value_of_another_kind_is_an_error_that_names_it(
    boxes, library, model, attribute, value, number, text
):
    setattr(model.tables.items["tORDERS"], attribute, value)
    open_widget(library).setModel(model)
    assert boxes.texts[0].endswith(reported(number, text))


def test_an_object_that_is_no_table_is_named(boxes, library, model):
    model.tables.items["tORDERS"] = "ORDERS"
    open_widget(library).setModel(model)
    assert boxes.texts[0].endswith(
        reported(440, "Collection.Item must be a zandor.TalvikZandorLib.ZDTable or None, not str")
    )


def test_none_where_an_object_must_be_is_error_91(boxes, library, model):
    model.tables.items["tORDERS"] = None
    open_widget(library).setModel(model)
    assert boxes.texts[0].endswith(reported(91, "Object variable or With block variable not set"))


def test_what_a_model_does_not_have_is_named(boxes, library):
    class Bare(TalvikZandorLib.Zandor):
        pass

    open_widget(library).setModel(Bare())
    assert boxes.texts[0].endswith(reported(440, "'Bare' object has no attribute 'Tables'"))


def test_an_exception_that_goes_through_cpp_comes_back_as_it_was():
    failure = ValueError("mine")

    class Description:
        schema = name = "orders"

        @property
        def columns(self):
            raise failure

    with pytest.raises(ValueError) as raised:
        zandor.Query().addTable(Description())
    assert raised.value is failure and raised.traceback


def test_a_model_that_fails_while_python_ends_does_no_harm(tmp_path):
    program = tmp_path / "ending.py"
    program.write_text(
        "from PyQt6.QtWidgets import QApplication\n"
        "import zandor\n"
        "from host import Calls, HostLibrary, Model\n"
        "application = QApplication([])\n"
        "calls = Calls()\n"
        "model = Model(calls)\n"
        "model.table('ORDERS', ['*', 'ID'], (300, 300, 2400, 2400))\n"
        "widget = zandor.ZandorWidget(HostLibrary(calls))\n"
        "widget.setDebugSwitch(0)\n"
        "widget.setModel(model)\n"
        "widget.show()\n"
        "application.processEvents()\n"
    )
    searched = os.pathsep.join([str(Path(__file__).parent), *filter(None, sys.path)])
    ended = subprocess.run(
        [sys.executable, program], capture_output=True, text=True,
        cwd=tmp_path, env={**os.environ, "PYTHONPATH": searched},
    )  # fmt: skip
    assert (ended.returncode, ended.stdout) == (0, "")
    assert "Traceback" not in ended.stderr
