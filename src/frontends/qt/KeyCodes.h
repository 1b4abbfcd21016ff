#pragma once

#include <QEvent>
#include <QPoint>

#include <cstdint>

class QKeyEvent;

namespace zandor::platform::qt {

/// The classic code of a key; 0 for a key that has none.
std::int16_t keyCode(const QKeyEvent& event);

/// The keys that open the context menu where the window system does not say so itself.
bool isMenuKey(const QKeyEvent& event);

/// Return, and Enter on the numeric pad.
bool isEnter(const QKeyEvent& event);

/// Whether the key writes a text rather than giving a command.
bool isTyping(const QKeyEvent& event);

/// The modifiers held, without the mark of the numeric pad's keys.
Qt::KeyboardModifiers modifiersOf(const QKeyEvent& event);

/// The unit step of an arrow key, right and down positive; null for any other key.
QPoint arrowOf(const QKeyEvent& event);

std::int16_t shiftState(Qt::KeyboardModifiers modifiers);

/// 1 left, 2 right, 4 middle, added up.
std::int16_t buttonState(Qt::MouseButtons buttons);

} // namespace zandor::platform::qt
