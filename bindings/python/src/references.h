#pragma once

#include "Object.h"

#include <Zandor/Query.h>
#include <Zandor/TalvikZandorLib.h>

/// How objects of a query model go between Python and C++. One of the ready-made model is wrapped,
/// and its wrapper holds a reference to it; one that is written in Python stands behind an adapter
/// (see adapters.h), and a reference holds both. So it lives as long as either side needs it.
namespace zandor::python {

using platform::Ref;

/// The Python object for a reference: None for nothing, the object itself for one written in
/// Python. Under the lock.
Object wrapped(const Ref<TalvikZandorLib::Zandor>& reference);
Object wrapped(const Ref<TalvikZandorLib::ZDTable>& reference);
Object wrapped(const Ref<TalvikZandorLib::ZDColumn>& reference);
Object wrapped(const Ref<TalvikZandorLib::ZDJoin>& reference);
Object wrapped(const Ref<TalvikZandorLib::ZDColumnDefinition>& reference);
Object wrapped(const Ref<TalvikZandorLib::ZDCriterium>& reference);

/// Whether referenceTo() takes it: None, an object of the ready-made model, one of a class derived
/// from the interface's in zandor.TalvikZandorLib.
template <class T>
bool refersTo(PyObject* object);
/// A TypeError, thrown as a PythonError, for anything else; `what` names the value in it.
template <class T>
Ref<T> referenceTo(PyObject* object, const char* what);

/// Makes a wrapper hold what it wraps, for as long as the wrapper is there.
void hold(PyObject* wrapper, std::shared_ptr<void> owner);
/// The same for a wrapper that is being initialised; a TypeError when it was before.
void holdFirst(PyObject* wrapper, std::shared_ptr<void> owner);
/// What a wrapper holds.
std::shared_ptr<void> held(PyObject* wrapper);

/// Whether libraryOf() takes it.
bool isLibrary(PyObject* object);
/// A library of the control, ready-made or written in Python.
std::shared_ptr<TalvikZandorLib::Library> libraryOf(PyObject* object);

/// The query that a wrapper is for, one of a derived class too; a TypeError for anything else.
Ref<model::Query> queryOf(PyObject* wrapper);

} // namespace zandor::python
