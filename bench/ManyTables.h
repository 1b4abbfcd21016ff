#pragma once

#include <QSqlDatabase>
#include <QString>

/// A database of five thousand tables.
namespace manytables {

inline constexpr int count = 5000;

/// Makes them; ends the program where it cannot.
void make(const QSqlDatabase& database);
/// In a file.
void makeSqlite(const QString& path);
/// Reads their names by a query of the engine's own, as a program without a reader would.
void listOwn(const QSqlDatabase& database);

} // namespace manytables
