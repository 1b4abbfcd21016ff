#include "sipAPI_zandor.h"

#include "Database.h"
#include "PythonError.h"
#include "conversions.h"
#include "raise.h"
#include "records.h"

#include <Zandor/reader/addTables.h>
#include <Zandor/reader/dialectOf.h>

namespace zandor::python {

namespace {

/// The value, or the error as Python has it.
template <class T>
T valueOf(reader::Result<T> result) {
    if (!result) raise("DatabaseError", result.failure().message);
    return std::move(*result);
}

} // namespace

Database::Database(const QString& address, const QString& password)
    : mConnection(valueOf(reader::openDatabase(address, password))),
      mReader(reader::makeReader(mConnection.database())) {}

model::sql::Dialect Database::dialect() const { return reader::dialectOf(mConnection.database()); }

std::vector<reader::TableEntry> Database::tables() { return valueOf(mReader->tables()); }

model::TableDescription Database::table(const reader::TableId& id) {
    return valueOf(mReader->table(id));
}

std::vector<reader::ForeignKey> Database::foreignKeys(const reader::TableId& child) {
    return valueOf(mReader->foreignKeys(child));
}

Object Database::addTables(model::Query& query, PyObject* names, std::int32_t canvasWidth) {
    std::vector<reader::LeftOut> leftOut;
    const auto tables =
        valueOf(reader::addTables(query, *mReader, tableIds(names), canvasWidth, &leftOut));
    const Object list = Object::take(PyList_New(0));
    for (const auto& table : tables)
        append(list.get(), toPython(Ref<TalvikZandorLib::ZDTable>(table)));
    return Object::take(PyTuple_Pack(2, list.get(), listOf(leftOut).get()));
}

} // namespace zandor::python
