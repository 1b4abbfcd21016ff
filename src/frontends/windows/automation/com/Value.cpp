#include "frontends/windows/automation/com/Value.h"

#include "frontends/windows/automation/com/Failure.h"

namespace zandor::automation {

namespace {

/// The value as one of a kind.
void change(Value& changed, const VARIANT& value, VARTYPE kind) {
    Value followed;
    require(VariantCopyInd(&followed, const_cast<VARIANT*>(&value)));
    // Numbers and texts are written in one way everywhere, so that a file says the same to all.
    require(VariantChangeTypeEx(&changed, &followed, LOCALE_INVARIANT, VARIANT_ALPHABOOL, kind));
}

} // namespace

platform::String stringOf(const VARIANT& value) {
    Value changed;
    change(changed, value, VT_BSTR);
    return textOf(changed.bstrVal);
}

bool flagOf(const VARIANT& value) {
    Value changed;
    change(changed, value, VT_BOOL);
    return changed.boolVal != VARIANT_FALSE;
}

std::int16_t integerOf(const VARIANT& value) {
    Value changed;
    change(changed, value, VT_I2);
    return changed.iVal;
}

std::int32_t longOf(const VARIANT& value) {
    Value changed;
    change(changed, value, VT_I4);
    return static_cast<std::int32_t>(changed.lVal);
}

Held<IDispatch> objectOf(const VARIANT& value) {
    Value followed;
    require(VariantCopyInd(&followed, const_cast<VARIANT*>(&value)));
    if (followed.vt != VT_DISPATCH && followed.vt != VT_UNKNOWN)
        throw platform::errors::typeMismatch();
    if (!followed.punkVal) return {};
    Held<IDispatch> object = Held<IDispatch>::of(followed.punkVal);
    if (!object) throw platform::errors::typeMismatch();
    return object;
}

} // namespace zandor::automation
