#include "frontends/windows/automation/control/ControlObject.h"

#include "frontends/windows/automation/control/Conversion.h"
#include "frontends/windows/automation/model/Exchange.h"

#include <algorithm>

// The public interface early-bound. What a member does stands in the control's own table.

namespace zandor::automation {

namespace {

const TalvikDBxZandor::automation::Member& memberOf(std::uint32_t number) {
    const auto members = TalvikDBxZandor::automation::members();
    return *std::find_if(members.begin(), members.end(),
                         [&](const auto& member) { return member.dispatchId == number; });
}

void hand(Value& value, BSTR& place) {
    place = value.bstrVal;
    VariantInit(&value);
}
void hand(Value& value, SHORT& place) { place = value.iVal; } // a flag is one, too

VARIANT lent(BSTR text) {
    VARIANT value;
    VariantInit(&value);
    value.vt = VT_BSTR;
    value.bstrVal = text;
    return value;
}
VARIANT lent(SHORT number) {
    VARIANT value;
    VariantInit(&value);
    value.vt = VT_I2;
    value.iVal = number;
    return value;
}

} // namespace

template <class Raw>
HRESULT ControlObject::read(std::uint32_t number, Raw* value) {
    return answer([&] {
        const Held<_Zandor> meanwhile(this);
        Raw& place = placeOf(value);
        Value held = toHost(memberOf(number).get(mHouse->control()));
        hand(held, place);
    });
}

template <class Raw>
HRESULT ControlObject::write(std::uint32_t number, Raw value) {
    return answer([&] {
        const Held<_Zandor> meanwhile(this);
        const auto& member = memberOf(number);
        member.set(mHouse->control(), fromHost(member.type, lent(value)));
        pictureChanged();
    });
}

/// An object of the host's own that has no such interface is to be had late-bound: error 13.
template <class Object>
HRESULT ControlObject::readObject(std::uint32_t number, Object** value) {
    return answer([&] {
        const Held<_Zandor> meanwhile(this);
        Object*& place = placeOf(value);
        place = nullptr;
        const Value held = toHost(memberOf(number).get(mHouse->control()));
        if (!held.pdispVal) return;
        place = Held<Object>::of(held.pdispVal).detach();
        if (!place) throw platform::errors::typeMismatch();
    });
}

// clang-format off
#define ZANDOR_MEMBER(number, type, name) \
    STDMETHODIMP ControlObject::get_##name(type* value) { return read(number, value); } \
    STDMETHODIMP ControlObject::put_##name(type value) { return write(number, value); }
#define ZANDOR_MEMBER_BY_REFERENCE(number, type, name) \
    STDMETHODIMP ControlObject::get_##name(type* value) { return read(number, value); } \
    STDMETHODIMP ControlObject::put_##name(type* value) { \
        return value ? write(number, *value) : leave(platform::errors::invalidProcedureCall()); \
    }
#define ZANDOR_OBJECT(number, type, name) \
    STDMETHODIMP ControlObject::get_##name(type** value) { return readObject(number, value); } \
    STDMETHODIMP ControlObject::putref_##name(type* value) { \
        return answer([&] { \
            const Held<_Zandor> meanwhile(this); \
            memberOf(number).set(mHouse->control(), fromHost<TalvikZandorLib::Zandor>(value)); \
            pictureChanged(); \
        }); \
    }
#define ZANDOR_NOTHING(number, type, name) \
    STDMETHODIMP ControlObject::get_##name(type** value) { return readObject(number, value); }
#include "frontends/windows/automation/members.def"
// clang-format on

STDMETHODIMP ControlObject::Terminate() {
    const Held<_Zandor> meanwhile(this);
    mHouse->control().Terminate();
    pictureChanged();
    return S_OK;
}

STDMETHODIMP ControlObject::SelectColumnNames(BSTR* TabName, BSTR* ColName) {
    return answer([&] {
        const Held<_Zandor> meanwhile(this);
        mHouse->control().SelectColumnNames(textOf(placeOf(TabName)), textOf(placeOf(ColName)));
        pictureChanged();
    });
}

STDMETHODIMP ControlObject::SetCurrentTable(BSTR TabName) {
    return answer([&] {
        const Held<_Zandor> meanwhile(this);
        mHouse->control().SetCurrentTable(textOf(TabName));
        pictureChanged();
    });
}

} // namespace zandor::automation
