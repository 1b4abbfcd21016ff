#pragma once

#include <QString>

namespace zandor::designer {

/// A number of a result as its reader writes it: with the decimal sign of the user's language, and
/// without marks between thousands, for it may be a year or the number of an invoice.
QString shownNumber(const QString& number);

} // namespace zandor::designer
