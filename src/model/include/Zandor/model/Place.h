#pragma once

#include <Zandor/model/Items.h>
#include <Zandor/model/export.h>

/// How joins and definitions name their tables and columns: by key within one query's tables. A
/// place holds no table, so nothing owns in a circle, and it may outlive the query.
namespace zandor::model {

using platform::Ref;
using platform::String;

class Column;
class Table;

/// The tables of one query.
using Tables = Items<Table, TalvikZandorLib::ZDTable>;

/// A table by key.
class ZANDOR_MODEL_EXPORT TablePlace {
public:
    TablePlace() = default;
    /// Of a query's tables, the one with a key.
    TablePlace(std::weak_ptr<const Tables> home, String key)
        : mHome(std::move(home)), mKey(std::move(key)) {}

    /// The table, or nothing when it was deleted or its query is gone.
    Ref<Table> table() const;
    /// Whether no table was ever named.
    bool empty() const { return mKey.empty(); }
    /// Empty when no table was ever named.
    const String& key() const { return mKey; }
    /// The same tables, and none of them.
    TablePlace nowhere() const { return {mHome, {}}; }
    /// Whether both are of one query.
    bool sameHome(const TablePlace& other) const;
    /// Whether it names one of these tables, there or deleted.
    bool isIn(const std::shared_ptr<const Tables>& tables) const;

    friend bool operator==(const TablePlace& left, const TablePlace& right) {
        return left.mKey == right.mKey && left.sameHome(right);
    }

private:
    std::weak_ptr<const Tables> mHome;
    String mKey;
};

/// A column by key, with its table.
class ZANDOR_MODEL_EXPORT ColumnPlace {
public:
    ColumnPlace() = default;
    /// Of a table, the column with a key.
    ColumnPlace(TablePlace table, String key) : mTable(std::move(table)), mKey(std::move(key)) {}

    /// The column, or nothing when its table was deleted or its query is gone.
    Ref<Column> column() const;
    /// Whether no column was ever named.
    bool empty() const { return mKey.empty(); }
    /// Empty when no column was ever named.
    const String& key() const { return mKey; }
    /// The table, which may be named without a column.
    const TablePlace& table() const { return mTable; }

    /// Error 91 when no column is named; error 5 when it is not, or no longer, a column of these
    /// tables.
    void require(const std::shared_ptr<const Tables>& tables) const;

    friend bool operator==(const ColumnPlace&, const ColumnPlace&) = default;

private:
    TablePlace mTable;
    String mKey;
};

/// The place of a table or column; an empty one for nothing. Error 5 for an object of another
/// model library.
ZANDOR_MODEL_EXPORT TablePlace placeOf(const Ref<TalvikZandorLib::ZDTable>& table);
ZANDOR_MODEL_EXPORT ColumnPlace placeOf(const Ref<TalvikZandorLib::ZDColumn>& column);

} // namespace zandor::model
