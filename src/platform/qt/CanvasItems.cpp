#include "platform/qt/CanvasItems.h"

#include "platform/qt/Twips.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace platform::qt {

namespace {

QPointF pixelPoint(float x, float y) {
    // The rim keeps nonsense coordinates of a host away from integer overflow further down.
    const auto pixel = [](float twips) {
        constexpr float rim = 1 << 20;
        const float pixels = twips / twipsPerPixel;
        return static_cast<qreal>(pixels > -rim ? std::min(pixels, rim) : -rim);
    };
    return {pixel(x), pixel(y)};
}

QColor between(const QColor& one, const QColor& other, qreal share) {
    const auto mix = [share](int a, int b) {
        return static_cast<int>(std::lround(a + (b - a) * share));
    };
    return {mix(one.red(), other.red()), mix(one.green(), other.green()),
            mix(one.blue(), other.blue())};
}

} // namespace

void CanvasItem::leave() {
    if (!mCanvas) return;
    setVisible(false);
    mCanvas->remove(*this);
    mCanvas = nullptr;
}

void CanvasItem::setVisible(bool value) {
    if (mVisible == value) return;
    mVisible = value;
    if (mCanvas) mCanvas->update(mExtent);
}

void CanvasItem::changed(const QRegion& extent) {
    if (mCanvas && mVisible) mCanvas->update(mExtent.united(extent));
    mExtent = extent;
}

CanvasLine::CanvasLine(Canvas& canvas, QString name) : CanvasItem(canvas, std::move(name)) {
    canvas.add(*this);
}

CanvasLine::~CanvasLine() { leave(); }

void CanvasLine::setEnds(float X1, float Y1, float X2, float Y2) {
    if (X1 == mX1 && Y1 == mY1 && X2 == mX2 && Y2 == mY2) return;
    mX1 = X1;
    mY1 = Y1;
    mX2 = X2;
    mY2 = Y2;
    changed(area());
}

void CanvasLine::BorderWidth(std::int16_t value) {
    if (value == mBorderWidth) return;
    mBorderWidth = value;
    changed(area());
}

QRegion CanvasLine::area() const {
    const QPointF from = pixelPoint(mX1, mY1);
    const QPointF way = pixelPoint(mX2, mY2) - from;
    const qreal margin = mBorderWidth / 2.0 + 1;
    // A slanting line in pieces: its bounding box would have the tables beside it painted too.
    const qreal thin = std::min(std::abs(way.x()), std::abs(way.y()));
    const int pieces = std::clamp(static_cast<int>(thin / 32), 1, 16);
    QRegion region;
    for (int i = 0; i < pieces; ++i) {
        const QPointF start = from + way * i / pieces;
        const QPointF end = from + way * (i + 1) / pieces;
        region += QRectF(start, end)
                      .normalized()
                      .adjusted(-margin, -margin, margin, margin)
                      .toAlignedRect();
    }
    return region;
}

void CanvasLine::paint(QPainter& painter, const QPalette& palette) const {
    const bool highlighted = mBorderWidth > 1;
    const QColor colour =
        highlighted ? palette.color(QPalette::Highlight)
                    : between(palette.color(QPalette::Window),
                              palette.color(QPalette::WindowText), 0.6);
    painter.setPen(QPen(colour, highlighted ? mBorderWidth : 1.2, Qt::SolidLine, Qt::FlatCap));
    painter.drawLine(pixelPoint(mX1, mY1), pixelPoint(mX2, mY2));
}

CanvasShape::CanvasShape(Canvas& canvas, QString name) : CanvasItem(canvas, std::move(name)) {
    canvas.add(*this);
}

CanvasShape::~CanvasShape() { leave(); }

void CanvasShape::setBounds(const Bounds& bounds) {
    if (bounds == mBounds) return;
    mBounds = bounds;
    changed(area());
}

void CanvasShape::ShapeStyle(std::int16_t value) {
    if (value == mStyle) return;
    mStyle = value;
    changed(area());
}

QRegion CanvasShape::area() const {
    return QRectF(pixelPoint(mBounds.Left, mBounds.Top),
                  pixelPoint(mBounds.Left + mBounds.Width, mBounds.Top + mBounds.Height))
        .adjusted(-1, -1, 1, 1)
        .toAlignedRect();
}

void CanvasShape::paint(QPainter& painter, const QPalette& palette) const {
    const QRectF box(pixelPoint(mBounds.Left, mBounds.Top),
                     pixelPoint(mBounds.Left + mBounds.Width, mBounds.Top + mBounds.Height));
    const QColor outline = between(palette.color(QPalette::Window),
                                   palette.color(QPalette::WindowText), 0.6);
    painter.setPen(QPen(outline, 1.2));
    painter.setBrush(palette.color(QPalette::Base));
    const QRectF inner = box.adjusted(0.6, 0.6, -0.6, -0.6);
    if (mStyle == shapeCircle)
        painter.drawEllipse(inner);
    else
        painter.drawRect(inner);
}

} // namespace platform::qt
