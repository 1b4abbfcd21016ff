#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/reader/Result.h>
#include <Zandor/reader/export.h>

#include <QSqlDatabase>

#include <memory>

namespace zandor::reader {

using platform::String;

/// A table or view by name; an empty schema is the database's default one.
struct TableId {
    String schema; ///< empty: the default one
    String name;   ///< as the database has it

    friend bool operator==(const TableId&, const TableId&) = default;
};

/// What a database has: a table, or a view.
struct TableEntry {
    TableId id;          ///< its name
    bool isView = false; ///< it is a view

    friend bool operator==(const TableEntry&, const TableEntry&) = default;
};

/// The names as the foreign key words them, which may differ in case from the names of the tables.
struct ForeignKey {
    TableId child;  ///< the table that declares the key
    TableId parent; ///< the table that it refers to
    std::vector<std::pair<String, String>> columns; ///< child's and parent's, pair by pair

    friend bool operator==(const ForeignKey&, const ForeignKey&) = default;
};

/// Reads the structure of a database, nothing of its rows: first what tables there are, then the
/// columns of those that are asked for.
class ZANDOR_READER_EXPORT DatabaseReader {
public:
    virtual ~DatabaseReader() = default;
    /// Tables and views in the order of their names; none of the database's own.
    virtual Result<std::vector<TableEntry>> tables() = 0;
    /// The columns of a table or view in their order. A table that is not there is an error.
    virtual Result<model::TableDescription> table(const TableId& id) = 0;
    /// The foreign keys that a table declares, in the order of their declaration; none for a table
    /// that is not there. One that names no column of the parent means the parent's primary key;
    /// it is left out when that does not fit.
    virtual Result<std::vector<ForeignKey>> foreignKeys(const TableId& child) = 0;
};

/// Readers of an open database, which stays open as long as the reader is used.
ZANDOR_READER_EXPORT std::unique_ptr<DatabaseReader> makeSqliteReader(const QSqlDatabase& database);
ZANDOR_READER_EXPORT std::unique_ptr<DatabaseReader>
makePostgresReader(const QSqlDatabase& database);
/// Lists the tables of the database that the address names, or of all of the server's when it names
/// none. Foreign keys come in the order of their names, for the engine keeps no other.
ZANDOR_READER_EXPORT std::unique_ptr<DatabaseReader> makeMysqlReader(const QSqlDatabase& database);
/// Knows of any engine what its Qt driver tells: tables, columns, primary keys; no foreign keys.
ZANDOR_READER_EXPORT std::unique_ptr<DatabaseReader>
makeGenericReader(const QSqlDatabase& database);
/// The one for the database's engine.
ZANDOR_READER_EXPORT std::unique_ptr<DatabaseReader> makeReader(const QSqlDatabase& database);

} // namespace zandor::reader
