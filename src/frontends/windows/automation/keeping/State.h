#pragma once

#include <Zandor/Interface.h>

#include <optional>
#include <vector>

namespace zandor::automation {

/// What a container keeps of a control: the values of its kept members, in their order.
using State = std::vector<platform::Variant>;

/// Every member that is written, but for the query: that has a life of its own.
const std::vector<const TalvikDBxZandor::automation::Member*>& keptMembers();

/// The kept members by their places in that list, as they are to be written one after the other.
const std::vector<std::size_t>& writingOrder();

State stateOf(TalvikDBxZandor::Zandor& control);
/// Writes all of them. The control has nothing to report where they are possible.
void restore(TalvikDBxZandor::Zandor& control, const State& state);
/// Whether a control can have this state: of each member the type, and no place beyond a scroll
/// bar's end.
bool isPossible(const State& state);
/// The first member, by its place, that a control cannot have with the others; nothing: it can have
/// all of them.
std::optional<std::size_t> impossibleIn(const State& state);

} // namespace zandor::automation
