#pragma once

#include "frontends/windows/automation/com/Value.h"

#include <string>
#include <vector>

/// What a late-bound call came to.
struct Outcome {
    HRESULT code = S_OK;
    zandor::automation::Value value;
    UINT wrong = 99;     ///< the place of the argument that was refused
    std::string failure; ///< what an exception says, in UTF-8

    explicit operator bool() const { return SUCCEEDED(code); }
    /// As text, in UTF-8.
    std::string text() const;
};

/// An object as a script has it: its members by name.
class Late {
public:
    using Values = std::vector<zandor::automation::Value>;

    Late(zandor::automation::Held<IDispatch> object) : mObject(std::move(object)) {}
    Late(IUnknown* object) : mObject(zandor::automation::Held<IDispatch>::of(object)) {}

    IDispatch* object() const { return mObject.get(); }

    /// DISPID_UNKNOWN where there is none.
    DISPID idOf(const wchar_t* name) const;
    Outcome get(const wchar_t* name) const { return invoke(name, DISPATCH_PROPERTYGET, {}); }
    template <class T>
    Outcome put(const wchar_t* name, T&& value) const {
        return invoke(name, DISPATCH_PROPERTYPUT, list(std::forward<T>(value)));
    }
    Outcome set(const wchar_t* name, IDispatch* object) const {
        return invoke(name, DISPATCH_PROPERTYPUTREF,
                      list(zandor::automation::Held<IDispatch>(object)));
    }
    template <class... Arguments>
    Outcome call(const wchar_t* name, Arguments&&... arguments) const {
        return invoke(name, DISPATCH_METHOD | DISPATCH_PROPERTYGET,
                      list(std::forward<Arguments>(arguments)...));
    }
    /// What a member or a call gives, as an object.
    template <class... Arguments>
    Late at(const wchar_t* name, Arguments&&... arguments) const {
        const Outcome outcome = call(name, std::forward<Arguments>(arguments)...);
        return outcome.value.vt == VT_DISPATCH ? Late(outcome.value.pdispVal) : Late(nullptr);
    }
    explicit operator bool() const { return bool(mObject); }

    /// Arguments in their order; named ones are those of the ids, the first arguments.
    Outcome invoke(const wchar_t* name, WORD how, Values arguments,
                   std::vector<DISPID> named = {}) const;

    template <class... Arguments>
    static Values list(Arguments&&... arguments) {
        Values values;
        (values.emplace_back(std::forward<Arguments>(arguments)), ...);
        return values;
    }

private:
    zandor::automation::Held<IDispatch> mObject;
};
