#pragma once

#include <Zandor/model/Description.h>

namespace zandor::reader {

/// What a type means that a database declares for a column: "VARCHAR(40)", "bigint", "TIMESTAMP
/// WITH TIME ZONE". An unknown word is judged by SQLite's rules of affinity.
model::ColumnType columnType(platform::StringView declared);

} // namespace zandor::reader
