#include "conversions.h"

#include "PythonError.h"

#include <bit>
#include <cmath>

namespace zandor::python {

namespace {

// Named, so that a first character that looks like a byte order mark stays one.
constexpr bool little = std::endian::native == std::endian::little;
constexpr const char* encoding = little ? "utf-16-le" : "utf-16-be";

} // namespace

Object toPython(platform::StringView text) {
    int order = little ? -1 : 1;
    return Object::take(PyUnicode_DecodeUTF16(reinterpret_cast<const char*>(text.data()),
                                              static_cast<Py_ssize_t>(text.size() * 2),
                                              "surrogatepass", &order));
}

Object toPython(bool value) { return Object::share(value ? Py_True : Py_False); }
Object toPython(std::int16_t value) { return Object::take(PyLong_FromLong(value)); }
Object toPython(std::int32_t value) { return Object::take(PyLong_FromLong(value)); }
Object toPython(float value) {
    return Object::take(PyFloat_FromDouble(static_cast<double>(value)));
}

platform::String toString(PyObject* text) {
    const Object bytes = Object::take(PyUnicode_AsEncodedString(text, encoding, "surrogatepass"));
    const auto size = static_cast<std::size_t>(PyBytes_Size(bytes.get()));
    platform::String result(size / 2, u'\0');
    std::char_traits<char>::copy(reinterpret_cast<char*>(result.data()),
                                 PyBytes_AsString(bytes.get()), size);
    return result;
}

platform::String asText(PyObject* value, const char* what) {
    if (!PyUnicode_Check(value))
        throwTypeError("%s must be a str, not %s", what, Py_TYPE(value)->tp_name);
    return toString(value);
}

bool asFlag(PyObject* value) {
    const int result = PyObject_IsTrue(value);
    if (result < 0) throwPythonError();
    return result == 1;
}

std::int32_t asNumber(PyObject* value, const char* what, std::int32_t least, std::int32_t most) {
    if (!PyIndex_Check(value) && !PyFloat_Check(value))
        throwTypeError("%s must be a number, not %s", what, Py_TYPE(value)->tp_name);
    const Object number = Object::take(PyNumber_Float(value));
    const double rounded = std::nearbyint(PyFloat_AsDouble(number.get()));
    if (!(rounded >= least && rounded <= most)) throw platform::errors::overflow();
    return static_cast<std::int32_t>(rounded);
}

} // namespace zandor::python
