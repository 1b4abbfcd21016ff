#include "platform/qt/KeyMarker.h"

#include <QPainter>
#include <QPainterPath>

namespace platform::qt {

void paintKeyMarker(QPainter& painter, const QRectF& square, const QColor& colour) {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(square.topLeft());
    painter.scale(square.width() / 16, square.height() / 16);

    QPainterPath bow;
    bow.addEllipse(QPointF(4.5, 8), 4.3, 4.3);
    QPainterPath hole;
    hole.addEllipse(QPointF(4.2, 8), 1.7, 1.7);
    QPainterPath shaft;
    shaft.addRect(QRectF(7.5, 6.9, 8, 2.2));
    shaft.addRect(QRectF(13.3, 8, 2.2, 4.4));
    shaft.addRect(QRectF(10, 8, 2, 3.2));
    painter.fillPath(bow.subtracted(hole).united(shaft), colour);
    painter.restore();
}

} // namespace platform::qt
