#pragma once

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Value.h"

#include <type_traits>

namespace zandor::automation {

/// An object that a host has handed over, behind one of the model's classes. A failure of it is
/// thrown with its number and its text.
class HostObject {
public:
    explicit HostObject(IDispatch* object) : mObject(object) {}
    HostObject(const HostObject&) = delete;
    HostObject& operator=(const HostObject&) = delete;
    virtual ~HostObject() = default;

    const Held<IDispatch>& dispatch() const { return mObject; }

protected:
    // By name. Error 438 where there is no such member.
    Value get(const wchar_t* member) const; ///< a value
    template <class... Arguments>
    Value call(const wchar_t* member, Arguments&&... arguments) const {
        // Backwards, as the system has them.
        Value values[sizeof...(arguments)];
        std::size_t place = sizeof...(arguments);
        ((values[--place] = Value(std::forward<Arguments>(arguments))), ...);
        return invoke(member, DISPATCH_METHOD | DISPATCH_PROPERTYGET, values, sizeof...(arguments));
    }
    void put(const wchar_t* member, Value value) const; ///< writes a value, or sets an object
    bool has(const wchar_t* member) const;

    // By an interface where the object has it, and by name otherwise.
    template <class Typed, class Raw>
    Value get(const wchar_t* member, const Held<Typed>& typed,
              HRESULT (STDMETHODCALLTYPE Typed::*getter)(Raw*)) const {
        if (!typed) return get(member);
        Raw raw{};
        require((typed.get()->*getter)(&raw), typed.get(), __uuidof(Typed));
        return Value::taken(raw);
    }
    template <class Typed, class Raw>
    void put(const wchar_t* member, Value value, const Held<Typed>& typed,
             HRESULT (STDMETHODCALLTYPE Typed::*setter)(Raw)) const {
        if (!typed) return put(member, std::move(value));
        require((typed.get()->*setter)(rawOf<Raw>(value)), typed.get(), __uuidof(Typed));
    }

private:
    Value invoke(const wchar_t* member, WORD how, Value* arguments, std::size_t count) const;

    template <class Raw>
    static Raw rawOf(const Value& value) {
        if constexpr (std::is_same_v<Raw, BSTR>)
            return value.bstrVal;
        else if constexpr (std::is_same_v<Raw, IDispatch*>)
            return value.pdispVal;
        else
            return value.iVal; // a flag is one, too
    }

    const Held<IDispatch> mObject;
};

} // namespace zandor::automation
