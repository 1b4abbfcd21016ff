#pragma once

#include "designer/statement/readStatement.h"

namespace zandor::designer {

/// The text of a file with a statement: UTF-8, or another Unicode with its mark at the beginning.
/// Or one line on what is wrong with it.
model::Result<QString, Undrawn> readStatementFile(const QString& path);

/// The same of bytes; `name` is how a message calls them.
model::Result<QString, Undrawn> statementTextOf(const QByteArray& bytes, const QString& name);

/// More bytes than that are no statement that can be read.
inline constexpr qint64 mostStatementBytes = 1'000'000;

} // namespace zandor::designer
