#pragma once

#include "Program.h"

#include <QPoint>

/// An X server of one's own without a monitor, and the mouse and the keyboard in front of it.
class Screen {
public:
    /// Takes a display number that is free.
    Screen();

    /// "DISPLAY=:7", for programs that are to stand on this screen.
    QString variable() const { return QStringLiteral("DISPLAY=:") + mNumber; }

    void move(QPoint to) { use({"mousemove", number(to.x()), number(to.y())}); }
    void press(int button) { use({"mousedown", number(button)}); }
    void release(int button) { use({"mouseup", number(button)}); }
    void click(QPoint at, int button = 1);
    void doubleClick(QPoint at);
    /// "Return", "Escape", "Down"
    void key(const QString& name) { use({"key", name}); }
    void holdKey(const QString& name) { use({"keydown", name}); }
    void letGoOfKey(const QString& name) { use({"keyup", name}); }
    void type(const QString& text) { use({"type", "--delay", "5", text}); }

private:
    static QString number(int value) { return QString::number(value); }
    void use(const QStringList& words);

    Program mServer;
    QString mNumber;
};
