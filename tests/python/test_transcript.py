"""A host in Python is told what one in C++ is told; HostTranscriptTest.cpp checks the same file."""

from user import LINES, STEPS, User

import zandor


def key(item):
    return item.Key


def connect(widget, told):
    def tell(event, text=lambda *_: ""):
        getattr(widget, event).connect(
            lambda *given: told.append(f"event {event} {text(*given)}".rstrip())
        )

    tell("TableMoved")
    tell("Activate")
    tell("TableDeleted", widget.DeletedTable)
    for event in ("JoinCreated", "JoinModified", "JoinRemoved"):
        tell(event, key)
    for event in ("ColumnCreated", "ColumnModified", "ColumnRemoved"):
        tell(event, key)


def test_the_transcript_is_the_one_of_the_host_in_cpp(application, boxes, library, model, calls):
    widget = zandor.ZandorWidget(library)
    widget.setDebugSwitch(0)
    widget.setOnlyJoin(False)
    told = [line for line in LINES if line.startswith("#")]
    connect(widget, told)
    user = User(application, widget, model)
    calls.told = told
    for step in STEPS:
        told.append("> " + step)
        assert user.play(step), step
    calls.told = None
    assert told == LINES
    assert boxes.texts == []
