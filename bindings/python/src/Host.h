#pragma once

#include "PythonError.h"
#include "conversions.h"

#include <string>

namespace zandor::python {

/// A Python object whose attributes are the properties of an interface, and whose methods are its
/// methods. Whatever it raises is thrown as a PythonError. The object is held by whoever uses it.
class Host {
public:
    explicit Host(PyObject* object) : mObject(object) {}
    virtual ~Host() = default;

    PyObject* object() const { return mObject; }

    template <class T>
    T get(const char* name) const {
        const Gil gil;
        const Object value = Object::take(PyObject_GetAttrString(object(), name));
        return convert<T>(value.get(), nameOf(name).c_str());
    }

    template <class T>
    void set(const char* name, const T& value) const {
        const Gil gil;
        if (PyObject_SetAttrString(object(), name, toPython(value).get()) < 0) throwPythonError();
    }

    template <class Result = void, class... Arguments>
    Result call(const char* name, const Arguments&... arguments) const {
        const Gil gil;
        const Object method = Object::take(PyObject_GetAttrString(object(), name));
        const Object result = Object::take(
            PyObject_CallFunctionObjArgs(method.get(), toPython(arguments).get()..., nullptr));
        if constexpr (!std::is_void_v<Result>)
            return convert<Result>(result.get(), nameOf(name).c_str());
    }

protected:
    std::string nameOf(const char* member) const {
        return std::string(Py_TYPE(object())->tp_name) + "." + member;
    }

private:
    PyObject* const mObject;
};

} // namespace zandor::python
