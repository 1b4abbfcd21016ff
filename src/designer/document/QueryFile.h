#pragma once

#include "model/files/QueryDocument.h"

#include <QObject>
#include <QString>

#include <optional>

namespace designer {

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
    /// Of the database that the query asks, never with a password: what the file said, or was set.
    std::optional<QString> databaseAddress() const;
    /// For the next saving; a password is taken out of it. Nothing is modified by it.
    void setDatabaseAddress(const QString& address);

    /// An empty query without a file; the database stays.
    void startNew();
    /// On an error everything stays as it was.
    std::optional<QString> open(const QString& path);
    /// To path(), which must not be empty.
    std::optional<QString> save() { return saveAs(mPath); }
    std::optional<QString> saveAs(const QString& path);

    /// Everything that is saved, as it is now.
    files::QueryDocument content() const;
    /// Takes a content over as one that is not saved, in a file of this path (or of none yet).
    void recover(const QString& path, const files::QueryDocument& content);

signals:
    /// path() is another, or databaseAddress().
    void changed();

private:
    void take(const QString& path, const files::QueryDocument& content);

    Document& mDocument;
    QString mPath;
    QString mDatabase;
    std::shared_ptr<const files::Unknown> mUnknown;
};

} // namespace designer
