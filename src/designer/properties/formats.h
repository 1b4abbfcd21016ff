#pragma once

#include "designer/run/CellFormat.h"

#include <Zandor/model/Description.h>

#include <span>

namespace zandor::model {
class ColumnDefinition;
}

namespace zandor::designer {

/// The formats in the order in which they are offered, the one of all values first. A whole number
/// is a number without decimals.
std::span<const CellFormat> offeredFormats();

/// "Thousands".
QString nameOf(const CellFormat& offered);
/// "Thousands: 1,234.50", with an example in the user's language where there is one.
QString exampleOf(const CellFormat& offered);

/// The place among those offered of the one that a column has.
int placeOf(const model::ColumnDefinition& definition);

/// Gives a column a format, and as many decimals as people expect who have not said how many.
void setFormat(model::ColumnDefinition& definition, const CellFormat& offered);

/// Whether values of a type can be shown so. Texts may be dates: not every engine has a type for
/// them.
bool suits(model::Format format, model::ColumnType type);

} // namespace zandor::designer
