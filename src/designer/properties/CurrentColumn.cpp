#include "designer/properties/CurrentColumn.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"

#include <Zandor/platform/Numbers.h>

#include <QItemSelectionModel>

namespace zandor::designer {

using platform::qt::GridWidget;

CurrentColumn::CurrentColumn(Document& document, DrawingArea& area, QObject* parent)
    : QObject(parent), mDocument(document), mArea(area) {
    // The grid shows it only when control has come back.
    connect(&document, &Document::changed, this, &CurrentColumn::changed, Qt::QueuedConnection);
    connect(&area, &DrawingArea::controlMade, this, &CurrentColumn::watch, Qt::QueuedConnection);
    watch();
}

GridWidget* CurrentColumn::grid() const {
    for (QWidget* part : mArea.control().findChildren<QWidget*>(QStringLiteral("sprColumn")))
        if (auto* found = dynamic_cast<GridWidget*>(part)) return found;
    return nullptr;
}

void CurrentColumn::watch() {
    if (const GridWidget* cells = grid())
        connect(cells->view().selectionModel(), &QItemSelectionModel::currentChanged, this,
                &CurrentColumn::changed, Qt::QueuedConnection);
    emit changed();
}

platform::Ref<model::ColumnDefinition> CurrentColumn::definition() const {
    const GridWidget* const cells = grid();
    if (!cells || mArea.control().OnlyJoin()) return nullptr;
    if (cells->currentCol() >= cells->model().cols()) return nullptr;
    const std::int32_t number = cells->model().columnData(cells->currentCol());
    return number > 0 ? definition(u"x" + platform::decimal(number)) : nullptr;
}

platform::Ref<model::ColumnDefinition>
CurrentColumn::definition(const platform::String& key) const {
    for (const auto& each : platform::Each<TalvikZandorLib::ZDColumnDefinition>(
             mDocument.query()->ColumnDefinitions()))
        if (each->Key() == key) return std::dynamic_pointer_cast<model::ColumnDefinition>(each);
    return nullptr;
}

} // namespace zandor::designer
