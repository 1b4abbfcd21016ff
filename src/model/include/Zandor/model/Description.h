#pragma once

#include <Zandor/platform/String.h>

#include <vector>

/// A table as a database describes it, before it stands in a query.
namespace zandor::model {

using platform::String;
using platform::StringView;

/// What kind of values a column holds, as far as a criterion has to be written differently.
enum class ColumnType {
    Unknown,
    Text,
    Integer,
    Decimal, ///< numbers with a fraction, exact or not
    Date,
    Time,
    Timestamp,
    Boolean,
    Blob,
};

struct ColumnDescription {
    String name = {};
    ColumnType type = ColumnType::Unknown;
    String declaredType = {}; ///< as the database words it; may be empty
    bool primaryKey = false;

    friend bool operator==(const ColumnDescription&, const ColumnDescription&) = default;
};

struct TableDescription {
    String schema = {}; ///< empty: the database's default schema
    String name = {};
    std::vector<ColumnDescription> columns = {};

    friend bool operator==(const TableDescription&, const TableDescription&) = default;
};

} // namespace zandor::model
