#pragma once

#include <QPaintEngine>
#include <QPainter>
#include <QPalette>
#include <QWidget>

#include <cmath>

namespace zandor::platform::qt {

inline bool isWhole(qreal number) { return std::abs(number - std::round(number)) < 1e-4; }

/// Whether what a painter of a widget paints, counted from `origin`, comes to stand on whole pixels
/// of the same size as those of its screen, so that a picture of them does as well. Not so on
/// paper, in a picture of another scale, nor at places between two pixels.
inline bool paintsOwnPixels(const QPainter& painter, const QWidget& widget, QPoint origin = {}) {
    const QPaintEngine* const engine = painter.paintEngine();
    if (!engine || engine->type() != QPaintEngine::Raster) return false;
    const QTransform way = painter.deviceTransform();
    const qreal scale = widget.devicePixelRatioF();
    const QPointF begin = way.map(QPointF(origin));
    return way.type() <= QTransform::TxScale && way.m11() == scale && way.m22() == scale &&
           isWhole(begin.x()) && isWhole(begin.y());
}

/// Whether two palettes paint the same, by the widget's being active or enabled, too.
inline bool hasSameColours(const QPalette& one, const QPalette& other) {
    return one.cacheKey() == other.cacheKey() &&
           one.currentColorGroup() == other.currentColorGroup();
}

/// Paints a region one rectangle at a time, each by a call: where the clip is a single rectangle,
/// pixels are copied; where it is many, they are blended row by row.
template <class Call>
void byRectangles(QPainter& painter, const QRegion& region, const Call& paint) {
    // Between two pixels, rectangles side by side would leave gaps.
    const bool clips = isWhole(painter.deviceTransform().m11()) && region.rectCount() > 1;
    for (const QRect& part : region) {
        if (clips) painter.setClipRect(part);
        paint(part);
    }
    if (clips) painter.setClipping(false);
}

} // namespace zandor::platform::qt
