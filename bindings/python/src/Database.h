#pragma once

#include "Object.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>
#include <Zandor/reader/Connection.h>

namespace zandor::python {

/// An open database and its reader. What goes wrong is thrown as Python's zandor.DatabaseError.
class Database {
public:
    /// As reader::openDatabase.
    Database(const QString& address, const QString& password);

    QSqlDatabase database() const { return mConnection.database(); }
    model::sql::Dialect dialect() const;
    bool answers() const { return reader::answers(mConnection); }

    std::vector<reader::TableEntry> tables();
    model::TableDescription table(const reader::TableId& id);
    std::vector<reader::ForeignKey> foreignKeys(const reader::TableId& child);
    /// The tables and what was left out, as a tuple of Python.
    Object addTables(model::Query& query, PyObject* names, std::int32_t canvasWidth);

private:
    reader::Connection mConnection;
    std::unique_ptr<reader::DatabaseReader> mReader;
};

} // namespace zandor::python

using zandor::python::Database;
