#include "PythonError.h"

#include "conversions.h"

#include <cstdarg>

namespace zandor::python {

namespace {

platform::String textOf(PyObject* exception) {
    const Object text = [exception] {
        PyObject* text = PyObject_Str(exception);
        if (!text) PyErr_Clear(); // an exception that cannot say what it is goes by its name
        return text ? Object::take(text) : Object();
    }();
    if (text.get() && PyUnicode_GetLength(text.get()) > 0) return toString(text.get());
    return platform::fromUtf8(Py_TYPE(exception)->tp_name);
}

platform::RuntimeError errorOf(PyObject* exception) {
    if (PyErr_GivenExceptionMatches(exception, PyExc_MemoryError))
        return platform::errors::outOfMemory();
    if (PyObject_IsInstance(exception, ofPackage("errors", "NumberedError").get()) == 1) {
        const Object number = Object::take(PyObject_GetAttrString(exception, "number"));
        const Object description = Object::take(PyObject_GetAttrString(exception, "description"));
        return {convert<std::int32_t>(number.get(), "number"),
                convert<platform::String>(description.get(), "description")};
    }
    return platform::errors::automation(textOf(exception));
}

} // namespace

Object Object::take(PyObject* object) {
    if (!object) throwPythonError();
    return Object(object);
}

void throwPythonError() {
    PyObject *type = nullptr, *value = nullptr, *traceback = nullptr;
    PyErr_Fetch(&type, &value, &traceback);
    PyErr_NormalizeException(&type, &value, &traceback);
    if (traceback) PyException_SetTraceback(value, traceback);
    Py_XDECREF(type);
    Py_XDECREF(traceback);
    const auto exception = std::make_shared<const Object>(Object::take(value));
    throw PythonError{errorOf(exception->get()), exception};
}

void throwTypeError(const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    PyErr_FormatV(PyExc_TypeError, format, arguments);
    va_end(arguments);
    throwPythonError();
}

Object toPython(const platform::RuntimeError& error) {
    return Object::take(PyObject_CallFunctionObjArgs(ofPackage("errors", "NumberedError").get(),
                                                     toPython(error.Number).get(),
                                                     toPython(error.Description).get(), nullptr));
}

void setPythonError() {
    try {
        throw;
    } catch (const PythonError& error) {
        PyObject* value = error.exception->get();
        PyErr_Restore(Py_NewRef(reinterpret_cast<PyObject*>(Py_TYPE(value))), Py_NewRef(value),
                      PyException_GetTraceback(value));
    } catch (const platform::RuntimeError& error) {
        try {
            const Object value = toPython(error);
            PyErr_SetObject(reinterpret_cast<PyObject*>(Py_TYPE(value.get())), value.get());
        } catch (const PythonError&) {
            setPythonError();
        }
    } catch (const std::exception& error) {
        PyErr_SetString(PyExc_RuntimeError, error.what());
    } catch (...) {
        PyErr_SetString(PyExc_RuntimeError, "an unknown exception of C++");
    }
}

Object ofPackage(const char* module, const char* name) {
    const std::string path = std::string("zandor.") + module;
    const Object found = Object::take(PyImport_ImportModule(path.c_str()));
    return Object::take(PyObject_GetAttrString(found.get(), name));
}

bool isOfPackage(PyObject* object, const char* module, const char* name) {
    const int result = PyObject_IsInstance(object, ofPackage(module, name).get());
    if (result < 0) throwPythonError();
    return result == 1;
}

} // namespace zandor::python
