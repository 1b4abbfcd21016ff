#pragma once

#include <QHash>
#include <QPalette>
#include <QPixmap>
#include <QPoint>
#include <QRect>
#include <QRegion>

#include <vector>

class QPainter;

namespace zandor::platform::qt {

class CanvasItem;

/// The ground of the canvas with the items that rest on it, kept as pictures of square tiles, so
/// that what moves over them has none of them painted again. A tile is right or it is not kept.
class Backdrop {
public:
    /// False at a scale at which a tile does not fill whole pixels.
    static bool worksAt(qreal scale);
    /// Nothing kept from before counts in another look.
    void setLook(const QPalette& palette, qreal scale);
    /// What stands there has changed.
    void forget(const QRegion& place);
    /// Lets go of what is further off than a tile.
    void keepAround(const QRect& place);
    /// Paints a region of the canvas, in its coordinates, with those of the items that rest.
    void paint(QPainter& painter, const QRegion& region, const std::vector<CanvasItem*>& items);

private:
    QPixmap tile(const QRect& place, const std::vector<CanvasItem*>& items) const;

    /// By the place among the tiles; without a pixmap where there is only ground.
    QHash<QPoint, QPixmap> mTiles;
    QPalette mPalette;
    qreal mScale = 0;
};

} // namespace zandor::platform::qt
