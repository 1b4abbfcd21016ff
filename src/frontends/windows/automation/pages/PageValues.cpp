#include "frontends/windows/automation/pages/PageValues.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/control/Conversion.h"

#include <algorithm>

namespace zandor::automation {

namespace {

using platform::String;
using platform::StringView;
using platform::Variant;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Type;

constexpr StringView yes = u"True";
constexpr StringView no = u"False";

String shown(const Variant& value) {
    if (const bool* const flag = std::get_if<bool>(&value)) return String(*flag ? yes : no);
    return stringOf(toHost(value));
}

Variant understood(Type type, const String& text) {
    if (type == Type::Boolean) return text == yes;
    return fromHost(type, Value(StringView(text)));
}

DISPID numberOf(const Member& member) { return static_cast<DISPID>(member.dispatchId); }

Value read(IDispatch& object, const Member& member) {
    DISPPARAMS none{};
    Value value;
    require(object.Invoke(numberOf(member), IID_NULL, LOCALE_USER_DEFAULT, DISPATCH_PROPERTYGET,
                          &none, &value, nullptr, nullptr));
    return value;
}

HRESULT write(IDispatch& object, const Member& member, const Variant& wanted) {
    Value value = toHost(wanted);
    DISPID put = DISPID_PROPERTYPUT;
    DISPPARAMS given{&value, &put, 1, 1};
    return object.Invoke(numberOf(member), IID_NULL, LOCALE_USER_DEFAULT, DISPATCH_PROPERTYPUT,
                         &given, nullptr, nullptr, nullptr);
}

} // namespace

bool PageValues::isFlag(std::size_t row) const { return keptMembers()[row]->type == Type::Boolean; }

void PageValues::setObjects(std::vector<Held<IDispatch>> objects) {
    mWanted.assign(size(), {});
    mStates.clear();
    mObjects = std::move(objects);
    try {
        read();
    } catch (...) {
        mObjects.clear();
        mStates.clear();
        throw;
    }
}

void PageValues::read() {
    const auto objects = mObjects;
    std::vector<State> states;
    for (const auto& object : objects) {
        State state;
        for (const Member* const member : keptMembers())
            state.push_back(fromHost(member->type, automation::read(*object.get(), *member)));
        states.push_back(std::move(state));
    }
    mStates = std::move(states);
}

String PageValues::text(std::size_t row) const {
    if (mWanted[row]) return *mWanted[row];
    if (mStates.empty()) return {};
    const Variant& first = mStates.front()[row];
    const bool same =
        std::ranges::all_of(mStates, [&](const State& state) { return state[row] == first; });
    return same ? shown(first) : String();
}

void PageValues::want(std::size_t row, const String& text) {
    mWanted[row].reset();
    if (hasObjects() && text != this->text(row)) mWanted[row] = text;
}

bool PageValues::isDirty() const {
    return std::ranges::any_of(mWanted, [](const auto& wanted) { return wanted.has_value(); });
}

std::optional<std::size_t> PageValues::rowOf(DISPID member) {
    const auto& members = keptMembers();
    const auto found = std::ranges::find_if(
        members, [&](const Member* known) { return numberOf(*known) == member; });
    if (found == members.end()) return {};
    return static_cast<std::size_t>(found - members.begin());
}

std::optional<PageValues::Refusal> PageValues::apply() {
    std::vector<std::optional<Variant>> values(size());
    for (std::size_t row = 0; row < size(); ++row) {
        if (!mWanted[row]) continue;
        try {
            values[row] = understood(keptMembers()[row]->type, *mWanted[row]);
        } catch (const platform::RuntimeError&) {
            return Refusal{row, String(name(row)) + u" takes a whole number from -32768 to 32767."};
        }
    }
    for (State state : mStates) {
        for (std::size_t row = 0; row < size(); ++row)
            if (values[row]) state[row] = *values[row];
        if (const auto row = impossibleIn(state))
            return Refusal{*row, String(name(*row)) +
                                     u" takes no number below 0 and none beyond the end of its "
                                     u"scroll bar."};
    }
    // A control may do anything as it is written to, give this other controls among it.
    const auto objects = mObjects;
    for (const std::size_t row : writingOrder())
        for (const auto& object : objects) {
            if (!values[row]) continue;
            const HRESULT written = write(*object.get(), *keptMembers()[row], *values[row]);
            if (FAILED(written))
                return Refusal{row, String(name(row)) + u": " + errorOf(written).Description};
        }
    mWanted.assign(size(), {});
    read();
    return {};
}

} // namespace zandor::automation
