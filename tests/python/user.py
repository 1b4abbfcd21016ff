"""The user of transcript.txt, in front of a widget: plays its steps by keys."""

from pathlib import Path

from PyQt6.QtCore import QCoreApplication, QEvent, QObject, QPoint, Qt, QTimer
from PyQt6.QtGui import QContextMenuEvent, QKeySequence
from PyQt6.QtTest import QTest
from PyQt6.QtWidgets import QDialog, QLineEdit, QMenu, QMessageBox, QPushButton, QVBoxLayout, QWidget

from conftest import settle

LINES = (Path(__file__).parent / "transcript.txt").read_text(encoding="utf-8").splitlines()
STEPS = [line[2:] for line in LINES if line.startswith("> ")]


class User(QObject):
    def __init__(self, application, widget, model):
        super().__init__()
        self.widget, self.model = widget, model
        self.choice = None
        application.installEventFilter(self)
        self.window = QWidget()
        column = QVBoxLayout(self.window)
        column.setContentsMargins(0, 0, 0, 0)
        self.before, self.after = QLineEdit(), QLineEdit()
        for part in (self.before, widget, self.after):
            column.addWidget(part)
        self.window.resize(900, 700)
        self.window.show()
        self.window.activateWindow()
        settle()
        self.before.setFocus()

    def eventFilter(self, watched, event):
        if event.type() == QEvent.Type.Show:
            if isinstance(watched, QMenu):
                QTimer.singleShot(0, lambda: self.choose(watched))
            elif isinstance(watched, QDialog) and not isinstance(watched, QMessageBox):
                QTimer.singleShot(0, lambda: self.agree(watched))
        return False

    def agree(self, dialog):
        """As its buttons stand; a dialog that could not be filled in is left."""
        dialog.findChild(QPushButton, "cmdOk").click()
        if dialog.isVisible():
            dialog.reject()

    def choose(self, menu):
        for action in menu.actions():
            if action.objectName() == self.choice and action.isEnabled():
                menu.setActiveAction(action)
                QTest.keyClick(menu, Qt.Key.Key_Return)
                return
        QTest.keyClick(menu, Qt.Key.Key_Escape)

    def focus(self):
        """The name of the part of the widget that has the focus."""
        at = self.window.focusWidget()
        while at is not None and (not at.objectName() or at.objectName().startswith("qt_")):
            at = at.parentWidget()
        return at.objectName() if at is not None else ""

    def press(self, key, modifiers=Qt.KeyboardModifier.NoModifier):
        QTest.keyClick(self.window.focusWidget(), key, modifiers)
        self.calm()

    def calm(self):
        settle()
        if not self.window.isActiveWindow():
            self.window.activateWindow()
            settle()

    def play(self, step):
        verb, _, what = step.partition(" ")
        if verb == "bind":
            self.widget.setModel(self.model)
        elif verb == "tab":
            self.before.setFocus()
            for _ in range(30):
                if self.focus() == what[3:]:
                    break
                self.press(Qt.Key.Key_Tab)
            return self.focus() == what[3:]
        elif verb == "key":
            keys = QKeySequence.fromString(what)[0]
            self.press(keys.key(), keys.keyboardModifiers())
        elif verb == "type":
            QTest.keyClicks(self.window.focusWidget(), what)
        elif verb == "menu":
            self.choice = what
            request = QContextMenuEvent(
                QContextMenuEvent.Reason.Keyboard, QPoint(), self.window.mapToGlobal(QPoint())
            )
            QCoreApplication.sendEvent(self.window.windowHandle(), request)
        elif verb == "current":
            self.widget.SetCurrentTable(what)
        elif verb == "terminate":
            self.widget.Terminate()
        else:
            raise ValueError(f"there is no step {step}")
        self.calm()
        return True
