#include "model/sql_reader/Columns.h"

#include "model/criteria/Writer.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Sameness.h"

#include <Zandor/sql/Builder.h>

#include <algorithm>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

bool isTotal(const Node& node) { return node && sql::holds<sql::Aggregate>(*node); }

} // namespace

Columns::Columns(Query& query, const Selected& selected) : mQuery(query), mSelected(selected) {
    const sql::Statement& statement = selected.statement;
    mTotals = isTotal(statement.having);
    for (const auto& item : statement.items)
        if (const auto* node = std::get_if<Node>(&item.what)) mTotals = mTotals || isTotal(*node);
    for (const auto& item : statement.order) mTotals = mTotals || isTotal(item.value);
    mGrouped = mTotals || !statement.group.empty();
}

void Columns::addItems() {
    for (const auto& item : mSelected.statement.items) {
        if (const auto* all = std::get_if<sql::AllColumns>(&item.what))
            addAllOf(all->table);
        else
            add(std::get<Node>(item.what), true, item.name);
    }
    for (const Node& group : mSelected.statement.group)
        if (!find(group, false)) add(group, false);
}

void Columns::addAllOf(const String& table) {
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(mQuery.tableNamed(table)->Columns().Item(1));
    mQuery.AddColumnDefinition(definition);
}

Columns::Column& Columns::add(const Node& subject, bool visible, const String& name) {
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    fill(*definition, subject);
    definition->Visible(visible);
    mQuery.AddColumnDefinition(definition);
    const auto* column = std::get_if<ColumnRef>(&subject->node);
    if (!column || column->column != name) definition->Synonym(name);
    mColumns.push_back(
        {model::criteria::Subject(subject, definition->Column()->Name()), definition});
    return mColumns.back();
}

void Columns::fill(model::ColumnDefinition& definition, const Node& subject) {
    const auto* total = std::get_if<sql::Aggregate>(&subject->node);
    if (!total) {
        // Without a total somewhere nothing else says that rows are put together.
        if (mGrouped && !mTotals) definition.total(model::Total::Group);
        return fillValue(definition, subject);
    }
    definition.total(total->total);
    if (total->operand)
        fillValue(definition, total->operand);
    else
        definition.Column(mQuery.Tables().Item(1)->Columns().Item(1));
}

void Columns::fillValue(model::ColumnDefinition& definition, const Node& value) {
    if (const auto* column = std::get_if<ColumnRef>(&value->node)) {
        definition.Column(mQuery.tableNamed(column->table)->columnNamed(column->column));
        return;
    }
    const auto text = model::criteria::written(value);
    if (!text) refusePart<MessageCode::totalWithin>(mSelected.placeOf(value));
    definition.expression(*text);
}

Columns::Column* Columns::find(const Node& subject, bool apart) {
    const auto at = std::find_if(mColumns.begin(), mColumns.end(), [&](const Column& column) {
        const bool chooses = column.definition->total() == model::Total::Condition;
        return chooses == apart && sql::same(column.subject.node, subject);
    });
    return at == mColumns.end() ? nullptr : &*at;
}

Columns::Column* Columns::knownFor(const Node& subject, bool apart) {
    const bool total = std::holds_alternative<sql::Aggregate>(subject->node);
    if (!mGrouped || total) return find(subject, false);
    // What rows are put together by can as well be asked before.
    Column* grouped = apart ? nullptr : find(subject, false);
    return grouped ? grouped : find(subject, true);
}

Columns::Column& Columns::forCondition(const Node& subject, bool apart) {
    if (Column* known = knownFor(subject, apart)) return *known;
    Column& made = add(subject, false);
    const bool total = std::holds_alternative<sql::Aggregate>(subject->node);
    if (mGrouped && !total) made.definition->total(model::Total::Condition);
    return made;
}

void Columns::moveNewestBefore(const Column& other) {
    Ref<TalvikZandorLib::ZDColumnDefinition> before;
    for (const auto& each :
         platform::Each<TalvikZandorLib::ZDColumnDefinition>(mQuery.ColumnDefinitions())) {
        if (each == other.definition) break;
        before = each;
    }
    mQuery.StandsBehind(mColumns.back().definition, before);
}

void Columns::dropOwnNames() {
    std::vector<std::pair<Ref<model::ColumnDefinition>, String>> named;
    for (const Column& column : mColumns)
        if (column.definition->comesOut()) {
            named.emplace_back(column.definition, column.definition->Synonym());
            column.definition->Synonym({});
        }
    const sql::Built built = sql::build(mQuery);
    std::size_t next = 0;
    for (const auto& item : built.statement->items) {
        if (std::holds_alternative<sql::AllColumns>(item.what) || next == named.size()) continue;
        const auto& [definition, name] = named[next++];
        if (name != item.name) definition->Synonym(name);
    }
}

void Columns::sort() {
    std::vector<Ref<model::ColumnDefinition>> sorted;
    for (const auto& item : mSelected.statement.order) {
        if (std::holds_alternative<sql::Value>(item.value->node)) continue;
        Column* known = find(item.value, false);
        Column& column = known ? *known : add(item.value, false);
        if (column.definition->SortOrder() != 0) continue;
        column.definition->SortOrder(item.descending ? 2 : 1);
        sorted.push_back(column.definition);
    }
    std::vector<Ref<model::ColumnDefinition>> inOrder;
    for (const Column& column : mColumns)
        if (column.definition->SortOrder() != 0) inOrder.push_back(column.definition);
    if (inOrder == sorted) return;
    std::int16_t priority = 0;
    for (const auto& definition : sorted) {
        if (priority == model::ColumnDefinition::greatestSortPriority) return;
        definition->sortPriority(++priority);
    }
}

} // namespace zandor::sql_reader
