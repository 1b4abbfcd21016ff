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

Columns::Columns(Query& query, const Selected& selected, bool written)
    : mQuery(query), mSelected(selected), mWritten(written) {
    const sql::Statement& statement = selected.statement;
    mTotals = isTotal(statement.having);
    for (const auto& item : statement.items)
        if (const auto* node = std::get_if<Node>(&item.what)) mTotals = mTotals || isTotal(*node);
    for (const auto& item : statement.order) mTotals = mTotals || isTotal(item.value);
    mGrouped = mTotals || !statement.group.empty();
}

/// Where nothing is shown, all that rows are put together by and into comes out, without names.
bool Columns::isNameless() const {
    const auto& items = mSelected.statement.items;
    return mWritten && mGrouped && std::all_of(items.begin(), items.end(), [](const auto& item) {
               return item.name.empty();
           });
}

void Columns::addItems() {
    const bool shown = !isNameless();
    for (const auto& item : mSelected.statement.items) {
        if (const auto* all = std::get_if<sql::AllColumns>(&item.what))
            addAllOf(all->table);
        else
            mItems.push_back(add(std::get<Node>(item.what), shown, item.name).definition);
    }
    addGroups();
}

/// Rows are put together in the order of the grid.
void Columns::addGroups() {
    addInOrder(
        mSelected.statement.group, [this](const Node& group) { return find(group, false); },
        [this](const Node& group) -> Column& { return add(group, false); });
}

std::vector<Columns::Column*>
Columns::addInOrder(const std::vector<Node>& subjects,
                    const std::function<std::vector<Column*>(const Node&)>& known,
                    const std::function<Column&(const Node&)>& make) {
    std::vector<Column*> columns;
    for (const Node& subject : subjects) {
        const auto all = known(subject);
        columns.push_back(all.empty() ? nullptr : all.front());
    }
    std::vector<const Column*> next(subjects.size()); // known, behind each
    for (std::size_t n = subjects.size(); n > 1; --n)
        next[n - 2] = columns[n - 1] ? columns[n - 1] : next[n - 1];
    for (std::size_t n = 0; n < subjects.size(); ++n) {
        if (columns[n]) continue;
        // It may be one that was just made.
        if (const auto all = known(subjects[n]); !all.empty()) {
            columns[n] = all.front();
            continue;
        }
        columns[n] = &make(subjects[n]);
        if (next[n]) moveNewestBefore(*next[n]);
    }
    return columns;
}

void Columns::addAllOf(const String& table) {
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(mQuery.tableNamed(table)->Columns().Item(1));
    mQuery.AddColumnDefinition(definition);
    mItems.push_back(definition);
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

std::vector<Columns::Column*> Columns::find(const Node& subject, bool apart) {
    std::vector<Column*> found;
    for (Column& column : mColumns) {
        const bool chooses = column.definition->total() == model::Total::Condition;
        if (chooses == apart && sql::same(column.subject.node, subject)) found.push_back(&column);
    }
    return found;
}

std::vector<Columns::Column*> Columns::knownFor(const Node& subject, bool apart) {
    const bool total = std::holds_alternative<sql::Aggregate>(subject->node);
    std::vector<Column*> known;
    // What rows are put together by can as well be asked before.
    if (!mGrouped || total || !apart) known = find(subject, false);
    if (known.empty() && mGrouped && !total) known = find(subject, true);
    std::sort(known.begin(), known.end(), [&](const Column* one, const Column* other) {
        return placeOf(*one) < placeOf(*other);
    });
    return known;
}

std::vector<Columns::Column*> Columns::forConditions(const std::vector<Node>& subjects,
                                                     bool apart) {
    return addInOrder(
        subjects, [&](const Node& subject) { return knownFor(subject, apart); },
        [this](const Node& subject) -> Column& { return addForCondition(subject); });
}

Columns::Column& Columns::addForCondition(const Node& subject) {
    Column& made = add(subject, false);
    const bool total = std::holds_alternative<sql::Aggregate>(subject->node);
    if (mGrouped && !total) made.definition->total(model::Total::Condition);
    return made;
}

Columns::Column& Columns::ownForCondition(const Node& subject, const Column* behind) {
    Column& made = addForCondition(subject);
    mQuery.StandsBehind(made.definition, behind ? behind->definition : nullptr);
    return made;
}

std::size_t Columns::placeOf(const Column& column) const {
    std::size_t place = 0;
    for (const auto& each :
         platform::Each<TalvikZandorLib::ZDColumnDefinition>(mQuery.ColumnDefinitions())) {
        if (each == column.definition) break;
        ++place;
    }
    return place;
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
    std::vector<const Column*> sorted;
    for (const auto& item : mSelected.statement.order) {
        if (std::holds_alternative<sql::Value>(item.value->node)) continue;
        auto known = find(item.value, false);
        if (known.empty()) known = {&add(item.value, false)};
        const auto free = std::find_if(known.begin(), known.end(), [](const Column* column) {
            return column->definition->SortOrder() == 0;
        });
        // What sorted already leaves nothing to sort.
        if (free == known.end() && !mWritten) continue;
        Column& column = free == known.end() ? add(item.value, false) : **free;
        column.definition->SortOrder(item.descending ? 2 : 1);
        sorted.push_back(&column);
    }
    std::vector<std::size_t> places;
    for (const Column* column : sorted) places.push_back(placeOf(*column));
    if (std::is_sorted(places.begin(), places.end())) return;
    std::int16_t priority = 0;
    for (const Column* column : sorted) {
        if (priority == model::ColumnDefinition::greatestSortPriority) return;
        column->definition->sortPriority(++priority);
    }
}

} // namespace zandor::sql_reader
