#include "designer/document/QueryFile.h"

#include "designer/database/Address.h"
#include "designer/document/Document.h"
#include "designer/document/paths.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/files/Replacement.h>

#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QFileInfo>

namespace zandor::designer {

namespace {

QByteArray digest(const QByteArray& content) {
    return QCryptographicHash::hash(content, QCryptographicHash::Sha1);
}

/// Empty when there is no such file, or it cannot be read.
QByteArray digestOf(const QString& path) {
    QFile file(path);
    QCryptographicHash hash(QCryptographicHash::Sha1);
    // A pipe would wait for its writer.
    if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly) || !hash.addData(&file))
        return {};
    return hash.result();
}

} // namespace

QueryFile::QueryFile(Document& document, QObject* parent) : QObject(parent), mDocument(document) {}

QString QueryFile::name() const {
    return mPath.isEmpty() ? tr("Untitled") : QFileInfo(mPath).fileName();
}

QString QueryFile::besideWith(const QString& suffix) const {
    if (mPath.isEmpty()) return {};
    const QFileInfo file(mPath);
    return file.dir().filePath(file.completeBaseName() + u'.' + suffix);
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
    mMark.reset();
    mOrigin.clear();
    take({}, empty);
}

std::optional<QString> QueryFile::open(const QString& path) {
    // Before it is read, so that a change in between is seen later and not overlooked.
    const auto mark = FileMark::of(path);
    const QByteArray origin = digestOf(path);
    const auto content = files::loadQuery(pathOf(path));
    if (!content) return inWords(content.failure());
    mMark = mark;
    mOrigin = origin;
    take(QFileInfo(path).absoluteFilePath(), *content);
    return {};
}

std::optional<QString> QueryFile::saveAs(const QString& path) {
    const auto text = files::toJson(files::namedFrom(content(), pathOf(path)));
    if (!text) return inWords(text.failure());
    if (const auto error = files::replaceFile(pathOf(path), *text)) return inWords(*error);
    mMark = FileMark::of(path);
    mOrigin = digest(QByteArray::fromStdString(*text));
    mPath = QFileInfo(path).absoluteFilePath();
    mDocument.setModified(false);
    emit changed();
    return {};
}

files::QueryDocument QueryFile::content() const {
    mDocument.settle();
    files::QueryDocument content(mDocument.query());
    content.database = mDatabase.toStdU16String();
    content.typed = mDocument.typed();
    content.unknown = mUnknown;
    return content;
}

void QueryFile::recover(const QString& path, const files::QueryDocument& content,
                        const QByteArray& origin) {
    take(path, content);
    mMark.reset();
    mOrigin = origin;
    if (origin.isEmpty()) knowAsItIs();
    mDocument.setModified(true);
}

QueryFile::OnDisk QueryFile::onDisk(Look look) {
    if (mPath.isEmpty()) return OnDisk::asKnown;
    const auto mark = FileMark::of(mPath);
    if (look == Look::quick && mark == mMark) return OnDisk::asKnown;
    const QByteArray found = digestOf(mPath);
    if (found == mOrigin) {
        mMark = mark;
        return OnDisk::asKnown;
    }
    return mark ? OnDisk::changed : OnDisk::gone;
}

void QueryFile::keepInstead() {
    knowAsItIs();
    mDocument.setModified(true);
}

void QueryFile::decideLater() { mMark = FileMark::of(mPath); }

void QueryFile::knowAsItIs() {
    mMark = mPath.isEmpty() ? std::nullopt : FileMark::of(mPath);
    mOrigin = mMark ? digestOf(mPath) : QByteArray();
}

void QueryFile::take(const QString& path, const files::QueryDocument& content) {
    mPath = path;
    // Somebody may have written one into the file.
    mDatabase = partPassword(QString::fromStdU16String(content.database)).address;
    mUnknown = content.unknown;
    mDocument.setQuery(content.query, content.typed);
    emit changed();
}

} // namespace zandor::designer
