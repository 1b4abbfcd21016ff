#include "designer/run/shapeIcon.h"

#include <QGuiApplication>
#include <QIconEngine>
#include <QPainter>
#include <QPalette>

namespace zandor::designer {

namespace {

class ShapeEngine final : public QIconEngine {
public:
    explicit ShapeEngine(const QPolygonF& shape) : mShape(shape) {}

    void paint(QPainter* painter, const QRect& place, QIcon::Mode mode, QIcon::State) override {
        const auto group = mode == QIcon::Disabled ? QPalette::Disabled : QPalette::Active;
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->setPen(Qt::NoPen);
        painter->setBrush(QGuiApplication::palette().color(group, QPalette::ButtonText));
        painter->translate(place.topLeft());
        painter->scale(place.width(), place.height());
        painter->drawPolygon(mShape);
        painter->restore();
    }
    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        QPixmap result(size);
        result.fill(Qt::transparent);
        QPainter painter(&result);
        paint(&painter, QRect(QPoint(), size), mode, state);
        return result;
    }
    QIconEngine* clone() const override { return new ShapeEngine(mShape); }

private:
    const QPolygonF mShape;
};

} // namespace

QIcon shapeIcon(const QPolygonF& shape) { return QIcon(new ShapeEngine(shape)); }

} // namespace zandor::designer
