#include <Zandor/Query.h>

#include <Zandor/sql/Builder.h>

#include <algorithm>

// Saved queries that stand in a query as tables.

namespace zandor::model {

using platform::Each;
using platform::makeRef;

namespace {

std::vector<ColumnDescription> columnsOf(const SavedQuery& saved) {
    return sql::outputColumns(*Query::restored(saved.record));
}

} // namespace

std::optional<Message> Query::refusalOf(const SavedQuery& saved) {
    if (const auto fault = faultOf(saved.record)) return fault->message;
    if (depthOf(saved.record) >= deepestSavedQuery)
        return say<MessageCode::queriesNested>(deepestSavedQuery);
    if (columnsOf(saved).empty()) return say<MessageCode::nothingComesOut>();
    return {};
}

Ref<Table> Query::addQuery(const String& name, SavedQuery saved) {
    if (name.empty() || refusalOf(saved)) throw platform::errors::invalidProcedureCall();
    const TableDescription source{.schema = {}, .name = name, .columns = columnsOf(saved)};
    return add(source, SavedQueryRef(std::move(saved)));
}

std::optional<Message> Query::refusalOf(const Table& table, const SavedQuery& saved) {
    if (auto refusal = refusalOf(saved)) return refusal;
    tieCriteria(); // what a criterion names is used as well
    const auto used = usedColumns();
    const auto given = columnsOf(saved);
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
    if (!table->savedQuery() || refusalOf(*table, saved))
        throw platform::errors::invalidProcedureCall();
    auto contents = std::make_shared<TableContents>();
    const auto& before = table->contents()->columns;
    contents->columns.Add(before.Item(1), before.Item(1)->Key());
    for (ColumnDescription& description : columnsOf(saved)) {
        Ref<Column> column;
        for (std::int32_t position = 2; position <= before.Count() && !column; ++position)
            if (before.Item(position)->Name() == description.name)
                column = std::static_pointer_cast<Column>(before.Item(position));
        if (!column || column->description() != description) {
            const String key = column ? column->Key() : nextKey(u'c', mLastColumn);
            column = makeRef<Column>(ColumnPlace(table->place(), key), std::move(description));
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
