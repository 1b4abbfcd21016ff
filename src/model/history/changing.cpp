#include <Zandor/Query.h>

#include <algorithm>

// The query from one of its moments to another.

namespace zandor::model {

namespace {

/// Error 5 unless the list has what the change takes away, and is long enough for what it brings.
template <class Items, class State>
void require(const Items& items, const ListChange<State>& change) {
    auto count = items.Count();
    for (const auto& gone : change.gone)
        if (gone.position > count || items.Item(gone.position) != gone.state.object)
            throw platform::errors::invalidProcedureCall();
    for (const auto& pair : change.changed)
        if (!items.Contains(pair.before.object->Key()))
            throw platform::errors::invalidProcedureCall();
    count -= static_cast<std::int32_t>(change.gone.size());
    for (const auto& come : change.come) {
        const String key = come.state.object->Key();
        const bool stays =
            items.Contains(key) &&
            std::none_of(change.gone.begin(), change.gone.end(),
                         [&](const auto& gone) { return gone.state.object->Key() == key; });
        if (stays || come.position > ++count) throw platform::errors::invalidProcedureCall();
    }
}

template <class Items, class State, class Set>
void apply(Items& items, const ListChange<State>& change, Set set) {
    for (const auto& gone : change.gone) items.Remove(gone.state.object->Key());
    for (const auto& come : change.come) {
        set(come.state);
        items.Insert(come.position, come.state.object);
    }
    for (const auto& pair : change.changed) set(pair.after);
}

} // namespace

void Query::apply(const Change& change) {
    if (change.lastBefore != lastKeys() || change.optionsBefore != options())
        throw platform::errors::invalidProcedureCall();
    require(*mTables, change.tables);
    require(mJoins, change.joins);
    require(mDefinitions, change.definitions);

    mOptions = change.optionsAfter;
    const auto put = [this](const auto& state) { set(state); };
    model::apply(*mTables, change.tables, put);
    model::apply(mJoins, change.joins, put);
    model::apply(mDefinitions, change.definitions, put);
    mLastTable = change.lastAfter.table;
    mLastColumn = change.lastAfter.column;
    mLastJoin = change.lastAfter.join;
    mLastDefinition = change.lastAfter.definition;
}

void Query::set(const TableState& state) {
    Table& table = *state.object;
    table.mName = state.name;
    // Not by the properties, which take singles and would round beyond 24 bits.
    table.mLeft = state.left;
    table.mTop = state.top;
    table.mWidth = state.width;
    table.mHeight = state.height;
    table.mContents = state.contents;
}

void Query::set(const JoinState& state) {
    Join& join = *state.object;
    join.mLeft = state.left;
    join.mRight = state.right;
    join.mJoinType = state.type;
    join.mCompareOperator = state.comparison;
}

void Query::set(const DefinitionState& state) {
    ColumnDefinition& definition = *state.object;
    definition.mPlace = state.column;
    definition.mSynonym = state.synonym;
    definition.mSortOrder = state.sortOrder;
    definition.mVisible = state.visible;
    definition.mWidth = state.width;
    definition.mTotal = state.total;
    definition.mSortPriority = state.sortPriority;
    definition.mExpression = state.expression;
    definition.mFormat = state.format;
    definition.mDecimals = state.decimals;
    definition.mCriteria.clear();
    for (const CriterionState& criterion : state.criteria) {
        definition.mCriteria.Add(criterion.text.text, platform::decimal(criterion.row));
        definition.mCriteria.rows().at(criterion.row)->tie(criterion.text);
    }
}

} // namespace zandor::model
