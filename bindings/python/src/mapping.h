#pragma once

#include "Items.h"
#include "PythonError.h"
#include "Widget.h"
#include "conversions.h"
#include "documents.h"
#include "names.h"
#include "records.h"

// What the .sip files do at the border: no exception of C++ leaves these functions.

namespace zandor::python {

/// What `make` makes, or nothing with a Python exception set.
template <class Make>
PyObject* giveBy(const Make& make) {
    try {
        return make().release();
    } catch (...) {
        setPythonError();
        return nullptr;
    }
}

/// The Python object for a value.
template <class T>
PyObject* give(const T& value) {
    return giveBy([&value] { return toPython(value); });
}

/// What SIP asks of a type: without `failed` whether the object can be one, and then the value.
template <class T, class Test, class Make>
int receiveBy(PyObject* object, T** result, int* failed, const Test& test, const Make& make) {
    if (!failed) return test(object);
    try {
        *result = new T(make(object));
    } catch (...) {
        setPythonError();
        *failed = 1;
    }
    return SIP_TEMPORARY;
}
template <class T>
int receive(PyObject* object, platform::Ref<T>** result, int* failed) {
    return receiveBy(object, result, failed, refersTo<T>,
                     [](PyObject* object) { return referenceTo<T>(object, "the object"); });
}
inline int receive(PyObject* object, platform::String** result, int* failed) {
    return receiveBy(
        object, result, failed, [](PyObject* object) { return PyUnicode_Check(object); }, toString);
}
inline int receive(PyObject* object, files::Path** result, int* failed) {
    return receiveBy(
        object, result, failed,
        [](PyObject* object) {
            return PyUnicode_Check(object) || PyObject_HasAttrString(object, "__fspath__");
        },
        pathOf);
}
inline int receive(PyObject* object, LibraryRef** result, int* failed) {
    return receiveBy(object, result, failed, isLibrary, libraryOf);
}
inline int receive(PyObject* object, QuestionsRef** result, int* failed) {
    return receiveBy(object, result, failed, asksNothingOrQuestions, questionsOf);
}

/// A collection as a part of what a wrapper is for. It then belongs to its wrapper.
template <class List>
PyObject* giveItems(List& list, PyObject* owner) {
    return giveBy([&] {
        return Object::take(sipConvertFromNewType(itemsOf(list, owner), sipType_Items, nullptr));
    });
}
template <class Which>
PyObject* giveItem(const Items& items, const Which& which) {
    return giveBy([&] { return items.Item(which); });
}

inline PyObject* giveFindings(model::Query& query, model::sql::Dialect dialect) {
    return giveBy([&] { return listOf(model::sql::validate(query, dialect)); });
}
inline PyObject* giveStatement(model::Query& query, model::sql::Dialect dialect,
                               model::sql::ValueForm form, PyObject* limit) {
    return giveBy([&] {
        std::optional<std::int64_t> rows;
        if (limit && limit != Py_None)
            rows = asNumber(limit, "limit", 0, std::numeric_limits<std::int32_t>::max());
        return toPython(model::sql::statementText(query, dialect, form, rows), dialect);
    });
}

/// A table as the ready-made model has it; error 5 for another model's.
inline Ref<model::Table> ownTable(const Ref<TalvikZandorLib::ZDTable>& table) {
    auto own = std::dynamic_pointer_cast<model::Table>(table);
    if (table && !own) throw platform::errors::invalidProcedureCall();
    return own;
}

/// A new object of the ready-made model for the wrapper that is being initialised.
template <class T>
T* made(sipSimpleWrapper* wrapper) {
    try {
        const auto object = platform::makeRef<T>();
        holdFirst(reinterpret_cast<PyObject*>(wrapper), object);
        return object.get();
    } catch (...) {
        setPythonError();
        return nullptr;
    }
}

} // namespace zandor::python
