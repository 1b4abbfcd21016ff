#pragma once

class QColor;
class QPainter;
class QRectF;

namespace zandor::platform::qt {

/// The tick of a column that comes out in the rows.
void paintOutputMarker(QPainter& painter, const QRectF& square, const QColor& colour);

} // namespace zandor::platform::qt
