#pragma once

#include <Zandor/reader/export.h>
#include <Zandor/sql/Dialect.h>

#include <QVariant>

namespace zandor::reader {

/// A value of a statement as Qt SQL hands it to the engine of a dialect. SQLite compares by the
/// kind of value that it is given and has no exact decimals: it gets a double, with some 15 digits.
/// The others get the digits.
ZANDOR_READER_EXPORT QVariant bindValue(const model::sql::Value& value,
                                        model::sql::Dialect dialect);

} // namespace zandor::reader
