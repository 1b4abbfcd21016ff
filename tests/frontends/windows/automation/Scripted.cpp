#include "Scripted.h"

#include "frontends/windows/automation/com/Failure.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;
using namespace zandor::automation;

namespace {

std::string narrow(const std::wstring& text) { return {text.begin(), text.end()}; }

std::string kindOf(const VARIANT& value) {
    switch (value.vt) {
    case VT_R4: return "R4";
    case VT_I2: return "I2";
    case VT_BOOL: return "BOOL";
    case VT_BSTR: return "BSTR";
    case VT_DISPATCH: return "DISPATCH";
    default: return std::to_string(value.vt);
    }
}

HRESULT fail(EXCEPINFO* failure, const Scripted::Failure& thrown) {
    if (!failure) return DISP_E_EXCEPTION;
    failure->scode = thrown.code;
    failure->bstrDescription = newText(thrown.text);
    return DISP_E_EXCEPTION;
}

} // namespace

void Scripted::have(const wchar_t* name, Member member, DISPID number) {
    if (number == DISPID_UNKNOWN) number = static_cast<DISPID>(mRows.size()) + 1000;
    mRows.push_back({name, number, std::move(member)});
}

void Scripted::haveValue(const wchar_t* name, Value value) {
    const auto held = std::make_shared<Value>(std::move(value));
    mValues[name] = held;
    have(name, [held](WORD how, const Arguments& arguments) {
        Value result;
        if (how & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF)) {
            if (arguments.size() != 1) throw Failure{DISP_E_BADPARAMCOUNT, u""};
            VariantCopyInd(held.get(), const_cast<VARIANT*>(arguments[0]));
        } else {
            VariantCopy(&result, held.get());
        }
        return result;
    });
}

void Scripted::haveText(const wchar_t* name, std::u16string value) {
    haveValue(name, Value(platform::StringView(value)));
}

void Scripted::haveNumber(const wchar_t* name, double value) {
    Value number;
    number.vt = VT_R8;
    number.dblVal = value;
    haveValue(name, std::move(number));
}

void Scripted::haveFlag(const wchar_t* name, bool value) { haveValue(name, Value(value)); }

void Scripted::haveObject(const wchar_t* name, IDispatch* value) {
    haveValue(name, Value(Held<IDispatch>(value)));
}

std::string Scripted::textAt(const std::wstring& name) const {
    return platform::toUtf8(stringOf(*mValues.at(name)));
}

double Scripted::numberAt(const std::wstring& name) const {
    Value changed;
    VariantChangeType(&changed, mValues.at(name).get(), 0, VT_R8);
    return changed.dblVal;
}

IDispatch* Scripted::objectAt(const std::wstring& name) const { return mValues.at(name)->pdispVal; }

STDMETHODIMP Scripted::GetTypeInfoCount(UINT* count) {
    *count = 0;
    return S_OK;
}

STDMETHODIMP Scripted::GetIDsOfNames(REFIID, LPOLESTR* names, UINT, LCID, DISPID* ids) {
    const auto found = std::find_if(mRows.begin(), mRows.end(),
                                    [&](const Row& row) { return row.name == names[0]; });
    *ids = found == mRows.end() ? DISPID_UNKNOWN : found->number;
    return found == mRows.end() ? DISP_E_UNKNOWNNAME : S_OK;
}

STDMETHODIMP Scripted::Invoke(DISPID id, REFIID, LCID, WORD how, DISPPARAMS* arguments,
                              VARIANT* result, EXCEPINFO* failure, UINT*) {
    const auto found =
        std::find_if(mRows.begin(), mRows.end(), [&](const Row& row) { return row.number == id; });
    if (found == mRows.end()) return DISP_E_MEMBERNOTFOUND;
    Arguments given;
    for (UINT n = arguments->cArgs; n > 0; --n) given.push_back(&arguments->rgvarg[n - 1]);
    const bool writes = how & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF);
    calls.push_back(narrow(found->name) + (writes ? "=" + kindOf(*given.at(0)) : ""));
    const Held<Scripted> meanwhile(this);
    // A copy: the test may give it others meanwhile.
    const Member member = found->member;
    try {
        Value answered = member(how, given);
        if (result) answered.moveTo(*result);
        return S_OK;
    } catch (const Failure& thrown) {
        return fail(failure, thrown);
    } catch (const platform::RuntimeError& error) {
        return fail(failure, {codeOf(error.Number), error.Description});
    }
}
