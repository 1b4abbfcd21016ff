#include "designer/document/AutosaveSlot.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSaveFile>
#include <QStandardPaths>
#include <QUuid>

namespace designer {

namespace {

const QString suffix = QStringLiteral(".autosave");
const QString fileMember = QStringLiteral("file");
const QString queryMember = QStringLiteral("query");

} // namespace

files::Result<QByteArray> Autosaved::bytes() const {
    const auto text = files::toJson(content);
    if (!text) return files::Error{text.error()};
    return QJsonDocument(
               QJsonObject{{fileMember, path}, {queryMember, QString::fromStdString(*text)}})
        .toJson(QJsonDocument::Compact);
}

files::Result<Autosaved> Autosaved::read(const QByteArray& bytes) {
    const QJsonObject object = QJsonDocument::fromJson(bytes).object();
    const auto content = files::fromJson(object.value(queryMember).toString().toStdString());
    if (!content) return files::Error{content.error()};
    return Autosaved{object.value(fileMember).toString(), *content};
}

QString AutosaveSlot::standardFolder() {
    return QDir(QStandardPaths::writableLocation(QStandardPaths::AppDataLocation))
        .filePath(QStringLiteral("autosave"));
}

AutosaveSlot::AutosaveSlot(const QString& file)
    : mFile(file), mLock(file + QStringLiteral(".lock")) {
    // However long the process lives.
    mLock.setStaleLockTime(0);
}

AutosaveSlot::Ptr AutosaveSlot::made(const QString& folder) {
    if (!QDir().mkpath(folder)) return {};
    QFile::setPermissions(folder, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    const QString name = QUuid::createUuid().toString(QUuid::WithoutBraces) + suffix;
    Ptr slot(new AutosaveSlot(QDir(folder).filePath(name)));
    return slot->mLock.tryLock(0) ? std::move(slot) : Ptr();
}

std::vector<AutosaveSlot::Ptr> AutosaveSlot::abandoned(const QString& folder) {
    std::vector<Ptr> found;
    const auto files =
        QDir(folder).entryInfoList({QLatin1Char('*') + suffix}, QDir::Files, QDir::Time);
    for (const QFileInfo& file : files) {
        Ptr slot(new AutosaveSlot(file.absoluteFilePath()));
        // Once more, for its owner may have ended and removed it just now.
        if (slot->mLock.tryLock(0) && QFileInfo::exists(slot->mFile))
            found.push_back(std::move(slot));
    }
    return found;
}

QDateTime AutosaveSlot::saved() const { return QFileInfo(mFile).lastModified(); }

std::optional<Autosaved> AutosaveSlot::read() const {
    QFile file(mFile);
    if (!file.open(QIODevice::ReadOnly)) return {};
    const auto content = Autosaved::read(file.readAll());
    if (!content) return {};
    return *content;
}

std::optional<QString> AutosaveSlot::write(const QString& file, const QByteArray& bytes) {
    QSaveFile saving(file);
    if (saving.open(QIODevice::WriteOnly) && saving.write(bytes) == bytes.size() && saving.commit())
        return {};
    return saving.errorString();
}

void AutosaveSlot::remove() { QFile::remove(mFile); }

} // namespace designer
