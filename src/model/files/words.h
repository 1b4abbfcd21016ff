#pragma once

#include "model/files/Object.h"

#include <array>

/// The words of the file, in the order of the codes that they stand for.
namespace zandor::files::words {

inline constexpr std::string_view format = "zandor-query";

/// model::sql::Dialect
inline constexpr std::array<std::string_view, 5> dialects = {"sqlite", "postgresql", "mysql",
                                                             "sqlserver", "standard"};

/// model::ColumnType
inline constexpr std::array<std::string_view, 9> columnTypes = {
    "unknown", "text", "integer", "decimal", "date", "time", "timestamp", "boolean", "blob"};
inline constexpr std::array<std::string_view, 4> joinTypes = {"inner", "left", "right", "full"};
inline constexpr std::array<std::string_view, 6> comparisons = {"=", "<>", "<", ">", "<=", ">="};
inline constexpr std::array<std::string_view, 3> sortOrders = {"none", "ascending", "descending"};

/// model::Total
inline constexpr std::array<std::string_view, 9> totals = {
    "none",    "group",    "count",   "count different", "sum",
    "average", "smallest", "largest", "condition"};

/// model::CommentPlace
inline constexpr std::array<std::string_view, 7> commentPlaces = {
    "start", "table", "column", "criterion", "groups", "order", "end"};

/// model::Format
inline constexpr std::array<std::string_view, 11> formats = {
    "none",          "number",   "thousands",  "percent", "short date", "long date",
    "date and time", "iso date", "year-month", "weekday", "time"};

} // namespace zandor::files::words
