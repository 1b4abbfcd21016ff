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

/// A column as its database describes it.
struct ColumnDescription {
    String name = {};                      ///< as the database has it
    ColumnType type = ColumnType::Unknown; ///< of its values
    String declaredType = {};              ///< as the database words it; may be empty
    bool primaryKey = false;               ///< whether it belongs to the primary key

    friend bool operator==(const ColumnDescription&, const ColumnDescription&) = default;
};

/// A table or view as its database describes it.
struct TableDescription {
    String schema = {};                          ///< empty: the database's default schema
    String name = {};                            ///< as the database has it
    std::vector<ColumnDescription> columns = {}; ///< in their order

    friend bool operator==(const TableDescription&, const TableDescription&) = default;
};

} // namespace zandor::model
