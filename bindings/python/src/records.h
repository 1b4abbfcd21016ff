#pragma once

#include "Object.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/Questions.h>
#include <Zandor/comforts/Field.h>
#include <Zandor/model/Finding.h>
#include <Zandor/platform/Words.h>
#include <Zandor/reader/addTables.h>
#include <Zandor/sql/Builder.h>

#include <QMap>

/// Plain values between C++ and zandor.records. All under the interpreter's lock; a value of
/// another shape is a TypeError, thrown as a PythonError.
namespace zandor::python {

Object toPython(const model::ColumnDescription& column);
Object toPython(const model::TableDescription& table);
Object toPython(const model::Finding& finding);
Object toPython(const reader::TableId& id);
Object toPython(const reader::TableEntry& entry);
Object toPython(const reader::ForeignKey& key);
Object toPython(const reader::LeftOut& leftOut);
/// By name.
Object toPython(const platform::Words& words);
/// The bindings as values that the dialect's engine takes.
Object toPython(const model::sql::Text& statement, model::sql::Dialect dialect);

Object toPython(const TalvikDBxZandor::JoinEnd& end);
Object toPython(const TalvikDBxZandor::MenuPlace& place);

/// An entry for the control's menu.
struct OfferedEntry {
    platform::String caption;
    Object chosen; ///< can be called, or is None
    bool enabled = true;
};
/// Those of whatever can be iterated, each with the attributes of a HostEntry.
std::vector<OfferedEntry> offeredEntries(PyObject* values);

model::TableDescription tableDescription(PyObject* value);
/// A name, or a schema and a name as a TableId has them.
reader::TableId tableId(PyObject* value);
std::vector<reader::TableId> tableIds(PyObject* values);
/// Those that have a row, each with the attributes definition, row and text.
std::vector<comforts::Finding> cellFindings(PyObject* values);
/// A dict by name; what it does not name is in English. ValueError for a name that is none of them.
platform::Words words(PyObject* values);
QMap<QString, QString> texts(PyObject* values);

/// A list of what each value is to Python.
template <class Value>
Object listOf(const std::vector<Value>& values) {
    Object list = Object::take(PyList_New(0));
    for (const Value& value : values) append(list.get(), toPython(value));
    return list;
}
void append(PyObject* list, const Object& value);

} // namespace zandor::python
