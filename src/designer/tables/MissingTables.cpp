#include "designer/tables/MissingTables.h"

#include "designer/DrawingArea.h"
#include "designer/database/Database.h"
#include "designer/document/Document.h"

#include <Zandor/model/Names.h>
#include <Zandor/platform/KeyedCollection.h>

#include <QFileInfo>

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
    const auto noteOn = [&](const model::Table& table) -> QString {
        if (const auto& saved = table.savedQuery()) {
            const QString file = QString::fromStdU16String(saved->file);
            if (file.isEmpty() || QFileInfo::exists(file)) return {};
            return tr("There is no file \"%1\" any more; the query is as it was read last.")
                .arg(QFileInfo(file).fileName());
        }
        if (!mDatabase.isOpen() || isThere(table)) return {};
        return tr("There is no table \"%1\" in %2.")
            .arg(QString::fromStdU16String(table.sourceName()), mDatabase.name());
    };
    for (const auto& each : platform::Each<TalvikZandorLib::ZDTable>(mDocument.query()->Tables())) {
        const QString note = noteOn(static_cast<const model::Table&>(*each));
        if (!note.isEmpty()) notes[QString::fromStdU16String(each->Name())] = note;
    }
    mArea.control().setTableNotes(notes);
}

} // namespace zandor::designer
