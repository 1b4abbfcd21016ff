#pragma once

#include "model/reader/Connection.h"
#include "model/reader/DatabaseReader.h"
#include "model/sql/Dialect.h"

#include <QObject>

#include <memory>
#include <optional>

namespace designer {

/// The database that the designer works on: what is in it for the panels, and connections to it.
/// The password is kept in memory only.
class Database final : public QObject {
    Q_OBJECT

public:
    explicit Database(QObject* parent = nullptr);
    ~Database() override;

    /// Opens another database (see reader::openDatabase) in place of the one before and reads the
    /// list of its tables; emits opened(). On an error the one before stays. Returns what went
    /// wrong.
    std::optional<QString> open(const QString& address, const QString& password = {});
    /// Connects afresh to the same database and reads the list of its tables again; emits opened().
    std::optional<QString> renew();
    bool isOpen() const;

    /// Path or URL, never with a password; empty before the first open().
    const QString& address() const { return mAddress; }
    /// For titles: the file's or database's name.
    QString name() const;
    model::sql::Dialect dialect() const;
    /// Tables and views in the order of their names.
    const std::vector<reader::TableEntry>& tables() const { return mTables; }
    /// Only while isOpen().
    reader::DatabaseReader& reader() { return *mReader; }

    /// A further read-only connection to the same database, for the thread that calls this. May be
    /// called from any thread.
    reader::Result<reader::Connection> connect() const;

    /// Tells everybody that the connection has broken down; `message` is the engine's.
    void sayLost(const QString& message) { emit lost(message); }

signals:
    void opened();
    void lost(const QString& message);

private:
    QString mAddress;
    QString mPassword;
    std::optional<reader::Connection> mConnection;
    std::unique_ptr<reader::DatabaseReader> mReader;
    std::vector<reader::TableEntry> mTables;
};

} // namespace designer
