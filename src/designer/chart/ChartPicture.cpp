#include "designer/chart/ChartPicture.h"

#include "designer/chart/ChartDrawing.h"

#include <QPainter>

namespace zandor::designer {

void ChartPicture::render(QPainter& painter) const {
    painter.fillRect(QRect(QPoint(), mSize), Qt::white);
    ChartDrawing(mData, ChartLook::ofPage(mFont), mSize).paint(painter);
}

} // namespace zandor::designer
