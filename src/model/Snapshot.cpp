#include "model/Snapshot.h"

#include "model/Query.h"

#include <algorithm>
#include <unordered_map>

namespace model {

namespace {

TableState stateOf(Ref<Table> table) {
    return {table, table->Name(), table->Left(), table->Top(), table->Width(), table->Height()};
}

JoinState stateOf(Ref<Join> join) {
    return {join, join->left(), join->right(), join->JoinType(), join->CompareOperator()};
}

DefinitionState stateOf(Ref<ColumnDefinition> definition) {
    DefinitionState state{definition,
                          definition->place(),
                          definition->Synonym(),
                          definition->SortOrder(),
                          definition->Visible(),
                          {}};
    for (const auto& [row, criterium] : definition->criteria().rows())
        state.criteria.push_back({row, criterium->Criterium(), criterium->references()});
    return state;
}

template <class Object, class State, class Interface>
std::vector<State> statesOf(const TalvikZandorLib::Collection<Interface>& items) {
    std::vector<State> states;
    states.reserve(static_cast<std::size_t>(items.Count()));
    for (const auto& item : platform::Each<Interface>(items))
        states.push_back(stateOf(std::static_pointer_cast<Object>(item)));
    return states;
}

template <class State>
ListChange<State> difference(const std::vector<State>& before, const std::vector<State>& after) {
    ListChange<State> change;
    const auto compare = [&](const State& old, const State& now) {
        if (!(old == now)) change.changed.push_back({old, now});
    };
    const auto same = [](const State& old, const State& now) { return old.object == now.object; };
    // Nearly always all that there is; what it leaves is where something has come or gone.
    const auto [begin, nowBegin] =
        std::mismatch(before.begin(), before.end(), after.begin(), after.end(), same);
    for (auto old = before.begin(), now = after.begin(); old != begin;) compare(*old++, *now++);

    std::unordered_map<const void*, std::size_t> places;
    const auto first = static_cast<std::size_t>(nowBegin - after.begin());
    for (std::size_t at = first; at < after.size(); ++at) places[after[at].object.get()] = at;
    std::vector<bool> stayed(after.size(), false);
    std::size_t next = first;
    for (auto old = begin; old != before.end(); ++old) {
        const auto place = places.find(old->object.get());
        if (place == places.end() || place->second < next) {
            change.gone.push_back({static_cast<std::int32_t>(old - before.begin()) + 1, *old});
            continue;
        }
        compare(*old, after[place->second]);
        stayed[place->second] = true;
        next = place->second + 1;
    }
    for (std::size_t at = first; at < after.size(); ++at)
        if (!stayed[at]) change.come.push_back({static_cast<std::int32_t>(at) + 1, after[at]});
    return change;
}

} // namespace

Change Snapshot::update(Query& query) {
    const LastKeys last = query.lastKeys();
    auto tables = statesOf<Table, TableState>(query.Tables());
    auto joins = statesOf<Join, JoinState>(query.Joins());
    auto definitions = statesOf<ColumnDefinition, DefinitionState>(query.ColumnDefinitions());
    Change change{mLastKeys, last, difference(mTables, tables), difference(mJoins, joins),
                  difference(mDefinitions, definitions)};
    mLastKeys = last;
    mTables = std::move(tables);
    mJoins = std::move(joins);
    mDefinitions = std::move(definitions);
    return change;
}

} // namespace model
