#include "frontends/windows/toolkit/CanvasItems.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Surroundings.h"

#include <Zandor/comforts/slantingPieces.h>

#include <algorithm>
#include <cmath>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr int haloWidth = 7; ///< of the shine around a line with the focus, in logical pixels

COLORREF outline(const Surroundings& around, double share = 0.6) {
    return mixed(around.ground(), around.ink(), share);
}

} // namespace

CanvasItem::CanvasItem(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index)
    : mCanvas(canvas), mName(String(name) + u'(' + decimal(index) + u')'), mIndex(index) {}

Surroundings& CanvasItem::around() const { return mCanvas->surroundings(); }

const Scale& CanvasItem::scale() const { return around().scale; }

POINT CanvasItem::pixelPoint(float x, float y) const {
    return {scale().toPixels(x), scale().toPixels(y)};
}

bool CanvasItem::focused() const {
    return static_cast<const CanvasItem*>(mCanvas->focusedLine()) == this;
}

void CanvasItem::invalidate() const {
    if (!mVisible || !canvas()) return;
    for (const RECT& place : places()) InvalidateRect(mCanvas->hwnd(), &place, FALSE);
}

void CanvasItem::setVisible(bool value) {
    if (mVisible == value) return;
    invalidate();
    mVisible = value;
    invalidate();
}

void CanvasItem::leave() {
    setVisible(false);
    mCanvas->remove(*this);
}

CanvasLine::CanvasLine(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index)
    : CanvasItem(canvas, name, index) {
    canvas->add(*this);
}

CanvasLine::~CanvasLine() { leave(); }

TalvikTabulet::Point CanvasLine::at(float share) const {
    return {mX1 + share * (mX2 - mX1), mY1 + share * (mY2 - mY1)};
}

float CanvasLine::distanceTo(TalvikTabulet::Point place) const {
    const float x = mX2 - mX1;
    const float y = mY2 - mY1;
    const float square = x * x + y * y;
    const float share = square > 0 ? ((place.X - mX1) * x + (place.Y - mY1) * y) / square : 0;
    const TalvikTabulet::Point nearest = at(std::clamp(share, 0.0F, 1.0F));
    return std::hypot(place.X - nearest.X, place.Y - nearest.Y);
}

void CanvasLine::setEnds(float X1, float Y1, float X2, float Y2) {
    if (X1 == mX1 && Y1 == mY1 && X2 == mX2 && Y2 == mY2) return;
    invalidate();
    mX1 = X1;
    mY1 = Y1;
    mX2 = X2;
    mY2 = Y2;
    invalidate();
}

void CanvasLine::BorderWidth(std::int16_t value) {
    if (value == mBorderWidth) return;
    invalidate();
    mBorderWidth = value;
    invalidate();
}

void CanvasLine::Notes(const LineNotes& value) {
    if (value == mNotes) return;
    invalidate();
    mNotes = value;
    invalidate();
}

RECT CanvasLine::place() const {
    const POINT from = pixelPoint(mX1, mY1);
    const POINT to = pixelPoint(mX2, mY2);
    return {std::min(from.x, to.x), std::min(from.y, to.y), std::max(from.x, to.x) + 1,
            std::max(from.y, to.y) + 1};
}

std::vector<RECT> CanvasLine::places() const {
    const POINT from = pixelPoint(mX1, mY1);
    const POINT to = pixelPoint(mX2, mY2);
    const int margin = scale().pixels(haloWidth) / 2 + 2;
    std::vector<RECT> all;
    for (const auto& piece :
         comforts::slantingPieces({static_cast<double>(from.x), static_cast<double>(from.y),
                                   static_cast<double>(to.x), static_cast<double>(to.y)})) {
        const auto [left, right] = std::minmax(piece.fromX, piece.toX);
        const auto [top, bottom] = std::minmax(piece.fromY, piece.toY);
        all.push_back(
            {std::lround(std::floor(left)) - margin, std::lround(std::floor(top)) - margin,
             std::lround(std::ceil(right)) + margin, std::lround(std::ceil(bottom)) + margin});
    }
    for (const Plate& plate : plates()) all.push_back(within(plate.place, -1, -1, -1, -1));
    return all;
}

HFONT CanvasLine::plateFont() const {
    Surroundings& around = canvas()->surroundings();
    return around.fonts.of(canvas()->font(), Fonts::Face::small);
}

std::vector<CanvasLine::Plate> CanvasLine::plates() const {
    if (!canvas() || (mNotes.First.empty() && mNotes.Middle.empty() && mNotes.Second.empty()))
        return {};
    const POINT from = pixelPoint(mX1, mY1);
    const POINT to = pixelPoint(mX2, mY2);
    const double length = std::hypot(to.x - from.x, to.y - from.y);
    const int padding = scale().pixels(4);
    const int clear = scale().pixels(6); // of the mark at the end
    std::vector<Plate> all;
    const auto add = [&](const String& note, int side) {
        if (note.empty()) return;
        const int width = canvas()->surroundings().fonts.widthOf(plateFont(), note) + 2 * padding;
        const int height = canvas()->surroundings().fonts.heightOf(plateFont()) + 2;
        // On a short line the plates stay apart from each other rather than from the ends.
        const double way = std::min(length * 0.2, width / 2.0 + clear);
        const double nearEnd = length > 0 ? way / length : 0;
        const double share = side < 0 ? nearEnd : side > 0 ? 1 - nearEnd : 0.5;
        const int left = static_cast<int>(from.x + share * (to.x - from.x)) - width / 2;
        const int top = static_cast<int>(from.y + share * (to.y - from.y)) - height / 2;
        all.push_back({note, {left, top, left + width, top + height}});
    };
    add(mNotes.First, -1);
    add(mNotes.Middle, 0);
    add(mNotes.Second, 1);
    int together = 0;
    for (const Plate& plate : all) together += widthOf(plate.place);
    if (all.size() < 2 || together < length) return all;
    // A line too short for all of them has them on one.
    String joined;
    for (const Plate& plate : std::exchange(all, {}))
        joined += (joined.empty() ? u"" : u" ") + plate.text;
    add(joined, 0);
    return all;
}

void CanvasLine::paint(HDC dc) const {
    const bool highlighted = mBorderWidth > 1 || focused();
    const POINT from = pixelPoint(mX1, mY1);
    const POINT to = pixelPoint(mX2, mY2);
    const COLORREF highlight = systemColour(COLOR_HIGHLIGHT);
    if (focused())
        line(dc, from, to, mixed(around().ground(), highlight, 0.35), scale().pixels(haloWidth));
    const int width = highlighted ? std::max<int>(mBorderWidth, 2) : 1;
    line(dc, from, to, highlighted ? highlight : outline(around()), scale().pixels(width));
}

void CanvasLine::paintAbove(HDC dc) const {
    const bool highlighted = mBorderWidth > 1 || focused();
    const COLORREF edge = highlighted ? systemColour(COLOR_HIGHLIGHT) : outline(around(), 0.45);
    for (const Plate& plate : plates()) {
        const HGDIOBJ pen = SelectObject(dc, GetStockObject(DC_PEN));
        const HGDIOBJ brush = SelectObject(dc, GetStockObject(DC_BRUSH));
        SetDCPenColor(dc, edge);
        SetDCBrushColor(dc, systemColour(COLOR_WINDOW));
        const int round = heightOf(plate.place) * 4 / 5;
        RoundRect(dc, plate.place.left, plate.place.top, plate.place.right, plate.place.bottom,
                  round, round);
        SelectObject(dc, pen);
        SelectObject(dc, brush);
        write(dc, plate.text, plate.place, plateFont(), systemColour(COLOR_WINDOWTEXT), DT_CENTER);
    }
}

CanvasShape::CanvasShape(const std::shared_ptr<Canvas>& canvas, StringView name, std::int16_t index)
    : CanvasItem(canvas, name, index) {
    canvas->add(*this);
}

CanvasShape::~CanvasShape() { leave(); }

void CanvasShape::setBounds(const Bounds& bounds) {
    if (bounds == mBounds) return;
    invalidate();
    mBounds = bounds;
    invalidate();
}

void CanvasShape::ShapeStyle(std::int16_t value) {
    if (value == mStyle) return;
    mStyle = value;
    invalidate();
}

std::vector<RECT> CanvasShape::places() const {
    return {within(scale().toPixels(mBounds), -1, -1, -1, -1)};
}

bool CanvasShape::touchesFocus() const {
    const CanvasLine* const focused = canvas() ? canvas()->focusedLine() : nullptr;
    if (!focused) return false;
    // The line begins on the mark's edge.
    const auto holds = [this](TalvikTabulet::Point at) {
        constexpr float reach = 1;
        return at.X >= mBounds.Left - reach && at.X <= mBounds.Left + mBounds.Width + reach &&
               at.Y >= mBounds.Top - reach && at.Y <= mBounds.Top + mBounds.Height + reach;
    };
    return holds(focused->at(0)) || holds(focused->at(1));
}

void CanvasShape::paint(HDC dc) const {
    const bool filled = touchesFocus();
    const RECT box = scale().toPixels(mBounds);
    const COLORREF edge = filled ? systemColour(COLOR_HIGHLIGHT) : outline(around());
    const COLORREF filling = filled ? edge : systemColour(COLOR_WINDOW);
    const HGDIOBJ pen = SelectObject(dc, GetStockObject(DC_PEN));
    const HGDIOBJ brush = SelectObject(dc, GetStockObject(DC_BRUSH));
    SetDCPenColor(dc, edge);
    SetDCBrushColor(dc, filling);
    (mStyle == shapeCircle ? Ellipse : Rectangle)(dc, box.left, box.top, box.right, box.bottom);
    SelectObject(dc, pen);
    SelectObject(dc, brush);
}

} // namespace zandor::platform::windows
