#pragma once

#include <QSqlDatabase>

/// Copies the tables and views of an SQLite database with their rows into an empty one of
/// PostgreSQL or MariaDB, which gets the declared types, or those that hold the same. Throws
/// std::runtime_error with the engine's words when a statement fails.
void copyToServer(const QSqlDatabase& sqlite, const QSqlDatabase& server);

/// Runs one statement; throws std::runtime_error with the engine's words when it fails.
void run(const QSqlDatabase& database, const QString& statement);
