#pragma once

#include <Python.h>

#include <utility>

namespace zandor::python {

/// The interpreter's lock for as long as it lives, on any thread and however often.
class Gil {
public:
    Gil() : mState(PyGILState_Ensure()) {}
    Gil(const Gil&) = delete;
    Gil& operator=(const Gil&) = delete;
    ~Gil() { PyGILState_Release(mState); }

private:
    const PyGILState_STATE mState;
};

/// A counted reference to a Python object. It is made and copied under the lock, and may go without
/// it, also when the interpreter has ended before.
class Object {
public:
    Object() = default;
    /// Takes over a reference, of which nothing means that an exception is set: it is thrown.
    static Object take(PyObject* object);
    static Object share(PyObject* object) {
        Py_XINCREF(object);
        return Object(object);
    }
    Object(const Object& other) : Object(share(other.mObject)) {}
    Object(Object&& other) noexcept : mObject(std::exchange(other.mObject, nullptr)) {}
    Object& operator=(Object other) noexcept {
        std::swap(mObject, other.mObject);
        return *this;
    }
    ~Object() {
        if (!mObject || !Py_IsInitialized()) return;
        const Gil gil;
        Py_DECREF(mObject);
    }

    PyObject* get() const { return mObject; }
    /// Hands the reference over.
    PyObject* release() { return std::exchange(mObject, nullptr); }

private:
    explicit Object(PyObject* object) : mObject(object) {}

    PyObject* mObject = nullptr;
};

} // namespace zandor::python
