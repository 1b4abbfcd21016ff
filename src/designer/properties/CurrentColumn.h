#pragma once

#include <Zandor/Query.h>

#include <QObject>

namespace zandor::platform::qt {
class GridWidget;
}

namespace zandor::designer {

class Document;
class DrawingArea;

/// The output column that the grid is in.
class CurrentColumn final : public QObject {
    Q_OBJECT

public:
    /// Both outlive the object.
    CurrentColumn(Document& document, DrawingArea& area, QObject* parent = nullptr);

    /// Nothing in a blank column, and without a grid.
    platform::Ref<model::ColumnDefinition> definition() const;
    /// Of a key; nothing when the query has it no longer.
    platform::Ref<model::ColumnDefinition> definition(const platform::String& key) const;

signals:
    /// It is another one, or says something else.
    void changed();

private:
    platform::qt::GridWidget* grid() const;
    void watch();

    Document& mDocument;
    DrawingArea& mArea;
};

} // namespace zandor::designer
