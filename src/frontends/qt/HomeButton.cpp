#include "frontends/qt/HomeButton.h"

#include "frontends/qt/FocusFrame.h"

#include <QPainter>
#include <QPainterPath>
#include <QStyleOptionToolButton>
#include <QStylePainter>

#include <algorithm>

namespace zandor::platform::qt {

HomeButton::HomeButton(QWidget* parent) : QToolButton(parent) {
    setFocusPolicy(Qt::ClickFocus);
    setAutoFillBackground(true);
}

void HomeButton::paintEvent(QPaintEvent*) {
    QStylePainter painter(this);
    QStyleOptionToolButton option;
    initStyleOption(&option);
    option.state &= ~QStyle::State_HasFocus; // too small for the style's own frame
    painter.drawComplexControl(QStyle::CC_ToolButton, option);
    if (hasFocus()) paintFocusFrame(painter, rect(), palette());

    // An arrow into the upper left corner.
    const qreal side = std::min({width(), height(), 20}) - 5.0;
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate((width() - side) / 2, (height() - side) / 2);
    QTransform grown;
    grown.scale(side / 10, side / 10);
    painter.setPen(QPen(
        palette().color(isEnabled() ? QPalette::Active : QPalette::Disabled, QPalette::ButtonText),
        1.3, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    QPainterPath arrow;
    arrow.moveTo(9, 9);
    arrow.lineTo(1, 1);
    arrow.moveTo(1, 6);
    arrow.lineTo(1, 1);
    arrow.lineTo(6, 1);
    painter.drawPath(grown.map(arrow));
}

} // namespace zandor::platform::qt
