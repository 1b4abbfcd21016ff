#include "designer/document/QueryFile.h"

#include "designer/database/Address.h"
#include "designer/document/Document.h"
#include "designer/document/paths.h"

#include <QFileInfo>

namespace designer {

QueryFile::QueryFile(Document& document, QObject* parent) : QObject(parent), mDocument(document) {}

QString QueryFile::name() const {
    return mPath.isEmpty() ? tr("Untitled") : QFileInfo(mPath).fileName();
}

std::optional<QString> QueryFile::databaseAddress() const {
    if (mDatabase.isEmpty()) return {};
    return mDatabase;
}

void QueryFile::setDatabaseAddress(const QString& address) {
    mDatabase = partPassword(address).address;
    emit changed();
}

void QueryFile::startNew() {
    files::QueryDocument empty;
    empty.database = mDatabase.toStdU16String();
    take({}, empty);
}

std::optional<QString> QueryFile::open(const QString& path) {
    const auto content = files::loadQuery(pathOf(path));
    if (!content) return QString::fromStdString(content.error());
    take(QFileInfo(path).absoluteFilePath(), *content);
    return {};
}

std::optional<QString> QueryFile::saveAs(const QString& path) {
    if (const auto error = files::saveQuery(pathOf(path), content()))
        return QString::fromStdString(error->text);
    mPath = QFileInfo(path).absoluteFilePath();
    mDocument.setModified(false);
    emit changed();
    return {};
}

files::QueryDocument QueryFile::content() const {
    mDocument.settle();
    files::QueryDocument content(mDocument.query());
    content.database = mDatabase.toStdU16String();
    content.unknown = mUnknown;
    return content;
}

void QueryFile::recover(const QString& path, const files::QueryDocument& content) {
    take(path, content);
    mDocument.setModified(true);
}

void QueryFile::take(const QString& path, const files::QueryDocument& content) {
    mPath = path;
    // Somebody may have written one into the file.
    mDatabase = partPassword(QString::fromStdU16String(content.database)).address;
    mUnknown = content.unknown;
    mDocument.setQuery(content.query);
    emit changed();
}

} // namespace designer
