#include "frontends/qt/Images.h"

#include <QPainter>
#include <QPainterPath>

namespace zandor::platform::qt {

namespace {

/// In a square of 16.
QPainterPath keyOutline() {
    QPainterPath bow;
    bow.addEllipse(QPointF(4.5, 8), 4.3, 4.3);
    QPainterPath hole;
    hole.addEllipse(QPointF(4.2, 8), 1.7, 1.7);
    QPainterPath shaft;
    shaft.addRect(QRectF(7.5, 6.9, 8, 2.2));
    shaft.addRect(QRectF(13.3, 8, 2.2, 4.4));
    shaft.addRect(QRectF(10, 8, 2, 3.2));
    return bow.subtracted(hole).united(shaft);
}

void paintKey(QPainter& painter, const QRectF& square, const QColor& colour) {
    static const QPainterPath outline = keyOutline(); // takes longer to join than to fill
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(square.topLeft());
    painter.scale(square.width() / 16, square.height() / 16);
    painter.fillPath(outline, colour);
    painter.restore();
}

} // namespace

std::optional<Picture> Images::Image(std::int16_t number) const {
    if (number < 1 || static_cast<std::size_t>(number) > mPictures.size()) return {};
    return mPictures[static_cast<std::size_t>(number) - 1];
}

void paintPicture(QPainter& painter, Picture picture, const QRectF& square, const QColor& colour) {
    switch (picture) {
    case Picture::key: return paintKey(painter, square, colour);
    }
}

} // namespace zandor::platform::qt
