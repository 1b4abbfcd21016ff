#pragma once

#include <QEvent>

#include <cstdint>

class QKeyEvent;

namespace platform::qt {

/// The classic code of a key; 0 for a key that has none.
std::int16_t keyCode(const QKeyEvent& event);

std::int16_t shiftState(Qt::KeyboardModifiers modifiers);

/// 1 left, 2 right, 4 middle, added up.
std::int16_t buttonState(Qt::MouseButtons buttons);

} // namespace platform::qt
