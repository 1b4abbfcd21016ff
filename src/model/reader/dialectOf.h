#pragma once

#include "model/sql/Dialect.h"

#include <QSqlDatabase>

namespace reader {

/// The dialect that the engine of an open database reads.
model::sql::Dialect dialectOf(const QSqlDatabase& database);

} // namespace reader
