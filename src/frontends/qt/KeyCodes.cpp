#include "frontends/qt/KeyCodes.h"

#include <QKeyEvent>

namespace zandor::platform::qt {

std::int16_t keyCode(const QKeyEvent& event) {
    const int key = event.key();
    // Letters, digits and the blank have their character as their code in both worlds.
    if (key == Qt::Key_Space || (key >= Qt::Key_0 && key <= Qt::Key_9) ||
        (key >= Qt::Key_A && key <= Qt::Key_Z))
        return static_cast<std::int16_t>(key);
    if (key >= Qt::Key_F1 && key <= Qt::Key_F12)
        return static_cast<std::int16_t>(112 + key - Qt::Key_F1);
    switch (key) {
    case Qt::Key_Backspace: return 8;
    case Qt::Key_Tab:
    case Qt::Key_Backtab: return 9;
    case Qt::Key_Return:
    case Qt::Key_Enter: return 13;
    case Qt::Key_Escape: return 27;
    case Qt::Key_PageUp: return 33;
    case Qt::Key_PageDown: return 34;
    case Qt::Key_End: return 35;
    case Qt::Key_Home: return 36;
    case Qt::Key_Left: return 37;
    case Qt::Key_Up: return 38;
    case Qt::Key_Right: return 39;
    case Qt::Key_Down: return 40;
    case Qt::Key_Insert: return 45;
    case Qt::Key_Delete: return 46;
    default: return 0;
    }
}

bool isEnter(const QKeyEvent& event) {
    return event.key() == Qt::Key_Return || event.key() == Qt::Key_Enter;
}

bool isTyping(const QKeyEvent& event) {
    // Both together are AltGr.
    const Qt::KeyboardModifiers commands = Qt::ControlModifier | Qt::AltModifier;
    const Qt::KeyboardModifiers held = event.modifiers() & (commands | Qt::MetaModifier);
    return (held == Qt::NoModifier || held == commands) && !event.text().isEmpty() &&
           event.text().at(0).isPrint();
}

bool isMenuKey(const QKeyEvent& event) {
    return event.key() == Qt::Key_F10 && modifiersOf(event) == Qt::ShiftModifier;
}

Qt::KeyboardModifiers modifiersOf(const QKeyEvent& event) {
    return event.modifiers() & ~Qt::KeypadModifier;
}

QPoint arrowOf(const QKeyEvent& event) {
    switch (event.key()) {
    case Qt::Key_Left: return {-1, 0};
    case Qt::Key_Right: return {1, 0};
    case Qt::Key_Up: return {0, -1};
    case Qt::Key_Down: return {0, 1};
    default: return {};
    }
}

std::int16_t shiftState(Qt::KeyboardModifiers modifiers) {
    return static_cast<std::int16_t>((modifiers & Qt::ShiftModifier ? 1 : 0) +
                                     (modifiers & Qt::ControlModifier ? 2 : 0) +
                                     (modifiers & Qt::AltModifier ? 4 : 0));
}

std::int16_t buttonState(Qt::MouseButtons buttons) {
    return static_cast<std::int16_t>((buttons & Qt::LeftButton ? 1 : 0) +
                                     (buttons & Qt::RightButton ? 2 : 0) +
                                     (buttons & Qt::MiddleButton ? 4 : 0));
}

} // namespace zandor::platform::qt
