#include "designer/database/Address.h"
#include "designer/document/paths.h"
#include "designer/shell/Task.h"
#include "designer/shell/loadForTask.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/sql/Builder.h>

namespace zandor::designer::shell {

using model::sql::Dialect;

namespace {

Dialect dialectFor(const QString& database) {
    const auto address = parseAddress(database);
    if (!address) return Dialect::SQLite;
    switch (address->engine) {
    case Engine::PostgreSQL: return Dialect::PostgreSQL;
    case Engine::MySQL: return Dialect::MySQL;
    case Engine::ODBC: return Dialect::Standard;
    case Engine::SQLite: break;
    }
    return Dialect::SQLite;
}

} // namespace

int printStatement(const Task& task) {
    const auto document = loadForTask(task.query);
    if (!document) return complain(inWords(document.failure())), unusable;
    const Dialect dialect =
        task.dialect ? *task.dialect : dialectFor(QString::fromStdU16String(document->database));
    const auto text = statementText(*document->query, dialect, model::sql::ValueForm::script);
    for (const model::Finding& finding : text.findings) complain(inWords(finding.message));
    // One with something left out would not say what was drawn.
    if (!text.runnable()) return failed;
    return print(QByteArray::fromStdString(platform::toUtf8(text.text)) + '\n');
}

} // namespace zandor::designer::shell
