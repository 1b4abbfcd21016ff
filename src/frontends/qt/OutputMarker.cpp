#include "frontends/qt/OutputMarker.h"

#include <QPainter>

namespace zandor::platform::qt {

void paintOutputMarker(QPainter& painter, const QRectF& square, const QColor& colour) {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(square.topLeft());
    painter.scale(square.width() / 16, square.height() / 16);
    painter.setPen(QPen(colour, 2.2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPolyline(QPolygonF({{3, 8.5}, {6.5, 12}, {13, 4.5}}));
    painter.restore();
}

} // namespace zandor::platform::qt
