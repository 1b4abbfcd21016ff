#pragma once

#include "Object.h"
#include "references.h"

#include <Zandor/platform/String.h>

#include <string>
#include <type_traits>

// Values between Python and C++. All under the interpreter's lock; what cannot be converted is a
// TypeError, which is thrown as a PythonError, and a number out of range error 6.

namespace zandor::python {

Object toPython(platform::StringView text);
inline Object toPython(const platform::String& text) {
    return toPython(platform::StringView(text));
}
Object toPython(const char* text) = delete;
/// What is one already.
inline Object toPython(const Object& object) { return object; }
Object toPython(bool value);
Object toPython(std::int16_t value);
Object toPython(std::int32_t value);
Object toPython(float value);
template <class T>
Object toPython(const platform::Ref<T>& reference) {
    return wrapped(reference);
}

/// A text as it stands, with halves of characters too. `text` is a str.
platform::String toString(PyObject* text);

platform::String asText(PyObject* value, const char* what);
bool asFlag(PyObject* value);
/// A whole number of `least` to `most`; one with a fraction is rounded, halves to even.
std::int32_t asNumber(PyObject* value, const char* what, std::int32_t least, std::int32_t most);

template <class T>
struct Conversion;
template <>
struct Conversion<Object> {
    static Object from(PyObject* value, const char*) { return Object::share(value); }
};
template <class T>
struct Conversion<platform::Ref<T>> {
    static platform::Ref<T> from(PyObject* value, const char* what) {
        return referenceTo<T>(value, what);
    }
};
template <>
struct Conversion<platform::String> {
    static platform::String from(PyObject* value, const char* what) { return asText(value, what); }
};
template <>
struct Conversion<bool> {
    static bool from(PyObject* value, const char*) { return asFlag(value); }
};
template <class T>
requires std::is_same_v<T, std::int16_t> || std::is_same_v<T, std::int32_t>
struct Conversion<T> {
    static T from(PyObject* value, const char* what) {
        return static_cast<T>(
            asNumber(value, what, std::numeric_limits<T>::min(), std::numeric_limits<T>::max()));
    }
};

/// `what` names the value in an error: "Column.Name".
template <class T>
T convert(PyObject* value, const char* what) {
    return Conversion<T>::from(value, what);
}

} // namespace zandor::python
