#include <Zandor/Query.h>

#include <Zandor/model/Result.h>
#include <Zandor/sql/Builder.h>

#include <algorithm>

// Saved queries that stand in a query as tables.

namespace zandor::model {

using platform::Each;
using platform::makeRef;

namespace {

using Columns = std::vector<ColumnDescription>;

/// What the table would have, or why there cannot be one.
Result<Columns, Message> columnsOf(const SavedQuery& saved) {
    if (const auto fault = faultOf(saved.record)) return fault->message;
    if (depthOf(saved.record) >= deepestSavedQuery)
        return say<MessageCode::queriesNested>(deepestSavedQuery);
    auto columns = sql::outputColumns(*Query::restored(saved.record));
    if (columns.empty()) return say<MessageCode::nothingComesOut>();
    return columns;
}

} // namespace

std::optional<Message> Query::refusalOf(const SavedQuery& saved) {
    const auto columns = columnsOf(saved);
    return columns ? std::nullopt : std::optional(columns.failure());
}

Ref<Table> Query::addQuery(const String& name, SavedQuery saved) {
    const auto columns = columnsOf(saved);
    if (name.empty() || !columns) throw platform::errors::invalidProcedureCall();
    return add({.schema = {}, .name = name, .columns = *columns}, SavedQueryRef(std::move(saved)));
}

std::optional<Message> Query::refusalOf(const Table& table, const SavedQuery& saved) const {
    const auto columns = columnsOf(saved);
    return columns ? refusalOf(table, *columns) : columns.failure();
}

std::optional<Message> Query::refusalOf(const Table& table, const Columns& given) const {
    // What a criterion names is used as well. It is tied in a copy, for to ask changes nothing.
    const auto copy = restored(record());
    copy->tieCriteria();
    const auto used = copy->usedColumns();
    const auto& columns = table.contents()->columns;
    for (std::int32_t position = 2; position <= columns.Count(); ++position) {
        const auto column = columns.Item(position);
        const bool there = std::any_of(given.begin(), given.end(), [&](const auto& description) {
            return description.name == column->Name();
        });
        if (!there && used.contains(column->Key()))
            return say<MessageCode::columnNoLongerGiven>(table.Name(), column->Name());
    }
    return {};
}

void Query::refreshQuery(const Ref<Table>& table, SavedQuery saved) {
    requireOwn(table);
    const auto given = columnsOf(saved);
    if (!table->savedQuery() || !given || refusalOf(*table, *given))
        throw platform::errors::invalidProcedureCall();
    auto contents = std::make_shared<TableContents>();
    const auto& before = table->contents()->columns;
    contents->columns.Add(before.Item(1), before.Item(1)->Key());
    for (const ColumnDescription& description : *given) {
        Ref<Column> column;
        for (std::int32_t position = 2; position <= before.Count() && !column; ++position)
            if (before.Item(position)->Name() == description.name)
                column = std::static_pointer_cast<Column>(before.Item(position));
        if (!column || column->description() != description) {
            const String key = column ? column->Key() : nextKey(u'c', mLastColumn);
            column = makeRef<Column>(ColumnPlace(table->place(), key), description);
        }
        contents->columns.Add(column, column->Key());
    }
    contents->query = SavedQueryRef(std::move(saved));
    table->mContents = std::move(contents);
}

/// The keys of those that joins, output columns, criteria and expressions name.
std::unordered_set<String> Query::usedColumns() const {
    std::unordered_set<String> keys;
    const auto add = [&](const criteria::References& names) {
        for (const criteria::Reference& name : names) keys.insert(name.column.key());
    };
    for (std::int32_t position = 1; position <= mJoins.Count(); ++position) {
        keys.insert(mJoins.own(position)->left().key());
        keys.insert(mJoins.own(position)->right().key());
    }
    for (std::int32_t position = 1; position <= mDefinitions.Count(); ++position) {
        const auto definition = mDefinitions.own(position);
        keys.insert(definition->place().key());
        add(definition->expression().references);
        for (const auto& [row, criterium] : definition->criteria().rows())
            add(criterium->tied().references);
    }
    return keys;
}

} // namespace zandor::model
