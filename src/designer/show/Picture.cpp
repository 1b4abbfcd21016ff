#include "designer/show/Picture.h"

#include <QBuffer>
#include <QPainter>
#include <QSvgGenerator>
#include <QSvgRenderer>

namespace zandor::designer {

QImage Picture::image(qreal scale) const {
    QImage result(size() * scale, QImage::Format_ARGB32_Premultiplied);
    if (result.isNull()) return result;
    result.setDevicePixelRatio(scale);
    QPainter painter(&result);
    render(painter);
    return result;
}

QByteArray Picture::svg() const {
    QByteArray content;
    QBuffer buffer(&content);
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    generator.setResolution(pixelsPerInch);
    generator.setSize(size());
    generator.setViewBox(QRect(QPoint(), size()));
    QPainter painter(&generator);
    render(painter);
    painter.end();
    return content;
}

// Through SVG: widgets count on a device that clips what they paint, and a page does not.
void Picture::paint(QPainter& painter, const QRectF& into) const {
    if (isEmpty() || into.isEmpty()) return;
    QRectF place(QPointF(), QSizeF(size()).scaled(into.size(), Qt::KeepAspectRatio));
    place.moveCenter(into.center());
    QSvgRenderer(svg()).render(&painter, place);
}

} // namespace zandor::designer
