#include "Late.h"

#include <algorithm>

using namespace zandor;
using namespace zandor::automation;

std::string Outcome::text() const {
    Value changed;
    if (FAILED(VariantChangeType(&changed, const_cast<Value*>(&value), VARIANT_ALPHABOOL, VT_BSTR)))
        return "?";
    return platform::toUtf8(textOf(changed.bstrVal));
}

DISPID Late::idOf(const wchar_t* name) const {
    DISPID id = DISPID_UNKNOWN;
    auto* asked = const_cast<wchar_t*>(name);
    mObject->GetIDsOfNames(IID_NULL, &asked, 1, LOCALE_USER_DEFAULT, &id);
    return id;
}

Outcome Late::invoke(const wchar_t* name, WORD how, Values arguments,
                     std::vector<DISPID> named) const {
    Outcome outcome;
    if (!mObject) {
        outcome.code = E_POINTER;
        return outcome;
    }
    const DISPID id = idOf(name);
    if (id == DISPID_UNKNOWN) {
        outcome.code = DISP_E_UNKNOWNNAME;
        return outcome;
    }
    // Named ones stay in front; the others stand backwards.
    std::reverse(arguments.begin() + static_cast<std::ptrdiff_t>(named.size()), arguments.end());
    if (how & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF)) named = {DISPID_PROPERTYPUT};
    DISPPARAMS parameters{arguments.data(), named.data(), static_cast<UINT>(arguments.size()),
                          static_cast<UINT>(named.size())};
    EXCEPINFO failure{};
    outcome.code = mObject->Invoke(id, IID_NULL, LOCALE_USER_DEFAULT, how, &parameters,
                                   &outcome.value, &failure, &outcome.wrong);
    if (outcome.code == DISP_E_EXCEPTION) {
        outcome.code = failure.scode;
        outcome.failure = platform::toUtf8(textOf(failure.bstrDescription));
    }
    SysFreeString(failure.bstrSource);
    SysFreeString(failure.bstrDescription);
    SysFreeString(failure.bstrHelpFile);
    return outcome;
}
