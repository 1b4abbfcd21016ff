#include "designer/tables/MissingTables.h"

#include "designer/DrawingArea.h"
#include "designer/database/Database.h"
#include "designer/document/Document.h"

#include <Zandor/model/Names.h>
#include <Zandor/platform/KeyedCollection.h>

namespace zandor::designer {

MissingTables::MissingTables(Document& document, Database& database, DrawingArea& area)
    : QObject(&area), mDocument(document), mDatabase(database), mArea(area) {
    connect(&document, &Document::changed, this, &MissingTables::mark);
    connect(&database, &Database::opened, this, &MissingTables::mark);
    // It gets its tables only then.
    connect(&area, &DrawingArea::controlMade, this, &MissingTables::mark, Qt::QueuedConnection);
}

void MissingTables::mark() {
    QMap<QString, QString> notes;
    const auto isThere = [&](const model::Table& table) {
        return std::ranges::any_of(mDatabase.tables(), [&](const reader::TableEntry& entry) {
            return model::sameName(entry.id.name, table.sourceName()) &&
                   model::sameName(entry.id.schema, table.schema());
        });
    };
    if (mDatabase.isOpen())
        for (const auto& each :
             platform::Each<TalvikZandorLib::ZDTable>(mDocument.query()->Tables())) {
            const auto& table = static_cast<const model::Table&>(*each);
            if (!isThere(table))
                notes[QString::fromStdU16String(table.Name())] =
                    tr("There is no table \"%1\" in %2.")
                        .arg(QString::fromStdU16String(table.sourceName()), mDatabase.name());
        }
    mArea.control().setTableNotes(notes);
}

} // namespace zandor::designer
