#pragma once

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QByteArray>
#include <QVariantMap>

#include <memory>

class QPainter;

namespace zandor::designer {

/// The whole drawing of a query as it is now, for a page: its tables and joins, whatever part of
/// them a window shows, on white, without what only a mouse needs and without what is selected.
/// Nothing is written into the query. Needs a QApplication.
class DrawingPicture {
public:
    /// How high the tables are: with all their columns, as far as the canvas reaches (32767 twips),
    /// what stands below moving down; or as they are drawn, ending with a whole row.
    enum class Rows { all, asDrawn };

    /// `options` are properties of the control by name.
    explicit DrawingPicture(const model::Query& query, const QVariantMap& options = {},
                            Rows rows = Rows::all);
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
    void bind(const platform::Ref<model::Query>& query);
    void render(QPainter& painter) const;

    model::Library mLibrary;
    std::unique_ptr<ZandorWidget> mControl; ///< never on a screen
    QSize mSize;
};

} // namespace zandor::designer
