#pragma once

#include <Zandor/model/Messages.h>
#include <Zandor/model/export.h>
#include <Zandor/sql/Statement.h>

namespace zandor::model::sql {

/// What an engine reads; Standard is SQL as its norm has it.
enum class Dialect { SQLite, PostgreSQL, MySQL, SqlServer, Standard };

/// All of them.
inline constexpr Dialect allDialects[] = {Dialect::SQLite, Dialect::PostgreSQL, Dialect::MySQL,
                                          Dialect::SqlServer, Dialect::Standard};

/// "SQLite", "PostgreSQL", "MySQL/MariaDB", "SQL Server", "Standard SQL".
ZANDOR_MODEL_EXPORT StringView nameOf(Dialect dialect);

/// A name as the dialect writes it, in quotes where it needs them.
ZANDOR_MODEL_EXPORT String identifier(StringView name, Dialect dialect);

/// Why the dialect cannot carry a name, or nothing when it can.
ZANDOR_MODEL_EXPORT std::optional<Message> cannotCarry(StringView name, Dialect dialect);

/// A value written out, in the dialect's quotes.
ZANDOR_MODEL_EXPORT String literal(const Value& value, Dialect dialect);

/// A pattern as sql::Like keeps it, as the dialect's LIKE reads it.
ZANDOR_MODEL_EXPORT String likePattern(StringView pattern, Dialect dialect);

/// A placeholder for a value of a type that is handed over beside the statement.
ZANDOR_MODEL_EXPORT String placeholder(ColumnType type, Dialect dialect);

} // namespace zandor::model::sql
