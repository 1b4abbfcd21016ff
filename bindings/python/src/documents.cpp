#include "documents.h"

#include "PythonError.h"
#include "conversions.h"
#include "raise.h"
#include "references.h"

namespace zandor::python {

namespace {

[[noreturn]] void raiseFileError(const files::Error& error) {
    raise("FileError", error.message, platform::fromUtf8(error.reason()));
}

template <class T>
T valueOf(files::Result<T> result) {
    if (!result) raiseFileError(result.failure());
    return std::move(*result);
}

} // namespace

platform::String jsonOf(const files::QueryDocument& document) {
    return platform::fromUtf8(valueOf(files::toJson(document)));
}

files::QueryDocument documentOf(PyObject* text) {
    const Object bytes = PyUnicode_Check(text) ? Object::take(PyUnicode_AsUTF8String(text))
                                               : Object::take(PyBytes_FromObject(text));
    return valueOf(files::fromJson(
        {PyBytes_AsString(bytes.get()), static_cast<std::size_t>(PyBytes_Size(bytes.get()))}));
}

void save(const files::Path& path, const files::QueryDocument& document) {
    if (const auto error = files::saveQuery(path, document)) raiseFileError(*error);
}

files::QueryDocument load(const files::Path& path) { return valueOf(files::loadQuery(path)); }

namespace {

files::Path pathOrNone(PyObject* path) {
    return path && path != Py_None ? pathOf(path) : files::Path();
}

Object listOfTexts(const std::vector<platform::String>& texts) {
    const Object list = Object::take(PyList_New(0));
    for (const platform::String& text : texts)
        if (PyList_Append(list.get(), toPython(text).get()) != 0) throwPythonError();
    return list;
}

} // namespace

model::SavedQuery readSaved(const files::Path& path, PyObject* into) {
    return valueOf(files::readSavedQuery(path, pathOrNone(into)));
}

Object readSavedAgain(PyObject* query, PyObject* into) {
    const auto result = files::readSavedAgain(*queryOf(query), pathOrNone(into));
    std::vector<platform::String> kept;
    for (const files::Error& error : result.kept) kept.push_back(platform::fromUtf8(error.text()));
    return Object::take(
        PyTuple_Pack(2, listOfTexts(result.changed).get(), listOfTexts(kept).get()));
}

files::Path pathOf(PyObject* path) {
    PyObject* bytes = nullptr;
    if (!PyUnicode_FSConverter(path, &bytes)) throwPythonError();
    return files::Path(PyBytes_AsString(Object::take(bytes).get()));
}

} // namespace zandor::python
