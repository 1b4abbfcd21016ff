#pragma once

class QSqlDatabase;
struct sqlite3;

namespace zandor::designer {

/// The handle of an SQLite database, if Qt's driver uses the same library as this program: its
/// structures may be handed to no other.
sqlite3* sharedSqlite(const QSqlDatabase& database);

} // namespace zandor::designer
