#include "designer/properties/TotalCommands.h"

#include "designer/document/Document.h"
#include "designer/properties/fields.h"
#include "designer/properties/totals.h"

#include <Zandor/qt/Text.h>

#include <QActionGroup>

namespace zandor::designer {

using model::Total;

TotalCommands::TotalCommands(Document& document, CurrentColumn& column, QWidget* parent)
    : QObject(parent), mDocument(document), mColumn(column),
      mMenu(new QMenu(tr("&Total"), parent)) {
    mMenu->setObjectName(QStringLiteral("totalMenu"));
    auto* const group = new QActionGroup(mMenu);
    for (const Total total : allTotals()) {
        QAction* const action = group->addAction(mMenu->addAction(nameOf(total)));
        action->setObjectName(QStringLiteral("total%1").arg(static_cast<int>(total)));
        action->setData(static_cast<int>(total));
        action->setCheckable(true);
        connect(action, &QAction::triggered, this, [this, total] {
            if (const auto definition = mColumn.definition()) setTotal(definition->Key(), total);
        });
        if (total == Total::None) mMenu->addSeparator();
    }
    connect(&mColumn, &CurrentColumn::changed, this, &TotalCommands::follow);
    follow();
}

void TotalCommands::follow() {
    const auto definition = mColumn.definition();
    mMenu->setEnabled(definition != nullptr);
    for (QAction* action : mMenu->actions()) {
        if (action->isSeparator()) continue;
        const auto total = static_cast<Total>(action->data().toInt());
        action->setEnabled(definition && model::suits(total, typeOf(*definition)));
        action->setChecked(definition && definition->total() == total);
    }
}

std::vector<TalvikDBxZandor::HostEntry>
TotalCommands::entries(const platform::Ref<model::ColumnDefinition>& definition) {
    std::vector<TalvikDBxZandor::HostEntry> result;
    if (!definition) return result;
    for (const Total total : allTotals()) {
        // The rarer ones are in the panel of the column.
        if (total == Total::Group || total == Total::Condition || total == definition->total())
            continue;
        if (!model::suits(total, typeOf(*definition))) continue;
        result.push_back({platform::qt::fromQt(nameOf(total)),
                          [this, key = definition->Key(), total] { setTotal(key, total); }});
    }
    return result;
}

void TotalCommands::setTotal(const platform::String& key, Total total) {
    if (!mColumn.definition(key)) return;
    mDocument.change({}, [&](model::Query&) { mColumn.definition(key)->total(total); });
}

} // namespace zandor::designer
