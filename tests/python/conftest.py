import gc
import os

os.environ.setdefault("QT_QPA_PLATFORM", "offscreen")

import pytest
from PyQt6.QtCore import QEvent, QObject, QTimer
from PyQt6.QtWidgets import QApplication, QMessageBox

import zandor
from host import Calls, HostLibrary, Model


@pytest.fixture(scope="session")
def application():
    return QApplication.instance() or QApplication(["tests"])


def settle():
    for _ in range(3):
        QApplication.processEvents()
        QApplication.sendPostedEvents(None, QEvent.Type.DeferredDelete)


class Boxes(QObject):
    """The message boxes that open: each is read and closed."""

    def __init__(self):
        super().__init__()
        self.texts = []

    def eventFilter(self, watched, event):
        if event.type() == QEvent.Type.Show and isinstance(watched, QMessageBox):
            self.texts.append(watched.text().replace("\r", ""))
            QTimer.singleShot(0, watched.accept)
        return False


@pytest.fixture
def boxes(application):
    boxes = Boxes()
    application.installEventFilter(boxes)
    yield boxes
    application.removeEventFilter(boxes)


@pytest.fixture
def widget(application):
    """The widget over the ready-made library, with the grid and without traces."""
    widget = zandor.ZandorWidget(zandor.Library())
    widget.setDebugSwitch(0)
    widget.setOnlyJoin(False)
    widget.resize(900, 600)
    yield widget
    del widget
    gc.collect()


@pytest.fixture
def query():
    """Customers and orders, joined, with one output column."""
    query = zandor.Query()
    key = zandor.ColumnDescription("id", zandor.ColumnType.Integer, "INTEGER", True)
    customers = query.addTable(
        zandor.TableDescription("customers", [key, zandor.ColumnDescription("name")])
    )
    orders = query.addTable(
        zandor.TableDescription(
            "orders",
            [
                key,
                zandor.ColumnDescription("customer", zandor.ColumnType.Integer),
                zandor.ColumnDescription("total", zandor.ColumnType.Decimal),
            ],
        )
    )
    join = zandor.Join()
    join.LeftColumn = orders.Columns.Item(3)
    join.RightColumn = customers.Columns.Item(2)
    query.AddJoin(join)
    definition = zandor.ColumnDefinition()
    definition.Column = orders.Columns.Item(4)
    query.AddColumnDefinition(definition)
    return query


@pytest.fixture
def calls():
    return Calls()


@pytest.fixture
def model(calls):
    """ORDERS and CUSTOMERS as a host has them."""
    model = Model(calls)
    model.table("ORDERS", ["*", "ID", "CUSTOMER", "TOTAL"], (300, 300, 2400, 2400))
    model.table("CUSTOMERS", ["*", "ID", "NAME"], (6000, 300, 2400, 2400))
    return model


@pytest.fixture
def library(calls):
    return HostLibrary(calls)
