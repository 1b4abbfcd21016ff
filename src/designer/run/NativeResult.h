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
    /// The value of the current row as PostgreSQL writes it: a moment with all its digits, its
    /// offset and its era, also one that no calendar has.
    std::optional<QString> written(int column) const;
    /// Whether what Qt takes for bytes is a text of MySQL in a collation that compares bytes.
    bool isText(int column) const;
    /// Whether what Qt takes for a text is the bits of a number of MySQL.
    bool isBits(int column) const;

private:
    void* handle() const;

    const QSqlQuery& mQuery;
    enum class Engine { unknown, sqlite, postgres, mysql } mEngine = Engine::unknown;
};

} // namespace zandor::designer
