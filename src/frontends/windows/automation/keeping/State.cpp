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

std::size_t indexOf(StringView name) {
    const auto& members = keptMembers();
    return static_cast<std::size_t>(
        std::find_if(members.begin(), members.end(),
                     [&](const Member* member) { return member->name == name; }) -
        members.begin());
}

std::int16_t numberAt(const State& state, StringView name) {
    return std::get<std::int16_t>(state[indexOf(name)]);
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

const std::vector<std::size_t>& writingOrder() {
    static const std::vector<std::size_t> order = [] {
        const auto& members = keptMembers();
        const std::size_t traces = indexOf(u"DebugSwitch");
        const std::size_t layout = indexOf(u"OnlyJoin");
        std::vector<std::size_t> places;
        const auto add = [&](TalvikDBxZandor::automation::Kind kind) {
            for (std::size_t n = 0; n < members.size(); ++n)
                if (members[n]->kind == kind && n != traces && n != layout) places.push_back(n);
        };
        // The grid takes its titles with the layout, which comes before all places.
        add(TalvikDBxZandor::automation::Kind::field);
        places.push_back(layout);
        add(TalvikDBxZandor::automation::Kind::property);
        places.push_back(traces);
        return places;
    }();
    return order;
}

void restore(Zandor& control, const State& state) {
    control.DebugSwitch(0);
    for (const std::size_t n : writingOrder()) keptMembers()[n]->set(control, state[n]);
}

std::optional<std::size_t> impossibleIn(const State& state) {
    const auto& members = keptMembers();
    for (std::size_t n = 0; n < members.size(); ++n)
        if (!isOfType(state[n], members[n]->type)) return n;
    if (!isWithin(state, u"HorizontalScrollbarPos", u"HorizMaxScrollPos"))
        return indexOf(u"HorizontalScrollbarPos");
    if (!isWithin(state, u"VerticalScrollbarPos", u"VertMaxScrollPos"))
        return indexOf(u"VerticalScrollbarPos");
    for (const StringView frame : {u"VisibleFrameLeft", u"VisibleFrameTop"})
        if (numberAt(state, frame) < 0) return indexOf(frame);
    return {};
}

bool isPossible(const State& state) {
    return state.size() == keptMembers().size() && !impossibleIn(state);
}

} // namespace zandor::automation
