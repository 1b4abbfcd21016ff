#include "frontends/qt/Backdrop.h"

#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/OwnPixels.h"

#include <QPainter>

namespace zandor::platform::qt {

namespace {

constexpr int side = 256; ///< of a tile, in logical pixels; whole pixels at each usual scale

QRect tilePlace(QPoint tile) { return {tile * side, QSize(side, side)}; }

int tileAt(int pixel) { return (pixel >= 0 ? pixel : pixel - side + 1) / side; }

/// Calls for each tile that a place is on.
template <class Call>
void eachTile(const QRect& place, const Call& call) {
    for (int y = tileAt(place.top()); y <= tileAt(place.bottom()); ++y)
        for (int x = tileAt(place.left()); x <= tileAt(place.right()); ++x) call(QPoint(x, y));
}

} // namespace

bool Backdrop::worksAt(qreal scale) { return isWhole(side * scale); }

void Backdrop::setLook(const QPalette& palette, qreal scale) {
    if (scale == mScale && hasSameColours(palette, mPalette)) return;
    mPalette = palette;
    mScale = scale;
    mTiles.clear();
}

void Backdrop::forget(const QRegion& place) {
    mTiles.removeIf([&](const auto& tile) { return place.intersects(tilePlace(tile.key())); });
}

void Backdrop::keepAround(const QRect& place) {
    const QRect around = place.adjusted(-side, -side, side, side);
    mTiles.removeIf([&](const auto& tile) { return !around.intersects(tilePlace(tile.key())); });
}

void Backdrop::paint(QPainter& painter, const QRegion& region,
                     const std::vector<CanvasItem*>& items) {
    byRectangles(painter, region, [&](const QRect& part) {
        eachTile(part, [&](QPoint at) {
            const QRect place = tilePlace(at);
            auto kept = mTiles.find(at);
            if (kept == mTiles.end()) kept = mTiles.insert(at, tile(place, items));
            if (kept->isNull())
                painter.fillRect(part & place, mPalette.window());
            else
                painter.drawPixmap(place.topLeft(), *kept);
        });
    });
}

QPixmap Backdrop::tile(const QRect& place, const std::vector<CanvasItem*>& items) const {
    std::vector<const CanvasItem*> here;
    for (const CanvasItem* item : items)
        if (item->rests() && item->visible() && item->extent().intersects(place))
            here.push_back(item);
    if (here.empty()) return {};
    QPixmap picture(place.size() * mScale);
    picture.setDevicePixelRatio(mScale);
    QPainter painter(&picture);
    painter.translate(-place.topLeft());
    painter.fillRect(place, mPalette.window());
    for (const CanvasItem* item : here) item->paint(painter, mPalette);
    return picture;
}

} // namespace zandor::platform::qt
