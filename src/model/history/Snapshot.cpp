#include <Zandor/model/Snapshot.h>

#include <Zandor/Query.h>

#include <algorithm>
#include <iterator>
#include <unordered_set>

namespace zandor::model {

namespace {

TableState stateOf(const Ref<Table>& table) {
    return {table,          table->Name(),   table->Left(),    table->Top(),
            table->Width(), table->Height(), table->contents()};
}

JoinState stateOf(const Ref<Join>& join) {
    return {join, join->left(), join->right(), join->JoinType(), join->CompareOperator()};
}

DefinitionState stateOf(const Ref<ColumnDefinition>& definition) {
    DefinitionState state{definition,
                          definition->place(),
                          definition->Synonym(),
                          definition->SortOrder(),
                          definition->Visible(),
                          definition->Width(),
                          {},
                          definition->total(),
                          definition->sortPriority(),
                          definition->expression(),
                          definition->format(),
                          definition->decimals()};
    for (const auto& [row, criterium] : definition->criteria().rows())
        state.criteria.push_back({row, criterium->tied()});
    return state;
}

using Revisions = std::vector<const Revision*>;
using Places = std::unordered_map<const Revision*, std::int32_t>;

/// The most items whose places rise in the order given: those that stand where they stood if all
/// others have moved. So one item that a user moves is one that has moved, however far it went.
std::unordered_set<const Revision*> longestRising(const Revisions& items, const Places& places) {
    // Of all rising sequences of a length, the one that ends lowest.
    std::vector<std::size_t> ends;
    std::vector<std::size_t> before(items.size());
    const auto place = [&](std::size_t n) { return places.at(items[n]); };
    for (std::size_t n = 0; n < items.size(); ++n) {
        const auto at = std::partition_point(
            ends.begin(), ends.end(), [&](std::size_t end) { return place(end) < place(n); });
        before[n] = at == ends.begin() ? items.size() : *std::prev(at);
        if (at == ends.end())
            ends.push_back(n);
        else
            *at = n;
    }
    std::unordered_set<const Revision*> longest;
    for (std::size_t n = ends.empty() ? items.size() : ends.back(); n < items.size(); n = before[n])
        longest.insert(items[n]);
    return longest;
}

} // namespace

template <class State>
template <class Object, class Interface>
ListChange<State> Snapshot::List<State>::update(const Items<Object, Interface>& items,
                                                const std::vector<const Revision*>& revised) {
    ListChange<State> change;
    if (std::find(revised.begin(), revised.end(), &items.revision()) != revised.end())
        updateOrder(items, change);
    for (const Revision* revision : revised) {
        const auto known = mStates.find(revision);
        if (known == mStates.end()) continue;
        State& state = known->second;
        State now = stateOf(state.object);
        if (state == now) continue;
        change.changed.push_back({std::exchange(state, now), now});
    }
    if (change.changed.size() > 1) sort(change.changed);
    return change;
}

template <class State>
template <class Object, class Interface>
void Snapshot::List<State>::updateOrder(const Items<Object, Interface>& items,
                                        ListChange<State>& change) {
    const std::vector<const Revision*> before = std::move(mOrder);
    mOrder.clear();
    for (std::int32_t position = 1; position <= items.Count(); ++position)
        mOrder.push_back(&items.own(position)->revision());
    const auto& after = mOrder;

    // What is between the ends that are alike has come, gone or moved.
    const auto [begin, nowBegin] =
        std::mismatch(before.begin(), before.end(), after.begin(), after.end());
    const auto [end, nowEnd] = std::mismatch(before.rbegin(), std::make_reverse_iterator(begin),
                                             after.rbegin(), std::make_reverse_iterator(nowBegin));
    const auto positionOf = [](const auto& list, auto at) {
        return static_cast<std::int32_t>(at - list.begin()) + 1;
    };
    std::unordered_map<const Revision*, std::int32_t> places;
    for (auto now = nowBegin; now != nowEnd.base(); ++now)
        places.emplace(*now, positionOf(after, now));
    std::vector<const Revision*> stayed;
    for (auto old = begin; old != end.base(); ++old)
        if (places.contains(*old)) stayed.push_back(*old);
    const auto still = longestRising(stayed, places);
    for (auto old = begin; old != end.base(); ++old) {
        if (still.contains(*old)) continue;
        auto state = mStates.extract(*old);
        change.gone.push_back({positionOf(before, old), std::move(state.mapped())});
    }
    for (auto now = nowBegin; now != nowEnd.base(); ++now) {
        if (still.contains(*now)) continue;
        const std::int32_t position = positionOf(after, now);
        const State& state = mStates.emplace(*now, stateOf(items.own(position))).first->second;
        change.come.push_back({position, state});
    }
}

/// Into the order of the list.
template <class State>
void Snapshot::List<State>::sort(std::vector<typename ListChange<State>::Pair>& changed) const {
    std::unordered_map<const Revision*, std::size_t> positions;
    for (std::size_t position = 0; position < mOrder.size(); ++position)
        positions[mOrder[position]] = position;
    const auto at = [&](const auto& pair) { return positions.at(&pair.after.object->revision()); };
    std::sort(changed.begin(), changed.end(),
              [&](const auto& left, const auto& right) { return at(left) < at(right); });
}

Change Snapshot::update(Query& query) {
    const auto revised = query.mLog->since(mMoment);
    Change change{mLastKeys,
                  query.lastKeys(),
                  mOptions,
                  query.options(),
                  mTables.update(*query.mTables, revised),
                  mJoins.update(query.mJoins, revised),
                  mDefinitions.update(query.mDefinitions, revised)};
    mMoment = query.mLog->now();
    mLastKeys = change.lastAfter;
    mOptions = change.optionsAfter;
    return change;
}

} // namespace zandor::model
