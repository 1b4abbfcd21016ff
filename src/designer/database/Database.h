#pragma once

#include "designer/FileMark.h"
#include "designer/database/RememberingReader.h"

#include <Zandor/reader/Connection.h>
#include <Zandor/sql/Dialect.h>

#include <QMutex>
#include <QObject>

#include <functional>
#include <memory>
#include <optional>

namespace zandor::designer {

/// Makes a connection to one database; keeps what it needs for it, so that it may be taken along to
/// another thread.
using Connector = std::function<reader::Result<reader::Connection>()>;

/// The database that the designer works on: what is in it for the panels, and connections to it.
/// The password is kept in memory only.
class Database final : public QObject {
    Q_OBJECT

public:
    using Tables = std::vector<reader::TableEntry>;

    explicit Database(QObject* parent = nullptr);
    ~Database() override;

    /// Opens another database (see reader::openDatabase) in place of the one before and reads the
    /// list of its tables; emits opened(). A password in the address is taken out of it. On an
    /// error the one before stays. Returns what went wrong. Waits for the server: windows call
    /// openPatiently() instead.
    std::optional<reader::Error> open(const QString& address, const QString& password = {});
    /// The same with a list of tables that was read already.
    std::optional<reader::Error> open(const QString& address, const QString& password,
                                      Tables tables);
    /// Connects afresh to the same database and reads everything again; emits opened().
    std::optional<reader::Error> renew();
    std::optional<reader::Error> renew(Tables tables);
    bool isOpen() const { return mConnection.has_value(); }
    /// From now on there is none; emits opened().
    void close();

    /// Path or URL, never with a password; empty before the first open().
    const QString& address() const { return mAddress; }
    /// For titles: the file's or database's name.
    QString name() const;
    model::sql::Dialect dialect() const;
    /// Whether it is behind a network, and reading may take its time.
    bool isServer() const;
    /// Tables and views in the order of their names.
    const Tables& tables() const { return mTables; }
    /// Only while isOpen(). Reads over this object's connection what was not read before.
    RememberingReader& reader() { return *mReader; }

    /// A further read-only connection to the same database, for the thread that calls this. May be
    /// called from any thread.
    reader::Result<reader::Connection> connect() const;
    /// For connections that are made later, when this object may have another database.
    Connector connector() const;
    static Connector connectorTo(const QString& address, const QString& password);

    /// Tells everybody, once until the connection is renewed, that it has broken down; `message` is
    /// what the engine said, or why it was not reached. A file cannot be lost.
    void sayLost(const QString& message);
    /// That it answers again, over whatever connection; emits found() when it was lost.
    void sayFound();
    bool isLost() const { return mLost; }

    /// What became of an SQLite file since it was opened.
    enum class Change {
        gone,
        replaced, ///< another file has its name; what is open here nobody else sees any more
        altered,  ///< its tables are others
    };
    /// Looks whether the open file is still what was read, and tells everybody, once until the
    /// connection is renewed. A server is not asked.
    void look();

signals:
    /// Another database, the same one afresh, or none.
    void opened();
    void lost(const QString& message);
    void found();
    void outdated(designer::Database::Change change);

private:
    std::optional<Change> changed();
    std::optional<reader::Error> take(const QString& address, const QString& password,
                                      std::optional<Tables> tables);

    QString mAddress;
    QString mPassword;
    mutable QMutex mTarget; ///< guards the two above against connect() on other threads
    std::optional<reader::Connection> mConnection;
    std::unique_ptr<RememberingReader> mReader;
    Tables mTables;
    bool mLost = false;
    std::optional<FileMark> mMark; ///< of a file, when it was read
    QByteArray mStructure;         ///< what a file said of its tables then
    bool mOutdated = false;
};

} // namespace zandor::designer
