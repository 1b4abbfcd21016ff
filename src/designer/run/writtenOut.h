#pragma once

#include <QString>
#include <QVariantList>

namespace zandor::designer {

/// A statement of MySQL's with values in the places of its placeholders: what would be bound, as
/// literals that mean the same. The session reads a backslash in a text as an escape.
QString writtenOut(const QString& statement, const QVariantList& values);

} // namespace zandor::designer
