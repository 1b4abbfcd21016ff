#pragma once

#include <QIcon>
#include <QPolygonF>

namespace zandor::designer {

/// An icon of one shape in the colour of the text beside it, whatever that is at the moment. The
/// shape is given within a square of size 1.
QIcon shapeIcon(const QPolygonF& shape);

} // namespace zandor::designer
