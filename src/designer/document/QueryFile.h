#pragma once

#include "designer/FileMark.h"

#include <Zandor/QueryDocument.h>

#include <QObject>
#include <QString>

#include <optional>

namespace zandor::designer {

class Document;

/// The file that the document's query is kept in, and the database that the file names. Knows no
/// widget: what can go wrong is returned as one line for the user.
class QueryFile final : public QObject {
    Q_OBJECT

public:
    explicit QueryFile(Document& document, QObject* parent = nullptr);

    /// Absolute; empty as long as the query was never saved.
    const QString& path() const { return mPath; }
    /// For titles and messages: the file's name without its folder, or "Untitled".
    QString name() const;
    /// Beside the file and called like it, with another suffix: what to call something that is made
    /// of the query. Empty as long as the query was never saved.
    QString besideWith(const QString& suffix) const;
    /// Of the database that the query asks, never with a password: what the file said, or was set.
    std::optional<QString> databaseAddress() const;
    /// For the next saving; a password is taken out of it. Nothing is modified by it.
    void setDatabaseAddress(const QString& address);

    /// What became of the file on the disk since it was read or written here.
    enum class OnDisk { asKnown, changed, gone };
    /// `thorough` reads it even where the system says that nothing has happened to it.
    enum class Look { quick, thorough };
    OnDisk onDisk(Look look);
    /// From now on the file counts as known as it is, and the query as another than that one.
    void keepInstead();
    /// A quick look says no more of the file as it is; a thorough one, before it is written, does.
    void decideLater();

    /// An empty query without a file; the database stays.
    void startNew();
    /// On an error everything stays as it was.
    std::optional<QString> open(const QString& path);
    /// To path(), which must not be empty.
    std::optional<QString> save() { return saveAs(mPath); }
    std::optional<QString> saveAs(const QString& path);

    /// Everything that is saved, as it is now.
    files::QueryDocument content() const;
    /// By what the file is known again that the query comes from; empty: there is none.
    const QByteArray& origin() const { return mOrigin; }
    /// Takes a content over as one that is not saved, in a file of this path (or of none yet), with
    /// the origin that it had; without one the file counts as known as it is.
    void recover(const QString& path, const files::QueryDocument& content,
                 const QByteArray& origin = {});

signals:
    /// path() is another, or databaseAddress().
    void changed();

private:
    void take(const QString& path, const files::QueryDocument& content);
    void knowAsItIs();

    Document& mDocument;
    QString mPath;
    QByteArray mOrigin;            ///< a digest of the file as it was last read or written here
    std::optional<FileMark> mMark; ///< of the file then
    QString mDatabase;
    std::shared_ptr<const files::Unknown> mUnknown;
};

} // namespace zandor::designer
