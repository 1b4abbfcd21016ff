#pragma once

#include <Zandor/DatabaseReader.h>

class QMimeData;

namespace zandor::designer {

/// Tables as they are dragged from the list of tables to the drawing.
std::unique_ptr<QMimeData> tablesAsMime(const std::vector<reader::TableId>& tables);
bool hasTables(const QMimeData& data);
/// Empty for data of another kind, or from elsewhere that cannot be read.
std::vector<reader::TableId> tablesOfMime(const QMimeData& data);

} // namespace zandor::designer
