#pragma once

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/com/Text.h"

#include <cstdint>

namespace zandor::automation {

/// A value of the system's kind that is freed with it.
class Value : public VARIANT {
public:
    Value() { VariantInit(this); }
    explicit Value(platform::StringView text) : Value() {
        bstrVal = newText(text);
        vt = VT_BSTR;
    }
    explicit Value(bool flag) : Value() {
        vt = VT_BOOL;
        boolVal = flag ? VARIANT_TRUE : VARIANT_FALSE;
    }
    explicit Value(std::int16_t number) : Value() {
        vt = VT_I2;
        iVal = number;
    }
    explicit Value(std::int32_t number) : Value() {
        vt = VT_I4;
        lVal = static_cast<LONG>(number);
    }
    explicit Value(float number) : Value() {
        vt = VT_R4;
        fltVal = number;
    }
    /// Nothing is a value, too.
    explicit Value(const Held<IDispatch>& object) : Value() {
        vt = VT_DISPATCH;
        pdispVal = object.copy();
    }
    Value(Value&& other) noexcept : VARIANT(other) { VariantInit(&other); }
    Value& operator=(Value&& other) noexcept {
        if (this == &other) return *this;
        VariantClear(this);
        other.moveTo(*this);
        return *this;
    }
    Value(const Value&) = delete;
    Value& operator=(const Value&) = delete;
    ~Value() { VariantClear(this); }

    // What a call has answered, taken over.
    static Value taken(SHORT number) { return Value(std::int16_t{number}); }
    static Value taken(LONG number) { return Value(static_cast<std::int32_t>(number)); }
    static Value taken(BSTR text) {
        Value value;
        value.vt = VT_BSTR;
        value.bstrVal = text;
        return value;
    }
    static Value taken(IDispatch* object) {
        Value value;
        value.vt = VT_DISPATCH;
        value.pdispVal = object;
        return value;
    }

    /// Hands it over to who asked.
    void moveTo(VARIANT& other) {
        other = *this;
        VariantInit(this);
    }
};

/// Whether a value stands for an argument that was left out.
inline bool isMissing(const VARIANT& value) {
    return value.vt == VT_ERROR && value.scode == DISP_E_PARAMNOTFOUND;
}

// What a value of any kind is as one of another; a reference is followed, and an object gives its
// default. Each throws a RuntimeError: 13 where it cannot be one, 6 where it is beyond the range.

platform::String stringOf(const VARIANT& value);
bool flagOf(const VARIANT& value);            ///< true for any number but 0
std::int16_t integerOf(const VARIANT& value); ///< to the nearest, halves to even
std::int32_t longOf(const VARIANT& value);    ///< the same
/// An object, or nothing; error 13 for anything else.
Held<IDispatch> objectOf(const VARIANT& value);

} // namespace zandor::automation
