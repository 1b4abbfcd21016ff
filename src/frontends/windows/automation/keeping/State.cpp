#include "frontends/windows/automation/keeping/State.h"

#include <algorithm>

namespace zandor::automation {

using platform::StringView;
using platform::Variant;
using TalvikDBxZandor::Zandor;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Setter;
using TalvikDBxZandor::automation::Type;

namespace {

bool isOfType(const Variant& value, Type type) {
    switch (type) {
    case Type::String: return std::holds_alternative<platform::String>(value);
    case Type::Boolean: return std::holds_alternative<bool>(value);
    case Type::Integer: return std::holds_alternative<std::int16_t>(value);
    default: return false;
    }
}

std::size_t placeOf(StringView name) {
    const auto& members = keptMembers();
    return static_cast<std::size_t>(
        std::find_if(members.begin(), members.end(),
                     [&](const Member* member) { return member->name == name; }) -
        members.begin());
}

std::int16_t numberAt(const State& state, StringView name) {
    return std::get<std::int16_t>(state[placeOf(name)]);
}

bool isWithin(const State& state, StringView place, StringView end) {
    return numberAt(state, place) >= 0 && numberAt(state, place) <= numberAt(state, end);
}

} // namespace

const std::vector<const Member*>& keptMembers() {
    static const std::vector<const Member*> kept = [] {
        std::vector<const Member*> found;
        for (const Member& member : TalvikDBxZandor::automation::members())
            if (member.setter == Setter::byValue || member.setter == Setter::byReference)
                found.push_back(&member);
        return found;
    }();
    return kept;
}

State stateOf(Zandor& control) {
    State state;
    for (const Member* const member : keptMembers()) state.push_back(member->get(control));
    return state;
}

void restore(Zandor& control, const State& state) {
    const auto& members = keptMembers();
    const auto write = [&](std::size_t n) { members[n]->set(control, state[n]); };
    const std::size_t traces = placeOf(u"DebugSwitch");
    const std::size_t layout = placeOf(u"OnlyJoin");
    control.DebugSwitch(0);
    // The grid takes its titles with this one, which lays out anew and so comes before all places.
    for (std::size_t n = 0; n < members.size(); ++n)
        if (members[n]->kind == TalvikDBxZandor::automation::Kind::field) write(n);
    write(layout);
    for (std::size_t n = 0; n < members.size(); ++n)
        if (members[n]->kind == TalvikDBxZandor::automation::Kind::property && n != traces &&
            n != layout)
            write(n);
    write(traces);
}

bool isPossible(const State& state) {
    const auto& members = keptMembers();
    if (state.size() != members.size()) return false;
    for (std::size_t n = 0; n < members.size(); ++n)
        if (!isOfType(state[n], members[n]->type)) return false;
    return isWithin(state, u"HorizontalScrollbarPos", u"HorizMaxScrollPos") &&
           isWithin(state, u"VerticalScrollbarPos", u"VertMaxScrollPos") &&
           numberAt(state, u"VisibleFrameLeft") >= 0 && numberAt(state, u"VisibleFrameTop") >= 0;
}

} // namespace zandor::automation
