#pragma once

#include "designer/show/Picture.h"

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QVariantMap>

#include <memory>

namespace zandor::designer {

/// The whole drawing of a query as it is now, for a page: its tables and joins, whatever part of
/// them a window shows, on white, without what only a mouse needs and without what is selected.
/// Nothing is written into the query. Needs a QApplication.
class DrawingPicture final : public Picture {
public:
    /// How high the tables are: with all their columns, as far as the canvas reaches (32767 twips),
    /// what stands below moving down; or as they are drawn, ending with a whole row.
    enum class Rows { all, asDrawn };

    /// `options` are properties of the control by name.
    explicit DrawingPicture(const model::Query& query, const QVariantMap& options = {},
                            Rows rows = Rows::all);
    ~DrawingPicture() override;

    /// 15 twips for a logical pixel; empty for a query without tables.
    QSize size() const override { return mSize; }

protected:
    void render(QPainter& painter) const override;

private:
    void bind(const platform::Ref<model::Query>& query);

    model::Library mLibrary;
    std::unique_ptr<ZandorWidget> mControl; ///< never on a screen
    QSize mSize;
};

} // namespace zandor::designer
