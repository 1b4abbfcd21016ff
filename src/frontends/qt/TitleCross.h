#pragma once

#include <QAbstractButton>
#include <QColor>

namespace zandor::platform::qt {

class TabuletWidget;

/// The cross in the title bar of a table: a square, on whatever colour.
void paintCross(QPainter& painter, const QRectF& square, const QColor& colour);

/// The button that it is once somebody is about to press it.
class TitleCross : public QAbstractButton {
public:
    explicit TitleCross(TabuletWidget& box);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    TabuletWidget& mBox;
};

} // namespace zandor::platform::qt
