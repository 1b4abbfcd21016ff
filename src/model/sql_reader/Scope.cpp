#include "model/sql_reader/Scope.h"

#include "model/sql_reader/Refused.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <numeric>

namespace zandor::sql_reader {

namespace {

ColumnRef refTo(const ScopedTable& table, const model::ColumnDescription& column) {
    return {table.alias, column.name, column.type, column.declaredType};
}

/// How many signs must be put in, taken out or changed.
std::size_t distance(StringView left, StringView right) {
    std::vector<std::size_t> row(right.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t(0));
    for (std::size_t i = 1; i <= left.size(); ++i) {
        std::size_t corner = std::exchange(row[0], i);
        for (std::size_t j = 1; j <= right.size(); ++j) {
            const std::size_t change = corner + (left[i - 1] == right[j - 1] ? 0 : 1);
            corner = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, change});
        }
    }
    return row.back();
}

} // namespace

std::optional<String> nearest(StringView name, const std::vector<String>& names) {
    const String folded = model::foldedName(name);
    std::size_t least = folded.size() / 3 + 1;
    std::optional<String> found;
    for (const String& each : names) {
        const std::size_t far = distance(folded, model::foldedName(each));
        if (far > least || (found && far == least)) continue;
        least = far;
        found = each;
    }
    return found;
}

/// PostgreSQL's parser has made small letters of what stands without quotes.
bool Scope::isSame(StringView left, StringView right) const {
    return mDialect == Dialect::PostgreSQL ? left == right : model::sameName(left, right);
}

/// The column of exactly the name, else one that differs in case.
const model::ColumnDescription* Scope::columnOf(const ScopedTable& table, StringView name) const {
    const model::ColumnDescription* found = nullptr;
    for (const auto& column : table.columns) {
        if (column.name == name) return &column;
        if (!found && isSame(column.name, name)) found = &column;
    }
    return found;
}

void Scope::add(ScopedTable table, std::size_t place) {
    if (tableNamed(table.alias)) refuse<MessageCode::sameAlias>(place, table.alias);
    mTables.push_back(std::move(table));
}

void Scope::add(const Scope& other, std::size_t place) {
    for (const ScopedTable& table : other.mTables) add(table, place);
    mShared.insert(mShared.end(), other.mShared.begin(), other.mShared.end());
}

const ScopedTable* Scope::tableNamed(StringView alias) const {
    const auto at = std::find_if(mTables.begin(), mTables.end(), [&](const ScopedTable& table) {
        return isSame(table.alias, alias);
    });
    return at == mTables.end() ? nullptr : &*at;
}

const ScopedTable& Scope::source(const std::vector<String>& names, std::size_t place) const {
    const ScopedTable* table = tableNamed(names.back());
    const auto mayStand = [&](const String& schema) {
        return !schema.empty() && isSame(schema, names.front());
    };
    const bool known =
        names.size() == 1 || (names.size() == 2 && table &&
                              std::any_of(table->schemas.begin(), table->schemas.end(), mayStand));
    if (table && known) return *table;
    String shown = names.front();
    for (std::size_t n = 1; n < names.size(); ++n) shown += u'.' + names[n];
    refuse<MessageCode::unknownSource>(place, shown);
}

bool Scope::isHidden(const ColumnRef& column) const {
    return std::any_of(mShared.begin(), mShared.end(),
                       [&](const Shared& shared) { return shared.other == column; });
}

/// What comes out for a column that may be shared.
ColumnRef Scope::kept(ColumnRef column) const {
    for (const Shared& shared : mShared)
        if (shared.other == column) return kept(shared.kept);
    return column;
}

std::optional<ColumnRef> Scope::find(StringView name, std::size_t place) const {
    std::optional<ColumnRef> found;
    for (const ScopedTable& table : mTables) {
        const auto* column = columnOf(table, name);
        if (!column) continue;
        const ColumnRef ref = refTo(table, *column);
        if (isHidden(ref)) continue;
        if (found) refuse<MessageCode::ambiguousColumn>(place, name);
        found = ref;
    }
    return found;
}

ColumnRef Scope::column(StringView table, StringView name, std::size_t place) const {
    std::vector<String> near;
    const auto offer = [&](const ScopedTable& from) {
        for (const auto& column : from.columns) near.push_back(column.name);
    };
    if (table.empty()) {
        if (auto found = find(name, place)) return *found;
        for (const ScopedTable& each : mTables) offer(each);
    } else {
        const ScopedTable& from = source({String(table)}, place);
        if (const auto* column = columnOf(from, name)) return refTo(from, *column);
        offer(from);
    }
    if (const auto similar = nearest(name, near))
        refuse<MessageCode::unknownColumnNear>(place, name, *similar);
    refuse<MessageCode::unknownColumn>(place, name);
}

std::optional<std::vector<ColumnRef>> Scope::everything() const {
    if (mShared.empty()) return {};
    std::vector<ColumnRef> all;
    const auto add = [&](const ColumnRef& column) {
        if (std::find(all.begin(), all.end(), column) == all.end()) all.push_back(column);
    };
    // SQLite leaves them where they stand in their tables.
    if (mDialect != Dialect::SQLite)
        for (const Shared& shared : mShared) add(kept(shared.kept));
    for (const ScopedTable& table : mTables)
        for (const auto& column : table.columns) add(kept(refTo(table, column)));
    return all;
}

std::vector<model::criteria::NamedColumn> Scope::columnsNamed(StringView table,
                                                              StringView column) const {
    const ScopedTable* from = tableNamed(table);
    const auto* found = from ? columnOf(*from, column) : nullptr;
    if (!found) return {};
    return {{refTo(*from, *found), {}}};
}

std::vector<model::criteria::NamedColumn> Scope::columnsNamed(StringView column) const {
    std::vector<model::criteria::NamedColumn> found;
    for (const ScopedTable& table : mTables)
        if (const auto* each = columnOf(table, column)) found.push_back({refTo(table, *each), {}});
    return found;
}

} // namespace zandor::sql_reader
