#pragma once

#include <Zandor/SqlReader.h>
#include <Zandor/sql/Statement.h>

#include "model/criteria/NameReader.h"

namespace zandor::sql_reader {

using model::sql::ColumnRef;
using model::sql::Dialect;
using model::sql::Node;

/// A table as the statement reads from it.
struct ScopedTable {
    String alias;                                  ///< what columns call it
    std::vector<model::ColumnDescription> columns; ///< in their order
    std::vector<String> schemas{};                 ///< what may stand before it
    bool isStored = false;                         ///< no query within the statement
};

/// The names that a place of a statement may use: those of the tables in its FROM.
class Scope final : public model::criteria::Resolver {
public:
    explicit Scope(Dialect dialect = Dialect::SQLite) : mDialect(dialect) {}

    /// Throws Refused where the name is taken.
    void add(ScopedTable table, std::size_t place);
    void add(const Scope& other, std::size_t place);
    const std::vector<ScopedTable>& tables() const { return mTables; }
    const ScopedTable* tableNamed(StringView alias) const;

    /// From now on a name that both sides of a join share means one column.
    void share(const ColumnRef& kept, const ColumnRef& other) { mShared.push_back({kept, other}); }

    /// The column that a name means; an empty table means any. Throws Refused where there is none,
    /// or several.
    ColumnRef column(StringView table, StringView name, std::size_t place) const;
    /// The same, nothing where there is none.
    std::optional<ColumnRef> find(StringView name, std::size_t place) const;

    /// All columns that come out for *, each one that is shared once; nothing where none is, so
    /// that all of a table does for it.
    std::optional<std::vector<ColumnRef>> everything() const;

    std::vector<model::criteria::NamedColumn> columnsNamed(StringView table,
                                                           StringView column) const override;
    std::vector<model::criteria::NamedColumn> columnsNamed(StringView column) const override;

    /// The same by all names that stand before a column or star. Throws Refused with the place where
    /// no table has them.
    const ScopedTable& source(const std::vector<String>& names, std::size_t place) const;

private:
    struct Shared {
        ColumnRef kept;
        ColumnRef other;
    };
    bool isHidden(const ColumnRef& column) const;
    ColumnRef kept(ColumnRef column) const;
    bool isSame(StringView left, StringView right) const;
    const model::ColumnDescription* columnOf(const ScopedTable& table, StringView name) const;

    Dialect mDialect;
    std::vector<ScopedTable> mTables;
    std::vector<Shared> mShared;
};

/// The name that is most like one, where one is much like it.
std::optional<String> nearest(StringView name, const std::vector<String>& names);

} // namespace zandor::sql_reader
