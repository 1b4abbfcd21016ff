#pragma once

#include <QString>

#include <optional>

class QSqlDatabase;
class QSqlQuery;

namespace zandor::designer {

/// What an engine's own library knows of a result and Qt's driver does not hand on. Nothing is
/// known where the driver uses another library than is expected; then Qt's word is all that there
/// is.
class NativeResult {
public:
    /// For a statement of the database that has been sent. `query` outlives the object.
    NativeResult(const QSqlQuery& query, const QSqlDatabase& database);

    /// A column's name, of which Qt leaves out the quotes in SQLite.
    std::optional<QString> name(int column) const;
    /// The moment that the current row has in a column, as PostgreSQL or a driver of ODBC writes
    /// it: with all its digits, its offset and its era, also one that no calendar has. A null text
    /// where the row has none. It is asked for before Qt is, column by column, for a driver of ODBC
    /// may give each value once.
    std::optional<QString> moment(int column) const;

private:
    using GetValue = const char* (*)(const void*, int, int);
    using GetData = short (*)(void*, unsigned short, short, void*, long, long*);

    void* handle() const;
    std::optional<QString> momentOfPostgres(int column) const;
    std::optional<QString> momentOfOdbc(int column) const;

    const QSqlQuery& mQuery;
    bool mSqlite = false;
    GetValue mGetValue = nullptr; ///< of PostgreSQL
    GetData mGetData = nullptr;   ///< of ODBC
};

} // namespace zandor::designer
