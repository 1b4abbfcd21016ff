#include "frontends/qt/CanvasItems.h"

#include "frontends/qt/CanvasAccessible.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/mixed.h"

#include <Zandor/comforts/slantingPieces.h>
#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QFontMetricsF>
#include <QLineF>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace zandor::platform::qt {

namespace {

constexpr int haloWidth = 7; ///< of the shine around a line with the focus, in logical pixels

QPointF pixelPoint(float x, float y) {
    // The rim keeps nonsense coordinates of a host away from integer overflow further down.
    const auto pixel = [](float twips) {
        constexpr float rim = 1 << 20;
        const float pixels = twips / twipsPerPixel;
        return static_cast<qreal>(pixels > -rim ? std::min(pixels, rim) : -rim);
    };
    return {pixel(x), pixel(y)};
}

/// A filled rectangle with a frame within it, both on whole pixels of the device: crisper than an
/// outline across their edges, and a matter of filling twice.
void fillFramed(QPainter& painter, const QRectF& place, qreal frame, const QColor& edge,
                const QColor& filling) {
    const QTransform toDevice = painter.deviceTransform();
    const QTransform back = toDevice.inverted();
    const QRectF outer = toDevice.mapRect(place);
    const QPointF corner(std::round(outer.left()), std::round(outer.top()));
    const QRectF whole(corner, QPointF(std::round(outer.right()), std::round(outer.bottom())));
    const qreal width = std::max(1.0, std::round(frame * std::abs(toDevice.m11())));
    painter.fillRect(back.mapRect(whole), edge);
    painter.fillRect(back.mapRect(whole.adjusted(width, width, -width, -width)), filling);
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
    note();
    mVisible = value;
}

void CanvasItem::setFocused(bool value) {
    if (mFocused == value) return;
    mFocused = value;
    changed();
}

void CanvasItem::changed() {
    note();
    mMeasured = false;
}

void CanvasItem::note() {
    if (!mCanvas || std::exchange(mNoted, true)) return;
    mCanvas->changes(*this);
    mPaintings = 0;
}

const QRegion& CanvasItem::extent() const {
    if (!std::exchange(mMeasured, true)) mExtent = area();
    return mExtent;
}

bool CanvasItem::settle() {
    return isGround() && mVisible && !rests() && ++mPaintings > paintingsToRest;
}

CanvasLine::CanvasLine(Canvas& canvas, QString name, std::int16_t index, const LineEnds& asked)
    : CanvasItem(canvas, std::move(name)), mIndex(index), mAsked(asked) {
    canvas.add(*this);
}

CanvasLine::~CanvasLine() {
    leave();
    if (mAccessible) QAccessible::deleteAccessibleInterface(mAccessible);
}

QAccessibleInterface* CanvasLine::accessible() {
    if (!canvas()) return nullptr;
    if (!mAccessible)
        mAccessible = QAccessible::registerAccessibleInterface(makeAccessible(*this, *canvas()));
    return QAccessible::accessibleInterface(mAccessible);
}

QPointF CanvasLine::at(double share) const {
    return QLineF(QPointF(mX1, mY1), QPointF(mX2, mY2)).pointAt(share);
}

double CanvasLine::distanceTo(QPointF place) const {
    const QPointF way = at(1) - at(0);
    const double square = QPointF::dotProduct(way, way);
    const double share = square > 0 ? QPointF::dotProduct(place - at(0), way) / square : 0;
    return QLineF(place, at(std::clamp(share, 0.0, 1.0))).length();
}

void CanvasLine::setEnds(float X1, float Y1, float X2, float Y2) {
    mEnds = mAsked;
    if (X1 == mX1 && Y1 == mY1 && X2 == mX2 && Y2 == mY2) return;
    mX1 = X1;
    mY1 = Y1;
    mX2 = X2;
    mY2 = Y2;
    changed();
}

void CanvasLine::BorderWidth(std::int16_t value) {
    if (value == mBorderWidth) return;
    mBorderWidth = value;
    changed();
}

QRegion CanvasLine::area() const {
    const QPointF from = pixelPoint(mX1, mY1);
    const QPointF to = pixelPoint(mX2, mY2);
    const qreal margin = (focused() ? haloWidth : mBorderWidth) / 2.0 + 1;
    QRegion region;
    for (const auto& piece : comforts::slantingPieces({from.x(), from.y(), to.x(), to.y()}))
        region += QRectF(QPointF(piece.fromX, piece.fromY), QPointF(piece.toX, piece.toY))
                      .normalized()
                      .adjusted(-margin, -margin, margin, margin)
                      .toAlignedRect();
    for (const Plate& plate : plates())
        region += plate.place.adjusted(-1, -1, 1, 1).toAlignedRect();
    return region;
}

void CanvasLine::Notes(const LineNotes& value) {
    if (value == mNotes) return;
    mNotes = value;
    changed();
}

QFont CanvasLine::plateFont() const {
    QFont font = canvas() ? canvas()->font() : QFont();
    if (font.pointSizeF() > 0)
        font.setPointSizeF(font.pointSizeF() * 0.85);
    else
        font.setPixelSize(std::max(1, font.pixelSize() * 85 / 100));
    return font;
}

std::vector<CanvasLine::Plate> CanvasLine::plates() const {
    if (mNotes.First.empty() && mNotes.Middle.empty() && mNotes.Second.empty()) return {};
    const QLineF line(pixelPoint(mX1, mY1), pixelPoint(mX2, mY2));
    const QFontMetricsF metrics(plateFont());
    std::vector<Plate> all;
    const auto add = [&](const String& note, qreal side) {
        if (note.empty()) return;
        constexpr qreal padding = 4;
        constexpr qreal clear = 6; // of the mark at the end
        const QString text = asSigns(toQt(note));
        const QSizeF size(metrics.horizontalAdvance(text) + 2 * padding, metrics.height() + 1);
        // On a short line the plates stay apart from each other rather than from the ends.
        const qreal way = std::min(line.length() * 0.2, size.width() / 2 + clear);
        const qreal share = line.length() > 0 ? way / line.length() : 0;
        QRectF place({}, size);
        place.moveCenter(line.pointAt(side < 0 ? share : side > 0 ? 1 - share : 0.5));
        all.push_back({text, place});
    };
    add(mNotes.First, -1);
    add(mNotes.Middle, 0);
    add(mNotes.Second, 1);
    qreal together = 0;
    for (const Plate& plate : all) together += plate.place.width();
    if (all.size() < 2 || together < line.length()) return all;
    // A line too short for all of them has them on one.
    String joined;
    for (const Plate& plate : std::exchange(all, {}))
        joined += (joined.empty() ? u"" : u" ") + fromQt(plate.text);
    add(joined, 0);
    return all;
}

void CanvasLine::paintAbove(QPainter& painter, const QPalette& palette) const {
    const auto all = plates();
    if (all.empty()) return;
    const bool highlighted = mBorderWidth > 1 || focused();
    const QColor window = palette.color(QPalette::Window);
    const QColor text = palette.color(QPalette::WindowText);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setFont(plateFont());
    for (const Plate& plate : all) {
        painter.setPen(
            QPen(highlighted ? palette.color(QPalette::Highlight) : mixed(window, text, 0.45), 1));
        painter.setBrush(palette.color(QPalette::Base));
        const QRectF inner = plate.place.adjusted(0.5, 0.5, -0.5, -0.5);
        painter.drawRoundedRect(inner, inner.height() / 2.5, inner.height() / 2.5);
        painter.setPen(palette.color(QPalette::Text));
        painter.drawText(plate.place, Qt::AlignCenter, plate.text);
    }
}

void CanvasLine::paint(QPainter& painter, const QPalette& palette) const {
    const bool highlighted = mBorderWidth > 1 || focused();
    const QColor colour = highlighted ? palette.color(QPalette::Highlight)
                                      : mixed(palette.color(QPalette::Window),
                                              palette.color(QPalette::WindowText), 0.6);
    painter.setRenderHint(QPainter::Antialiasing);
    if (focused()) {
        QColor halo = palette.color(QPalette::Active, QPalette::Highlight);
        halo.setAlphaF(0.35F);
        painter.setPen(QPen(halo, haloWidth, Qt::SolidLine, Qt::FlatCap));
        painter.drawLine(pixelPoint(mX1, mY1), pixelPoint(mX2, mY2));
    }
    painter.setPen(QPen(colour, highlighted ? std::max<qreal>(mBorderWidth, 2) : 1.2, Qt::SolidLine,
                        Qt::FlatCap));
    painter.drawLine(pixelPoint(mX1, mY1), pixelPoint(mX2, mY2));
}

CanvasShape::CanvasShape(Canvas& canvas, QString name) : CanvasItem(canvas, std::move(name)) {
    canvas.add(*this);
}

CanvasShape::~CanvasShape() { leave(); }

void CanvasShape::setBounds(const Bounds& bounds) {
    if (bounds == mBounds) return;
    mBounds = bounds;
    changed();
}

void CanvasShape::ShapeStyle(std::int16_t value) {
    if (value == mStyle) return;
    mStyle = value;
    changed();
}

bool CanvasShape::touches(const CanvasLine& line) const {
    // The line begins on the mark's edge.
    const QRectF box =
        QRectF(mBounds.Left, mBounds.Top, mBounds.Width, mBounds.Height).adjusted(-1, -1, 1, 1);
    return visible() && (box.contains(line.at(0)) || box.contains(line.at(1)));
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
    const QColor outline =
        mixed(palette.color(QPalette::Window), palette.color(QPalette::WindowText), 0.6);
    const QColor focus = palette.color(QPalette::Active, QPalette::Highlight);
    const QColor edge = focused() ? focus : outline;
    const QColor filling = focused() ? focus : palette.color(QPalette::Base);
    constexpr qreal thickness = 1.2;
    painter.setRenderHint(QPainter::Antialiasing, mStyle == shapeCircle);
    if (mStyle != shapeCircle) return fillFramed(painter, box, thickness, edge, filling);
    painter.setPen(QPen(edge, thickness));
    painter.setBrush(filling);
    constexpr qreal inset = thickness / 2;
    painter.drawEllipse(box.adjusted(inset, inset, -inset, -inset));
}

} // namespace zandor::platform::qt
