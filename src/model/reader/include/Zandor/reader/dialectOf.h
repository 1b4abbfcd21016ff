#pragma once

#include <Zandor/sql/Dialect.h>

#include <QSqlDatabase>

namespace zandor::reader {

/// The dialect that the engine of an open database reads.
model::sql::Dialect dialectOf(const QSqlDatabase& database);

} // namespace zandor::reader
