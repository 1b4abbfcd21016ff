#include "sipAPI_zandor.h"

#include "PythonError.h"
#include "conversions.h"
#include "names.h"
#include "records.h"

#include <Zandor/qt/Text.h>
#include <Zandor/reader/bindValue.h>

#include <functional>

namespace zandor::python {

namespace {

/// A value of a class in zandor.records.
template <class... Parts>
Object record(const char* name, const Parts&... parts) {
    const Object type = ofPackage("records", name);
    return Object::take(PyObject_CallFunctionObjArgs(type.get(), parts.get()..., nullptr));
}

template <class Enum>
Object enumeration(Enum value, const sipTypeDef* type) {
    return Object::take(sipConvertFromEnum(static_cast<int>(value), type));
}

Object position(std::size_t value) { return Object::take(PyLong_FromSize_t(value)); }

template <class T>
T attribute(PyObject* value, const char* name) {
    const Object found = Object::take(PyObject_GetAttrString(value, name));
    return convert<T>(found.get(), name);
}

/// Calls `use` for each item of whatever can be iterated.
void forEach(PyObject* values, const std::function<void(PyObject*)>& use) {
    const Object iterator = Object::take(PyObject_GetIter(values));
    while (PyObject* item = PyIter_Next(iterator.get())) use(Object::take(item).get());
    if (PyErr_Occurred()) throwPythonError();
}

model::ColumnDescription columnDescription(PyObject* value) {
    model::ColumnDescription column;
    column.name = attribute<platform::String>(value, "name");
    const Object type = Object::take(PyObject_GetAttrString(value, "type"));
    const int number = sipConvertToEnum(type.get(), sipType_ColumnType);
    if (PyErr_Occurred()) throwPythonError();
    column.type = static_cast<model::ColumnType>(number);
    column.declaredType = attribute<platform::String>(value, "declaredType");
    column.primaryKey = attribute<bool>(value, "primaryKey");
    return column;
}

Object binding(const model::sql::Binding& binding, model::sql::Dialect dialect) {
    if (const auto* parameter = std::get_if<model::sql::Parameter>(&binding))
        return record("Parameter", toPython(parameter->name),
                      enumeration(parameter->type, sipType_ColumnType),
                      toPython(parameter->pattern));
    auto value = std::make_unique<QVariant>(
        reader::bindValue(std::get<model::sql::Value>(binding), dialect));
    return Object::take(sipConvertFromNewType(value.release(), sipType_QVariant, nullptr));
}

} // namespace

void append(PyObject* list, const Object& value) {
    if (PyList_Append(list, value.get()) < 0) throwPythonError();
}

Object toPython(const model::ColumnDescription& column) {
    return record("ColumnDescription", toPython(column.name),
                  enumeration(column.type, sipType_ColumnType), toPython(column.declaredType),
                  toPython(column.primaryKey));
}

Object toPython(const model::TableDescription& table) {
    return record("TableDescription", toPython(table.name), listOf(table.columns),
                  toPython(table.schema));
}

Object toPython(const model::Finding& finding) {
    const Object code =
        Object::take(PyUnicode_FromString(std::string(finding.message.code()).c_str()));
    return record("Finding", enumeration(finding.kind, sipType_FindingKind), code,
                  toPython(finding.text()), toPython(finding.isError()), toPython(finding.table),
                  toPython(finding.join), toPython(finding.definition), toPython(finding.row),
                  position(finding.position));
}

Object toPython(const reader::TableId& id) {
    return record("TableId", toPython(id.name), toPython(id.schema));
}

Object toPython(const reader::TableEntry& entry) {
    return record("TableEntry", toPython(entry.id), toPython(entry.isView));
}

Object toPython(const reader::ForeignKey& key) {
    const Object columns = Object::take(PyList_New(0));
    for (const auto& [child, parent] : key.columns)
        append(columns.get(),
               Object::take(PyTuple_Pack(2, toPython(child).get(), toPython(parent).get())));
    return record("ForeignKey", toPython(key.child), toPython(key.parent), columns);
}

Object toPython(const reader::LeftOut& leftOut) {
    return record("LeftOut", toPython(leftOut.drawn), toPython(leftOut.other));
}

Object toPython(const platform::Words& words) {
    Object result = Object::take(PyDict_New());
    for (const auto& [name, word] : platform::wordTable)
        if (PyDict_SetItem(result.get(), toPython(name).get(), toPython(words.*word).get()) < 0)
            throwPythonError();
    return result;
}

Object toPython(const model::sql::Text& statement, model::sql::Dialect dialect) {
    const Object bindings = Object::take(PyList_New(0));
    for (const auto& each : statement.bindings) append(bindings.get(), binding(each, dialect));
    return record("Statement", toPython(statement.text), bindings, listOf(statement.findings),
                  toPython(statement.runnable()));
}

Object toPython(const TalvikDBxZandor::JoinEnd& end) {
    return record("JoinEnd", toPython(end.Table), toPython(end.Column));
}

Object toPython(const TalvikDBxZandor::MenuPlace& place) {
    return record("MenuPlace", record("MenuSource", toPython(place.Source)), toPython(place.Table),
                  toPython(place.Column), toPython(place.Join), toPython(place.Definition),
                  toPython(place.Row), toPython(place.X), toPython(place.Y));
}

std::vector<OfferedEntry> offeredEntries(PyObject* values) {
    std::vector<OfferedEntry> entries;
    forEach(values, [&entries](PyObject* value) {
        const auto chosen = attribute<Object>(value, "Chosen");
        if (chosen.get() != Py_None && !PyCallable_Check(chosen.get()))
            throwTypeError("Chosen must be None or something to be called, not %s",
                           Py_TYPE(chosen.get())->tp_name);
        entries.push_back({attribute<platform::String>(value, "Caption"), chosen,
                           attribute<bool>(value, "Enabled")});
    });
    return entries;
}

model::TableDescription tableDescription(PyObject* value) {
    model::TableDescription table;
    table.name = attribute<platform::String>(value, "name");
    table.schema = attribute<platform::String>(value, "schema");
    const Object columns = Object::take(PyObject_GetAttrString(value, "columns"));
    forEach(columns.get(),
            [&table](PyObject* column) { table.columns.push_back(columnDescription(column)); });
    return table;
}

reader::TableId tableId(PyObject* value) {
    if (PyUnicode_Check(value)) return {{}, toString(value)};
    return {attribute<platform::String>(value, "schema"),
            attribute<platform::String>(value, "name")};
}

std::vector<reader::TableId> tableIds(PyObject* values) {
    if (PyUnicode_Check(values)) throwTypeError("the names of tables must be a list, not one str");
    std::vector<reader::TableId> ids;
    forEach(values, [&ids](PyObject* value) { ids.push_back(tableId(value)); });
    return ids;
}

std::vector<comforts::Finding> cellFindings(PyObject* values) {
    std::vector<comforts::Finding> findings;
    forEach(values, [&findings](PyObject* value) {
        const auto row = attribute<std::int32_t>(value, "row");
        if (row > 0)
            findings.push_back({attribute<platform::String>(value, "definition"), row,
                                attribute<platform::String>(value, "text")});
    });
    return findings;
}

platform::Words words(PyObject* values) {
    platform::Words words;
    const Object items = Object::take(PyMapping_Items(values));
    forEach(items.get(), [&words](PyObject* item) {
        PyObject *name = nullptr, *text = nullptr;
        if (!PyArg_ParseTuple(item, "UO", &name, &text)) throwPythonError();
        const platform::String known = toString(name);
        const auto found =
            std::find_if(std::begin(platform::wordTable), std::end(platform::wordTable),
                         [&known](const auto& row) { return row.first == known; });
        if (found == std::end(platform::wordTable)) {
            PyErr_Format(PyExc_ValueError, "there is no word %R; words() names all", name);
            throwPythonError();
        }
        words.*found->second = asText(text, "a word");
    });
    return words;
}

QMap<QString, QString> texts(PyObject* values) {
    QMap<QString, QString> result;
    const Object items = Object::take(PyMapping_Items(values));
    forEach(items.get(), [&result](PyObject* item) {
        PyObject *name = nullptr, *text = nullptr;
        if (!PyArg_ParseTuple(item, "UU", &name, &text)) throwPythonError();
        result.insert(platform::qt::toQt(toString(name)), platform::qt::toQt(toString(text)));
    });
    return result;
}

} // namespace zandor::python
