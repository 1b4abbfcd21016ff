#pragma once

#include "model/Library.h"
#include "platform/qt/ZandorWidget.h"

#include <QByteArray>
#include <QVariantMap>

#include <memory>

class QPainter;

namespace designer {

/// The whole drawing of a query as it is now: its tables and joins, whatever part of them a window
/// shows. Nothing is written into the query. Needs a QApplication.
class DrawingPicture {
public:
    /// `options` are properties of the control by name.
    explicit DrawingPicture(const model::Query& query, const QVariantMap& options = {});
    ~DrawingPicture();

    bool isEmpty() const { return mSize.isEmpty(); }
    /// Logical pixels, 15 twips each; empty for a query without tables.
    QSize size() const { return mSize; }
    /// With so many pixels for a logical one.
    QImage image(qreal scale) const;
    /// As SVG: lines and text, no pixels.
    QByteArray svg() const;
    /// Paints the drawing as large as fits into a rectangle, in its middle; as lines and text where
    /// the painter's device keeps them as such.
    void paint(QPainter& painter, const QRectF& into) const;

private:
    void showWholeRows(model::Query& query);
    void render(QPainter& painter) const;

    model::Library mLibrary;
    std::unique_ptr<ZandorWidget> mControl; ///< never on a screen
    QSize mSize;
};

} // namespace designer
