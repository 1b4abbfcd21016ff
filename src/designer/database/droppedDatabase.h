#pragma once

#include <QString>

#include <optional>

class QMimeData;

namespace zandor::designer {

/// The path of a database that is dragged over a window: one local file that begins like an SQLite
/// database. Nothing for anything else.
std::optional<QString> droppedDatabase(const QMimeData& data);

} // namespace zandor::designer
