#pragma once

#include <Zandor/reader/export.h>
#include <Zandor/sql/Dialect.h>

#include <QSqlDatabase>

namespace zandor::reader {

/// The dialect that the engine of an open database reads. Behind ODBC the engine is asked which one
/// it is.
ZANDOR_READER_EXPORT model::sql::Dialect dialectOf(const QSqlDatabase& database);

} // namespace zandor::reader
