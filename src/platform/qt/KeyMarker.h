#pragma once

class QColor;
class QPainter;
class QRectF;

namespace platform::qt {

/// Paints the image of a marked column, a key, into a square; crisp at every scale.
void paintKeyMarker(QPainter& painter, const QRectF& square, const QColor& colour);

} // namespace platform::qt
