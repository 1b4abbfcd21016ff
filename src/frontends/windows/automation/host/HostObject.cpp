#include "frontends/windows/automation/host/HostObject.h"

#include "frontends/windows/automation/com/Text.h"

#include <dispex.h>

namespace zandor::automation {

namespace {

/// What an object says of its own failure.
platform::RuntimeError errorOf(EXCEPINFO& failure) {
    if (failure.pfnDeferredFillIn) failure.pfnDeferredFillIn(&failure);
    // Either a code of the system's kind or a number of the host's own.
    platform::RuntimeError error = failure.wCode != 0
                                       ? platform::RuntimeError{failure.wCode, u"Automation error"}
                                       : automation::errorOf(failure.scode);
    if (failure.bstrDescription) error.Description = textOf(failure.bstrDescription);
    SysFreeString(failure.bstrSource);
    SysFreeString(failure.bstrDescription);
    SysFreeString(failure.bstrHelpFile);
    return error;
}

// Objects of a script may have their members by IDispatchEx alone.

HRESULT find(IDispatch& object, const wchar_t* member, DISPID& number) {
    auto* name = const_cast<wchar_t*>(member);
    const HRESULT found = object.GetIDsOfNames(IID_NULL, &name, 1, LOCALE_USER_DEFAULT, &number);
    const auto extended = found == E_NOTIMPL ? Held<IDispatchEx>::of(&object) : nullptr;
    if (!extended) return found;
    const Text text(reinterpret_cast<const char16_t*>(member));
    return extended->GetDispID(text.get(), fdexNameCaseInsensitive, &number);
}

HRESULT run(IDispatch& object, DISPID number, WORD how, DISPPARAMS& given, VARIANT* result,
            EXCEPINFO& failure) {
    const HRESULT code = object.Invoke(number, IID_NULL, LOCALE_USER_DEFAULT, how, &given, result,
                                       &failure, nullptr);
    const auto extended = code == E_NOTIMPL ? Held<IDispatchEx>::of(&object) : nullptr;
    if (!extended) return code;
    return extended->InvokeEx(number, LOCALE_USER_DEFAULT, how, &given, result, &failure, nullptr);
}

} // namespace

bool HostObject::has(const wchar_t* member) const {
    DISPID number = DISPID_UNKNOWN;
    return SUCCEEDED(find(*mObject.get(), member, number));
}

Value HostObject::get(const wchar_t* member) const {
    return invoke(member, DISPATCH_PROPERTYGET, nullptr, 0);
}

void HostObject::put(const wchar_t* member, Value value) const {
    const bool sets = value.vt == VT_DISPATCH;
    invoke(member, sets ? DISPATCH_PROPERTYPUTREF : DISPATCH_PROPERTYPUT, &value, 1);
}

Value HostObject::invoke(const wchar_t* member, WORD how, Value* arguments,
                         std::size_t count) const {
    DISPID number = DISPID_UNKNOWN;
    require(find(*mObject.get(), member, number));

    DISPPARAMS given{arguments, nullptr, static_cast<UINT>(count), 0};
    DISPID written = DISPID_PROPERTYPUT;
    const bool writes = how & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF);
    if (writes) {
        given.rgdispidNamedArgs = &written;
        given.cNamedArgs = 1;
    }
    Value result;
    EXCEPINFO failure{};
    const auto tried = [&](WORD way) {
        return run(*mObject.get(), number, way, given, writes ? nullptr : &result, failure);
    };
    HRESULT code = tried(how);
    // Some know objects as values alone, and some values as what is called. Both ways at once would
    // have a script's engine call what is a value.
    if (code == DISP_E_MEMBERNOTFOUND && how == DISPATCH_PROPERTYPUTREF)
        code = tried(DISPATCH_PROPERTYPUT);
    else if (code == DISP_E_MEMBERNOTFOUND && how == DISPATCH_PROPERTYGET)
        code = tried(DISPATCH_METHOD);
    if (code == DISP_E_EXCEPTION) throw errorOf(failure);
    require(code);
    return result;
}

} // namespace zandor::automation
