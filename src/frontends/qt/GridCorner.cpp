#include "frontends/qt/GridCorner.h"

#include "frontends/qt/GridCells.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/ShownText.h"

#include <QStyleOptionHeader>
#include <QStylePainter>

namespace zandor::platform::qt {

GridCorner::GridCorner(const GridModel& model, QWidget* parent) : QWidget(parent), mModel(model) {
    setAutoFillBackground(true);
}

void GridCorner::paintEvent(QPaintEvent*) {
    QStylePainter painter(this);
    QStyleOptionHeader option;
    option.initFrom(this);
    option.state |= QStyle::State_Raised;
    option.orientation = Qt::Horizontal;
    option.position = QStyleOptionHeader::Beginning; // column headers follow
    option.text = asSigns(mModel.text(0, 0));
    option.textAlignment = atTheLeft;
    paintFixedCell(painter, option, *this);
}

} // namespace zandor::platform::qt
