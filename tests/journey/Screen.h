#pragma once

#include "Program.h"

#include <QPoint>
#include <QSize>

/// An X server of one's own without a monitor, and the mouse and the keyboard in front of it.
class Screen {
public:
    /// What the hands have done so far.
    struct Effort {
        int clicks = 0; ///< a double click is two
        int turns = 0;  ///< of the wheel
        int keys = 0;   ///< one for keys that are pressed together
        int letters = 0;
    };

    /// Takes a display number that is free.
    explicit Screen(QSize size = {1366, 900});

    /// "DISPLAY=:7", for programs that are to stand on this screen.
    QString variable() const { return QStringLiteral("DISPLAY=:") + mNumber; }

    /// Whether a window stands on it whose title has this text.
    bool shows(const QString& title);

    void move(QPoint to) { use({"mousemove", number(to.x()), number(to.y())}); }
    const Effort& effort() const { return mEffort; }

    void press(int button) {
        ++mEffort.clicks;
        use({"mousedown", number(button)});
    }
    void release(int button) { use({"mouseup", number(button)}); }
    void click(QPoint at, int button = 1);
    void doubleClick(QPoint at);
    /// Towards oneself, or away; at the place where the mouse is.
    void turnWheel(bool away = false);
    /// "Return", "Escape", "Down"
    void key(const QString& name) {
        ++mEffort.keys;
        use({"key", name});
    }
    void holdKey(const QString& name) { use({"keydown", name}); }
    void letGoOfKey(const QString& name) { use({"keyup", name}); }
    void type(const QString& text) {
        mEffort.letters += static_cast<int>(text.size());
        use({"type", "--delay", "5", text});
    }

private:
    static QString number(int value) { return QString::number(value); }
    void use(const QStringList& words);

    Program mServer;
    QString mNumber;
    Effort mEffort;
};
