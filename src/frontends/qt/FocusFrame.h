#pragma once

#include <QPainter>
#include <QPalette>
#include <QRect>

namespace zandor::platform::qt {

inline constexpr int focusFrameWidth = 2;

/// The frame around whatever has the keyboard's focus, just inside a rectangle.
inline void paintFocusFrame(QPainter& painter, const QRect& place, const QPalette& palette) {
    constexpr int width = focusFrameWidth;
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing, false);
    QPen pen(palette.color(QPalette::Active, QPalette::Highlight), width);
    pen.setJoinStyle(Qt::MiterJoin);
    painter.setPen(pen);
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(place.adjusted(width / 2, width / 2, -width / 2, -width / 2));
    painter.restore();
}

} // namespace zandor::platform::qt
