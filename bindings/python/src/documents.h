#pragma once

#include "Object.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/files/SavedQueries.h>
#include <Zandor/sql/Dialect.h>

/// Queries as files. What goes wrong is thrown as Python's zandor.FileError. Under the lock.
namespace zandor::python {

platform::String jsonOf(const files::QueryDocument& document);
/// A str or bytes of UTF-8.
files::QueryDocument documentOf(PyObject* text);
void save(const files::Path& path, const files::QueryDocument& document);
files::QueryDocument load(const files::Path& path);

/// `into` is a path, None or nothing.
model::SavedQuery readSaved(const files::Path& path, PyObject* into);
/// A tuple of two lists of str.
Object readSavedAgain(PyObject* query, PyObject* into);

/// Python's path as the system has it.
files::Path pathOf(PyObject* path);

} // namespace zandor::python
