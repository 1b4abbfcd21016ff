// The generated header is first: it knows how Python's and Qt's macros get along.
#include "sipAPI_zandor.h"

#include "PythonModel.h"
#include "adapters.h"
#include "names.h"

namespace zandor::python {

namespace {

constexpr const char* capsuleName = "zandor.reference";

/// An interface of the model: the classes of the ready-made model that are one, the class that
/// hosts derive theirs from, and the adapter for those.
template <class T>
struct Interface;

template <>
struct Interface<TalvikZandorLib::Zandor> {
    static constexpr const char* name = "Zandor";
    using Own = std::tuple<model::Query>;
    using Adapter = PythonQuery;
    static constexpr const char* extension = "OrderedDefinitions";
    using Extended = PythonOrderedQuery;
};
template <>
struct Interface<TalvikZandorLib::ZDTable> {
    static constexpr const char* name = "ZDTable";
    using Own = std::tuple<model::Table>;
    using Adapter = PythonTable;
};
template <>
struct Interface<TalvikZandorLib::ZDColumn> {
    static constexpr const char* name = "ZDColumn";
    using Own = std::tuple<model::Column, model::FieldColumn, model::OutputName>;
    using Adapter = PythonColumn;
};
template <>
struct Interface<TalvikZandorLib::ZDJoin> {
    static constexpr const char* name = "ZDJoin";
    using Own = std::tuple<model::Join>;
    using Adapter = PythonJoin;
};
template <>
struct Interface<TalvikZandorLib::ZDColumnDefinition> {
    static constexpr const char* name = "ZDColumnDefinition";
    using Own = std::tuple<model::ColumnDefinition>;
    using Adapter = PythonDefinition;
    static constexpr const char* extension = "SizedDefinition";
    using Extended = PythonSizedDefinition;
};
template <>
struct Interface<TalvikZandorLib::ZDCriterium> {
    static constexpr const char* name = "ZDCriterium";
    using Own = std::tuple<model::RowCriterium>;
    using Adapter = PythonCriterium;
};

template <class Class>
const sipTypeDef* typeOf();
template <>
const sipTypeDef* typeOf<model::Query>() {
    return sipType_Query;
}
template <>
const sipTypeDef* typeOf<model::Table>() {
    return sipType_Table;
}
template <>
const sipTypeDef* typeOf<model::Column>() {
    return sipType_Column;
}
template <>
const sipTypeDef* typeOf<model::FieldColumn>() {
    return sipType_FieldColumn;
}
template <>
const sipTypeDef* typeOf<model::OutputName>() {
    return sipType_OutputName;
}
template <>
const sipTypeDef* typeOf<model::Join>() {
    return sipType_Join;
}
template <>
const sipTypeDef* typeOf<model::ColumnDefinition>() {
    return sipType_ColumnDefinition;
}
template <>
const sipTypeDef* typeOf<model::RowCriterium>() {
    return sipType_RowCriterium;
}

template <>
const sipTypeDef* typeOf<model::Library>() {
    return sipType_Library;
}

template <class Class>
PyObject* classOf() {
    return reinterpret_cast<PyObject*>(sipTypeAsPyTypeObject(typeOf<Class>()));
}

bool is(PyObject* object, PyObject* type) {
    const int result = PyObject_IsInstance(object, type);
    if (result < 0) throwPythonError();
    return result == 1;
}

/// Whether an object is a wrapper and nothing more. A query of a class that a host has derived is
/// the host's: what it overrides is called.
template <class Class>
bool wraps(PyObject* object) {
    if constexpr (std::is_same_v<Class, model::Query>)
        return reinterpret_cast<PyObject*>(Py_TYPE(object)) == classOf<Class>();
    return is(object, classOf<Class>());
}

bool isOfModel(PyObject* object, const char* name) {
    return isOfPackage(object, "TalvikZandorLib", name);
}

/// What a wrapper is for.
template <class Class>
Ref<Class> unwrapped(PyObject* wrapper) {
    int failed = 0;
    void* address = sipConvertToType(wrapper, typeOf<Class>(), nullptr,
                                     SIP_NOT_NONE | SIP_NO_CONVERTORS, nullptr, &failed);
    if (failed) throwPythonError();
    return std::shared_ptr<Class>(held(wrapper), static_cast<Class*>(address));
}

template <class T, class... Own>
Ref<T> unwrappedAny(PyObject* object, std::tuple<Own...>*) {
    Ref<T> found;
    ((wraps<Own>(object) && (found = unwrapped<Own>(object), true)) || ...);
    return found;
}

template <class... Own>
bool isOfAny(PyObject* object, std::tuple<Own...>*) {
    return (is(object, classOf<Own>()) || ...);
}

template <class T>
Ref<T> adaptedTo(PyObject* object) {
    using Facts = Interface<T>;
    if constexpr (requires { Facts::extension; })
        if (isOfModel(object, Facts::extension) ||
            isOfAny(object, static_cast<typename Facts::Own*>(nullptr)))
            return adapted<typename Facts::Extended, T>(object);
    return adapted<typename Facts::Adapter, T>(object);
}

template <class Class, class T>
bool wrapIf(const Ref<T>& reference, Object& wrapper) {
    const auto own = std::dynamic_pointer_cast<Class>(reference);
    if (!own) return false;
    wrapper = Object::take(sipConvertFromType(own.get(), typeOf<Class>(), nullptr));
    hold(wrapper.get(), own);
    return true;
}

template <class T, class... Own>
bool wrapAny(const Ref<T>& reference, Object& wrapper, std::tuple<Own...>*) {
    return (wrapIf<Own>(reference, wrapper) || ...);
}

template <class T>
Object wrap(const Ref<T>& reference) {
    if (!reference) return Object::share(Py_None);
    if (const auto host = std::dynamic_pointer_cast<Host>(reference))
        return Object::share(host->object());
    Object wrapper;
    if (!wrapAny(reference, wrapper, static_cast<typename Interface<T>::Own*>(nullptr)))
        throwTypeError("this %s is of a model that Python does not know", Interface<T>::name);
    return wrapper;
}

void release(PyObject* capsule) {
    delete static_cast<std::shared_ptr<void>*>(PyCapsule_GetPointer(capsule, capsuleName));
}

} // namespace

template <class T>
bool refersTo(PyObject* object) {
    if (object == Py_None) return true;
    try {
        return isOfAny(object, static_cast<typename Interface<T>::Own*>(nullptr)) ||
               isOfModel(object, Interface<T>::name);
    } catch (const PythonError&) {
        return false; // SIP then says which argument it was
    }
}

template <class T>
Ref<T> referenceTo(PyObject* object, const char* what) {
    if (object == Py_None) return {};
    if (auto own = unwrappedAny<T>(object, static_cast<typename Interface<T>::Own*>(nullptr)))
        return own;
    if (!refersTo<T>(object))
        throwTypeError("%s must be a zandor.TalvikZandorLib.%s or None, not %s", what,
                       Interface<T>::name, Py_TYPE(object)->tp_name);
    return adaptedTo<T>(object);
}

template bool refersTo<TalvikZandorLib::Zandor>(PyObject*);
template bool refersTo<TalvikZandorLib::ZDTable>(PyObject*);
template bool refersTo<TalvikZandorLib::ZDColumn>(PyObject*);
template bool refersTo<TalvikZandorLib::ZDJoin>(PyObject*);
template bool refersTo<TalvikZandorLib::ZDColumnDefinition>(PyObject*);
template bool refersTo<TalvikZandorLib::ZDCriterium>(PyObject*);

template Ref<TalvikZandorLib::Zandor> referenceTo(PyObject*, const char*);
template Ref<TalvikZandorLib::ZDTable> referenceTo(PyObject*, const char*);
template Ref<TalvikZandorLib::ZDColumn> referenceTo(PyObject*, const char*);
template Ref<TalvikZandorLib::ZDJoin> referenceTo(PyObject*, const char*);
template Ref<TalvikZandorLib::ZDColumnDefinition> referenceTo(PyObject*, const char*);
template Ref<TalvikZandorLib::ZDCriterium> referenceTo(PyObject*, const char*);

Object wrapped(const Ref<TalvikZandorLib::Zandor>& reference) { return wrap(reference); }
Object wrapped(const Ref<TalvikZandorLib::ZDTable>& reference) { return wrap(reference); }
Object wrapped(const Ref<TalvikZandorLib::ZDColumn>& reference) { return wrap(reference); }
Object wrapped(const Ref<TalvikZandorLib::ZDJoin>& reference) { return wrap(reference); }
Object wrapped(const Ref<TalvikZandorLib::ZDColumnDefinition>& reference) {
    return wrap(reference);
}
Object wrapped(const Ref<TalvikZandorLib::ZDCriterium>& reference) { return wrap(reference); }

void hold(PyObject* wrapper, std::shared_ptr<void> owner) {
    auto* const self = reinterpret_cast<sipSimpleWrapper*>(wrapper);
    if (sipGetUserObject(self)) return; // known before, and holding it
    auto copy = std::make_unique<std::shared_ptr<void>>(std::move(owner));
    Object capsule = Object::take(PyCapsule_New(copy.get(), capsuleName, release));
    copy.release();
    sipSetUserObject(self, capsule.release());
}

void holdFirst(PyObject* wrapper, std::shared_ptr<void> owner) {
    if (sipGetUserObject(reinterpret_cast<sipSimpleWrapper*>(wrapper)))
        throwTypeError("this %s is initialized already", Py_TYPE(wrapper)->tp_name);
    hold(wrapper, std::move(owner));
}

std::shared_ptr<void> held(PyObject* wrapper) {
    PyObject* const capsule = sipGetUserObject(reinterpret_cast<sipSimpleWrapper*>(wrapper));
    if (!capsule)
        throwTypeError("super().__init__() of this %s was never called", Py_TYPE(wrapper)->tp_name);
    return *static_cast<std::shared_ptr<void>*>(PyCapsule_GetPointer(capsule, capsuleName));
}

bool isLibrary(PyObject* object) {
    try {
        return is(object, classOf<model::Library>()) || isOfModel(object, "Library");
    } catch (const PythonError&) {
        return false;
    }
}

std::shared_ptr<TalvikZandorLib::Library> libraryOf(PyObject* object) {
    if (reinterpret_cast<PyObject*>(Py_TYPE(object)) == classOf<model::Library>())
        return std::make_shared<model::Library>();
    return adapted<PythonLibrary, TalvikZandorLib::Library>(object);
}

Ref<model::Query> queryOf(PyObject* wrapper) {
    if (!is(wrapper, classOf<model::Query>()))
        throwTypeError("the query must be a zandor.Query, not %s", Py_TYPE(wrapper)->tp_name);
    return unwrapped<model::Query>(wrapper);
}

} // namespace zandor::python
