#pragma once

#include <Zandor/QueryDocument.h>

#include <QByteArray>
#include <QDateTime>
#include <QLockFile>
#include <QString>

#include <memory>
#include <optional>
#include <vector>

namespace zandor::designer {

/// A query that was saved of itself, and where it belongs.
struct Autosaved {
    QString path; ///< of the file that it is a later state of; empty: there is none yet
    files::QueryDocument content;
    QByteArray origin = {}; ///< QueryFile::origin()

    /// One line of what is wrong, in place of the bytes, when the query cannot be written.
    files::Result<QByteArray> bytes() const;
    static files::Result<Autosaved> read(const QByteArray& bytes);
};

/// A file for autosaving, and a lock by which it is this process's alone as long as the object is
/// there. The file stays when the object, or the process, goes; only remove() deletes it.
class AutosaveSlot {
public:
    using Ptr = std::unique_ptr<AutosaveSlot>;

    /// Where the designer keeps them: below QStandardPaths::AppDataLocation, in "autosave".
    static QString standardFolder();
    /// A new one, without its file yet; the folder is made for the user alone. The error is what
    /// the system said.
    static files::Result<Ptr> made(const QString& folder);
    /// Those with a file that no running process holds, the newest first: what designers left
    /// behind that were killed.
    static std::vector<Ptr> abandoned(const QString& folder);

    const QString& file() const { return mFile; }
    QDateTime saved() const;
    /// One line of what is wrong when it cannot be read.
    files::Result<Autosaved> read() const;
    /// Replaces the file in one step. May be called from another thread; what the system said when
    /// it could not, or nothing.
    static std::optional<QString> write(const QString& file, const QByteArray& bytes);
    void remove();
    /// Gives the file another name, under which it is no autosave any more and nobody removes it:
    /// one that cannot be read now may be one day. Returns where it is.
    QString setAside();

private:
    explicit AutosaveSlot(const QString& file);

    const QString mFile;
    QLockFile mLock;
};

} // namespace zandor::designer
