#include "frontends/windows/automation/control/invoke.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/control/Conversion.h"

#include <algorithm>
#include <vector>

namespace zandor::automation {

namespace {

using TalvikDBxZandor::Zandor;
using TalvikDBxZandor::automation::Kind;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Setter;
using TalvikDBxZandor::automation::Type;

/// What a caller has done wrong, and with which of its arguments.
struct Refused {
    HRESULT code;
    UINT argument = 0;
};

const Member& memberOf(DISPID number) {
    const auto members = TalvikDBxZandor::automation::members();
    const auto found = std::find_if(members.begin(), members.end(), [&](const Member& member) {
        return member.dispatchId == static_cast<std::uint32_t>(number);
    });
    if (found == members.end()) throw Refused{DISP_E_MEMBERNOTFOUND};
    return *found;
}

/// The argument at a place, as the control has those of a type.
platform::Variant argumentAt(const DISPPARAMS& arguments, UINT place, Type type) {
    const VARIANT& value = arguments.rgvarg[place];
    if (isMissing(value)) throw Refused{DISP_E_PARAMNOTOPTIONAL, place};
    try {
        return fromHost(type, value);
    } catch (const platform::RuntimeError& error) {
        if (error.Number == platform::errors::typeMismatch().Number)
            throw Refused{DISP_E_TYPEMISMATCH, place};
        if (error.Number == platform::errors::overflow().Number)
            throw Refused{DISP_E_OVERFLOW, place};
        throw;
    }
}

void put(Zandor& control, const Member& member, WORD flags, const DISPPARAMS& arguments) {
    if (!member.set) throw Refused{DISP_E_MEMBERNOTFOUND};
    // Some hosts write an object as they write a value; nobody sets what is none.
    if (!(flags & DISPATCH_PROPERTYPUT) && member.setter != Setter::object)
        throw Refused{DISP_E_MEMBERNOTFOUND};
    if (arguments.cArgs != 1) throw Refused{DISP_E_BADPARAMCOUNT};
    if (arguments.cNamedArgs > 1 ||
        (arguments.cNamedArgs == 1 && arguments.rgdispidNamedArgs[0] != DISPID_PROPERTYPUT))
        throw Refused{DISP_E_PARAMNOTFOUND};
    member.set(control, argumentAt(arguments, 0, member.type));
}

void get(Zandor& control, const Member& member, const DISPPARAMS& arguments, VARIANT* result) {
    if (arguments.cArgs != 0) throw Refused{DISP_E_BADPARAMCOUNT};
    Value value = toHost(member.get(control));
    if (result) value.moveTo(*result);
}

/// Named ones come first, those without a name backwards behind them.
void call(Zandor& control, const Member& member, const DISPPARAMS& arguments) {
    const std::size_t count = member.parameters.size();
    if (arguments.cArgs > count) throw Refused{DISP_E_BADPARAMCOUNT};
    constexpr UINT missing = UINT(-1);
    std::vector<UINT> places(count, missing);
    for (UINT place = 0; place < arguments.cArgs; ++place) {
        const bool named = place < arguments.cNamedArgs;
        const auto parameter = static_cast<std::size_t>(
            named ? arguments.rgdispidNamedArgs[place] : DISPID(arguments.cArgs - 1 - place));
        if (parameter >= count || places[parameter] != missing)
            throw Refused{DISP_E_PARAMNOTFOUND, place};
        places[parameter] = place;
    }
    std::vector<platform::Variant> values;
    for (const UINT place : places) {
        if (place == missing) throw Refused{DISP_E_PARAMNOTOPTIONAL};
        values.push_back(argumentAt(arguments, place, Type::String));
    }
    member.invoke(control, values);
}

void dispatch(Zandor& control, DISPID number, WORD flags, const DISPPARAMS& arguments,
              VARIANT* result) {
    const Member& member = memberOf(number);
    if (member.kind == Kind::method) {
        if (!(flags & DISPATCH_METHOD)) throw Refused{DISP_E_MEMBERNOTFOUND};
        call(control, member, arguments);
    } else if (flags & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF)) {
        put(control, member, flags, arguments);
    } else {
        get(control, member, arguments, result);
    }
}

} // namespace

HRESULT invoke(Zandor& control, DISPID member, WORD flags, const DISPPARAMS& arguments,
               VARIANT* result, EXCEPINFO* failure, UINT* wrong) {
    if ((arguments.cArgs > 0 && !arguments.rgvarg) || arguments.cNamedArgs > arguments.cArgs ||
        (arguments.cNamedArgs > 0 && !arguments.rgdispidNamedArgs))
        return E_INVALIDARG;
    if (result) VariantInit(result);
    try {
        dispatch(control, member, flags, arguments, result);
        return S_OK;
    } catch (const Refused& refused) {
        if (wrong) *wrong = refused.argument;
        return refused.code;
    } catch (const std::bad_alloc&) {
        return E_OUTOFMEMORY;
    } catch (...) {
        if (!failure) return DISP_E_EXCEPTION;
        const platform::RuntimeError error = platform::currentError();
        *failure = {};
        failure->scode = codeOf(error.Number);
        failure->bstrDescription =
            SysAllocString(reinterpret_cast<const OLECHAR*>(error.Description.c_str()));
        return DISP_E_EXCEPTION;
    }
}

} // namespace zandor::automation
