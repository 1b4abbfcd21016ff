#pragma once

#include "Object.h"

#include <Zandor/platform/RuntimeError.h>

#include <memory>

namespace zandor::python {

/// An exception of Python on its way through C++: to the control it is an error like any other, and
/// Python gets it back as it was. A NumberedError keeps its number, a MemoryError is error 7, any
/// other is error 440 with its text.
struct PythonError : platform::RuntimeError {
    std::shared_ptr<const Object> exception;
};

/// Throws the Python exception that is set, which then is set no more. Under the lock.
[[noreturn]] void throwPythonError();
/// Throws Python's TypeError with these words (as PyErr_Format).
[[noreturn]] void throwTypeError(const char* format, ...);

/// A NumberedError. Under the lock.
Object toPython(const platform::RuntimeError& error);

/// Sets the Python exception for the C++ exception being handled: a PythonError's own, a
/// NumberedError for a platform::RuntimeError, and RuntimeError for anything else. Under the lock.
void setPythonError();

/// A class or function of the package, by its module below `zandor` and its name.
Object ofPackage(const char* module, const char* name);
/// Whether an object is of a class of the package, or of one derived from it.
bool isOfPackage(PyObject* object, const char* module, const char* name);

} // namespace zandor::python
