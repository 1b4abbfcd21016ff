#include "designer/document/AutosaveSlot.h"

#include "designer/document/paths.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/files/Replacement.h>

#include <QDir>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStandardPaths>
#include <QUuid>

namespace zandor::designer {

namespace {

const QString suffix = QStringLiteral(".autosave");
const QString fileMember = QStringLiteral("file");
const QString originMember = QStringLiteral("origin");
const QString queryMember = QStringLiteral("query");

} // namespace

files::Result<QByteArray> Autosaved::bytes() const {
    const auto text = files::toJson(content);
    if (!text) return text.failure();
    return QJsonDocument(QJsonObject{{fileMember, path},
                                     {originMember, QString::fromLatin1(origin.toHex())},
                                     {queryMember, QString::fromStdString(*text)}})
        .toJson(QJsonDocument::Compact);
}

files::Result<Autosaved> Autosaved::read(const QByteArray& bytes) {
    const QJsonObject object = QJsonDocument::fromJson(bytes).object();
    const auto content = files::fromJson(object.value(queryMember).toString().toStdString());
    if (!content) return content.failure();
    return Autosaved{object.value(fileMember).toString(), *content,
                     QByteArray::fromHex(object.value(originMember).toString().toLatin1())};
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

files::Result<AutosaveSlot::Ptr> AutosaveSlot::made(const QString& folder) {
    std::error_code code;
    std::filesystem::create_directories(pathOf(folder), code);
    if (code) return files::Error{code.message()};
    QFile::setPermissions(folder, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    const QString name = QUuid::createUuid().toString(QUuid::WithoutBraces) + suffix;
    Ptr slot(new AutosaveSlot(QDir(folder).filePath(name)));
    if (slot->mLock.tryLock(0)) return slot;
    // What keeps the lock from being written keeps any file from it, and has a name there.
    const auto why = write(slot->mFile, QByteArray(1, ' '));
    slot->remove();
    return files::Error{why.value_or(QStringLiteral("no lock")).toStdString()};
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

files::Result<Autosaved> AutosaveSlot::read() const {
    QFile file(mFile);
    if (!file.open(QIODevice::ReadOnly)) return files::Error{file.errorString().toStdString()};
    return Autosaved::read(file.readAll());
}

std::optional<QString> AutosaveSlot::write(const QString& file, const QByteArray& bytes) {
    const auto error = files::replaceFile(pathOf(file), bytes.toStdString());
    if (!error) return {};
    const std::string said = error->reason();
    return said.empty() ? inWords(*error) : QString::fromStdString(said);
}

void AutosaveSlot::remove() { QFile::remove(mFile); }

QString AutosaveSlot::setAside() {
    const QString aside = mFile + QStringLiteral(".unreadable");
    QString name = aside;
    for (int n = 2; QFile::exists(name); ++n) name = aside + u'.' + QString::number(n);
    return QFile::rename(mFile, name) ? name : mFile;
}

} // namespace zandor::designer
