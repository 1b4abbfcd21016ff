#pragma once

#include <Zandor/sql/Statement.h>

#include <QSqlDatabase>
#include <QStringList>

#include <map>
#include <string>
#include <variant>
#include <vector>

/// A statement carried out in memory, row by row and without SQL: what engines are held against.
/// Numbers are doubles, dates texts, and what has no value is std::monostate.
class Evaluator {
public:
    using Datum = std::variant<std::monostate, double, std::string, bool>;
    /// By table and column, as the statement names them.
    using Row = std::map<std::pair<std::u16string, std::u16string>, Datum>;

    /// Reads the tables from a database when they are first asked for.
    explicit Evaluator(QSqlDatabase database) : mDatabase(std::move(database)) {}

    /// The rows, written as Engines writes them, in any order.
    QStringList rows(const zandor::model::sql::Statement& statement);

private:
    using Rows = std::vector<Row>;

    std::vector<std::vector<Datum>> values(const zandor::model::sql::Statement& statement);
    Rows rowsOf(const zandor::model::sql::SubSelect& query);
    Rows source(const zandor::model::sql::Source& source);
    const Rows& table(const std::u16string& name, const std::u16string& alias);

    QSqlDatabase mDatabase;
    std::map<std::pair<std::u16string, std::u16string>, Rows> mTables;
};
