#include "frontends/qt/TitleCross.h"

#include "frontends/qt/TabuletWidget.h"
#include "frontends/qt/mixed.h"

#include <QPainter>

namespace zandor::platform::qt {

void paintCross(QPainter& painter, const QRectF& square, const QColor& colour) {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    const QPointF middle = square.center();
    const qreal arm = square.width() * 0.22;
    painter.setPen(QPen(colour, 1.3, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(middle + QPointF(-arm, -arm), middle + QPointF(arm, arm));
    painter.drawLine(middle + QPointF(-arm, arm), middle + QPointF(arm, -arm));
    painter.restore();
}

TitleCross::TitleCross(TabuletWidget& box) : QAbstractButton(&box), mBox(box) {
    setFocusPolicy(Qt::NoFocus);
    setCursor(Qt::ArrowCursor);
    setAttribute(Qt::WA_Hover);
}

void TitleCross::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const TitleColours colours = mBox.titleColours();
    if (underMouse()) {
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(Qt::NoPen);
        painter.setBrush(mixed(colours.back, colours.text, isDown() ? 0.35 : 0.2));
        painter.drawRoundedRect(rect(), 3, 3);
    }
    paintCross(painter, rect(), colours.text);
}

} // namespace zandor::platform::qt
