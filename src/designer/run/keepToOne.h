#pragma once

#include <QString>

#include <optional>

class QSqlDatabase;

namespace zandor::designer {

/// Has the engine see to it that a text is one statement and no more, as it reads it itself: of
/// several the first could allow the second what a session must not do. What it says against the
/// text, or nothing. SQLite's driver takes one in any case.
std::optional<QString> keepToOne(const QSqlDatabase& database, const QString& statement);

} // namespace zandor::designer
