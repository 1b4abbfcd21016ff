#pragma once

#include <QByteArray>
#include <QImage>
#include <QSize>

class QPainter;
class QRectF;

namespace zandor::designer {

/// What can be taken out of the window: into a file, onto a page, to the clipboard.
class Picture {
public:
    static constexpr int pixelsPerInch = 96; ///< of logical pixels

    virtual ~Picture() = default;

    bool isEmpty() const { return size().isEmpty(); }
    /// Logical pixels; empty when there is nothing to draw.
    virtual QSize size() const = 0;
    /// With so many pixels for a logical one.
    QImage image(qreal scale) const;
    /// As SVG: lines and text, no pixels.
    QByteArray svg() const;
    /// Paints the picture as large as fits into a rectangle, in its middle; as lines and text where
    /// the painter's device keeps them as such.
    void paint(QPainter& painter, const QRectF& into) const;

protected:
    /// Paints it in its own size, background and all.
    virtual void render(QPainter& painter) const = 0;
};

} // namespace zandor::designer
