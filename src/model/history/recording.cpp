#include <Zandor/Query.h>

// The query to and from plain values.

namespace zandor::model {

using platform::Each;
using platform::makeRef;
using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDJoin;
using TalvikZandorLib::ZDTable;

namespace {

TableRecord recordOf(Table& table) {
    TableRecord record{.key = table.Key(),
                       .name = table.Name(),
                       .schema = table.schema(),
                       .sourceName = table.sourceName(),
                       .left = table.Left(),
                       .top = table.Top(),
                       .width = table.Width(),
                       .height = table.Height(),
                       .selected = std::as_const(table).Selected(),
                       .columns = {},
                       .query = table.savedQuery()};
    for (const auto& item : Each<ZDColumn>(table.Columns())) {
        const auto& column = static_cast<const Column&>(*item);
        record.columns.push_back({column.Key(), column.description(), column.Selected()});
    }
    return record;
}

EndRecord recordOf(const ColumnPlace& end) {
    if (!end.table().table()) return {};
    return {end.table().key(), end.column() ? end.key() : String()};
}

JoinRecord recordOf(const Join& join) {
    return {join.Key(), recordOf(join.left()), recordOf(join.right()), join.JoinType(),
            join.CompareOperator()};
}

std::vector<NameRecord> recordOf(const criteria::References& references) {
    std::vector<NameRecord> names;
    for (const criteria::Reference& reference : references)
        names.push_back({static_cast<std::int32_t>(reference.begin),
                         static_cast<std::int32_t>(reference.tableEnd),
                         reference.column.table().key(), reference.column.key()});
    return names;
}

DefinitionRecord recordOf(const ColumnDefinition& definition) {
    DefinitionRecord record{.key = definition.Key(),
                            .column = recordOf(definition.place()).column,
                            .synonym = definition.Synonym(),
                            .sortOrder = definition.SortOrder(),
                            .visible = definition.Visible(),
                            .width = definition.Width(),
                            .criteria = {},
                            .total = definition.total(),
                            .sortPriority = definition.sortPriority(),
                            .expression = definition.expression().text,
                            .names = recordOf(definition.expression().references),
                            .format = definition.format(),
                            .decimals = definition.decimals()};
    for (const auto& [row, criterium] : definition.criteria().rows())
        record.criteria.push_back(
            {row, criterium->Criterium(), recordOf(criterium->tied().references)});
    return record;
}

} // namespace

QueryRecord Query::record() const {
    QueryRecord record;
    record.lastKeys = lastKeys();
    record.options = options();
    for (const auto& table : Each<ZDTable>(*mTables))
        record.tables.push_back(recordOf(static_cast<Table&>(*table)));
    for (const auto& join : Each<ZDJoin>(mJoins))
        record.joins.push_back(recordOf(static_cast<const Join&>(*join)));
    for (const auto& definition : Each<ZDColumnDefinition>(mDefinitions))
        record.definitions.push_back(recordOf(static_cast<const ColumnDefinition&>(*definition)));
    return record;
}

Ref<Query> Query::restored(const QueryRecord& record) {
    if (faultOf(record)) throw platform::errors::invalidProcedureCall();
    auto query = makeRef<Query>();
    query->mLastTable = record.lastKeys.table;
    query->mLastColumn = record.lastKeys.column;
    query->mLastJoin = record.lastKeys.join;
    query->mLastDefinition = record.lastKeys.definition;
    query->mOptions = record.options;
    for (const TableRecord& table : record.tables) query->restoreTable(table);
    for (const JoinRecord& from : record.joins) {
        const auto join = makeRef<Join>();
        join->mLeft = query->restoredEnd(from.left);
        join->mRight = query->restoredEnd(from.right);
        join->mJoinType = from.type;
        join->mCompareOperator = from.comparison;
        join->mKey = from.key;
        query->mJoins.Add(join);
    }
    std::map<String, ColumnPlace> places;
    for (const TableRecord& table : record.tables)
        for (const ColumnRecord& column : table.columns)
            places.emplace(column.key, query->restoredEnd({table.key, column.key}));
    for (const DefinitionRecord& from : record.definitions) {
        const auto definition = makeRef<ColumnDefinition>();
        definition->mPlace = from.column.empty() ? query->restoredEnd({}) : places.at(from.column);
        definition->mSynonym = from.synonym;
        definition->mSortOrder = from.sortOrder;
        definition->mVisible = from.visible;
        definition->mWidth = from.width;
        definition->mTotal = from.total;
        definition->mSortPriority = from.sortPriority;
        definition->mExpression = {from.expression, query->restored(from.names)};
        definition->mFormat = from.format;
        definition->mDecimals = from.decimals;
        definition->mKey = from.key;
        for (const CriterionRecord& criterion : from.criteria) {
            definition->AddCriterium(criterion.text, platform::decimal(criterion.row));
            definition->criteria()
                .rows()
                .at(criterion.row)
                ->tie({criterion.text, query->restored(criterion.names)});
        }
        query->mDefinitions.Add(definition);
    }
    return query;
}

void Query::restoreTable(const TableRecord& record) {
    const TablePlace place(mTables, record.key);
    TableContents contents{.columns = {}, .query = record.query};
    for (const ColumnRecord& from : record.columns) {
        const auto column = makeRef<Column>(ColumnPlace(place, from.key), from.description);
        column->Selected(from.selected);
        contents.columns.Add(column, from.key);
    }
    const auto table =
        makeRef<Table>(place, record.name, record.schema, record.sourceName, std::move(contents));
    // Not by the properties, which take singles and would round beyond 24 bits.
    table->mLeft = record.left;
    table->mTop = record.top;
    table->mWidth = record.width;
    table->mHeight = record.height;
    table->mSelected = record.selected;
    mTables->Add(table);
}

criteria::References Query::restored(const std::vector<NameRecord>& names) const {
    criteria::References references;
    for (const NameRecord& name : names)
        references.push_back(
            {static_cast<std::size_t>(name.begin), static_cast<std::size_t>(name.tableEnd),
             name.column.empty() ? ColumnPlace() : restoredEnd({name.table, name.column})});
    return references;
}

// Also an end that reads as nothing is of this query, so that it can be set again.
ColumnPlace Query::restoredEnd(const EndRecord& record) const {
    return {TablePlace(mTables, record.table), record.column};
}

} // namespace zandor::model
