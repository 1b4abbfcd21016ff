#include "designer/tables/SavedQueryCommands.h"

#include "designer/document/Document.h"
#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/paths.h"
#include "designer/statement/ModelWords.h"
#include "designer/tables/TableAdding.h"

#include <Zandor/files/SavedQueries.h>

#include <QFileInfo>

namespace zandor::designer {

SavedQueryCommands::SavedQueryCommands(Document& document, const QueryFile& file,
                                       FileDialogs& dialogs, TableAdding& adding, QObject* parent)
    : QObject(parent), addQuery(tr("Add saved &query\u2026")),
      readAgain(tr("Read saved queries a&gain")), mDocument(document), mFile(file),
      mAdding(adding) {
    addQuery.setObjectName(QStringLiteral("addQuery"));
    readAgain.setObjectName(QStringLiteral("readQueriesAgain"));
    addQuery.setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_Q);
    connect(&addQuery, &QAction::triggered, this, [this, &dialogs] {
        const QString path = dialogs.ask(tr("Add saved query"));
        if (!path.isEmpty()) add(path);
    });
    connect(&readAgain, &QAction::triggered, this, [this] {
        Outcome outcome = read();
        if (!outcome.changed.isEmpty())
            outcome.kept.prepend(
                tr("Read again: %1.").arg(outcome.changed.join(QStringLiteral(", "))));
        if (outcome.kept.isEmpty()) outcome.kept << tr("The saved queries are as they are here.");
        emit noted(outcome.kept.join(u' '));
    });
    connect(&document, &Document::changed, this, &SavedQueryCommands::offer);
    offer();
}

void SavedQueryCommands::add(const QString& path) {
    const auto saved = files::readSavedQuery(pathOf(path), pathOf(mFile.path()));
    if (!saved) {
        emit refused(inWords(saved.failure()));
        return;
    }
    mAdding.addQuery(QFileInfo(path).completeBaseName(), *saved);
}

void SavedQueryCommands::followFiles() {
    const Outcome outcome = read();
    if (!outcome.kept.isEmpty()) emit noted(outcome.kept.join(u' '));
}

SavedQueryCommands::Outcome SavedQueryCommands::read() {
    files::ReadAgain result;
    mDocument.settle();
    mDocument.change(tr("Read saved queries again"), [&](model::Query& query) {
        result = files::readSavedAgain(query, pathOf(mFile.path()));
    });
    Outcome outcome;
    for (const auto& name : result.changed)
        outcome.changed.push_back(QString::fromStdU16String(name));
    for (const auto& error : result.kept) outcome.kept.push_back(inWords(error));
    return outcome;
}

void SavedQueryCommands::offer() {
    bool any = false;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(mDocument.query()->Tables()))
        any = any || static_cast<const model::Table&>(*table).savedQuery();
    readAgain.setEnabled(any);
}

} // namespace zandor::designer
